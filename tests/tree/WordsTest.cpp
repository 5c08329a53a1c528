#include <regex>
#include <sstream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tree.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/** Words that tell of how the project came to be instead of what it is; split, as this is a file
 * too. */
const std::string banned = "\\bs"
                           "pec\\b|s"
                           "pecification|\\bP"
                           "art [0-9]+(\\.[0-9]+)?\\b|i"
                           "ssue #|D"
                           "ESIGN\\.md|e"
                           "fl-notes|\\bb"
                           "rief\\.md|/w"
                           "ork/(main|shared)|\\.\\./s"
                           "hared|/tmp/b"
                           "uild-|\\bh"
                           "elper H[0-9]|deb\\.d"
                           "ebian\\.org|p"
                           "ypi\\.org|c"
                           "rates\\.io|n"
                           "pmjs\\.|proxy\\.g"
                           "olang\\.org|rubyg"
                           "ems\\.org|\\ba"
                           "rtifactory";

std::vector<std::string> bannedWords(const fs::path& root) {
    const std::regex form(banned, std::regex::icase | std::regex::optimize);
    std::vector<std::string> found;
    for (const auto& file : filesOf(root)) {
        const std::string contents = contentsOf(root / file);
        if (file == "LICENSE" || !isText(contents))
            continue;
        std::istringstream lines(contents);
        int number = 0;
        for (std::string line; std::getline(lines, line);) {
            ++number;
            std::smatch match;
            // Very long lines are data.
            if (line.size() < 2000 && std::regex_search(line, match, form))
                found.push_back(file + ":" + std::to_string(number) + ": " + match.str());
        }
    }
    return found;
}

} // namespace

TEST(Words, TellWhatTheProjectIs) {
    EXPECT_THAT(bannedWords(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(Words, OnesThatTellOfItsOriginAreFound) {
    const PlantedTree tree;
    tree.plant("src/A.cpp", std::string("int timespec; // special\n// See P") + "art 4.1.\n");
    tree.plant("docs/a.md", std::string("as the S") + "pecification says\n");
    tree.plant("build/x.txt", std::string("D") + "ESIGN.md");
    EXPECT_THAT(bannedWords(tree.root()),
                ElementsAre(std::string("docs/a.md:1: S") + "pecification",
                            std::string("src/A.cpp:2: P") + "art 4.1"));
}
