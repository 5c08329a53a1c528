#include "clock/ClockIcuDataModel.h"

#include <array>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "rules/CatalogueForTest.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace {

using testing::HasSubstr;

std::string currentZone() {
    const std::unique_ptr<char, decltype(&std::free)> zone(ClockIcuDataModel::getCurrentTimeZone(),
                                                           &std::free);
    return zone.get();
}

std::string formatted(std::time_t instant, const char* locale, const char* skeleton,
                      const char* zone) {
    std::array<char, 64> buffer{};
    EXPECT_TRUE(ClockIcuDataModel::getFormattedDateString(
        instant, buffer.data(), static_cast<int>(buffer.size()), locale, skeleton, zone));
    return buffer.data();
}

TEST(ClockIcuTimeZone, IsTheCurrentOneAndFollowsAChange) {
    const TimeZoneForTest zone("Europe/Berlin");
    EXPECT_EQ(currentZone(), "Europe/Berlin");
    TimeZoneForTest::set("Asia/Kolkata");
    EXPECT_EQ(currentZone(), "Asia/Kolkata");
    TimeZoneForTest::set("Nowhere/Land");
    EXPECT_EQ(currentZone(), "UTC");
}

struct ExistingCase {
    const char* zone;
    const char* now;
    int hour;
    int minute;
    const char* existing;
};

class ClockIcuExistingTimeTest : public testing::TestWithParam<ExistingCase> {};

TEST_P(ClockIcuExistingTimeTest, IsTodayAndMovedPastAGap) {
    const ExistingCase& c = GetParam();
    const TimeZoneForTest zone(c.zone);
    const FrozenTime now(at(c.now));
    ClockAlarmDbData alarm;
    alarm.hour = c.hour;
    alarm.min = c.minute;
    alarm.timeZone = "Pacific/Auckland"; // Where it was saved does not matter.
    EXPECT_EQ(civil(ClockIcuDataModel::verifyExistingTimeForDst(alarm)), c.existing);
}

INSTANTIATE_TEST_SUITE_P(
    Days, ClockIcuExistingTimeTest,
    testing::Values(
        ExistingCase{"Europe/Berlin", "2026-11-20 12:00:00", 7, 30, "2026-11-20 07:30:00"},
        ExistingCase{"Europe/Berlin", "2026-03-29 00:30:00", 2, 30, "2026-03-29 03:00:00"},
        ExistingCase{"Europe/Berlin", "2026-03-29 12:00:00", 2, 0, "2026-03-29 03:00:00"},
        ExistingCase{"Europe/Berlin", "2026-03-29 12:00:00", 3, 15, "2026-03-29 03:15:00"},
        ExistingCase{"Europe/Berlin", "2026-03-28 12:00:00", 2, 30, "2026-03-28 02:30:00"},
        ExistingCase{"Australia/Lord_Howe", "2026-10-04 12:00:00", 2, 10, "2026-10-04 02:30:00"},
        ExistingCase{"America/New_York", "2026-03-08 12:00:00", 2, 59, "2026-03-08 03:00:00"},
        ExistingCase{"Asia/Kolkata", "2026-12-31 23:59:00", 23, 59, "2026-12-31 23:59:00"}));

TEST(ClockIcuExistingTime, OfAnHourThatOccursTwiceIsTheFirst) {
    const TimeZoneForTest zone("Europe/Berlin");
    const FrozenTime now(at("2026-10-25 12:00:00"));
    ClockAlarmDbData alarm;
    alarm.hour = 2;
    alarm.min = 30;
    const auto instant = ClockIcuDataModel::verifyExistingTimeForDst(alarm);
    std::tm local{};
    localtime_r(&instant, &local);
    EXPECT_EQ(civil(instant), "2026-10-25 02:30:00");
    EXPECT_EQ(local.tm_isdst, 1);
}

struct FormatCase {
    const char* civilUtc;
    const char* locale;
    const char* skeleton;
    const char* zone;
    const char* text;
};

class ClockIcuFormatTest : public testing::TestWithParam<FormatCase> {};

TEST_P(ClockIcuFormatTest, WritesTheInstantInItsLanguageAndZone) {
    const FormatCase& c = GetParam();
    const TimeZoneForTest zone("UTC");
    EXPECT_EQ(formatted(at(c.civilUtc), c.locale, c.skeleton, c.zone), c.text);
}

INSTANTIATE_TEST_SUITE_P(
    Languages, ClockIcuFormatTest,
    testing::Values(FormatCase{"2026-11-20 07:30:00", "en", "EMMMd", "UTC", "Fri, Nov 20"},
                    FormatCase{"2026-11-20 07:30:00", "en_GB", "EMMMd", "UTC", "Fri, 20 Nov"},
                    FormatCase{"2026-11-20 07:30:00", "de", "EMMMd", "UTC", "Fr., 20. Nov."},
                    FormatCase{"2026-11-20 07:30:00", "ja", "EMMMd", "UTC", "11月20日(金)"},
                    FormatCase{"2026-11-20 07:30:00", "en", "HHmm", "UTC", "07:30"},
                    FormatCase{"2026-11-20 19:30:00", "en", "HHmm", "UTC", "19:30"},
                    FormatCase{"2026-11-20 19:30:00", "en", "hhmm", "UTC", "7:30\u202fPM"},
                    FormatCase{"2026-11-20 00:05:00", "en", "hhmm", "UTC", "12:05\u202fAM"},
                    FormatCase{"2026-11-20 19:30:00", "fi", "HHmm", "UTC", "19.30"},
                    FormatCase{"2026-11-20 19:30:00", "en", "HHmm", "Asia/Kolkata", "01:00"},
                    FormatCase{"2026-12-31 23:59:00", "en", "EMMMd", "UTC", "Thu, Dec 31"},
                    FormatCase{"2026-12-31 23:59:00", "en", "EMMMd", "Europe/Berlin", "Fri, Jan 1"},
                    // ICU's own copy of the zones is older than these rules.
                    FormatCase{"2026-07-01 13:00:00", "en", "HHmm", "America/Mexico_City", "07:00"},
                    FormatCase{"2026-07-01 04:00:00", "en", "HHmm", "Africa/Cairo", "07:00"}));

TEST(ClockIcuFormat, WithoutLocaleAndZoneUsesTheCurrentOnesAndFollowsAChange) {
    const CatalogueForTest language("de");
    const TimeZoneForTest zone("UTC");
    const auto instant = at("2026-11-20 23:30:00");
    EXPECT_EQ(formatted(instant, nullptr, "EMMMd", nullptr), "Fr., 20. Nov.");
    CatalogueForTest::setLanguage("en");
    EXPECT_EQ(formatted(instant, nullptr, "EMMMd", nullptr), "Fri, Nov 20");
    TimeZoneForTest::set("Asia/Kolkata");
    EXPECT_EQ(formatted(instant, nullptr, "EMMMd", nullptr), "Sat, Nov 21");
}

TEST(ClockIcuFormat, StaysInsideASmallBufferAndKeepsWholeCharacters) {
    std::array<char, 16> buffer{};
    buffer.fill('#');
    const auto noon = 1795176000;
    ASSERT_TRUE(
        ClockIcuDataModel::getFormattedDateString(noon, buffer.data(), 5, "ja", "EMMMd", "UTC"));
    EXPECT_STREQ(buffer.data(), "11");
    EXPECT_EQ(buffer[5], '#');
    ASSERT_TRUE(
        ClockIcuDataModel::getFormattedDateString(noon, buffer.data(), 1, "ja", "EMMMd", "UTC"));
    EXPECT_STREQ(buffer.data(), "");
}

TEST(ClockIcuFormat, ManySkeletonsKeepWorking) {
    for (int round = 0; round < 3; ++round)
        for (const char* language : {"en", "de", "fr", "ja", "fi", "ar", "tr", "he", "ko", "sv"})
            for (const char* skeleton : {"y", "M", "d", "E", "H", "h", "m", "s"})
                EXPECT_NE(formatted(1795176000, language, skeleton, "UTC"), "");
}

struct BadFormatCase {
    const char* what;
    int size;
    const char* skeleton;
    const char* zone;
    const char* logged;
};

class ClockIcuBadFormatTest : public testing::TestWithParam<BadFormatCase> {};

TEST_P(ClockIcuBadFormatTest, LogsAndLeavesAnEmptyText) {
    const BadFormatCase& c = GetParam();
    std::array<char, 16> buffer{"earlier"};
    testing::internal::CaptureStderr();
    const bool written = ClockIcuDataModel::getFormattedDateString(
        1795176000, buffer.data(), c.size, "en", c.skeleton, c.zone);
    EXPECT_THAT(testing::internal::GetCapturedStderr(), HasSubstr(c.logged)) << c.what;
    EXPECT_FALSE(written);
    EXPECT_STREQ(buffer.data(), c.size > 0 ? "" : "earlier");
}

INSTANTIATE_TEST_SUITE_P(
    Arguments, ClockIcuBadFormatTest,
    testing::Values(BadFormatCase{"no skeleton", 16, nullptr, "UTC", "skeleton is NULL !!"},
                    BadFormatCase{"empty skeleton", 16, "", "UTC", "no date format"},
                    BadFormatCase{"no room", 0, "HHmm", "UTC", "size is 0"},
                    BadFormatCase{"less than no room", -5, "HHmm", "UTC", "size is -5"},
                    BadFormatCase{"unknown zone", 16, "HHmm", "Mars/Phobos",
                                  "there is no time zone Mars/Phobos"}));

TEST(ClockIcuFormat, WithoutABufferLogsAndReturns) {
    testing::internal::CaptureStderr();
    EXPECT_FALSE(ClockIcuDataModel::getFormattedDateString(0, nullptr, 10, "en", "HHmm", "UTC"));
    EXPECT_THAT(testing::internal::GetCapturedStderr(), HasSubstr("buffer is NULL !!"));
}

struct LocaleCase {
    const char* language;
    const char* locale;
    int firstDay; // 1 Sunday to 7 Saturday
};

class ClockIcuLocaleTest : public testing::TestWithParam<LocaleCase> {};

TEST_P(ClockIcuLocaleTest, FollowsTheLanguageOfTheTexts) {
    const CatalogueForTest language(GetParam().language);
    EXPECT_STREQ(ClockIcuDataModel::getCurrentLocale(), GetParam().locale);
    EXPECT_EQ(ClockIcuDataModel::getFirstDayOfWeek(), GetParam().firstDay);
}

INSTANTIATE_TEST_SUITE_P(Languages, ClockIcuLocaleTest,
                         testing::Values(LocaleCase{"en", "en", 1},
                                         LocaleCase{"en_US.UTF-8", "en_US", 1},
                                         LocaleCase{"en_GB", "en_GB", 2},
                                         LocaleCase{"de:en", "de", 2}, LocaleCase{":de", "de", 2},
                                         LocaleCase{"ar_EG", "ar_EG", 7},
                                         LocaleCase{"sr_RS@latin", "sr_Latn_RS", 2},
                                         LocaleCase{"de_DE.UTF-8@euro", "de_DE", 2},
                                         LocaleCase{"", "en", 1}, LocaleCase{"C", "en", 1}));

TEST(ClockIcuLocale, OfTheCLocaleIsEnglishWhateverTheLanguage) {
    const CatalogueForTest language("de");
    setlocale(LC_ALL, "C");
    EXPECT_STREQ(ClockIcuDataModel::getCurrentLocale(), "en");
}

TEST(ClockIcuLocale, StaysReadableAfterAChange) {
    const CatalogueForTest language("de");
    const char* earlier = ClockIcuDataModel::getCurrentLocale();
    for (const char* next : {"fr", "ja", "tr", "en_US"}) {
        CatalogueForTest::setLanguage(next);
        EXPECT_STREQ(ClockIcuDataModel::getCurrentLocale(), next);
    }
    EXPECT_STREQ(earlier, "de");
}

} // namespace
