#include "base/CivilTime.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <limits>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "rules/TimeZoneForTest.h"

namespace {

base::CivilTime reading(const char* text) {
    base::CivilTime time;
    std::sscanf(text, "%d-%d-%d %d:%d:%d", &time.date.year, &time.date.month, &time.date.day,
                &time.hour, &time.minute, &time.second);
    return time;
}

std::string written(const base::CivilTime& time) {
    char text[80];
    std::snprintf(text, sizeof text, "%04d-%02d-%02d %02d:%02d:%02d", time.date.year,
                  time.date.month, time.date.day, time.hour, time.minute, time.second);
    return text;
}

std::int64_t utc(const char* text) {
    return base::toInstant(reading(text), "UTC");
}

// --- Dates ---------------------------------------------------------------------------------

TEST(BaseDays, AddedToADateCrossMonthsYearsAndLeapDays) {
    EXPECT_EQ(base::addDays({2026, 12, 31}, 1), (base::CivilDate{2027, 1, 1}));
    EXPECT_EQ(base::addDays({2027, 1, 1}, -1), (base::CivilDate{2026, 12, 31}));
    EXPECT_EQ(base::addDays({2028, 2, 28}, 1), (base::CivilDate{2028, 2, 29}));
    EXPECT_EQ(base::addDays({2100, 2, 28}, 1), (base::CivilDate{2100, 3, 1}));
    EXPECT_EQ(base::addDays({2000, 2, 28}, 2), (base::CivilDate{2000, 3, 1}));
}

TEST(BaseDays, KnowTheirWeekday) {
    EXPECT_EQ(base::weekdayOf({2026, 11, 20}), 5); // a Friday
    EXPECT_EQ(base::weekdayOf({2026, 11, 22}), 0); // a Sunday
    EXPECT_EQ(base::weekdayOf({1969, 12, 31}), 3); // a Wednesday
    EXPECT_EQ(base::weekdayOf({1600, 2, 29}), 2);  // a Tuesday
}

// --- Wall clock readings and instants ------------------------------------------------------

struct InstantCase {
    const char* zone;
    const char* civil;
    const char* inUtc;
};

class BaseToInstantTest : public testing::TestWithParam<InstantCase> {};

TEST_P(BaseToInstantTest, IsTheFirstMomentAtWhichTheClockShowsOrPassesTheReading) {
    const InstantCase& c = GetParam();
    EXPECT_EQ(written(base::toCivil(base::toInstant(reading(c.civil), c.zone), "UTC")), c.inUtc)
        << c.zone << " " << c.civil;
}

INSTANTIATE_TEST_SUITE_P(
    Zones, BaseToInstantTest,
    testing::Values(
        InstantCase{"UTC", "2026-11-20 07:30:00", "2026-11-20 07:30:00"},
        InstantCase{"Asia/Kolkata", "2026-11-20 07:30:00", "2026-11-20 02:00:00"},
        InstantCase{"Asia/Kathmandu", "2026-11-20 07:30:00", "2026-11-20 01:45:00"},
        InstantCase{"Europe/Berlin", "2026-03-29 01:59:59", "2026-03-29 00:59:59"},
        // 02:00 to 03:00 is skipped: all of it gives 03:00.
        InstantCase{"Europe/Berlin", "2026-03-29 02:00:00", "2026-03-29 01:00:00"},
        InstantCase{"Europe/Berlin", "2026-03-29 02:30:00", "2026-03-29 01:00:00"},
        InstantCase{"Europe/Berlin", "2026-03-29 02:59:59", "2026-03-29 01:00:00"},
        InstantCase{"Europe/Berlin", "2026-03-29 03:00:00", "2026-03-29 01:00:00"},
        InstantCase{"Europe/Berlin", "2026-03-29 03:30:00", "2026-03-29 01:30:00"},
        // 02:00 to 03:00 occurs twice: the first one counts.
        InstantCase{"Europe/Berlin", "2026-10-25 01:59:59", "2026-10-24 23:59:59"},
        InstantCase{"Europe/Berlin", "2026-10-25 02:00:00", "2026-10-25 00:00:00"},
        InstantCase{"Europe/Berlin", "2026-10-25 02:30:00", "2026-10-25 00:30:00"},
        InstantCase{"Europe/Berlin", "2026-10-25 03:00:00", "2026-10-25 02:00:00"},
        // Half an hour is skipped and repeated.
        InstantCase{"Australia/Lord_Howe", "2026-10-04 02:15:00", "2026-10-03 15:30:00"},
        InstantCase{"Australia/Lord_Howe", "2026-10-04 02:30:00", "2026-10-03 15:30:00"},
        InstantCase{"Australia/Lord_Howe", "2026-04-05 01:45:00", "2026-04-04 14:45:00"},
        InstantCase{"America/New_York", "2026-03-08 02:30:00", "2026-03-08 07:00:00"},
        InstantCase{"America/New_York", "2026-11-01 01:30:00", "2026-11-01 05:30:00"},
        InstantCase{"America/New_York", "2026-12-31 23:59:00", "2027-01-01 04:59:00"},
        // Midnight itself is skipped.
        InstantCase{"Asia/Beirut", "2026-03-29 00:00:00", "2026-03-28 22:00:00"},
        // A whole day is skipped.
        InstantCase{"Pacific/Apia", "2011-12-30 07:00:00", "2011-12-30 10:00:00"},
        // Rules of the last years: no summer time in Mexico, summer time in Egypt.
        InstantCase{"America/Mexico_City", "2026-07-01 07:00:00", "2026-07-01 13:00:00"},
        InstantCase{"Africa/Cairo", "2026-07-01 07:00:00", "2026-07-01 04:00:00"},
        // Summer time is the standard of Ireland and winter time the exception.
        InstantCase{"Europe/Dublin", "2026-07-01 07:00:00", "2026-07-01 06:00:00"},
        InstantCase{"Europe/Dublin", "2026-01-01 07:00:00", "2026-01-01 07:00:00"},
        InstantCase{"America/New_York", "1776-07-04 12:00:00", "1776-07-04 16:56:02"},
        InstantCase{"EST5EDT", "2026-07-01 12:00:00", "2026-07-01 16:00:00"}));

// The C library is asked about the same instants; the two must never disagree.
TEST(BaseToCivil, AgreesWithTheCLibraryInEveryTimeZone) {
    std::ifstream table("/usr/share/zoneinfo/tzdata.zi");
    ASSERT_TRUE(table) << "no list of time zones";
    std::vector<std::string> zones;
    for (std::string line; std::getline(table, line);)
        if (line.starts_with("Z "))
            zones.push_back(line.substr(2, line.find(' ', 2) - 2));
    ASSERT_GT(zones.size(), 300U);
    for (const auto& id : zones) {
        const TimeZoneForTest zone(id.c_str());
        // From 1930 until records run out of seconds in 2038, at no regular time of day.
        for (std::time_t instant = -1262304000; instant < 2147483647; instant += 3234577) {
            std::tm expected{};
            localtime_r(&instant, &expected);
            ASSERT_EQ(base::utcOffset(instant, id), expected.tm_gmtoff) << id << " " << instant;
            const auto civil = base::toCivil(instant, id);
            ASSERT_EQ(civil.hour, expected.tm_hour) << id << " " << instant;
            ASSERT_EQ(civil.date.day, expected.tm_mday) << id << " " << instant;
            ASSERT_LE(base::toInstant(civil, id), instant) << id;
            ASSERT_EQ(base::toCivil(base::toInstant(civil, id), id), civil) << id;
        }
    }
}

TEST(BaseToCivil, SurvivesTheEndsOfTheRange) {
    for (const auto instant :
         {std::numeric_limits<std::int64_t>::min(), std::numeric_limits<std::int64_t>::max()}) {
        const auto civil = base::toCivil(instant, "Europe/Berlin");
        EXPECT_GE(civil.date.month, 1);
        EXPECT_LE(civil.date.month, 12);
    }
    EXPECT_LT(base::toInstant({{-2000000000, 1, 1}, 0, 0, 0}, "Europe/Berlin"),
              base::toInstant({{2000000000, 12, 31}, 23, 59, 59}, "Europe/Berlin"));
}

// --- Time zones ----------------------------------------------------------------------------

struct ZoneCase {
    const char* variable;
    const char* id;
};

class BaseCurrentZoneTest : public testing::TestWithParam<ZoneCase> {};

TEST_P(BaseCurrentZoneTest, ComesFromTheEnvironment) {
    const TimeZoneForTest zone(GetParam().variable);
    EXPECT_EQ(base::currentTimeZone(), GetParam().id);
}

INSTANTIATE_TEST_SUITE_P(
    Forms, BaseCurrentZoneTest,
    testing::Values(ZoneCase{"Europe/Berlin", "Europe/Berlin"},
                    ZoneCase{":Asia/Kolkata", "Asia/Kolkata"},
                    ZoneCase{"/usr/share/zoneinfo/America/New_York", "America/New_York"},
                    ZoneCase{":/usr/share/zoneinfo/right/Asia/Tokyo", "Asia/Tokyo"},
                    ZoneCase{"posix/Asia/Tokyo", "Asia/Tokyo"},
                    ZoneCase{"CET-1CEST,M3.5.0,M10.5.0/3", "UTC"},
                    ZoneCase{"Mars/Olympus_Mons", "UTC"}, ZoneCase{"", "UTC"},
                    ZoneCase{"../../../etc/passwd", "UTC"}));

TEST(BaseCurrentZone, WithoutAVariableIsThatOfTheSystem) {
    const TimeZoneForTest zone(nullptr);
    const auto id = base::currentTimeZone();
    EXPECT_TRUE(base::isTimeZone(id)) << id;
    const auto now = std::time(nullptr);
    std::tm local{};
    localtime_r(&now, &local);
    EXPECT_EQ(base::utcOffset(now, id), local.tm_gmtoff);
}

TEST(BaseTimeZone, OfAnUnknownNameIsTheCurrentOne) {
    const TimeZoneForTest zone("Asia/Kolkata");
    EXPECT_FALSE(base::isTimeZone("Mars/Olympus_Mons"));
    EXPECT_FALSE(base::isTimeZone(""));
    EXPECT_EQ(base::utcOffset(0, "Mars/Olympus_Mons"), 19800);
}

// --- The next ring -------------------------------------------------------------------------

enum Weekdays { SUN = 1, MON = 2, TUE = 4, WED = 8, THU = 16, FRI = 32, SAT = 64, DAILY = 127 };
constexpr int WORKDAYS = MON | TUE | WED | THU | FRI;

struct RingCase {
    const char* zone;
    const char* now;
    int hour;
    int minute;
    int weekdays;
    const char* date; // of a one-time alarm, or null
    const char* ring; // in the zone; null = never
};

class BaseNextRingTest : public testing::TestWithParam<RingCase> {};

TEST_P(BaseNextRingTest, IsTheFirstStrictlyAfterNow) {
    const RingCase& c = GetParam();
    base::RingRule rule{c.hour, c.minute, c.weekdays, std::nullopt};
    if (c.date)
        rule.date = reading(c.date).date;
    const auto now = base::toInstant(reading(c.now), c.zone);
    const auto ring = base::nextRing(rule, now, c.zone);
    ASSERT_EQ(ring.has_value(), c.ring != nullptr);
    if (!ring)
        return;
    EXPECT_EQ(written(base::toCivil(*ring, c.zone)), c.ring) << c.zone << " " << c.now;
    EXPECT_GT(*ring, now);
}

INSTANTIATE_TEST_SUITE_P(
    OneTime, BaseNextRingTest,
    testing::Values(
        RingCase{"UTC", "2026-11-20 06:00:00", 7, 30, 0, nullptr, "2026-11-20 07:30:00"},
        RingCase{"UTC", "2026-11-20 07:29:59", 7, 30, 0, nullptr, "2026-11-20 07:30:00"},
        RingCase{"UTC", "2026-11-20 07:30:00", 7, 30, 0, nullptr, "2026-11-21 07:30:00"},
        RingCase{"UTC", "2026-12-31 23:59:00", 23, 59, 0, nullptr, "2027-01-01 23:59:00"},
        RingCase{"UTC", "2026-12-31 23:59:00", 0, 0, 0, nullptr, "2027-01-01 00:00:00"},
        RingCase{"UTC", "2026-11-20 06:00:00", 7, 30, 0, "2026-11-25", "2026-11-25 07:30:00"},
        RingCase{"UTC", "2026-11-20 06:00:00", 7, 30, 0, "2026-11-20", "2026-11-20 07:30:00"},
        RingCase{"UTC", "2026-11-20 07:30:00", 7, 30, 0, "2026-11-20", nullptr},
        RingCase{"UTC", "2026-11-20 06:00:00", 7, 30, 0, "2026-11-19", nullptr},
        RingCase{"Europe/Berlin", "2026-03-28 12:00:00", 2, 30, 0, nullptr, "2026-03-29 03:00:00"},
        RingCase{"Europe/Berlin", "2026-03-29 01:00:00", 2, 30, 0, "2026-03-29",
                 "2026-03-29 03:00:00"},
        RingCase{"Europe/Berlin", "2026-03-29 03:00:00", 2, 30, 0, "2026-03-29", nullptr}));

INSTANTIATE_TEST_SUITE_P(
    Weekly, BaseNextRingTest,
    testing::Values(
        // 20 November 2026 is a Friday.
        RingCase{"UTC", "2026-11-20 06:00:00", 7, 30, FRI, nullptr, "2026-11-20 07:30:00"},
        RingCase{"UTC", "2026-11-20 07:30:00", 7, 30, FRI, nullptr, "2026-11-27 07:30:00"},
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, WORKDAYS, nullptr, "2026-11-23 07:30:00"},
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, SAT | SUN, nullptr, "2026-11-21 07:30:00"},
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, SUN, nullptr, "2026-11-22 07:30:00"},
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, DAILY, nullptr, "2026-11-21 07:30:00"},
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, THU, nullptr, "2026-11-26 07:30:00"},
        // The day of a one-time alarm means nothing to a weekly one.
        RingCase{"UTC", "2026-11-20 08:00:00", 7, 30, MON, "2026-01-01", "2026-11-23 07:30:00"},
        RingCase{"UTC", "2026-12-31 23:59:00", 23, 59, THU, nullptr, "2027-01-07 23:59:00"},
        RingCase{"Europe/Berlin", "2026-03-28 07:30:00", 7, 30, DAILY, nullptr,
                 "2026-03-29 07:30:00"},
        RingCase{"Europe/Berlin", "2026-10-24 07:30:00", 7, 30, DAILY, nullptr,
                 "2026-10-25 07:30:00"},
        RingCase{"Europe/Berlin", "2026-03-28 12:00:00", 2, 30, SUN, nullptr,
                 "2026-03-29 03:00:00"},
        RingCase{"Europe/Berlin", "2026-03-29 03:00:00", 2, 30, SUN, nullptr,
                 "2026-04-05 02:30:00"},
        RingCase{"Australia/Lord_Howe", "2026-10-03 12:00:00", 2, 15, DAILY, nullptr,
                 "2026-10-04 02:30:00"},
        RingCase{"Asia/Kolkata", "2026-11-20 23:45:00", 0, 15, SAT, nullptr, "2026-11-21 00:15:00"},
        RingCase{"America/New_York", "2026-03-08 00:00:00", 2, 30, SUN, nullptr,
                 "2026-03-08 03:00:00"}));

TEST(BaseNextRing, OfAnHourThatOccursTwiceRingsOnce) {
    const base::RingRule rule{2, 30, DAILY, std::nullopt};
    const auto first = utc("2026-10-25 00:30:00"); // 02:30 in summer time
    const auto second = utc("2026-10-25 01:30:00");
    EXPECT_EQ(base::nextRing(rule, first - 1, "Europe/Berlin"), first);
    EXPECT_EQ(base::nextRing(rule, first, "Europe/Berlin"), utc("2026-10-26 01:30:00"));
    EXPECT_EQ(base::nextRing(rule, second - 1, "Europe/Berlin"), utc("2026-10-26 01:30:00"));
}

TEST(BaseNextRing, IsAsLateAsTheClockIsSetOnLordHoweIsland) {
    const base::RingRule rule{7, 0, DAILY, std::nullopt};
    const auto before = base::nextRing(rule, utc("2026-04-03 12:00:00"), "Australia/Lord_Howe");
    const auto after = base::nextRing(rule, *before, "Australia/Lord_Howe");
    ASSERT_TRUE(before && after);
    EXPECT_EQ(*after - *before, 24 * 3600 + 1800);
}

TEST(BaseNextRing, ReadsOnlyTheSevenWeekdays) {
    EXPECT_FALSE(base::nextRing({7, 0, 128, std::nullopt}, 0, "UTC"));
}

} // namespace
