#include "rules/DateLine.h"

#include <string>

#include <gtest/gtest.h>

#include "rules/RingDay.h"
#include "rules/TimeZoneForTest.h"

namespace {

using rules::DateLine;

struct LineCase {
    const char* ringDay;
    int hour;
    int minute;
    const char* now;
    DateLine line;
};

class DateLineTest : public testing::TestWithParam<LineCase> {};

TEST_P(DateLineTest, DependsOnTheDaysAndOnTheTime) {
    const LineCase& test = GetParam();
    const TimeZoneForTest zone("Europe/Berlin");
    const std::string midnight = std::string(test.ringDay) + " 00:00:00";
    EXPECT_EQ(rules::dateLine(rules::localTime(at(midnight.c_str())), test.hour, test.minute,
                              rules::localTime(at(test.now))),
              test.line);
}

INSTANTIATE_TEST_SUITE_P(
    Days, DateLineTest,
    testing::Values(
        // Years.
        LineCase{"2027-01-01", 7, 0, "2026-12-31 12:00:00", DateLine::DateWithYear},
        LineCase{"2027-11-18", 7, 0, "2026-11-18 06:00:00", DateLine::DateWithYear},
        LineCase{"2025-12-31", 7, 0, "2026-01-01 06:00:00", DateLine::Past},
        // Months: tomorrow is only called so within a month.
        LineCase{"2026-12-01", 7, 0, "2026-11-30 12:00:00", DateLine::Date},
        LineCase{"2026-12-24", 7, 0, "2026-11-30 12:00:00", DateLine::Date},
        LineCase{"2026-10-31", 7, 0, "2026-11-01 06:00:00", DateLine::Past},
        LineCase{"2026-10-20", 7, 0, "2026-11-18 06:00:00", DateLine::Past},
        // Days.
        LineCase{"2026-11-19", 7, 0, "2026-11-18 12:00:00", DateLine::TomorrowAndDate},
        LineCase{"2026-11-20", 7, 0, "2026-11-18 12:00:00", DateLine::Date},
        LineCase{"2026-11-30", 7, 0, "2026-11-18 12:00:00", DateLine::Date},
        LineCase{"2026-11-17", 23, 59, "2026-11-18 12:00:00", DateLine::Past},
        // Today.
        LineCase{"2026-11-18", 13, 0, "2026-11-18 12:59:59", DateLine::TodayAndDate},
        LineCase{"2026-11-18", 12, 31, "2026-11-18 12:30:59", DateLine::TodayAndDate},
        LineCase{"2026-11-18", 12, 30, "2026-11-18 12:30:00", DateLine::Past},
        LineCase{"2026-11-18", 12, 29, "2026-11-18 12:30:00", DateLine::Past},
        LineCase{"2026-11-18", 11, 59, "2026-11-18 12:00:00", DateLine::Past}));

TEST(DateLineTest, ADayThatIsOverMakesAOneTimeAlarmWithoutDates) {
    ClockAlarmDbData alarm{};
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 3;
    alarm.autoDate = 1000;
    alarm.manualDate = 1000;
    rules::clearPastDate(alarm);
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
}

TEST(DateLineTest, AWordAndADateAreJoinedByADash) {
    EXPECT_EQ(rules::wordAndDate("Today", "Wed, Nov 18"), "Today - Wed, Nov 18");
    EXPECT_EQ(rules::wordAndDate("Today", ""), "Today - ");
}

TEST(DateLineTest, ALongLineIsCutWithoutSplittingACharacter) {
    EXPECT_EQ(rules::wordAndDate(std::string(507, 'x'), "ä"), std::string(507, 'x') + " - ");
    EXPECT_EQ(rules::wordAndDate(std::string(506, 'x'), "ä"), std::string(506, 'x') + " - ä");
    EXPECT_EQ(rules::wordAndDate(std::string(2000, 'x'), "y", 1023), std::string(1023, 'x'));
}

TEST(DateTextTest, WritesADayInTheCurrentZone) {
    const TimeZoneForTest zone("Pacific/Auckland");
    const std::time_t day = at("2026-11-18 00:00:00");
    EXPECT_EQ(rules::dateText(day), "Wed, Nov 18");
    EXPECT_EQ(rules::dateText(day, rules::DAY_AND_YEAR_SKELETON), "Wed, Nov 18, 2026");
}

TEST(CurrentTimeZoneTest, IsThatOfTheProcess) {
    const TimeZoneForTest zone("Asia/Seoul");
    EXPECT_EQ(rules::currentTimeZone(), "Asia/Seoul");
}

} // namespace
