#include <functional>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/app_resource_manager.h>
#include <device/dlog.h>

#include "screens/EditorFixture.h"
#include "screens/RowPage.h"
#include "screens/TestCatalogue.h"

using testing::Contains;
using testing::Each;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

namespace {

constexpr const char* REGION_KEY = "db/menu_widget/regionformat";
constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

class TimePickerTest : public ScreenTest {
protected:
    /** Shows a row of its own for the record. */
    void show() {
        row = new AlarmTimePickerItem(alarm, date);
        row->setDateBtnSelectedCb([this] { ++dateClicks; });
        page = new RowPage(row);
        stage().push(page);
    }

    void setDates(const char* autoDay, const char* manualDay = nullptr) {
        const auto midnight = [](const char* day) {
            return static_cast<std::int32_t>(at(std::string(day) + " 00:00:00"));
        };
        alarm.autoDate = autoDay ? midnight(autoDay) : 0;
        alarm.manualDate = manualDay ? midnight(manualDay) : 0;
    }

    void pick(int hour, int minute) {
        std::tm time{};
        elm_datetime_value_get(row->getDateTimeObj(), &time);
        time.tm_hour = hour;
        time.tm_min = minute;
        elm_datetime_value_set(row->getDateTimeObj(), &time);
        evas_object_smart_callback_call(row->getDateTimeObj(), "changed", nullptr);
    }

    std::string dateText() const {
        const char* text = elm_object_part_text_get(row->getCalendarObj(), "date.text");
        return text ? text : "";
    }

    std::string style() const { return elm_object_style_get(row->getDateTimeObj()); }

    ClockAlarmDbData alarm{};
    std::tm date{};
    AlarmTimePickerItem* row = nullptr;
    RowPage* page = nullptr;
    int dateClicks = 0;
};

TEST_F(TimePickerTest, ShowsTheRecordsTime) {
    alarm.hour = 21;
    alarm.min = 7;
    show();
    std::tm time{};
    ASSERT_TRUE(elm_datetime_value_get(row->getDateTimeObj(), &time));
    EXPECT_EQ(time.tm_hour, 21);
    EXPECT_EQ(time.tm_min, 7);
    EXPECT_TRUE(stage().shows("21"));
    EXPECT_TRUE(stage().shows("07"));
}

TEST_F(TimePickerTest, TurningAWheelWritesTheTimeAndTheDay) {
    show();
    const Area wheels = Stage::area(row->getDateTimeObj());
    // Up on the hour wheel, on its left half.
    stage().drag(wheels.x + wheels.width / 4, wheels.middle().y, 0, -60);
    stage().settle();
    EXPECT_GT(alarm.hour, 6);
    EXPECT_EQ(alarm.min, 0);
    std::tm time{};
    elm_datetime_value_get(row->getDateTimeObj(), &time);
    EXPECT_EQ(alarm.hour, time.tm_hour);
    EXPECT_NE(alarm.autoDate, 0);
    const int hour = alarm.hour;
    // Down on the minute wheel.
    stage().drag(wheels.x + wheels.width * 3 / 4, wheels.middle().y, 0, 60);
    stage().settle();
    EXPECT_EQ(alarm.hour, hour);
    EXPECT_GT(alarm.min, 30);
}

struct PickCase {
    int hour;
    int minute;
    const char* text;
    const char* day;
};

class PickedTimeTest : public TimePickerTest, public testing::WithParamInterface<PickCase> {};

TEST_P(PickedTimeTest, DecidesTheDay) {
    show();
    pick(GetParam().hour, GetParam().minute);
    EXPECT_EQ(alarm.hour, GetParam().hour);
    EXPECT_EQ(alarm.min, GetParam().minute);
    EXPECT_EQ(civil(alarm.autoDate), std::string(GetParam().day) + " 00:00:00");
    EXPECT_EQ(dateText(), GetParam().text);
    std::tm day = date;
    EXPECT_EQ(std::mktime(&day), alarm.autoDate) << "the shared day is another one";
}

INSTANTIATE_TEST_SUITE_P(Times, PickedTimeTest,
                         testing::Values(PickCase{9, 41, "Tomorrow - Thu, Nov 19", "2026-11-19"},
                                         PickCase{9, 42, "Today - Wed, Nov 18", "2026-11-18"},
                                         PickCase{9, 40, "Tomorrow - Thu, Nov 19", "2026-11-19"},
                                         PickCase{8, 59, "Tomorrow - Thu, Nov 19", "2026-11-19"},
                                         PickCase{10, 0, "Today - Wed, Nov 18", "2026-11-18"},
                                         PickCase{0, 0, "Tomorrow - Thu, Nov 19", "2026-11-19"},
                                         PickCase{23, 59, "Today - Wed, Nov 18", "2026-11-18"}));

TEST_F(TimePickerTest, WithRepeatDaysTheWheelsChangeOnlyTheTime) {
    alarm.repeatWeekly = 2;
    show();
    pick(11, 11);
    EXPECT_EQ(alarm.hour, 11);
    EXPECT_EQ(alarm.min, 11);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(dateText(), "Mon ");
}

TEST_F(TimePickerTest, WithAPickedDayTheWheelsChangeOnlyTheTime) {
    setDates("2026-12-24", "2026-12-24");
    show();
    const std::int32_t before = alarm.autoDate;
    pick(11, 11);
    EXPECT_EQ(alarm.hour, 11);
    EXPECT_EQ(alarm.autoDate, before);
    EXPECT_EQ(dateText(), "Thu, Dec 24");
}

struct StripCase {
    const char* about;
    int weekdays;
    const char* autoDay;
    int hour;
    int minute;
    const char* text;
};

void PrintTo(const StripCase& strip, std::ostream* out) {
    *out << strip.about;
}

class StripTest : public TimePickerTest, public testing::WithParamInterface<StripCase> {};

TEST_P(StripTest, TellsTheDay) {
    const StripCase& strip = GetParam();
    alarm.repeatWeekly = strip.weekdays;
    alarm.hour = strip.hour;
    alarm.min = strip.minute;
    setDates(strip.autoDay);
    const std::int32_t before = alarm.autoDate;
    show();
    EXPECT_EQ(dateText(), strip.text);
    EXPECT_EQ(alarm.autoDate, before);
    if (before != 0) {
        EXPECT_EQ(std::mktime(&date), before);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Records, StripTest,
    testing::Values(StripCase{"no date and no repeat", 0, nullptr, 6, 0, ""},
                    StripCase{"later today", 0, "2026-11-18", 9, 42, "Today - Wed, Nov 18"},
                    StripCase{"tomorrow", 0, "2026-11-19", 6, 0, "Tomorrow - Thu, Nov 19"},
                    StripCase{"the day after", 0, "2026-11-20", 6, 0, "Fri, Nov 20"},
                    StripCase{"next month", 0, "2026-12-01", 6, 0, "Tue, Dec 1"},
                    StripCase{"next year", 0, "2027-01-01", 6, 0, "Fri, Jan 1, 2027"},
                    StripCase{"every day", 127, nullptr, 6, 0, "Every day"},
                    StripCase{"the weekend", 0x41, nullptr, 6, 0, "Sat Sun "},
                    StripCase{"a date goes before repeat days", 2, "2026-11-20", 6, 0,
                              "Fri, Nov 20"}));

TEST_F(TimePickerTest, OnTheLastOfTheMonthTomorrowIsADate) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-30 12:00:00");
    setDates("2026-12-01");
    show();
    EXPECT_EQ(dateText(), "Tue, Dec 1");
}

struct PastCase {
    const char* autoDay;
    int hour;
    int minute;
};

class PastDateTest : public TimePickerTest, public testing::WithParamInterface<PastCase> {};

TEST_P(PastDateTest, BecomesAOneTimeAlarmForTomorrow) {
    alarm.hour = GetParam().hour;
    alarm.min = GetParam().minute;
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 3;
    setDates(GetParam().autoDay, GetParam().autoDay);
    show();
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
    EXPECT_EQ(date.tm_mday, 19);
    EXPECT_EQ(date.tm_hour, 9) << "tomorrow keeps the time of day";
    expectLog("Set autoDate and manualDate to 0. Time already passed !!");
}

INSTANTIATE_TEST_SUITE_P(
    Days, PastDateTest,
    testing::Values(PastCase{"2026-11-18", 9, 41}, PastCase{"2026-11-18", 9, 40},
                    PastCase{"2026-11-18", 8, 59}, PastCase{"2026-11-17", 23, 0},
                    PastCase{"2026-10-30", 23, 0}, PastCase{"2025-12-31", 23, 0}));

TEST_F(TimePickerTest, TheDateButtonShoutsItsNameAndCallsTheOwner) {
    show();
    stage().tapText("DATE");
    EXPECT_EQ(dateClicks, 1);
    row->setDateBtnSelectedCb([this] { dateClicks += 10; });
    stage().tapText("DATE");
    EXPECT_EQ(dateClicks, 11);
}

TEST_F(TimePickerTest, AClickWithoutAnOwnerIsAProgrammingError) {
    AlarmTimePickerItem lonely(alarm, date);
    EXPECT_THROW(AlarmTimePickerItem::_dateBtnClickedCb(&lonely, nullptr, nullptr),
                 std::bad_function_call);
}

TEST_F(TimePickerTest, WithoutTheButtonTheStripStands) {
    device().fail("uxt_button_add");
    setDates("2026-11-19");
    show();
    EXPECT_FALSE(stage().shows("DATE"));
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    row->updateDateText();
}

TEST_F(TimePickerTest, WithoutTheWheelsTheRowStandsAndSaysSo) {
    device().fail("uxt_date_time_add");
    setDates("2026-11-19");
    show();
    EXPECT_EQ(row->getDateTimeObj(), nullptr);
    EXPECT_THAT(takeErrors(), Each("datetime is NULL !!"));
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    row->updateDateText();
    EXPECT_EQ(alarm.hour, 6);
}

TEST_F(TimePickerTest, WithoutTheThemeTheRowStandsAndSaysSo) {
    device().fail("app_resource_manager_get");
    show();
    EXPECT_NE(row->getCalendarObj(), nullptr);
    EXPECT_THAT(takeErrors(), Each("path is NULL !!"));
    pick(10, 0);
    EXPECT_EQ(civil(alarm.autoDate), "2026-11-18 00:00:00");
}

TEST_F(TimePickerTest, TheThemesPathIsLogged) {
    show();
    EXPECT_TRUE(device().logged(DLOG_ERROR,
                                "path: " CLOCK_RESOURCE_DIR "/edje/AlarmEditViewController.edj"));
}

TEST_F(TimePickerTest, ThePickersGroundIsTransparent) {
    show();
    EXPECT_THAT(device().callsTo("ea_theme_object_color_replace"),
                Contains(HasSubstr(R"("B0211", "transparent")")));
}

TEST_F(TimePickerTest, UpdatingBringsAnAutomaticDayUpToDate) {
    alarm.hour = 9;
    alarm.min = 42;
    setDates("2026-11-18");
    show();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:42:00");
    row->updateDateText();
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(civil(alarm.autoDate), "2026-11-19 00:00:00");
}

TEST_F(TimePickerTest, UpdatingWithoutADayLeavesTheStrip) {
    show();
    row->updateDateText();
    EXPECT_EQ(dateText(), "");
    EXPECT_EQ(alarm.autoDate, 0);
}

TEST_F(TimePickerTest, UpdatingTranslatesTheButtonAgain) {
    show();
    const TestCatalogue german{{"IDS_COM_BODY_DATE", "größer"}};
    row->updateDateText();
    stage().settle();
    EXPECT_TRUE(stage().shows("GRÖSSER"));
}

TEST_F(TimePickerTest, TheStripKeepsATextThatSomebodyElseHasWritten) {
    show();
    elm_object_part_text_set(row->getCalendarObj(), "date.text", "Today - Wed, Nov 18");
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
}

TEST_F(TimePickerTest, TheRepairedDayOutlivesTheStrip) {
    setDates("2026-11-17");
    show();
    expectLog("Set autoDate and manualDate to 0. Time already passed !!");
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    pick(9, 42);
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
}

// The form of the wheels.

struct FormCase {
    std::optional<DeviceSetting> hours;
    const char* style;
    const char* is24;
};

class CreatedFormTest : public TimePickerTest, public testing::WithParamInterface<FormCase> {};

TEST_P(CreatedFormTest, FollowsTheSetting) {
    if (GetParam().hours)
        device().setSetting(HOURS_KEY, *GetParam().hours);
    device().setSetting(REGION_KEY, "en_US");
    show();
    EXPECT_THAT(device().callsTo("uxt_date_time_add"),
                Each(HasSubstr(std::string("\"") + GetParam().style + "\")")));
    EXPECT_THAT(device().callsTo("uxt_date_time_set_format_by_locale"),
                Each(HasSubstr(std::string("\"en_US\", ") + GetParam().is24)));
    EXPECT_EQ(style(), GetParam().style);
    EXPECT_EQ(stage().shows("AM"), std::string(GetParam().is24) == "0");
}

INSTANTIATE_TEST_SUITE_P(Settings, CreatedFormTest,
                         testing::Values(FormCase{1, "time_layout", "0"},
                                         FormCase{2, "time_layout_24hr", "1"},
                                         FormCase{0, "time_layout_24hr", "1"},
                                         FormCase{7, "time_layout_24hr", "1"},
                                         FormCase{std::nullopt, "time_layout_24hr", "1"},
                                         FormCase{"12", "time_layout_24hr", "1"}));

TEST_F(TimePickerTest, WithoutARegionTheWheelsTakeTheCurrentLocale) {
    show();
    EXPECT_THAT(device().callsTo("uxt_date_time_set_format_by_locale"), Each(Not(HasSubstr("\""))));
}

TEST_F(TimePickerTest, TheWheelsFollowTheSettingWhileTheyAreShown) {
    device().setSetting(REGION_KEY, "en_US");
    device().setSetting(HOURS_KEY, 2);
    alarm.hour = 21;
    show();
    device().setSetting(HOURS_KEY, 1);
    stage().settle();
    EXPECT_EQ(style(), "time_layout");
    EXPECT_TRUE(stage().shows("PM"));
    EXPECT_TRUE(stage().shows("9"));
    device().setSetting(HOURS_KEY, 2);
    stage().settle();
    EXPECT_EQ(style(), "time_layout_24hr");
    EXPECT_FALSE(stage().shows("PM"));
    std::tm time{};
    elm_datetime_value_get(row->getDateTimeObj(), &time);
    EXPECT_EQ(time.tm_hour, 21);
}

TEST_F(TimePickerTest, AnotherRegionIsAppliedAtOnce) {
    device().setSetting(REGION_KEY, "en_US");
    device().setSetting(HOURS_KEY, 1);
    show();
    device().clearCalls();
    device().setSetting(REGION_KEY, "ko_KR");
    EXPECT_THAT(device().callsTo("uxt_date_time_set_format_by_locale"),
                Contains(HasSubstr("\"ko_KR\", 0")));
}

TEST_F(TimePickerTest, AnUnknownValueChangesNothing) {
    device().setSetting(REGION_KEY, "en_US");
    device().setSetting(HOURS_KEY, 1);
    show();
    device().clearCalls();
    for (const int value : {0, 3, -1}) {
        device().setSetting(HOURS_KEY, value);
        EXPECT_EQ(style(), "time_layout");
    }
    EXPECT_THAT(device().callsTo("uxt_date_time_set_format_by_locale"), IsEmpty());
}

TEST_F(TimePickerTest, AnUnreadableValueFallsBackToTwelveHours) {
    device().setSetting(REGION_KEY, "en_US");
    device().setSetting(HOURS_KEY, 2);
    show();
    device().setSetting(HOURS_KEY, "twelve");
    stage().settle();
    EXPECT_EQ(style(), "time_layout");
    EXPECT_STREQ(elm_datetime_format_get(row->getDateTimeObj()), "%d/%b/%Y %I:%M %p");
    EXPECT_TRUE(stage().shows("AM"));
}

TEST_F(TimePickerTest, AMissingRegionFallsBackToTwelveHours) {
    device().setSetting(REGION_KEY, "en_US");
    device().setSetting(HOURS_KEY, 2);
    show();
    device().removeSetting(REGION_KEY);
    device().notifyChange(REGION_KEY);
    EXPECT_EQ(style(), "time_layout");
}

TEST_F(TimePickerTest, BothSettingsAreWatchedAndTheWatchesStay) {
    show();
    const std::size_t watchers = device().watchers(HOURS_KEY);
    EXPECT_GE(watchers, 1U);
    EXPECT_EQ(device().watchers(REGION_KEY), watchers);
    takeStageDown();
    EXPECT_EQ(device().watchers(HOURS_KEY), watchers);
}

TEST_F(TimePickerTest, ASettingThatChangesAfterTheWheelsHaveGoneIsIgnored) {
    device().setSetting(REGION_KEY, "en_US");
    show();
    takeStageDown();
    device().clearCalls();
    device().setSetting(HOURS_KEY, 1);
    EXPECT_TRUE(device().logged(DLOG_INFO, "The time picker is gone. Ignore callback"));
    EXPECT_THAT(device().callsTo("uxt_date_time_set_format_by_locale"), IsEmpty());
}

// Content that comes and goes.

void countDeletionCb(void* data, Evas*, Evas_Object*, void*) {
    ++*static_cast<int*>(data);
}

TEST_F(TimePickerTest, AnUpdateAloneKeepsTheWidgets) {
    show();
    Evas_Object* picker = row->getDateTimeObj();
    Evas_Object* calendar = row->getCalendarObj();
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(row->getDateTimeObj(), picker);
    EXPECT_EQ(row->getCalendarObj(), calendar);
    EXPECT_TRUE(stage().canBeSeen(picker));
}

TEST_F(TimePickerTest, ThePointersFollowTheNewestWidgets) {
    show();
    Evas_Object* picker = row->getDateTimeObj();
    Evas_Object* calendar = row->getCalendarObj();
    int deletions = 0;
    for (Evas_Object* widget : {picker, calendar})
        evas_object_event_callback_add(widget, EVAS_CALLBACK_DEL, countDeletionCb, &deletions);
    row->renewContent();
    elm_genlist_item_update(page->item());
    stage().settle();
    EXPECT_EQ(deletions, 2);
    EXPECT_NE(row->getDateTimeObj(), nullptr);
    EXPECT_NE(row->getDateTimeObj(), picker);
    EXPECT_NE(row->getCalendarObj(), calendar);
    EXPECT_TRUE(stage().canBeSeen(row->getDateTimeObj()));
    EXPECT_TRUE(stage().canBeSeen(row->getCalendarObj()));
}

TEST_F(TimePickerTest, ThePointersAreNullOnceTheWidgetsAreGone) {
    show();
    elm_genlist_item_all_contents_unset(page->item(), nullptr);
    while (row->getDateTimeObj())
        evas_object_del(row->getDateTimeObj());
    while (row->getCalendarObj())
        evas_object_del(row->getCalendarObj());
    EXPECT_EQ(row->getDateTimeObj(), nullptr);
    EXPECT_EQ(row->getCalendarObj(), nullptr);
    setDates("2026-11-18");
    alarm.hour = 12;
    row->updateDateText();
    EXPECT_EQ(civil(alarm.autoDate), "2026-11-18 00:00:00");
}

TEST_F(TimePickerTest, WidgetsThatOutliveTheRowNoLongerCallIt) {
    auto* lonely = new AlarmTimePickerItem(alarm, date);
    app_resource_manager_init();
    Evas_Object* parent = stage().window();
    Evas_Object* picker =
        AlarmTimePickerItem::_getTimePickerItemContent(lonely, parent, "timepicker.area");
    Evas_Object* calendar =
        AlarmTimePickerItem::_getTimePickerItemContent(lonely, parent, "calendar.area");
    delete lonely;
    evas_object_smart_callback_call(picker, "changed", nullptr);
    evas_object_smart_callback_call(elm_object_part_content_get(calendar, "date.button"), "clicked",
                                    nullptr);
    EXPECT_EQ(alarm.autoDate, 0);
    evas_object_del(picker);
    evas_object_del(calendar);
}

TEST_F(TimePickerTest, OtherPartsHaveNoContent) {
    show();
    for (const char* part : {"", "elm.icon", "timepicker", "calendar.area2"})
        EXPECT_EQ(AlarmTimePickerItem::_getTimePickerItemContent(row, page->genlist(), part),
                  nullptr);
    EXPECT_EQ(AlarmTimePickerItem::_getTimePickerItemContent(row, page->genlist(), nullptr),
              nullptr);
}

TEST_F(TimePickerTest, TheItemClassIsThatOfTheTimeRow) {
    AlarmTimePickerItem item(alarm, date);
    Elm_Genlist_Item_Class* itemClass = item.getItemClassNew();
    EXPECT_STREQ(itemClass->item_style, "edit.theme.time");
    EXPECT_STREQ(itemClass->decorate_item_style, "mode/slide");
    EXPECT_EQ(itemClass->func.text_get, nullptr);
    Elm_Genlist_Item_Class* another = item.getItemClassNew();
    EXPECT_NE(itemClass, another);
    elm_genlist_item_class_free(itemClass);
    elm_genlist_item_class_free(another);
}

TEST_F(TimePickerTest, EveryCallbackToleratesMissingData) {
    EXPECT_EQ(AlarmTimePickerItem::_getTimePickerItemContent(nullptr, nullptr, "timepicker.area"),
              nullptr);
    AlarmTimePickerItem::_datetimeChangedCb(nullptr, nullptr, nullptr);
    AlarmTimePickerItem::_dateBtnClickedCb(nullptr, nullptr, nullptr);
    AlarmTimePickerItem::_datetimeFormatChangedCb(nullptr, nullptr);
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!", "Data is NULL !!",
                                          "Data is NULL !!"));
    AlarmTimePickerItem::_datetimePickerRegionFormatSet(nullptr);
    expectLog("datetime is NULL !!");
}

} // namespace
