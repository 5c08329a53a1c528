#include "Tree.h"

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <sstream>

namespace fs = std::filesystem;

namespace {

bool isToolFolder(const fs::path& folder) {
    const std::string name = folder.filename();
    return name == ".git" || name == ".cache" || name.starts_with("build");
}

} // namespace

std::vector<std::string> filesOf(const fs::path& root) {
    std::vector<std::string> files;
    for (auto entry = fs::recursive_directory_iterator(root);
         entry != fs::recursive_directory_iterator(); ++entry) {
        if (entry->is_directory() && isToolFolder(entry->path()))
            entry.disable_recursion_pending();
        else if (entry->is_regular_file())
            files.push_back(entry->path().lexically_relative(root));
    }
    std::sort(files.begin(), files.end());
    return files;
}

std::string contentsOf(const fs::path& file) {
    std::ostringstream contents;
    contents << std::ifstream(file, std::ios::binary).rdbuf();
    return contents.str();
}

bool isSource(std::string_view path) {
    return path.ends_with(".h") || path.ends_with(".cpp") || path.ends_with(".c");
}

bool isText(std::string_view contents) {
    return contents.find('\0') == std::string_view::npos;
}

PlantedTree::PlantedTree() {
    std::string path = (fs::temp_directory_path() / "clock-tree-XXXXXX").string();
    if (!mkdtemp(path.data()))
        std::abort();
    _root = path;
}

PlantedTree::~PlantedTree() {
    std::error_code ignored;
    fs::remove_all(_root, ignored);
}

void PlantedTree::plant(const std::string& path, const std::string& contents) const {
    fs::create_directories((_root / path).parent_path());
    std::ofstream(_root / path, std::ios::binary) << contents;
}
