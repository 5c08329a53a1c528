// The date popup over a page with the two rows that it serves.

#include <cstdlib>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include <dlfcn.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <libintl.h>

#include <app_assist/WContentViewController.h>
#include <clock/ClockIcuDataModel.h>
#include <device/app_resource_manager.h>

#include "AlarmDatePopupViewController.h"
#include "AlarmRepeatItem.h"
#include "AlarmTimePickerItem.h"
#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char* PAST_TOAST =
    "Alarms can't be set for a time in the past. Tomorrow's date has been set.";

std::optional<int>& toldFirstDay() {
    static std::optional<int> day;
    return day;
}

/** The language that texts and dates are looked up in, for the length of a test. */
class Language {
public:
    explicit Language(const char* name) { speak(name); }
    ~Language() { speak("en"); }
    Language(const Language&) = delete;
    Language& operator=(const Language&) = delete;

private:
    static void speak(const char* name) {
        setenv("LANGUAGE", name, 1);
        // Naming the domain again makes gettext forget what it has found so far.
        textdomain("clock");
    }
};

/** The editor's first two rows in a list of their own. */
class TwoRows : public app_assist::WContentViewController {
public:
    TwoRows(ClockAlarmDbData& alarm, std::tm& date)
        : timePicker(new AlarmTimePickerItem(alarm, date)), repeat(new AlarmRepeatItem(alarm)) {
        app_resource_manager_init();
    }
    ~TwoRows() override { app_resource_manager_release(); }

    AlarmTimePickerItem* timePicker;
    AlarmRepeatItem* repeat;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void*) override {
        elm_theme_extension_add(nullptr, CLOCK_RESOURCE_DIR "/edje/AlarmCustomTheme.edj");
        Evas_Object* genlist = elm_genlist_add(parent);
        elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
        append(genlist, timePicker);
        append(genlist, repeat);
        return genlist;
    }

private:
    static void append(Evas_Object* genlist, app_assist::WGenlistItem* row) {
        Elm_Genlist_Item_Class* itemClass = row->getItemClassNew();
        row->setElmObjectItem(
            elm_genlist_item_append(genlist, itemClass, row, nullptr, ELM_GENLIST_ITEM_NONE,
                                    app_assist::WGenlistItem::getSelectCb(), row));
        elm_genlist_item_class_free(itemClass);
    }
};

class DatePopupTest : public ScreenTest {
protected:
    void TearDown() override {
        toldFirstDay().reset();
        ScreenTest::TearDown();
    }

    /** The rows for an alarm at some time, Monday to Friday until a day is set. */
    void showRows(int hour, int minute) {
        alarm.hour = hour;
        alarm.min = minute;
        alarm.repeatOnce = 0;
        alarm.repeatWeekly = 62;
        page = new TwoRows(alarm, date);
        stage().push(page);
    }

    void openPopup() {
        popup = new AlarmDatePopupViewController(alarm, page->timePicker, page->repeat, date);
        attach();
    }

    void attach() {
        alive = popup->getWeakPtr();
        page->attachPopup(popup);
        stage().settle();
    }

    /** Shows the popup for an alarm, with the calendar on a day. */
    void open(int hour, int minute, const std::string& day) {
        const std::time_t noon = at(day + " 12:00:00");
        localtime_r(&noon, &date);
        showRows(hour, minute);
        openPopup();
    }

    /** The same with the calendar on today. */
    void open(int hour, int minute) {
        open(hour, minute, civil(VirtualClock::now()).substr(0, 10));
    }

    std::string strip() const {
        const char* text =
            elm_object_part_text_get(page->timePicker->getCalendarObj(), "date.text");
        return text ? text : "";
    }

    std::vector<std::string> repeatTexts() {
        stage().showRow(page->repeat->getElmObjectItem());
        return Stage::rows(page->getEvasObj()).back().texts;
    }

    std::string chosenDay() const {
        char text[32];
        std::strftime(text, sizeof text, "%Y-%m-%d %H:%M:%S", &date);
        return text;
    }

    void expectNothingChanged() const {
        EXPECT_EQ(alarm.repeatWeekly, 62);
        EXPECT_EQ(alarm.repeatOnce, 0);
        EXPECT_EQ(alarm.autoDate, 0);
        EXPECT_EQ(alarm.manualDate, 0);
        EXPECT_EQ(strip(), "Mon Tue Wed Thu Fri ");
        EXPECT_THAT(device().toasts(), IsEmpty());
    }

    void expectNoRepeat() {
        EXPECT_EQ(alarm.repeatOnce, 1);
        EXPECT_EQ(alarm.repeatWeekly, 0);
        EXPECT_THAT(repeatTexts(), ElementsAre("Repeat weekly", "Never"));
    }

    void expectTomorrowInstead(const std::string& text) {
        EXPECT_FALSE(alive);
        EXPECT_THAT(device().toasts(), ElementsAre(PAST_TOAST));
        EXPECT_EQ(strip(), text);
        EXPECT_EQ(alarm.autoDate, 0);
        EXPECT_EQ(alarm.manualDate, 0);
        expectNoRepeat();
    }

    /** True when something reddish is drawn there. */
    bool isMarked(const std::string& dayPart) {
        Area place;
        Evas_Object* edje = elm_layout_edje_get(face().calendar());
        edje_object_part_geometry_get(edje, dayPart.c_str(), &place.x, &place.y, &place.width,
                                      &place.height);
        int left = 0;
        int top = 0;
        evas_object_geometry_get(edje, &left, &top, nullptr, nullptr);
        for (int y = top + place.y; y < top + place.y + place.height; ++y)
            for (int x = left + place.x; x < left + place.x + place.width; ++x)
                if (const unsigned color = stage().pixel(x, y);
                    (color >> 16 & 0xff) > (color & 0xff) + 60)
                    return true;
        return false;
    }

    /** Columns of the third week, all of November 2026, that carry the holiday mark. */
    std::vector<int> markedColumns() {
        std::vector<int> columns;
        for (int column = 0; column < 7; ++column)
            if (isMarked("elm.cit_" + std::to_string(14 + column) + ".text"))
                columns.push_back(column);
        return columns;
    }

    ClockAlarmDbData alarm{};
    std::tm date{};
    TwoRows* page = nullptr;
    AlarmDatePopupViewController* popup = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> alive;
    DatePopupOnFace face() { return DatePopupOnFace(stage()); }
};

// What it looks like.

TEST_F(DatePopupTest, ShowsATitleAMonthAndTwoButtons) {
    open(7, 0);
    EXPECT_STREQ(elm_object_style_get(popup->getEvasObj()), "theme,bg");
    EXPECT_STREQ(elm_object_part_text_get(popup->getEvasObj(), "title,text"), "Set date");
    EXPECT_EQ(face().monthText(), "November 2026");
    const auto cancel = face().button("Cancel");
    const auto set = face().button("Set");
    ASSERT_TRUE(cancel && set);
    EXPECT_LT(cancel->area.x, set->area.x);
    EXPECT_STREQ(popup->getClassName(), "AlarmDatePopupViewController");
}

TEST_F(DatePopupTest, TheCalendarFillsThePlaceThatThereIs) {
    open(7, 0);
    double x = 0;
    double y = 0;
    evas_object_size_hint_weight_get(face().calendar(), &x, &y);
    EXPECT_EQ(x, EVAS_HINT_EXPAND);
    EXPECT_EQ(y, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_get(face().calendar(), &x, &y);
    EXPECT_EQ(x, EVAS_HINT_FILL);
    EXPECT_EQ(y, EVAS_HINT_FILL);
}

TEST_F(DatePopupTest, OpensOnTheChosenDay) {
    open(7, 0, "2027-02-28");
    EXPECT_EQ(face().selectedDay(), "2027-02-28");
    EXPECT_EQ(face().monthText(), "February 2027");
}

TEST_F(DatePopupTest, SaturdaysAreMarked) {
    open(7, 0);
    EXPECT_THAT(markedColumns(), ElementsAre(6));
}

TEST_F(DatePopupTest, FarInTheEastTheMarkIsOnSundays) {
    // The instant that the mark starts from is a Saturday evening in Greenwich.
    VirtualClock::setNow("Asia/Seoul", "2026-11-18 09:41:00");
    open(7, 0);
    EXPECT_THAT(markedColumns(), ElementsAre(0));
}

TEST_F(DatePopupTest, TheMarkIsWeekly) {
    open(7, 0);
    EXPECT_EQ(eina_list_count(elm_calendar_marks_get(face().calendar())), 1U);
    face().turnMonths(12);
    ASSERT_EQ(face().monthText(), "November 2027");
    EXPECT_TRUE(isMarked("elm.cit_20.text")) << "Saturday 20 November 2027";
}

// The first day of the week.

struct WeekCase {
    const char* language;
    const char* firstWeekday;
    bool onSunday;
};

class DatePopupWeekTest : public DatePopupTest, public testing::WithParamInterface<WeekCase> {};

TEST_P(DatePopupWeekTest, BeginsAsTheLanguageDoes) {
    const Language language(GetParam().language);
    const std::time_t noon = at("2026-11-18 12:00:00");
    localtime_r(&noon, &date);
    showRows(7, 0);
    openPopup();
    EXPECT_EQ(elm_calendar_first_day_of_week_get(face().calendar()) == ELM_DAY_SUNDAY,
              GetParam().onSunday);
    // The first of November 2026 is a Sunday.
    const int sunday =
        (7 - static_cast<int>(elm_calendar_first_day_of_week_get(face().calendar()))) % 7;
    EXPECT_EQ(face().partText("elm.cit_" + std::to_string(sunday) + ".text"), "1");
    EXPECT_EQ(face().firstWeekday(), GetParam().firstWeekday);
}

INSTANTIATE_TEST_SUITE_P(Languages, DatePopupWeekTest,
                         testing::Values(WeekCase{"de", "Mo", false}, WeekCase{"en", "Sun", true},
                                         WeekCase{"ar", "س", false}, WeekCase{"hi", "रवि", true},
                                         WeekCase{"fr", "lun", false},
                                         WeekCase{"pt_BR", "dom", true},
                                         WeekCase{"ru", "пн", false}, WeekCase{"ja", "日", true}),
                         [](const auto& test) { return test.param.language; });

TEST_F(DatePopupTest, WithoutAFirstDayTheWeekBeginsOnSunday) {
    toldFirstDay() = -1;
    const Language german("de");
    open(7, 0);
    expectLog("firstDayofWeek is failed, it will set automatically 1");
    EXPECT_EQ(elm_calendar_first_day_of_week_get(face().calendar()), ELM_DAY_SUNDAY);
}

TEST_F(DatePopupTest, EveryFirstDayIsTaken) {
    showRows(7, 0);
    for (int day = 1; day <= 7; ++day) {
        toldFirstDay() = day;
        openPopup();
        EXPECT_EQ(elm_calendar_first_day_of_week_get(face().calendar()), day - 1);
        face().tapCancel();
    }
}

// The years.

TEST_F(DatePopupTest, TheFirstMonthIsJanuary1973) {
    open(7, 0, "1973-02-10");
    face().turnMonths(-3);
    EXPECT_EQ(face().monthText(), "January 1973");
}

TEST_F(DatePopupTest, TheLastMonthIsDecember2030) {
    open(7, 0, "2030-11-10");
    face().turnMonths(3);
    EXPECT_EQ(face().monthText(), "December 2030");
    face().tapDay(31);
    face().tapSet();
    EXPECT_EQ(strip(), "Tue, Dec 31, 2030");
    EXPECT_EQ(alarm.manualDate, at("2030-12-31 00:00:00"));
}

TEST_F(DatePopupTest, FromADayAfterTheLastYearTheNextTapLeadsBackIntoIt) {
    open(7, 0, "2037-06-15");
    face().turnMonths(1);
    EXPECT_EQ(face().selectedDay().substr(0, 4), "2030");
}

// Which days can be set.

struct DayCase {
    const char* now;
    int months; // To turn.
    int day;    // To tap then.
    bool canSet;
};

class DatePopupDayTest : public DatePopupTest, public testing::WithParamInterface<DayCase> {};

TEST_P(DatePopupDayTest, CanBeSetFromTodayOn) {
    const DayCase& test = GetParam();
    VirtualClock::setNow("Europe/Berlin", test.now);
    open(7, 0);
    EXPECT_TRUE(face().canSet());
    face().turnMonths(test.months);
    face().tapDay(test.day);
    EXPECT_EQ(face().canSet(), test.canSet);
}

INSTANTIATE_TEST_SUITE_P(
    Days, DatePopupDayTest,
    testing::Values(
        DayCase{"2026-11-18 09:41:00", 0, 17, false}, DayCase{"2026-11-18 09:41:00", 0, 19, true},
        DayCase{"2026-11-18 23:59:00", 0, 17, false}, DayCase{"2026-11-18 00:00:00", 0, 19, true},
        DayCase{"2026-11-18 09:41:00", -1, 30, false}, DayCase{"2026-11-18 09:41:00", 1, 2, true},
        DayCase{"2026-12-31 23:59:30", 1, 1, true}, DayCase{"2027-01-01 00:00:30", -1, 31, false},
        DayCase{"2026-01-20 12:00:00", -2, 30, false}, DayCase{"2026-11-18 09:41:00", 12, 1, true},
        DayCase{"2026-11-18 09:41:00", -12, 30, false},
        // Days on which the clocks are changed.
        DayCase{"2026-03-29 03:00:00", 0, 28, false}, DayCase{"2026-10-25 00:30:00", 0, 24, false},
        DayCase{"2028-02-29 12:00:00", 0, 28, false}, DayCase{"2028-02-28 12:00:00", 0, 29, true}));

TEST_F(DatePopupTest, TodayCanBeSetAgainAfterAnotherDay) {
    open(10, 0);
    face().tapDay(17);
    EXPECT_FALSE(face().canSet());
    face().tapDay(18);
    EXPECT_TRUE(face().canSet());
}

TEST_F(DatePopupTest, ADisabledSetDoesNothing) {
    open(10, 0);
    face().tapDay(17);
    face().tapSet();
    EXPECT_TRUE(alive);
    expectNothingChanged();
    face().tapCancel();
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, AMonthAloneMovesTheDayToo) {
    open(10, 0);
    face().turnMonths(-1);
    EXPECT_EQ(face().selectedDay(), "2026-10-18");
    EXPECT_FALSE(face().canSet());
    face().turnMonths(2);
    EXPECT_EQ(face().selectedDay(), "2026-12-18");
    EXPECT_TRUE(face().canSet());
}

TEST_F(DatePopupTest, SetIsEnabledAtFirstWhateverTheDay) {
    open(10, 0, "2026-11-17");
    EXPECT_TRUE(face().canSet());
}

// What Set does.

struct ChoiceCase {
    const char* zone;
    const char* now;
    int hour;
    int minute;
    int months; // To turn from today.
    int day;    // To tap then.
    const char* text;
    const char* midnight; // Null: today, which leaves no dates behind.
};

class DatePopupChoiceTest : public DatePopupTest, public testing::WithParamInterface<ChoiceCase> {};

TEST_P(DatePopupChoiceTest, IsWrittenIntoTheAlarm) {
    const ChoiceCase& test = GetParam();
    VirtualClock::setNow(test.zone, test.now);
    open(test.hour, test.minute);
    face().turnMonths(test.months);
    face().tapDay(test.day);
    ASSERT_TRUE(face().canSet());
    face().tapSet();
    EXPECT_FALSE(alive);
    EXPECT_THAT(device().toasts(), IsEmpty());
    EXPECT_EQ(strip(), test.text);
    const std::time_t midnight = test.midnight ? at(test.midnight) : 0;
    EXPECT_EQ(alarm.autoDate, midnight);
    EXPECT_EQ(alarm.manualDate, midnight);
    expectNoRepeat();
    EXPECT_EQ(alarm.hour, test.hour);
    EXPECT_EQ(alarm.min, test.minute);
    const std::string today = civil(VirtualClock::now()).substr(0, 10) + " 00:00:00";
    EXPECT_EQ(chosenDay(), test.midnight ? test.midnight : today);
    std::tm copy = date;
    std::mktime(&copy);
    EXPECT_EQ(copy.tm_wday, date.tm_wday) << "the day is not normalised";
    EXPECT_EQ(copy.tm_yday, date.tm_yday);
    EXPECT_EQ(copy.tm_isdst, date.tm_isdst);
}

constexpr const char* BERLIN = "Europe/Berlin";

INSTANTIATE_TEST_SUITE_P(
    Days, DatePopupChoiceTest,
    testing::Values(
        // Another year.
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 2, 5, "Tue, Jan 5, 2027",
                   "2027-01-05 00:00:00"},
        ChoiceCase{BERLIN, "2026-12-31 23:59:00", 7, 0, 1, 1, "Fri, Jan 1, 2027",
                   "2027-01-01 00:00:00"},
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 12, 18, "Thu, Nov 18, 2027",
                   "2027-11-18 00:00:00"},
        // Another month: never called tomorrow.
        ChoiceCase{BERLIN, "2026-11-30 09:41:00", 7, 0, 1, 1, "Tue, Dec 1", "2026-12-01 00:00:00"},
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 1, 2, "Wed, Dec 2", "2026-12-02 00:00:00"},
        // Days of this month.
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 0, 19, "Tomorrow - Thu, Nov 19",
                   "2026-11-19 00:00:00"},
        ChoiceCase{BERLIN, "2026-11-18 23:59:00", 0, 0, 0, 19, "Tomorrow - Thu, Nov 19",
                   "2026-11-19 00:00:00"},
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 0, 20, "Fri, Nov 20",
                   "2026-11-20 00:00:00"},
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 7, 0, 0, 30, "Mon, Nov 30",
                   "2026-11-30 00:00:00"},
        ChoiceCase{BERLIN, "2028-02-28 09:41:00", 7, 0, 0, 29, "Tomorrow - Tue, Feb 29",
                   "2028-02-29 00:00:00"},
        // Today, while the time is still to come.
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 9, 45, 0, 18, "Today - Wed, Nov 18", nullptr},
        ChoiceCase{BERLIN, "2026-11-18 09:41:00", 10, 0, 0, 18, "Today - Wed, Nov 18", nullptr},
        ChoiceCase{BERLIN, "2026-12-31 23:58:00", 23, 59, 0, 31, "Today - Thu, Dec 31", nullptr},
        // Days on which the clocks are changed, and a zone of half hours.
        ChoiceCase{BERLIN, "2026-03-28 09:41:00", 2, 30, 0, 29, "Tomorrow - Sun, Mar 29",
                   "2026-03-29 00:00:00"},
        ChoiceCase{BERLIN, "2026-10-24 09:41:00", 2, 30, 0, 25, "Tomorrow - Sun, Oct 25",
                   "2026-10-25 00:00:00"},
        ChoiceCase{BERLIN, "2026-03-28 09:41:00", 2, 30, 0, 30, "Mon, Mar 30",
                   "2026-03-30 00:00:00"},
        ChoiceCase{"Asia/Kolkata", "2026-11-18 09:41:00", 7, 0, 0, 19, "Tomorrow - Thu, Nov 19",
                   "2026-11-19 00:00:00"},
        // In this zone summer time skips the hour after midnight.
        ChoiceCase{"Asia/Beirut", "2026-03-27 09:41:00", 7, 0, 0, 29, "Sun, Mar 29",
                   "2026-03-29 01:00:00"}));

struct PastCase {
    const char* now;
    int hour;
    int minute;
    const char* day; // On which the calendar opens; Set is tapped at once.
    const char* text;
    const char* chosen;
};

class DatePopupPastTest : public DatePopupTest, public testing::WithParamInterface<PastCase> {};

TEST_P(DatePopupPastTest, BecomesTomorrow) {
    const PastCase& test = GetParam();
    VirtualClock::setNow(BERLIN, test.now);
    open(test.hour, test.minute, test.day);
    const std::time_t now = VirtualClock::now();
    face().tapSet();
    expectTomorrowInstead(test.text);
    // The time of day is kept; some seconds have passed by the tap.
    EXPECT_EQ(chosenDay().substr(0, 16), test.chosen);
    EXPECT_LT(VirtualClock::now() - now, 30);
}

INSTANTIATE_TEST_SUITE_P(Days, DatePopupPastTest,
                         testing::Values(PastCase{"2026-11-18 09:41:00", 9, 41, "2026-11-18",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-11-18 09:41:00", 9, 40, "2026-11-18",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-11-18 09:41:00", 8, 59, "2026-11-18",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-11-18 09:41:00", 23, 59, "2026-11-17",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-11-18 09:41:00", 23, 59, "2026-10-30",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-11-18 09:41:00", 23, 59, "2025-12-31",
                                                  "Tomorrow - Thu, Nov 19", "2026-11-19 09:41"},
                                         PastCase{"2026-12-31 23:59:00", 23, 59, "2026-12-31",
                                                  "Tomorrow - Fri, Jan 1", "2027-01-01 23:59"},
                                         PastCase{"2026-11-30 12:00:00", 6, 0, "2026-11-30",
                                                  "Tomorrow - Tue, Dec 1", "2026-12-01 12:00"},
                                         // 86400 seconds later: an hour later after a night of 23
                                         // hours, the same day in one of 25.
                                         PastCase{"2026-03-28 12:00:00", 6, 0, "2026-03-28",
                                                  "Tomorrow - Sun, Mar 29", "2026-03-29 13:00"},
                                         PastCase{"2026-10-25 00:30:00", 0, 10, "2026-10-25",
                                                  "Tomorrow - Sun, Oct 25", "2026-10-25 23:30"}));

TEST_F(DatePopupTest, TheTimeIsThatOfTheWheels) {
    open(23, 0);
    std::tm time{};
    elm_datetime_value_get(page->timePicker->getDateTimeObj(), &time);
    time.tm_hour = 8;
    elm_datetime_value_set(page->timePicker->getDateTimeObj(), &time);
    face().tapSet();
    expectTomorrowInstead("Tomorrow - Thu, Nov 19");
}

TEST_F(DatePopupTest, WithoutWheelsTheTimeIsThatOfTheAlarm) {
    open(23, 0);
    while (Evas_Object* wheels = page->timePicker->getDateTimeObj())
        evas_object_del(wheels);
    face().tapSet();
    EXPECT_THAT(device().toasts(), IsEmpty());
    EXPECT_EQ(strip(), "Today - Wed, Nov 18");
}

TEST_F(DatePopupTest, TheDayThatItBecameWhileOpenCounts) {
    VirtualClock::setNow(BERLIN, "2026-11-18 23:59:00");
    open(23, 59, "2026-11-18");
    VirtualClock::jump(120);
    EXPECT_TRUE(face().canSet());
    face().tapSet();
    expectTomorrowInstead("Tomorrow - Fri, Nov 20");
}

TEST_F(DatePopupTest, ADayCanBeSetOverAnother) {
    open(7, 0);
    face().tapDay(25);
    face().tapSet();
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-25");
    face().tapDay(26);
    face().tapSet();
    EXPECT_EQ(strip(), "Thu, Nov 26");
    EXPECT_EQ(alarm.autoDate, at("2026-11-26 00:00:00"));
    EXPECT_EQ(alarm.manualDate, at("2026-11-26 00:00:00"));
}

TEST_F(DatePopupTest, SettingTodayTakesBackAnEarlierChoice) {
    open(10, 0);
    face().tapDay(25);
    face().tapSet();
    openPopup();
    face().tapDay(18);
    face().tapSet();
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
    EXPECT_EQ(strip(), "Today - Wed, Nov 18");
}

TEST_F(DatePopupTest, TranslationsAreNoFormats) {
    open(7, 0);
    const TestCatalogue hostile{{"IDS_CLOCK_BODY_TOMORROW", "%n%s%d"}, {"IDS_COM_SK_SET", "Set"}};
    popup->onEvent(ClockEventListener::LANGUAGE_CHANGED);
    face().tapDay(19);
    face().tapSet();
    EXPECT_EQ(strip().substr(0, 9), "%n%s%d - ");
}

TEST_F(DatePopupTest, ALongTextIsCutWithoutSplittingACharacter) {
    open(7, 0);
    const TestCatalogue wordy{{"IDS_CLOCK_BODY_TOMORROW", std::string(510, 'x') + "ä"},
                              {"IDS_COM_SK_SET", "Set"}};
    popup->onEvent(ClockEventListener::LANGUAGE_CHANGED);
    face().tapDay(19);
    face().tapSet();
    EXPECT_EQ(strip(), std::string(510, 'x'));
}

// How it closes.

TEST_F(DatePopupTest, CancelChangesNothing) {
    open(7, 0);
    face().tapDay(25);
    const std::string before = chosenDay();
    face().tapCancel();
    EXPECT_FALSE(alive);
    EXPECT_FALSE(face().isOpen());
    EXPECT_EQ(chosenDay(), before);
    expectNothingChanged();
}

TEST_F(DatePopupTest, TheBackKeyChangesNothing) {
    open(7, 0);
    face().tapDay(25);
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_FALSE(face().isOpen());
    expectNothingChanged();
}

TEST_F(DatePopupTest, TheBackKeyClosesItAtOnce) {
    open(7, 0);
    stage().backKey();
    Stage::frames(1);
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, ItMayBeDestroyedTwice) {
    open(7, 0);
    popup->destroy();
    popup->destroy();
    Stage::frames(1);
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, ItGoesWithItsView) {
    open(7, 0);
    evas_object_del(popup->getEvasObj());
    popup->onEvent(ClockEventListener::LANGUAGE_CHANGED);
    Stage::frames(1);
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, ItGoesWithItsPage) {
    open(7, 0);
    page->destroy();
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_FALSE(face().isOpen());
}

TEST_F(DatePopupTest, ItGoesWithTheWindow) {
    open(7, 0);
    takeStageDown();
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, ItMayEndWhileSetRuns) {
    open(7, 0, "2026-11-17");
    device().onCall("notification_status_message_post", [this] { popup->destroy(); });
    face().tapSet();
    expectTomorrowInstead("Tomorrow - Thu, Nov 19");
}

TEST_F(DatePopupTest, ItMayEndWhileADayIsChosen) {
    open(7, 0);
    evas_object_smart_callback_add(
        face().calendar(), "changed",
        [](void* data, Evas_Object*, void*) {
            static_cast<AlarmDatePopupViewController*>(data)->destroy();
        },
        popup);
    face().tapDay(25);
    EXPECT_FALSE(alive);
    expectNothingChanged();
}

TEST_F(DatePopupTest, ItsPageMayEndWhileADayIsChosen) {
    open(7, 0);
    evas_object_smart_callback_add(
        face().calendar(), "changed",
        [](void* data, Evas_Object*, void*) { static_cast<TwoRows*>(data)->destroy(); }, page);
    face().tapDay(25);
    EXPECT_FALSE(alive);
}

TEST_F(DatePopupTest, ASecondTapOnSetIsTooLate) {
    open(7, 0, "2026-11-17");
    Evas_Object* set = face().button("Set")->widget;
    evas_object_smart_callback_call(set, "clicked", nullptr);
    evas_object_smart_callback_call(set, "clicked", nullptr);
    stage().settle();
    EXPECT_THAT(device().toasts(), ElementsAre(PAST_TOAST));
}

TEST_F(DatePopupTest, TheCompletionFunctionIsNeverCalled) {
    open(7, 0);
    int calls = 0;
    popup->setSelectedCb([&calls] { ++calls; });
    face().tapDay(25);
    face().tapSet();
    openPopup();
    popup->setSelectedCb([&calls] { ++calls; });
    face().tapCancel();
    EXPECT_EQ(calls, 0);
}

// Language.

TEST_F(DatePopupTest, TheButtonsAndTheTitleFollowTheLanguage) {
    open(7, 0);
    const TestCatalogue french{{"IDS_COM_SK_SET", "Régler"},
                               {"IDS_COM_SK_CANCEL", "Annuler"},
                               {"IDS_CLOCK_HEADER_SET_DATE", "Date"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_TRUE(face().button("Régler"));
    EXPECT_TRUE(face().button("Annuler"));
    EXPECT_STREQ(elm_object_part_text_get(popup->getEvasObj(), "title,text"), "Date");
    face().tapDay(25);
    face().tapButton("Régler");
    EXPECT_EQ(alarm.manualDate, at("2026-11-25 00:00:00"));
}

TEST_F(DatePopupTest, OtherEventsChangeNoLabel) {
    open(7, 0);
    const TestCatalogue french{{"IDS_COM_SK_SET", "Régler"}};
    for (const auto event : {ClockEventListener::SETTINGS_CHANGED, ClockEventListener::TIME_CHANGED,
                             ClockEventListener::PAUSED, ClockEventListener::RESUMED})
        popup->onEvent(event);
    stage().settle();
    EXPECT_TRUE(face().button("Set"));
}

TEST_F(DatePopupTest, TheLanguageMayChangeBeforeItIsShown) {
    showRows(7, 0);
    AlarmDatePopupViewController hidden(alarm, page->timePicker, page->repeat, date);
    hidden.onEvent(ClockEventListener::LANGUAGE_CHANGED);
    EXPECT_THAT(takeErrors(), IsEmpty());
}

// Bad input.

TEST_F(DatePopupTest, WithoutAParentThereIsNoContent) {
    showRows(7, 0);
    AlarmDatePopupViewController hidden(alarm, page->timePicker, page->repeat, date);
    EXPECT_EQ(hidden._createContent(nullptr), nullptr);
    expectLog("Parent is NULL !!");
}

TEST_F(DatePopupTest, ToleratesAMissingPopup) {
    AlarmDatePopupViewController::_calendarPopupDateChangedCb(nullptr, nullptr, nullptr);
    expectLog("Data is NULL !!");
}

TEST_F(DatePopupTest, ToleratesMissingRows) {
    showRows(10, 0);
    const std::time_t noon = at("2026-11-18 12:00:00");
    localtime_r(&noon, &date);
    popup = new AlarmDatePopupViewController(alarm, nullptr, nullptr, date);
    attach();
    face().tapDay(25);
    face().tapSet();
    EXPECT_FALSE(alive);
    EXPECT_EQ(alarm.manualDate, at("2026-11-25 00:00:00"));
    popup = new AlarmDatePopupViewController(alarm, nullptr, nullptr, date);
    attach();
    face().tapDay(18);
    face().tapSet();
    EXPECT_EQ(alarm.manualDate, 0);
}

} // namespace

// Comes before the library's.
int ClockIcuDataModel::getFirstDayOfWeek() {
    if (toldFirstDay())
        return *toldFirstDay();
    using Function = int (*)();
    static const auto real =
        reinterpret_cast<Function>(dlsym(RTLD_NEXT, "_ZN17ClockIcuDataModel17getFirstDayOfWeekEv"));
    return real();
}
