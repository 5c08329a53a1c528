#include "rules/RingDay.h"

#include <gtest/gtest.h>

#include "rules/TimeZoneForTest.h"

namespace {

struct RingCase {
    const char* zone;
    const char* now;
    int hour;
    int minute;
    bool today;
    const char* midnight;
};

class RingDayTest : public testing::TestWithParam<RingCase> {};

TEST_P(RingDayTest, IsTodayWhenTheTimeIsStillToCome) {
    const RingCase& ring = GetParam();
    const TimeZoneForTest zone(ring.zone);
    const rules::RingDay day = rules::ringDay(ring.hour, ring.minute, at(ring.now));
    EXPECT_EQ(day.today, ring.today);
    EXPECT_EQ(civil(day.midnight), ring.midnight);
    EXPECT_EQ(day.midnight, at(ring.midnight));
    std::tm copy = day.day;
    EXPECT_EQ(copy.tm_hour, 0);
    EXPECT_EQ(std::mktime(&copy), day.midnight) << "the broken-down day is another one";
}

INSTANTIATE_TEST_SUITE_P(
    Moments, RingDayTest,
    testing::Values(
        RingCase{"UTC", "2026-11-18 07:00:00", 7, 0, false, "2026-11-19 00:00:00"},
        RingCase{"UTC", "2026-11-18 07:00:59", 7, 0, false, "2026-11-19 00:00:00"},
        RingCase{"UTC", "2026-11-18 06:59:59", 7, 0, true, "2026-11-18 00:00:00"},
        RingCase{"UTC", "2026-11-18 07:00:00", 7, 1, true, "2026-11-18 00:00:00"},
        RingCase{"UTC", "2026-11-18 07:30:00", 8, 0, true, "2026-11-18 00:00:00"},
        RingCase{"UTC", "2026-11-18 07:30:00", 6, 59, false, "2026-11-19 00:00:00"},
        RingCase{"UTC", "2026-11-30 23:00:00", 6, 0, false, "2026-12-01 00:00:00"},
        RingCase{"UTC", "2026-12-31 23:59:00", 0, 0, false, "2027-01-01 00:00:00"},
        RingCase{"UTC", "2028-02-28 12:00:00", 6, 0, false, "2028-02-29 00:00:00"},
        RingCase{"Asia/Kolkata", "2026-11-18 00:00:00", 0, 0, false, "2026-11-19 00:00:00"},
        // Days of 23 and 25 hours.
        RingCase{"Europe/Berlin", "2026-03-28 12:00:00", 6, 0, false, "2026-03-29 00:00:00"},
        RingCase{"Europe/Berlin", "2026-03-29 12:00:00", 6, 0, false, "2026-03-30 00:00:00"},
        RingCase{"Europe/Berlin", "2026-10-25 12:00:00", 6, 0, false, "2026-10-26 00:00:00"},
        // 86400 seconds after half past midnight, a day of 25 hours is not over yet.
        RingCase{"Europe/Berlin", "2026-10-25 00:30:00", 0, 10, false, "2026-10-25 00:00:00"},
        // ... and late in the evening before a day of 23 hours, it is over already.
        RingCase{"Europe/Berlin", "2026-03-28 23:30:00", 6, 0, false, "2026-03-30 00:00:00"}));

TEST(RingDayTest, ADayWithoutMidnightBeginsAtItsFirstInstant) {
    // In this zone summer time skips the hour after midnight.
    const TimeZoneForTest zone("Asia/Beirut");
    const rules::RingDay day = rules::ringDay(6, 0, at("2026-03-28 12:00:00"));
    EXPECT_FALSE(day.today);
    EXPECT_EQ(civil(day.midnight), "2026-03-29 01:00:00");
    EXPECT_EQ(day.day.tm_mday, 29);
}

struct SecondsCase {
    const char* now;
    int seconds;
};

class NextMinuteTest : public testing::TestWithParam<SecondsCase> {};

TEST_P(NextMinuteTest, IsReachedAfterTheRestOfThisOne) {
    const TimeZoneForTest zone("UTC");
    EXPECT_EQ(rules::secondsToNextMinute(at(GetParam().now)), GetParam().seconds);
}

INSTANTIATE_TEST_SUITE_P(Moments, NextMinuteTest,
                         testing::Values(SecondsCase{"2026-11-18 07:00:00", 60},
                                         SecondsCase{"2026-11-18 07:00:01", 59},
                                         SecondsCase{"2026-11-18 07:00:59", 1}));

TEST(OneDayLaterTest, KeepsTheTimeOfDay) {
    const TimeZoneForTest zone("UTC");
    const std::tm later = rules::oneDayLater(at("2026-12-31 21:15:42"));
    EXPECT_EQ(later.tm_year, 127);
    EXPECT_EQ(later.tm_mon, 0);
    EXPECT_EQ(later.tm_mday, 1);
    EXPECT_EQ(later.tm_hour, 21);
    EXPECT_EQ(later.tm_min, 15);
    EXPECT_EQ(later.tm_sec, 42);
}

} // namespace
