#include "rules/SaveTime.h"

#include <cstdlib>

#include <gtest/gtest.h>

#include "rules/TimeZoneForTest.h"

namespace {

struct DateCase {
    const char* about;
    int repeatWeekly;
    const char* autoDate; // Null: none.
    bool picked;
    int hour;
    const char* savedDate; // Null: none.
    bool keepsPicked;
    rules::RingDate result;
};

void PrintTo(const DateCase& test, std::ostream* out) {
    *out << test.about;
}

std::int32_t dateOf(const char* day) {
    return day ? static_cast<std::int32_t>(at((std::string(day) + " 00:00:00").c_str())) : 0;
}

class SettleRingDateTest : public testing::TestWithParam<DateCase> {};

TEST_P(SettleRingDateTest, KeepsRepeatAndDateConsistent) {
    const TimeZoneForTest zone("Asia/Tokyo");
    const DateCase& test = GetParam();
    ClockAlarmDbData alarm{};
    alarm.repeatWeekly = test.repeatWeekly;
    alarm.repeatOnce = -1;
    alarm.hour = test.hour;
    alarm.autoDate = dateOf(test.autoDate);
    alarm.manualDate = test.picked ? dateOf("2026-12-24") : 0;
    EXPECT_EQ(rules::settleRingDate(alarm, at("2026-11-18 09:00:00")), test.result);
    EXPECT_EQ(alarm.repeatOnce, test.repeatWeekly == 0 ? 1 : 0);
    EXPECT_EQ(alarm.repeatWeekly, test.repeatWeekly);
    EXPECT_EQ(alarm.autoDate, dateOf(test.savedDate));
    EXPECT_EQ(alarm.manualDate, test.keepsPicked ? dateOf("2026-12-24") : 0);
}

constexpr auto CHOSEN = rules::RingDate::Chosen;
constexpr auto NOT_CHOSEN = rules::RingDate::NotChosen;

INSTANTIATE_TEST_SUITE_P(
    Records, SettleRingDateTest,
    testing::Values(
        DateCase{"weekly", 2, nullptr, false, 7, nullptr, false, NOT_CHOSEN},
        DateCase{"weekly with dates", 2, "2026-12-24", true, 7, nullptr, false, NOT_CHOSEN},
        DateCase{"later today", 0, nullptr, false, 10, "2026-11-18", false, NOT_CHOSEN},
        DateCase{"this very minute", 0, nullptr, false, 9, "2026-11-19", false, NOT_CHOSEN},
        DateCase{"earlier", 0, nullptr, false, 8, "2026-11-19", false, NOT_CHOSEN},
        DateCase{"picked day without a date", 0, nullptr, true, 8, "2026-11-19", false, NOT_CHOSEN},
        DateCase{"picked", 0, "2026-12-24", true, 8, "2026-12-24", true, CHOSEN},
        DateCase{"automatic", 0, "2026-11-20", false, 8, "2026-11-20", false, NOT_CHOSEN}));

struct TimeCase {
    const char* processZone;
    const char* now; // In the alarm's zone.
    const char* zone;
    int hour;
    int minute;
    const char* utc;
};

class AlarmTimeTest : public testing::TestWithParam<TimeCase> {};

TEST_P(AlarmTimeTest, IsTodaysTimeInTheAlarmsZone) {
    const TimeCase& test = GetParam();
    std::time_t now = 0;
    {
        const TimeZoneForTest zone(test.zone);
        now = at(test.now);
    }
    std::time_t result = 0;
    {
        const TimeZoneForTest zone(test.processZone);
        result = rules::alarmTime(test.hour, test.minute, test.zone, now);
    }
    const TimeZoneForTest zone("UTC");
    EXPECT_EQ(civil(result), test.utc);
}

INSTANTIATE_TEST_SUITE_P(
    Days, AlarmTimeTest,
    testing::Values(
        TimeCase{"UTC", "2026-11-18 09:41:20", "UTC", 6, 0, "2026-11-18 06:00:00"},
        TimeCase{"UTC", "2026-11-18 01:00:00", "Asia/Tokyo", 7, 30, "2026-11-17 22:30:00"},
        TimeCase{"Asia/Tokyo", "2026-11-17 23:00:00", "America/New_York", 7, 30,
                 "2026-11-17 12:30:00"},
        // Summer time is in force: the standard hour is another one.
        TimeCase{"UTC", "2026-07-01 12:00:00", "Europe/Berlin", 7, 0, "2026-07-01 05:00:00"},
        // The day on which it begins and the day on which it ends, before and after the change.
        TimeCase{"UTC", "2026-03-29 00:10:00", "Europe/Berlin", 8, 0, "2026-03-29 06:00:00"},
        TimeCase{"UTC", "2026-03-29 12:00:00", "Europe/Berlin", 1, 0, "2026-03-29 00:00:00"},
        TimeCase{"UTC", "2026-10-25 00:10:00", "Europe/Berlin", 8, 0, "2026-10-25 07:00:00"},
        TimeCase{"UTC", "2026-10-25 12:00:00", "Europe/Berlin", 1, 0, "2026-10-24 23:00:00"},
        // 02:30 comes twice: the second one.
        TimeCase{"UTC", "2026-10-25 00:10:00", "Europe/Berlin", 2, 30, "2026-10-25 01:30:00"},
        TimeCase{"UTC", "2026-10-25 12:00:00", "Europe/Berlin", 2, 30, "2026-10-25 01:30:00"}));

TEST(AlarmTimeTest, TheProcesssZoneComesBack) {
    const TimeZoneForTest zone("Asia/Kolkata");
    rules::alarmTime(7, 0, "America/New_York", 0);
    EXPECT_STREQ(std::getenv("TZ"), "Asia/Kolkata");
    EXPECT_EQ(civil(0), "1970-01-01 05:30:00");
}

TEST(AlarmTimeTest, AProcessWithoutAZoneHasNoneAfterwards) {
    const TimeZoneForTest zone(nullptr);
    const std::string before = civil(0);
    rules::alarmTime(7, 0, "Pacific/Kiritimati", 0);
    EXPECT_EQ(std::getenv("TZ"), nullptr);
    EXPECT_EQ(civil(0), before);
}

} // namespace
