#include "rules/Explanation.h"

#include <string>

#include <gtest/gtest.h>

#include "rules/CatalogueForTest.h"

namespace {

constexpr const char* SNOOZE =
    "IDS_CLOCK_SBODY_SOUND_THE_ALARM_P1SD_TIMES_AT_P2SD_MINUTE_INTERVALS";
constexpr const char* RISING = "IDS_CLOCK_SBODY_INCREASE_THE_ALARM_VOLUME_FOR_THE_FIRST_PD_SECONDS";

std::string snoozeText(const std::string& translation, int times = 3, int minutes = 5) {
    const CatalogueForTest catalogue("xx", {{SNOOZE, translation}});
    return rules::snoozeExplanation(times, minutes);
}

std::string risingText(const std::string& translation) {
    const CatalogueForTest catalogue("xx", {{RISING, translation}});
    return rules::increaseVolumeExplanation();
}

TEST(ExplanationTest, SnoozeTellsTheNumberOfTimesAndThenTheMinutes) {
    EXPECT_EQ(snoozeText("%d times, %d min"), "3 times, 5 min");
    EXPECT_EQ(snoozeText("%1$d times, %2$d min"), "3 times, 5 min");
}

TEST(ExplanationTest, ALanguageMayTurnTheTwoNumbersAround) {
    EXPECT_EQ(snoozeText("every %2$d min, %1$d times"), "every 5 min, 3 times");
}

TEST(ExplanationTest, SnoozeTakesWhatTheRecordHolds) {
    EXPECT_EQ(snoozeText("%d/%d", 0, 0), "0/0");
    EXPECT_EQ(snoozeText("%d/%d", -1, 2147483647), "-1/2147483647");
}

TEST(ExplanationTest, RisingTakesSixtySeconds) {
    EXPECT_EQ(risingText("for %d s"), "for 60 s");
    EXPECT_EQ(risingText("for %1$d s, 100 %%"), "for 60 s, 100 %");
}

TEST(ExplanationTest, WithoutATranslationTheIdentifierIsShown) {
    const CatalogueForTest catalogue("xx", {});
    EXPECT_EQ(rules::snoozeExplanation(3, 5), SNOOZE);
    EXPECT_EQ(rules::increaseVolumeExplanation(), RISING);
}

class HostileExplanationTest : public testing::TestWithParam<const char*> {};

TEST_P(HostileExplanationTest, IsShownAsItIs) {
    EXPECT_EQ(snoozeText(GetParam()), GetParam());
    EXPECT_EQ(risingText(GetParam()), GetParam());
}

INSTANTIATE_TEST_SUITE_P(Formats, HostileExplanationTest,
                         testing::Values("%n", "%s", "%s%s", "%n%n", "%d%n", "%d%s", "%d %d %d",
                                         "%*d", "%*d%d", "%3$d", "%1$s %2$s", "%99999999999$d",
                                         "%p %p", "%", "%d%", "%ld%ld", "%.*s", "%f %f",
                                         "no number"));

TEST(ExplanationTest, AnEmptyTranslationLeavesNoText) {
    EXPECT_EQ(snoozeText(""), "");
    EXPECT_EQ(risingText(""), "");
}

TEST(ExplanationTest, TheTranslationIsCutAtOneKilobyte) {
    const std::string start = "%d %d";
    EXPECT_EQ(snoozeText(start + std::string(2000, 'x')), "3 5" + std::string(1023 - 5, 'x'));
}

TEST(ExplanationTest, TheTextIsCutAtOneKilobyte) {
    EXPECT_EQ(snoozeText("%d %d" + std::string(1018, 'x'), 1234567890, 1234567890),
              "1234567890 1234567890" + std::string(1023 - 21, 'x'));
}

TEST(ExplanationTest, ACutNeverSplitsACharacter) {
    // The first half of the last character would be byte 1023.
    EXPECT_EQ(risingText("%d" + std::string(1020, 'x') + "ä"), "60" + std::string(1020, 'x'));
}

TEST(ExplanationTest, APlaceholderThatTheCutRemovesLeavesTheRestAsItIs) {
    const std::string filling(1022, 'x');
    EXPECT_EQ(risingText(filling + "%d"), filling + "%");
}

} // namespace
