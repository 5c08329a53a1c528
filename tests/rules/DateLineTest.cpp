#include "rules/DateLine.h"

#include <string>

#include <gtest/gtest.h>

#include "rules/CatalogueForTest.h"
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

struct UndatedCase {
    int repeatWeekly;
    std::int32_t autoDate;
    bool undated;
};

class UndatedTest : public testing::TestWithParam<UndatedCase> {};

TEST_P(UndatedTest, HasNeitherRepeatDaysNorADate) {
    ClockAlarmDbData alarm{};
    alarm.repeatWeekly = GetParam().repeatWeekly;
    alarm.autoDate = GetParam().autoDate;
    EXPECT_EQ(rules::isUndated(alarm), GetParam().undated);
}

INSTANTIATE_TEST_SUITE_P(Records, UndatedTest,
                         testing::Values(UndatedCase{0, 0, true}, UndatedCase{2, 0, false},
                                         UndatedCase{0, 1000, false},
                                         UndatedCase{127, 1000, false}));

TEST(DateLineTest, RepeatDaysTakeDatesAway) {
    ClockAlarmDbData alarm{};
    alarm.autoDate = alarm.manualDate = 1000;
    alarm.repeatOnce = 1;
    rules::dropDatesOfWeekly(alarm);
    EXPECT_EQ(alarm.autoDate, 1000);
    EXPECT_EQ(alarm.manualDate, 1000);
    alarm.repeatWeekly = 2;
    rules::dropDatesOfWeekly(alarm);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
    EXPECT_EQ(alarm.repeatWeekly, 2);
    EXPECT_EQ(alarm.repeatOnce, 1);
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

struct ZoneCase {
    const char* zone;
    const char* ringDay; // Its midnight.
    int hour;
    int minute;
    const char* now;
    DateLine line;
};

class DateLineZoneTest : public testing::TestWithParam<ZoneCase> {};

TEST_P(DateLineZoneTest, ComparesLocalDaysAndTimes) {
    const ZoneCase& test = GetParam();
    const TimeZoneForTest zone(test.zone);
    EXPECT_EQ(rules::dateLine(rules::localTime(at(test.ringDay)), test.hour, test.minute,
                              rules::localTime(at(test.now))),
              test.line);
}

INSTANTIATE_TEST_SUITE_P(Zones, DateLineZoneTest,
                         testing::Values(
                             // Offsets of half hours and of quarters.
                             ZoneCase{"Asia/Kolkata", "2026-11-19 00:00:00", 0, 0,
                                      "2026-11-18 23:59:59", DateLine::TomorrowAndDate},
                             ZoneCase{"Asia/Kolkata", "2026-11-19 00:00:00", 0, 1,
                                      "2026-11-19 00:00:00", DateLine::TodayAndDate},
                             ZoneCase{"Asia/Kathmandu", "2026-11-18 00:00:00", 23, 59,
                                      "2026-11-18 23:58:00", DateLine::TodayAndDate},
                             ZoneCase{"America/St_Johns", "2026-11-18 00:00:00", 23, 59,
                                      "2026-11-19 00:00:00", DateLine::Past},
                             // The ends of the earth.
                             ZoneCase{"Pacific/Kiritimati", "2027-01-01 00:00:00", 0, 0,
                                      "2026-12-31 23:59:00", DateLine::DateWithYear},
                             ZoneCase{"Pacific/Pago_Pago", "2026-12-31 00:00:00", 23, 59,
                                      "2026-12-31 23:59:00", DateLine::Past},
                             // Days of 23 and of 25 hours.
                             ZoneCase{"Europe/Berlin", "2026-03-29 00:00:00", 2, 30,
                                      "2026-03-29 01:59:59", DateLine::TodayAndDate},
                             ZoneCase{"Europe/Berlin", "2026-03-29 00:00:00", 2, 30,
                                      "2026-03-29 03:00:00", DateLine::Past},
                             ZoneCase{"Europe/Berlin", "2026-03-30 00:00:00", 2, 30,
                                      "2026-03-29 03:00:00", DateLine::TomorrowAndDate},
                             ZoneCase{"Europe/Berlin", "2026-10-26 00:00:00", 7, 0,
                                      "2026-10-25 00:30:00", DateLine::TomorrowAndDate},
                             ZoneCase{"Australia/Lord_Howe", "2026-10-04 00:00:00", 2, 15,
                                      "2026-10-04 02:30:00", DateLine::Past},
                             // A day that begins at one o'clock.
                             ZoneCase{"Asia/Beirut", "2026-03-29 01:00:00", 7, 0,
                                      "2026-03-28 12:00:00", DateLine::TomorrowAndDate}));

struct BeforeCase {
    const char* day;
    const char* today;
    bool before;
};

class IsBeforeDayTest : public testing::TestWithParam<BeforeCase> {};

TEST_P(IsBeforeDayTest, LooksAtTheDayAlone) {
    const TimeZoneForTest zone("Europe/Berlin");
    EXPECT_EQ(rules::isBeforeDay(rules::localTime(at(GetParam().day)),
                                 rules::localTime(at(GetParam().today))),
              GetParam().before);
}

INSTANTIATE_TEST_SUITE_P(
    Days, IsBeforeDayTest,
    testing::Values(BeforeCase{"2026-11-18 00:00:00", "2026-11-18 23:59:59", false},
                    BeforeCase{"2026-11-18 23:59:59", "2026-11-18 00:00:00", false},
                    BeforeCase{"2026-11-17 23:59:59", "2026-11-18 00:00:00", true},
                    BeforeCase{"2026-11-19 00:00:00", "2026-11-18 23:59:59", false},
                    // A smaller day in a later month, a smaller month in a later year.
                    BeforeCase{"2026-12-01 00:00:00", "2026-11-30 00:00:00", false},
                    BeforeCase{"2027-01-01 00:00:00", "2026-12-31 23:59:00", false},
                    BeforeCase{"2026-10-31 00:00:00", "2026-11-01 00:00:00", true},
                    BeforeCase{"2025-12-31 23:59:00", "2026-01-01 00:00:00", true},
                    BeforeCase{"2028-02-29 12:00:00", "2028-03-01 00:00:00", true},
                    BeforeCase{"2026-03-29 03:00:00", "2026-03-29 01:59:59", false},
                    BeforeCase{"2026-10-25 00:30:00", "2026-10-25 23:30:00", false}));

TEST(PickedDateTest, MakesAOneTimeAlarmOnThatDay) {
    ClockAlarmDbData alarm{};
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 127;
    alarm.hour = 7;
    rules::setPickedDate(alarm, 1795042800);
    EXPECT_EQ(alarm.autoDate, 1795042800);
    EXPECT_EQ(alarm.manualDate, 1795042800);
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_EQ(alarm.hour, 7);
}

TEST(PickedDateTest, NoDayTakesBackAnEarlierOne) {
    ClockAlarmDbData alarm{};
    alarm.autoDate = alarm.manualDate = 1795042800;
    alarm.repeatWeekly = 2;
    rules::setPickedDate(alarm, 0);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.repeatWeekly, 0);
}

TEST(PickedDateTest, TheLastDayOfTheCalendarFits) {
    const TimeZoneForTest zone("Pacific/Pago_Pago");
    ClockAlarmDbData alarm{};
    rules::setPickedDate(alarm, at("2030-12-31 00:00:00"));
    EXPECT_EQ(civil(alarm.manualDate), "2030-12-31 00:00:00");
}

class DateLineTextTest : public testing::Test {
protected:
    static std::time_t day() { return at("2026-11-18 00:00:00"); }

    const TimeZoneForTest zone{"Asia/Kolkata"};
};

TEST_F(DateLineTextTest, HasAWordOrAYearOrNone) {
    const CatalogueForTest english(
        "en", {{"IDS_CLOCK_BODY_TODAY", "Today"}, {"IDS_CLOCK_BODY_TOMORROW", "Tomorrow"}});
    EXPECT_EQ(rules::dateLineText(DateLine::TodayAndDate, day()), "Today - Wed, Nov 18");
    EXPECT_EQ(rules::dateLineText(DateLine::TomorrowAndDate, day()), "Tomorrow - Wed, Nov 18");
    EXPECT_EQ(rules::dateLineText(DateLine::Date, day()), "Wed, Nov 18");
    EXPECT_EQ(rules::dateLineText(DateLine::DateWithYear, day()), "Wed, Nov 18, 2026");
    EXPECT_EQ(rules::dateLineText(DateLine::Past, day()), "");
}

TEST_F(DateLineTextTest, SpeaksTheCurrentLanguage) {
    const CatalogueForTest german("de", {{"IDS_CLOCK_BODY_TODAY", "Heute"}});
    EXPECT_EQ(rules::dateLineText(DateLine::TodayAndDate, day()), "Heute - Mi., 18. Nov.");
    EXPECT_EQ(rules::dateLineText(DateLine::DateWithYear, day()), "Mi., 18. Nov. 2026");
}

TEST_F(DateLineTextTest, IsCutAtTheLengthAskedFor) {
    const CatalogueForTest wordy("en", {{"IDS_CLOCK_BODY_TODAY", std::string(510, 'x') + "ä"},
                                        {"IDS_CLOCK_BODY_TOMORROW", std::string(1022, 'x') + "ä"}});
    EXPECT_EQ(rules::dateLineText(DateLine::TodayAndDate, day()), std::string(510, 'x'));
    EXPECT_EQ(rules::dateLineText(DateLine::TodayAndDate, day(), 1023),
              std::string(510, 'x') + "ä - Wed, Nov 18");
    EXPECT_EQ(rules::dateLineText(DateLine::TomorrowAndDate, day(), 1023), std::string(1022, 'x'));
}

TEST_F(DateLineTextTest, ATranslationIsNoFormat) {
    const CatalogueForTest hostile("en", {{"IDS_CLOCK_BODY_TODAY", "%n%s"}});
    EXPECT_EQ(rules::dateLineText(DateLine::TodayAndDate, day()), "%n%s - Wed, Nov 18");
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
