#include "rules/ToneName.h"

#include <cstdint>
#include <limits>
#include <string>

#include <gtest/gtest.h>

namespace {

struct NameCase {
    const char* path;
    const char* name;
};

class ToneNameTest : public testing::TestWithParam<NameCase> {};

TEST_P(ToneNameTest, IsTheFileNameWithoutFolderAndExtension) {
    EXPECT_EQ(rules::toneFileName(GetParam().path), GetParam().name);
}

INSTANTIATE_TEST_SUITE_P(
    Paths, ToneNameTest,
    testing::Values(NameCase{"/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg",
                             "Alarm_Impatient"},
                    NameCase{"/x/a.b.c.ogg", "a.b.c"}, NameCase{"/a.b/c", "c"},
                    NameCase{"/tones/Bells", "Bells"}, NameCase{"tones/Bells.ogg", "Bells"},
                    NameCase{"Bells.ogg", "Bells"}, NameCase{"Bells", "Bells"},
                    NameCase{"/tones/über.ogg", "über"}));

// The first character is never a separator.
INSTANTIATE_TEST_SUITE_P(
    FirstCharacters, ToneNameTest,
    testing::Values(NameCase{"/Alarm.ogg", "/Alarm"}, NameCase{"/", "/"}, NameCase{".ogg", ".ogg"},
                    NameCase{"/x/.hidden", ".hidden"}, NameCase{"/x/.hidden.ogg", ".hidden"},
                    NameCase{"/.ogg", "/"}, NameCase{"a/b", "b"}, NameCase{"//b", "b"},
                    NameCase{".", "."}, NameCase{"..", "."}, NameCase{"a.", "a"}));

INSTANTIATE_TEST_SUITE_P(Nothing, ToneNameTest,
                         testing::Values(NameCase{"", ""}, NameCase{"/x/", ""}, NameCase{"//", ""},
                                         NameCase{"a.ogg/", ""}));

TEST(ToneNameLimit, TheFileNameIsCutBeforeItsExtensionIsLookedFor) {
    const std::string longest(511, 'a');
    EXPECT_EQ(rules::toneFileName("/x/" + longest), longest);
    EXPECT_EQ(rules::toneFileName("/x/" + longest + "a"), longest);
    EXPECT_EQ(rules::toneFileName("/x/" + longest + ".ogg"), longest);
    const std::string shorter(510, 'a');
    EXPECT_EQ(rules::toneFileName("/x/" + shorter + ".ogg"), shorter);
    EXPECT_EQ(rules::toneFileName("/x/a." + longest), "a");
}

TEST(ToneNameLimit, AFolderMayBeLonger) {
    EXPECT_EQ(rules::toneFileName("/" + std::string(3000, 'f') + "/Bells.ogg"), "Bells");
}

TEST(ToneNameLimit, ACutLeavesWholeCharacters) {
    const std::string almost(510, 'a');
    EXPECT_EQ(rules::toneFileName("/x/" + almost + "ä"), almost);
    EXPECT_EQ(rules::toneFileName("/x/" + std::string(509, 'a') + "ä"),
              std::string(509, 'a') + "ä");
}

struct PositionCase {
    const char* text;
    std::int32_t position;
};

class TonePositionTest : public testing::TestWithParam<PositionCase> {};

TEST_P(TonePositionTest, IsTheNumberAtTheBeginning) {
    EXPECT_EQ(rules::tonePosition(GetParam().text), GetParam().position);
}

INSTANTIATE_TEST_SUITE_P(Numbers, TonePositionTest,
                         testing::Values(PositionCase{"0", 0}, PositionCase{"12", 12},
                                         PositionCase{" 12", 12}, PositionCase{"12abc", 12},
                                         PositionCase{"+4", 4}, PositionCase{"-3", -3},
                                         PositionCase{"010", 10}, PositionCase{"3.9", 3}));

INSTANTIATE_TEST_SUITE_P(NoNumbers, TonePositionTest,
                         testing::Values(PositionCase{"", 0}, PositionCase{"abc", 0},
                                         PositionCase{"0x10", 0}, PositionCase{"-", 0},
                                         PositionCase{"%n", 0}, PositionCase{"a12", 0}));

constexpr std::int32_t LEAST = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t MOST = std::numeric_limits<std::int32_t>::max();

INSTANTIATE_TEST_SUITE_P(
    Limits, TonePositionTest,
    testing::Values(PositionCase{"2147483647", MOST}, PositionCase{"2147483648", MOST},
                    PositionCase{"4294967296", MOST}, PositionCase{"99999999999999999999", MOST},
                    PositionCase{"-2147483648", LEAST}, PositionCase{"-2147483649", LEAST},
                    PositionCase{"-99999999999999999999", LEAST}));

} // namespace
