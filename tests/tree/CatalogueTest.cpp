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

std::set<std::string> translatedIds(const std::string& catalogue) {
    static const std::regex entry(R"re(msgid "([^"]+)"\s+msgstr "[^"]+")re");
    std::set<std::string> ids;
    for (std::sregex_iterator match(catalogue.begin(), catalogue.end(), entry), end; match != end;
         ++match)
        ids.insert((*match)[1]);
    return ids;
}

bool showsTexts(const std::string& file) {
    for (const char* folder : {"include/", "src/", "simulator/", "platform/", "host/", "edje/"}) {
        if (file.starts_with(folder))
            return true;
    }
    return false;
}

/** Message identifiers that the English catalogue, the last resort of all languages, lacks. */
std::vector<std::string> untranslated(const fs::path& root) {
    static const std::regex id("\"(IDS_[A-Za-z0-9_]+)\"");
    const auto translated = translatedIds(contentsOf(root / "po/en.po"));
    std::vector<std::string> missing;
    for (const auto& file : filesOf(root)) {
        if (!showsTexts(file))
            continue;
        const std::string text = contentsOf(root / file);
        for (std::sregex_iterator match(text.begin(), text.end(), id), end; match != end; ++match) {
            if (!translated.contains((*match)[1]))
                missing.push_back(file + ": " + (*match)[1].str());
        }
    }
    return missing;
}

} // namespace

TEST(Catalogue, EveryTextHasAnEnglishEntry) {
    EXPECT_THAT(untranslated(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(Catalogue, ATextWithoutAnEntryAndOneWithAnEmptyEntryAreFound) {
    const PlantedTree tree;
    tree.plant("po/en.po", "msgid \"IDS_A\"\nmsgstr \"A\"\n\nmsgid \"IDS_B\"\nmsgstr \"\"\n");
    tree.plant("src/A.cpp", "f(\"IDS_A\"); f(\"IDS_B\"); f(\"IDS_C\");");
    EXPECT_THAT(untranslated(tree.root()), ElementsAre("src/A.cpp: IDS_B", "src/A.cpp: IDS_C"));
}
