// The days of the calendar: pressed, chosen, today, gone by, of another month, reached by keys,
// turned. Today is 18 November 2026.

#include <string>

#include <gtest/gtest.h>

#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "support/Look.h"
#include "support/Ring.h"

namespace {

/** 1 November 2026 is a Sunday, and the calendar's week begins with one: the cell before a day. */
constexpr int CELL_OF_DAY_0 = -1;

class DateStatesTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        ClockAlarmDbData alarm = storedAlarm(7, 30);
        alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-20 00:00:00"));
        alarm.repeatWeekly = 0;
        alarm.repeatOnce = 1;
        editAlarm(alarm);
        stage().tapPart(timePickerRow().getCalendarObj(), "date.button");
        stage().settle();
        ASSERT_EQ(popup().selectedDay(), "2026-11-20");
    }
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    /** The cell of a day of November, also of one before or after it. */
    Area day(int number) {
        const std::string part = "cit_" + std::to_string(number + CELL_OF_DAY_0) + "_event";
        const Area whole = Stage::area(popup().calendar());
        Area area;
        edje_object_part_geometry_get(elm_layout_edje_get(popup().calendar()), part.c_str(),
                                      &area.x, &area.y, &area.width, &area.height);
        area.x += whole.x;
        area.y += whole.y;
        return area;
    }
    Look look(int number) { return {stage(), day(number)}; }
    void press(int number) { stage().press(day(number).middle().x, day(number).middle().y); }

    DatePopupOnFace popup() { return DatePopupOnFace(stage()); }
};

TEST_F(DateStatesTest, APressShowsAndThenTheDayIsChosen) {
    const Look before = look(25);
    press(25);
    const Look pressed = look(25);
    EXPECT_GT(pressed.unlike(before), SEEN);
    EXPECT_EQ(pressed.accent(), 0);
    stage().screenshot("day-pressed");
    stage().release();
    EXPECT_GT(look(25).accent(), 5 * SEEN);
    EXPECT_EQ(look(20).accent(), 0) << "chosen before";
}

TEST_F(DateStatesTest, TodayHasARing) {
    EXPECT_GT(look(18).accent(), 20);
    EXPECT_LT(look(18).accent(), look(20).accent());
    EXPECT_EQ(look(19).accent(), 0);
}

TEST_F(DateStatesTest, DaysBeforeTodayArePalerAndThoseOfOtherMonthsMore) {
    const int coming = look(19).brightest();
    const int gone = look(17).brightest();
    const int december = look(31).brightest();
    EXPECT_GT(coming, 240);
    EXPECT_LT(gone, coming - 60);
    EXPECT_LT(december, gone - 30);
    EXPECT_EQ(look(18).brightest(), 255) << "today";
    EXPECT_LT(look(14).brightest(), look(21).brightest()) << "Saturdays";
}

TEST_F(DateStatesTest, EachMonthKnowsWhatHasGoneBy) {
    popup().turnMonths(-1);
    // October begins on the fifth day of the week.
    const int dayInOctober = 4 + 22;
    EXPECT_LT(look(dayInOctober).brightest(), 180);
    popup().turnMonths(2);
    const int dayInDecember = 2 + 22;
    EXPECT_GT(look(dayInDecember).brightest(), 240);
    popup().turnMonths(-1);
    EXPECT_LT(look(17).brightest(), 180);
    EXPECT_GT(look(19).brightest(), 240);
}

TEST_F(DateStatesTest, AWeekMayBeginWithAnyDay) {
    Evas_Object* const calendar = popup().calendar();
    evas_object_hide(calendar);
    elm_calendar_first_day_of_week_set(calendar, ELM_DAY_MONDAY);
    evas_object_show(calendar);
    // The first of the month is now in the last column.
    const int later = 6;
    EXPECT_LT(look(17 + later).brightest(), 180);
    EXPECT_GT(look(19 + later).brightest(), 240);
}

TEST_F(DateStatesTest, ADayGoneByIsChosenInFullColourAndCannotBeSet) {
    popup().tapDay(17);
    const Look chosen = look(17);
    EXPECT_GT(chosen.accent(), 5 * SEEN);
    EXPECT_EQ(popup().selectedDay(), "2026-11-17");
    const Spot middle = day(17).middle();
    EXPECT_LT(Look(stage(), {middle.x - 8, middle.y - 8, 16, 16}).darkest(), 90) << "its text";
    const auto set = popup().button("Set");
    ASSERT_TRUE(set);
    EXPECT_FALSE(popup().canSet());
    stage().screenshot("day-gone-by");
    const Look pale(stage(), set->widget);
    popup().tapDay(19);
    EXPECT_GT(Look(stage(), set->widget).unlike(pale), 10 * SEEN);
}

TEST_F(DateStatesTest, KeysAndTurningAreSeen) {
    const Look before = look(20);
    const Area month{110, 35, 140, 48};
    const Look resting(stage(), month);
    ASSERT_TRUE(tabTo(stage(), popup().calendar()));
    EXPECT_GT(look(20).unlike(before), 40);
    stage().screenshot("day-focused");
    stage().keySettled("Return");
    EXPECT_GT(Look(stage(), month).accent(), resting.accent() + SEEN);
    stage().screenshot("day-turning");
    stage().keySettled("Return");
    EXPECT_EQ(Look(stage(), month).unlike(resting), 0);
    stage().tap(180, 12);
    EXPECT_EQ(look(20).unlike(before), 0);
}

TEST_F(DateStatesTest, TheButtonsShowAFingerAndTheKeys) {
    for (const char* text : {"Cancel", "Set"}) {
        SCOPED_TRACE(text);
        Evas_Object* const button = popup().button(text)->widget;
        const Look before(stage(), button);
        pressOn(stage(), button);
        EXPECT_GT(Look(stage(), button).unlike(before), 10 * SEEN);
        stage().moveTo(180, 12);
        stage().release();
        ASSERT_TRUE(tabTo(stage(), button));
        EXPECT_GT(Look(stage(), button).unlike(before), SEEN);
        stage().tap(180, 12);
        EXPECT_EQ(Look(stage(), button).unlike(before), 0);
    }
}

TEST_F(DateStatesTest, ADisabledCalendarIsPaler) {
    const Look before = look(25);
    elm_object_disabled_set(popup().calendar(), EINA_TRUE);
    const Look disabled = look(25);
    EXPECT_LT(disabled.brightest(), before.brightest() / 2);
    press(25);
    EXPECT_EQ(look(25).unlike(disabled), 0) << "it answers a touch";
    stage().release();
    EXPECT_FALSE(tabTo(stage(), popup().calendar()));
    elm_object_disabled_set(popup().calendar(), EINA_FALSE);
    EXPECT_EQ(look(25).unlike(before), 0);
}

} // namespace
