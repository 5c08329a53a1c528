#include "rules/CityHighlight.h"

#include <string>

#include <gtest/gtest.h>

namespace {

constexpr rules::TextColour blue{0x4d, 0xb6, 0xff, 0xff};

std::string highlighted(const std::string& text, const std::string& keyword) {
    return rules::highlight(text, keyword, [] { return blue; });
}

struct HighlightCase {
    const char* text;
    const char* keyword;
    const char* result;
};

class HighlightTest : public testing::TestWithParam<HighlightCase> {};

TEST_P(HighlightTest, ColoursTheFirstOccurrence) {
    EXPECT_EQ(highlighted(GetParam().text, GetParam().keyword), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(
    Names, HighlightTest,
    testing::Values(HighlightCase{"London", "lon", "<color=#4db6ffff>Lon</color>don"},
                    HighlightCase{"London", "DON", "Lon<color=#4db6ffff>don</color>"},
                    HighlightCase{"Baden-Baden", "bad", "<color=#4db6ffff>Bad</color>en-Baden"},
                    HighlightCase{"London", "london", "<color=#4db6ffff>London</color>"},
                    HighlightCase{"Köln", "ö", "K<color=#4db6ffff>ö</color>ln"},
                    HighlightCase{"London", "", "<color=#4db6ffff></color>London"},
                    HighlightCase{"", "", "<color=#4db6ffff></color>"}));

// The list's search knows more than this one.
INSTANTIATE_TEST_SUITE_P(NotFound, HighlightTest,
                         testing::Values(HighlightCase{"Zürich", "zurich", "Zürich"},
                                         HighlightCase{"London", "londons", "London"},
                                         HighlightCase{"", "a", ""}));

INSTANTIATE_TEST_SUITE_P(Markup, HighlightTest,
                         testing::Values(HighlightCase{"A<b>&c", "<B>",
                                                       "A<color=#4db6ffff><b></color>&c"}));

TEST(Highlight, TheColourIsAskedForOnlyWhereItIsNeeded) {
    int asked = 0;
    const auto colour = [&asked] {
        ++asked;
        return rules::TextColour{1, 2, 3, 4};
    };
    EXPECT_EQ(rules::highlight("Bonn", "x", colour), "Bonn");
    EXPECT_EQ(asked, 0);
    EXPECT_EQ(rules::highlight("Bonn", "b", colour), "<color=#01020304>B</color>onn");
    EXPECT_EQ(asked, 1);
}

TEST(HighlightLimit, APieceHasAtMost511Bytes) {
    const std::string longest(511, 'a');
    EXPECT_EQ(highlighted(longest + "a", "x"), longest);
    const std::string tags = "<color=#4db6ffff>a</color>";
    EXPECT_EQ(highlighted(longest, "a"), tags + std::string(511 - tags.size(), 'a'));
    EXPECT_EQ(highlighted(longest + "b", "b"), longest);
    EXPECT_EQ(highlighted(longest.substr(0, 500) + "b", "b"),
              longest.substr(0, 500) + "<color=#4db");
    EXPECT_EQ(highlighted(std::string(2000, 'b'), std::string(2000, 'b')).size(), 511U);
}

TEST(HighlightLimit, AfterACutCharacterNothingFollows) {
    std::string text(510, 'a');
    EXPECT_EQ(highlighted(text + "öb", "b"), text);
    text.resize(493);
    EXPECT_EQ(highlighted(text + "öb", "ö"), text + "<color=#4db6ffff>");
}

TEST(CityLine, JoinsCityAndCountry) {
    EXPECT_EQ(rules::cityLine("Bonn", "Germany", false), "Bonn, Germany");
    EXPECT_EQ(rules::cityLine("Monaco", "Monaco", true), "Monaco");
    EXPECT_EQ(rules::cityLine("", "", false), ", ");
}

TEST(CityLine, HasAtMost255Bytes) {
    const std::string name(255, 'a');
    EXPECT_EQ(rules::cityLine(name + "b", "c", true), name);
    EXPECT_EQ(rules::cityLine(name.substr(0, 252), "bc", false), name.substr(0, 252) + ", b");
    EXPECT_EQ(rules::cityLine(name.substr(0, 254) + "ö", "c", true), name.substr(0, 254))
        << "no half character";
}

} // namespace
