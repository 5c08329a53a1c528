#include <algorithm>
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

bool isDocument(const std::string& file) {
    return file.ends_with(".md") &&
           (file.find('/') == std::string::npos || file.starts_with("docs/"));
}

std::vector<std::string> allMatches(const std::string& text, const std::regex& form) {
    std::vector<std::string> matches;
    for (std::sregex_iterator match(text.begin(), text.end(), form), end; match != end; ++match)
        matches.push_back((*match)[1]);
    return matches;
}

/** A path of the tree: what people write with wildcards or placeholders is none. */
bool looksLikePath(const fs::path& root, const std::string& text) {
    static const std::regex plain(R"([A-Za-z0-9_.][A-Za-z0-9_./+-]*)");
    static const std::regex built(R"(build(/.*)?|.*\.(edj|mo|so|png\.new))");
    if (!std::regex_match(text, plain) || std::regex_match(text, built))
        return false;
    const auto slash = text.find('/');
    if (slash != std::string::npos)
        return text.starts_with("./") || fs::exists(root / text.substr(0, slash));
    static const std::regex file(R"(.*\.(md|txt|json|po|edc|sh|cmake))");
    return std::regex_match(text, file);
}

/** Groups of themes look like paths. */
bool isThemeGroup(const fs::path& root, const std::string& text) {
    const auto files = filesOf(root);
    return std::any_of(files.begin(), files.end(), [&](const std::string& file) {
        return file.ends_with(".edc") &&
               contentsOf(root / file).find('"' + text + '"') != std::string::npos;
    });
}

/** A bare file name may be that of a file anywhere. */
bool exists(const fs::path& root, const std::string& document, const std::string& path) {
    if (fs::exists(root / path) || fs::exists(root / fs::path(document).parent_path() / path))
        return true;
    const auto files = filesOf(root);
    return path.find('/') == std::string::npos &&
           std::any_of(files.begin(), files.end(),
                       [&](const std::string& file) { return file.ends_with("/" + path); });
}

/** What documents name in backticks, or link to, and is not there. */
std::vector<std::string> missingFiles(const fs::path& root) {
    static const std::regex quoted("`([^`\n]+)`");
    static const std::regex linked(R"(\]\(([^)#:\s]+)(#[^)]*)?\))");
    std::vector<std::string> missing;
    for (const auto& document : filesOf(root)) {
        if (!isDocument(document))
            continue;
        const std::string text = contentsOf(root / document);
        const std::string prefix = document + ": ";
        for (const auto& path : allMatches(text, quoted)) {
            if (looksLikePath(root, path) && !exists(root, document, path) &&
                !isThemeGroup(root, path))
                missing.push_back(prefix + path);
        }
        for (const auto& path : allMatches(text, linked)) {
            if (!exists(root, document, path))
                missing.push_back(prefix + path);
        }
    }
    return missing;
}

} // namespace

TEST(Documents, NameFilesThatExist) {
    EXPECT_THAT(missingFiles(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(Documents, ANameWithoutAFileIsFound) {
    const PlantedTree tree;
    tree.plant("src/A.cpp", "");
    tree.plant("src/page.edc", "group { name: \"src/page/top\"; }");
    tree.plant(
        "docs/HOW.md",
        "`src/A.cpp`, `src/page/top`, `src/B.cpp`, `db/setting/psmode`, `src/*.cpp`, [t](T.md)");
    tree.plant("README.md", "[how](docs/HOW.md#start) [web](https://example.org/x.md) `docs/NO.md` "
                            "`build/dev/bin/x` `./run` `GONE.md` `HOW.md`");
    EXPECT_THAT(missingFiles(tree.root()),
                ElementsAre("README.md: docs/NO.md", "README.md: ./run", "README.md: GONE.md",
                            "docs/HOW.md: src/B.cpp", "docs/HOW.md: T.md"));
}
