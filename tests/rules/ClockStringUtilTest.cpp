#include "clock/ClockStringUtil.h"

#include <array>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "rules/CatalogueForTest.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace {

using testing::ElementsAre;
using testing::HasSubstr;

constexpr const char* SPAN_TEXT = "IDS_CLOCK_TPOP_ALARM_SET_FOR_PS_FROM_NOW";
constexpr const char* PLAIN_TEXT = "IDS_CLOCK_TPOP_ALARM_SET";

struct OffsetCase {
    const char* what;
    const char* zone;
    const char* now;
    int hour;
    int minute;
    int weekdays;
    const char* date; // Midnight of a one-time alarm's day, or null.
    std::array<int, 3> offset;
};

class ClockStringOffsetTest : public testing::TestWithParam<OffsetCase> {};

TEST_P(ClockStringOffsetTest, CountsToTheNextRing) {
    const OffsetCase& c = GetParam();
    const TimeZoneForTest zone(c.zone);
    const FrozenTime now(at(c.now));
    ClockAlarmDbData alarm;
    alarm.enable = 1;
    alarm.hour = c.hour;
    alarm.min = c.minute;
    alarm.repeatWeekly = c.weekdays;
    alarm.timeZone = c.zone;
    alarm.autoDate = c.date ? static_cast<int>(at(c.date)) : 0;
    std::array<int, 3> offset{-1, -1, -1};
    ClockStringUtil::getAlertTimeOffset(alarm, &offset[0], &offset[1], &offset[2]);
    EXPECT_EQ(offset, c.offset) << c.what;
}

INSTANTIATE_TEST_SUITE_P(
    Moments, ClockStringOffsetTest,
    testing::Values(
        OffsetCase{"an hour", "UTC", "2026-11-20 06:30:00", 7, 30, 0, nullptr, {0, 1, 0}},
        OffsetCase{"a started minute", "UTC", "2026-11-20 06:30:01", 7, 30, 0, nullptr, {0, 1, 0}},
        OffsetCase{"59 s later", "UTC", "2026-11-20 06:30:59", 7, 30, 0, nullptr, {0, 1, 0}},
        OffsetCase{"next minute", "UTC", "2026-11-20 06:31:00", 7, 30, 0, nullptr, {0, 0, 59}},
        OffsetCase{"last second", "UTC", "2026-11-20 07:29:59", 7, 30, 0, nullptr, {0, 0, 1}},
        OffsetCase{"now is tomorrow", "UTC", "2026-11-20 07:30:00", 7, 30, 0, nullptr, {1, 0, 0}},
        OffsetCase{"just over", "UTC", "2026-11-20 07:30:01", 7, 30, 0, nullptr, {1, 0, 0}},
        OffsetCase{"a day's alarm",
                   "UTC",
                   "2026-11-20 06:00:00",
                   7,
                   5,
                   0,
                   "2026-12-25 00:00:00",
                   {35, 1, 5}},
        OffsetCase{
            "far away", "UTC", "2026-11-20 06:00:00", 6, 0, 0, "2037-11-20 00:00:00", {4018, 0, 0}},
        OffsetCase{"over", "UTC", "2026-11-20 08:00:00", 7, 5, 0, "2026-11-20 00:00:00", {0, 0, 0}},
        OffsetCase{
            "Monday from Friday", "UTC", "2026-11-20 08:00:00", 7, 0, 2, nullptr, {2, 23, 0}},
        OffsetCase{
            "weekly on the minute", "UTC", "2026-11-20 08:00:00", 8, 0, 32, nullptr, {7, 0, 0}},
        OffsetCase{"a date besides weekdays",
                   "UTC",
                   "2026-11-20 08:00:00",
                   7,
                   0,
                   2,
                   "2026-01-01 00:00:00",
                   {2, 23, 0}},
        OffsetCase{"a day of 23 hours",
                   "Europe/Berlin",
                   "2026-03-28 12:00:00",
                   12,
                   0,
                   127,
                   nullptr,
                   {0, 23, 0}},
        OffsetCase{"a day of 25 hours",
                   "Europe/Berlin",
                   "2026-10-24 12:00:00",
                   12,
                   0,
                   127,
                   nullptr,
                   {1, 1, 0}},
        OffsetCase{"23 and a half",
                   "Australia/Lord_Howe",
                   "2026-10-03 12:00:00",
                   12,
                   0,
                   127,
                   nullptr,
                   {0, 23, 30}},
        OffsetCase{"into the gap",
                   "Europe/Berlin",
                   "2026-03-29 01:30:00",
                   2,
                   30,
                   127,
                   nullptr,
                   {0, 0, 30}},
        OffsetCase{"the year's last minute",
                   "Asia/Kolkata",
                   "2026-12-31 23:59:00",
                   0,
                   0,
                   0,
                   nullptr,
                   {0, 0, 1}},
        OffsetCase{"a day without midnight",
                   "Asia/Beirut",
                   "2026-03-28 12:00:00",
                   7,
                   0,
                   0,
                   "2026-03-29 00:00:00",
                   {0, 18, 0}}));

TEST(ClockStringOffset, OfADayPickedInAnotherZoneIsThatDay) {
    ClockAlarmDbData alarm;
    alarm.enable = 1;
    alarm.hour = 7;
    alarm.timeZone = "Europe/Berlin";
    {
        const TimeZoneForTest zone("Europe/Berlin");
        alarm.autoDate = static_cast<int>(at("2026-11-22 00:00:00"));
    }
    const TimeZoneForTest zone("America/New_York");
    const FrozenTime now(at("2026-11-20 07:00:00"));
    int days = -1;
    int hours = -1;
    int minutes = -1;
    ClockStringUtil::getAlertTimeOffset(alarm, &days, &hours, &minutes);
    EXPECT_THAT((std::array{days, hours, minutes}), ElementsAre(2, 0, 0));
}

TEST(ClockStringOffset, OfAnAlarmThatIsSwitchedOffIsZero) {
    ClockAlarmDbData alarm;
    alarm.enable = 0;
    int days = -1;
    int hours = -1;
    int minutes = -1;
    ClockStringUtil::getAlertTimeOffset(alarm, &days, &hours, &minutes);
    EXPECT_THAT((std::array{days, hours, minutes}), ElementsAre(0, 0, 0));
}

TEST(ClockStringOffset, WithoutAPlaceForACountLogsAndReturns) {
    int count = -1;
    testing::internal::CaptureStderr();
    ClockStringUtil::getAlertTimeOffset({}, nullptr, &count, &count);
    ClockStringUtil::getAlertTimeOffset({}, &count, nullptr, &count);
    ClockStringUtil::getAlertTimeOffset({}, &count, &count, nullptr);
    const auto log = testing::internal::GetCapturedStderr();
    EXPECT_THAT(log, HasSubstr("days is NULL !!"));
    EXPECT_THAT(log, HasSubstr("hours is NULL !!"));
    EXPECT_THAT(log, HasSubstr("minutes is NULL !!"));
}

struct SentenceCase {
    const char* language;
    int days;
    int hours;
    int minutes;
    const char* text;
};

class ClockStringSentenceTest : public testing::TestWithParam<SentenceCase> {};

TEST_P(ClockStringSentenceTest, NamesTheUnitsThatAreNotZero) {
    const SentenceCase& c = GetParam();
    const CatalogueForTest catalogue(c.language, {{SPAN_TEXT, "<%s>"}, {PLAIN_TEXT, "set"}});
    std::string text = "earlier";
    ClockStringUtil::generateAlertOffsetToastPopupText(c.days, c.hours, c.minutes, text);
    EXPECT_EQ(text, c.text);
}

INSTANTIATE_TEST_SUITE_P(
    Languages, ClockStringSentenceTest,
    testing::Values(
        SentenceCase{"en", 0, 0, 0, "set"}, SentenceCase{"en", 0, 0, 1, "<1 minute>"},
        SentenceCase{"en", 0, 0, 2, "<2 minutes>"}, SentenceCase{"en", 0, 1, 0, "<1 hour>"},
        SentenceCase{"en", 1, 0, 5, "<1 day, 5 minutes>"},
        SentenceCase{"en", 2, 3, 4, "<2 days, 3 hours, 4 minutes>"},
        SentenceCase{"de", 1, 1, 0, "<1 Tag, 1 Stunde>"}, SentenceCase{"de", 2, 0, 0, "<2 Tage>"},
        // One, few and many.
        SentenceCase{"pl", 0, 1, 0, "<1 godzina>"}, SentenceCase{"pl", 0, 2, 0, "<2 godziny>"},
        SentenceCase{"pl", 0, 5, 0, "<5 godzin>"}, SentenceCase{"en", 4018, 0, 0, "<4,018 days>"},
        SentenceCase{"en", -1, 0, 0, "set"}));

TEST(ClockStringSentence, OfAHostileCatalogueIsShownAsItIs) {
    for (const char* hostile : {"%n", "%s %s", "%d", "no place for it", "%99999999s"}) {
        const CatalogueForTest catalogue("en", {{SPAN_TEXT, hostile}});
        std::string text;
        ClockStringUtil::generateAlertOffsetToastPopupText(0, 1, 0, text);
        EXPECT_EQ(text, hostile);
    }
}

TEST(ClockStringSentence, WithoutACatalogueShowsTheIdentifier) {
    const CatalogueForTest catalogue("en");
    std::string text;
    ClockStringUtil::generateAlertOffsetToastPopupText(0, 1, 0, text);
    EXPECT_EQ(text, SPAN_TEXT);
    ClockStringUtil::generateAlertOffsetToastPopupText(0, 0, 0, text);
    EXPECT_EQ(text, PLAIN_TEXT);
}

TEST(ClockStringSentence, OfTheEnglishCatalogueReadsWell) {
    const CatalogueForTest language("en");
    bindtextdomain("clock", CLOCK_RESOURCE_DIR "/locale");
    std::string text;
    ClockStringUtil::generateAlertOffsetToastPopupText(0, 2, 5, text);
    EXPECT_EQ(text, "Alarm set for 2 hours, 5 minutes from now.");
    ClockStringUtil::generateAlertOffsetToastPopupText(0, 0, 0, text);
    EXPECT_EQ(text, "Alarm set.");
}

TEST(ClockStringSentence, LogsNegativeCounts) {
    const CatalogueForTest language("en");
    std::string text;
    testing::internal::CaptureStderr();
    ClockStringUtil::generateAlertOffsetToastPopupText(0, -2, 5, text);
    EXPECT_THAT(testing::internal::GetCapturedStderr(), HasSubstr("negative span"));
}

struct UpperCase {
    const char* language;
    const char* text;
    const char* upper;
};

class ClockStringUpperTest : public testing::TestWithParam<UpperCase> {};

TEST_P(ClockStringUpperTest, FollowsTheRulesOfTheLanguage) {
    const CatalogueForTest language(GetParam().language);
    EXPECT_EQ(ClockStringUtil::changeStringToUpper(GetParam().text), GetParam().upper);
}

INSTANTIATE_TEST_SUITE_P(
    Languages, ClockStringUpperTest,
    testing::Values(UpperCase{"en", "Date", "DATE"}, UpperCase{"en", "", ""},
                    UpperCase{"en", "title 12:30", "TITLE 12:30"},
                    UpperCase{"tr", "tarih ı", "TARİH I"}, UpperCase{"de", "Straße", "STRASSE"},
                    UpperCase{"el", "Ημερομηνία", "ΗΜΕΡΟΜΗΝΙΑ"}, UpperCase{"ru", "дата", "ДАТА"},
                    UpperCase{"ja", "日付", "日付"}, UpperCase{"en", "a\xffz", "A\uFFFDZ"}));

} // namespace
