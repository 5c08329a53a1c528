#include <map>
#include <optional>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tree.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/** A folder and the folders that it may include from, besides itself. */
struct Layer {
    const char* folder;
    std::set<std::string> below;
};

/** The first that contains a file is its layer. Folders that are missing here may use everything.
 */
const std::vector<Layer> layers{
    {"platform/device", {}},
    {"platform/base", {"platform/device"}},
    {"platform/app_assist", {"platform/base", "platform/device"}},
    {"platform/clock", {"platform/base", "platform/device"}},
    {"include", {"platform/app_assist", "platform/clock", "platform/device"}},
    {"src/rules", {"platform/base", "platform/clock", "platform/device"}},
    {"src",
     {"include", "src/rules", "platform/app_assist", "platform/clock", "platform/base",
      "platform/device"}},
    {"host/include", {"platform/device"}},
    {"host", {"host/include", "platform/base", "platform/device"}},
    {"simulator",
     {"include", "src/rules", "platform/app_assist", "platform/clock", "platform/base",
      "platform/device", "host/include"}},
    {"examples",
     {"include", "platform/app_assist", "platform/clock", "platform/device", "host/include"}},
};

/** Layers that must not see the toolkit, not even through a header of another layer. */
const std::vector<std::string> withoutToolkit{"src/rules", "platform/base"};

/** Folders that includes are looked up in, besides that of the including file. */
const std::vector<std::string> searchFolders{"platform", "include", "src", "host/include", "host"};

struct Include {
    std::string from;
    int line = 0;
    std::string name;   ///< As written.
    std::string target; ///< File of the tree, empty for others.
};

const Layer* layerOf(const std::string& file) {
    for (const auto& layer : layers) {
        if (file.starts_with(std::string(layer.folder) + "/"))
            return &layer;
    }
    return nullptr;
}

std::string resolve(const fs::path& root, const std::string& from, const std::string& name) {
    const fs::path beside = (fs::path(from).parent_path() / name).lexically_normal();
    if (fs::is_regular_file(root / beside))
        return beside;
    for (const auto& folder : searchFolders) {
        const fs::path file = (fs::path(folder) / name).lexically_normal();
        if (fs::is_regular_file(root / file))
            return file;
    }
    return "";
}

std::vector<Include> includesOf(const fs::path& root, const std::string& file) {
    static const std::regex form(R"re(^\s*#\s*include\s*["<]([^">]+)[">])re");
    std::vector<Include> includes;
    std::istringstream lines(contentsOf(root / file));
    int number = 0;
    for (std::string line; std::getline(lines, line);) {
        ++number;
        std::smatch match;
        if (std::regex_search(line, match, form))
            includes.push_back({file, number, match[1], resolve(root, file, match[1])});
    }
    return includes;
}

std::string describe(const Include& include) {
    return include.from + ":" + std::to_string(include.line) + " includes " +
           (include.target.empty() ? include.name : include.target);
}

std::vector<std::string> upwardIncludes(const fs::path& root) {
    std::vector<std::string> found;
    for (const auto& file : filesOf(root)) {
        const Layer* from = isSource(file) ? layerOf(file) : nullptr;
        if (!from)
            continue;
        for (const auto& include : includesOf(root, file)) {
            const Layer* to = layerOf(include.target);
            const bool outside = !include.target.empty() && !to;
            if (outside || (to && to != from && !from->below.contains(to->folder)))
                found.push_back(describe(include));
        }
    }
    return found;
}

bool isToolkitHeader(const std::string& name) {
    static const std::regex form("(Elementary|Evas|Ecore|Edje|Eina|Efl|Eo|Eet|Emotion|Efreet|"
                                 "Eldbus|Embryo|Elm|eo|eina|evas|elm)([A-Z_/][A-Za-z0-9_/]*)?\\.h");
    return std::regex_match(name, form);
}

/** The toolkit headers that a file sees, directly or through other files of the tree. */
void collectToolkitHeaders(const fs::path& root, const std::string& file,
                           std::set<std::string>& seen, std::vector<std::string>& found) {
    if (!seen.insert(file).second)
        return;
    for (const auto& include : includesOf(root, file)) {
        if (isToolkitHeader(include.name))
            found.push_back(describe(include));
        else if (!include.target.empty())
            collectToolkitHeaders(root, include.target, seen, found);
    }
}

std::vector<std::string> toolkitBelow(const fs::path& root, const std::string& layer) {
    std::vector<std::string> found;
    std::set<std::string> seen;
    for (const auto& file : filesOf(root)) {
        if (isSource(file) && file.starts_with(layer + "/"))
            collectToolkitHeaders(root, file, seen, found);
    }
    return found;
}

} // namespace

TEST(Layers, IncludesPointDownOnly) {
    EXPECT_THAT(upwardIncludes(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(Layers, RulesAndBaseDoNotSeeTheToolkit) {
    for (const auto& layer : withoutToolkit)
        EXPECT_THAT(toolkitBelow(CLOCK_SOURCE_DIR, layer), IsEmpty()) << layer;
}

TEST(Layers, EveryLayerExists) {
    for (const auto& layer : layers)
        EXPECT_TRUE(fs::is_directory(fs::path(CLOCK_SOURCE_DIR) / layer.folder)) << layer.folder;
}

TEST(Layers, AnIncludeThatPointsUpIsFound) {
    const PlantedTree tree;
    tree.plant("host/include/device_host.h", "");
    tree.plant("platform/clock/Record.h", "#include <device/vconf.h>\n");
    tree.plant("platform/device/vconf.h", "#pragma once\n");
    tree.plant("src/Screen.cpp", "#include \"clock/Record.h\"\n#include \"device_host.h\"\n");
    tree.plant("platform/app_assist/View.cpp", "#include <clock/Record.h>\n");
    tree.plant("tests/ScreenTest.cpp", "#include \"../src/Screen.cpp\"\n");
    tree.plant("src/Other.cpp", "# include \"../tests/ScreenTest.cpp\"\n");
    EXPECT_THAT(upwardIncludes(tree.root()),
                ElementsAre("platform/app_assist/View.cpp:1 includes platform/clock/Record.h",
                            "src/Other.cpp:1 includes tests/ScreenTest.cpp",
                            "src/Screen.cpp:2 includes host/include/device_host.h"));
}

TEST(Layers, AToolkitHeaderBehindAnotherHeaderIsFound) {
    const PlantedTree tree;
    tree.plant("src/rules/Day.cpp", "#include \"clock/Record.h\"\n");
    tree.plant("platform/clock/Record.h", "#include <Ecore_Evas.h>\n");
    EXPECT_THAT(toolkitBelow(tree.root(), "src/rules"),
                ElementsAre("platform/clock/Record.h:1 includes Ecore_Evas.h"));
}
