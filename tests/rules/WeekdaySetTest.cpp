#include "rules/WeekdaySet.h"

#include <map>
#include <string>

#include <gtest/gtest.h>

namespace {

const char* english(const char* id) {
    static const std::map<std::string, const char*> texts = {
        {"IDS_ALM_BODY_EVERYDAY", "Every day"}, {"IDS_CLOCK_SBODY_MON_ABB2", "Mon"},
        {"IDS_CLOCK_SBODY_TUE_ABB2", "Tue"},    {"IDS_CLOCK_SBODY_WED_ABB2", "Wed"},
        {"IDS_CLOCK_SBODY_THU_ABB2", "Thu"},    {"IDS_CLOCK_SBODY_FRI_ABB2", "Fri"},
        {"IDS_CLOCK_SBODY_SAT_ABB2", "Sat"},    {"IDS_CLOCK_SBODY_SUN_ABB2", "Sun"},
    };
    const auto found = texts.find(id);
    return found == texts.end() ? id : found->second;
}

struct SummaryCase {
    int weekdays;
    const char* summary;
};

class WeekdaySummaryTest : public testing::TestWithParam<SummaryCase> {};

TEST_P(WeekdaySummaryTest, NamesTheDaysFromMondayToSunday) {
    EXPECT_EQ(rules::weekdaySummary(GetParam().weekdays, english), GetParam().summary);
}

INSTANTIATE_TEST_SUITE_P(
    Sets, WeekdaySummaryTest,
    testing::Values(SummaryCase{0, ""}, SummaryCase{1, "Sun "}, SummaryCase{2, "Mon "},
                    SummaryCase{3, "Mon Sun "}, SummaryCase{4, "Tue "}, SummaryCase{8, "Wed "},
                    SummaryCase{16, "Thu "}, SummaryCase{32, "Fri "}, SummaryCase{64, "Sat "},
                    SummaryCase{0x41, "Sat Sun "}, SummaryCase{62, "Mon Tue Wed Thu Fri "},
                    SummaryCase{126, "Mon Tue Wed Thu Fri Sat "}, SummaryCase{127, "Every day"},
                    SummaryCase{128, ""}, SummaryCase{129, "Sun "}));

TEST(WeekdaySetTest, AllDaysWithAStrayBitAreListed) {
    EXPECT_EQ(rules::weekdaySummary(255, english), "Mon Tue Wed Thu Fri Sat Sun ");
}

TEST(WeekdaySetTest, ALongNameIsCutWithoutSplittingACharacter) {
    // 62 bytes and then a character of two bytes: it would end at the 64th.
    static const std::string name = std::string(62, 'x') + "äyz";
    const auto translate = [](const char*) {
        return name.c_str();
    };
    EXPECT_EQ(rules::weekdaySummary(2, translate), std::string(62, 'x'));
}

TEST(WeekdaySetTest, ANameOfSixtyTwoBytesKeepsItsBlank) {
    static const std::string name(62, 'x');
    const auto translate = [](const char*) {
        return name.c_str();
    };
    EXPECT_EQ(rules::weekdaySummary(2, translate), name + " ");
}

TEST(WeekdaySetTest, TheTextForEveryDayIsCutAtOneKilobyte) {
    static const std::string text = std::string(1022, 'x') + "ä";
    const auto translate = [](const char*) {
        return text.c_str();
    };
    EXPECT_EQ(rules::weekdaySummary(127, translate), std::string(1022, 'x'));
}

} // namespace
