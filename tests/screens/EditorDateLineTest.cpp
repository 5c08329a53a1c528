#include <gtest/gtest.h>

#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"
#include "support/StoredData.h"

namespace {

class EditorDateLineTest : public EditorFixture {
protected:
    /** On the repeat screen, and comes back. */
    void flipMonday() {
        stage().tapRow(elm_genlist_item_next_get(elm_genlist_first_item_get(genlist())));
        stage().settle();
        stage().tapText("Every Monday");
        stage().settle();
        stage().backKey();
        stage().settle();
    }

    std::string lineOnLanguageChange() {
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
        stage().settle();
        return dateText();
    }
};

TEST_F(EditorDateLineTest, ALaterTimeIsToday) {
    editAlarm(alarmAt(9, 42));
    EXPECT_EQ(lineOnLanguageChange(), "Today - Wed, Nov 18");
}

TEST_F(EditorDateLineTest, TheCurrentMinuteIsTomorrow) {
    editAlarm(alarmAt(9, 41));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, AtSevenAnAlarmForSevenIsTomorrow) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 07:00:00");
    editAlarm(alarmAt(7, 0));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, AnEarlierHourIsTomorrow) {
    editAlarm(alarmAt(8, 59));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, ALaterHourIsTodayWhateverTheMinute) {
    editAlarm(alarmAt(10, 0));
    EXPECT_EQ(lineOnLanguageChange(), "Today - Wed, Nov 18");
}

TEST_F(EditorDateLineTest, RepeatDaysAreListedFromMondayToSunday) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatWeekly = 3;
    editAlarm(alarm);
    EXPECT_EQ(lineOnLanguageChange(), "Mon Sun ");
}

TEST_F(EditorDateLineTest, AllDaysAreEveryDay) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatWeekly = 127;
    editAlarm(alarm);
    EXPECT_EQ(lineOnLanguageChange(), "Every day");
}

TEST_F(EditorDateLineTest, ALineOfTranslationsIsCutAtOneKilobyte) {
    editAlarm(alarmAt(10, 0));
    const TestCatalogue wordy{{"IDS_CLOCK_BODY_TODAY", std::string(1022, 'x') + "ä"}};
    EXPECT_EQ(lineOnLanguageChange(), std::string(1022, 'x'));
}

TEST_F(EditorDateLineTest, ALineOfRepeatDaysTakesAllOfThem) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatWeekly = 62;
    editAlarm(alarm);
    const TestCatalogue wordy{{"IDS_CLOCK_SBODY_MON_ABB2", std::string(70, 'm')},
                              {"IDS_CLOCK_SBODY_TUE_ABB2", std::string(62, 't')}};
    EXPECT_EQ(lineOnLanguageChange().substr(0, 126),
              std::string(63, 'm') + std::string(62, 't') + " ");
}

TEST_F(EditorDateLineTest, TheSundayNightBeforeALongDayStaysOnIt) {
    // 86400 seconds later it is still the day on which the clocks went back.
    VirtualClock::setNow("Europe/Berlin", "2026-10-25 00:30:00");
    editAlarm(alarmAt(0, 10));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Sun, Oct 25");
}

TEST_F(EditorDateLineTest, TheLateEveningBeforeAShortDaySkipsIt) {
    VirtualClock::setNow("Europe/Berlin", "2026-03-28 23:30:00");
    editAlarm(alarmAt(6, 0));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Mon, Mar 30");
}

TEST_F(EditorDateLineTest, ThePickedDateReturnsWhenTheRowIsMadeAnew) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
    editAlarm(alarm);
    EXPECT_EQ(lineOnLanguageChange(), "Thu, Dec 24");
}

TEST_F(EditorDateLineTest, TheRepeatScreenBringsTheDays) {
    editAlarm(alarmAt(7, 0));
    flipMonday();
    EXPECT_EQ(dateText(), "Mon ");
}

TEST_F(EditorDateLineTest, TheRepeatScreenWithoutDaysBringsTheNextRing) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatWeekly = 2;
    editAlarm(alarm);
    flipMonday();
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, WithoutTheStripNothingHappens) {
    createAlarm();
    evas_object_del(timePickerRow().getCalendarObj());
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    EXPECT_TRUE(isOpen());
}

class EditorMinuteTimerTest : public EditorDateLineTest {
protected:
    /** An automatic alarm for 09:42, seen at 09:41:00. */
    void openForNextMinute() {
        createAlarm();
        pick(9, 42);
        EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
    }
};

TEST_F(EditorMinuteTimerTest, TheLineFollowsTheMinute) {
    openForNextMinute();
    const std::time_t minute = at("2026-11-18 09:42:00");
    while (VirtualClock::now() < minute)
        Stage::frames(1);
    Stage::frames(3);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

struct TurnCase {
    const char* zone;
    const char* now; // Less than a minute before something turns.
    int hour;
    int minute;
    const char* before;
    const char* after;
};

class EditorMinuteTurnTest : public EditorFixture, public testing::WithParamInterface<TurnCase> {};

TEST_P(EditorMinuteTurnTest, KeepsTheLineCurrent) {
    const TurnCase& turn = GetParam();
    VirtualClock::setNow(turn.zone, turn.now);
    createAlarm();
    pick(turn.hour, turn.minute);
    EXPECT_EQ(dateText(), turn.before);
    Stage::advance(31);
    EXPECT_EQ(dateText(), turn.after);
}

INSTANTIATE_TEST_SUITE_P(
    Moments, EditorMinuteTurnTest,
    testing::Values(TurnCase{"Europe/Berlin", "2026-11-18 09:41:30", 9, 42, "Today - Wed, Nov 18",
                             "Tomorrow - Thu, Nov 19"},
                    TurnCase{"Europe/Berlin", "2026-11-18 09:59:30", 10, 0, "Today - Wed, Nov 18",
                             "Tomorrow - Thu, Nov 19"},
                    // Midnight, the ends of a month and of a year, leap day.
                    TurnCase{"Europe/Berlin", "2026-11-18 23:59:30", 6, 0, "Tomorrow - Thu, Nov 19",
                             "Today - Thu, Nov 19"},
                    TurnCase{"Europe/Berlin", "2026-11-18 23:59:30", 0, 0, "Tomorrow - Thu, Nov 19",
                             "Tomorrow - Fri, Nov 20"},
                    TurnCase{"Europe/Berlin", "2026-11-30 23:59:30", 6, 0, "Tomorrow - Tue, Dec 1",
                             "Today - Tue, Dec 1"},
                    TurnCase{"Europe/Berlin", "2026-12-31 23:59:30", 6, 0, "Tomorrow - Fri, Jan 1",
                             "Today - Fri, Jan 1"},
                    TurnCase{"Europe/Berlin", "2028-02-28 23:59:30", 6, 0, "Tomorrow - Tue, Feb 29",
                             "Today - Tue, Feb 29"},
                    TurnCase{"Asia/Kolkata", "2026-11-18 23:59:30", 6, 0, "Tomorrow - Thu, Nov 19",
                             "Today - Thu, Nov 19"},
                    // The hour from two to three is left out.
                    TurnCase{"Europe/Berlin", "2026-03-29 01:59:30", 2, 30, "Today - Sun, Mar 29",
                             "Tomorrow - Mon, Mar 30"},
                    TurnCase{"Europe/Berlin", "2026-03-29 01:59:30", 3, 0, "Today - Sun, Mar 29",
                             "Tomorrow - Mon, Mar 30"},
                    // Half an hour is left out.
                    TurnCase{"Australia/Lord_Howe", "2026-10-04 01:59:30", 2, 15,
                             "Today - Sun, Oct 4", "Tomorrow - Mon, Oct 5"}));

TEST_F(EditorMinuteTimerTest, AnHourThatComesTwiceBringsTodayBack) {
    // Thirty seconds before three o'clock becomes two again.
    VirtualClock::setNow("Europe/Berlin", "2026-10-25 01:59:30");
    VirtualClock::setNow(VirtualClock::now() + 3600);
    createAlarm();
    pick(2, 30);
    EXPECT_EQ(dateText(), "Tomorrow - Mon, Oct 26");
    Stage::advance(31);
    EXPECT_EQ(dateText(), "Today - Sun, Oct 25");
}

TEST_F(EditorMinuteTimerTest, APickedDateStaysAsItReadsAtMidnight) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 23:59:30");
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    editAlarm(alarm);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    Stage::advance(31);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle();
    EXPECT_EQ(dateText(), "Today - Thu, Nov 19");
}

TEST_F(EditorMinuteTimerTest, RepeatDaysStayAsTheyRead) {
    ClockAlarmDbData alarm = alarmAt(9, 42);
    alarm.repeatWeekly = 8;
    editAlarm(alarm);
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Wed ");
}

TEST_F(EditorMinuteTimerTest, TheLineStaysUntilTheMinuteIsOver) {
    openForNextMinute();
    const std::time_t minute = at("2026-11-18 09:42:00");
    while (VirtualClock::now() < minute - 1)
        Stage::frames(1);
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
}

TEST_F(EditorMinuteTimerTest, TheTimerGoesOnWithOneTimer) {
    openForNextMinute();
    for (int i = 0; i < 3; ++i) {
        Stage::advance(60);
        EXPECT_EQ(liveTimers(), 1);
    }
    pick(9, 47);
    ASSERT_EQ(dateText(), "Today - Wed, Nov 18");
    Stage::advance(180);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorMinuteTimerTest, InTheBackgroundThereIsNoTimer) {
    openForNextMinute();
    ClockEventListener::raise(ClockEventListener::PAUSED);
    EXPECT_EQ(liveTimers(), 0);
    Stage::advance(120);
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
}

TEST_F(EditorMinuteTimerTest, ComingBackBringsTheLineUpToDateAndStartsTheTimer) {
    openForNextMinute();
    ClockEventListener::raise(ClockEventListener::PAUSED);
    Stage::advance(120);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(liveTimers(), 1);
}

TEST_F(EditorMinuteTimerTest, ComingBackTwiceKeepsOneTimer) {
    openForNextMinute();
    ClockEventListener::raise(ClockEventListener::RESUMED);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_EQ(liveTimers(), 1);
}

TEST_F(EditorMinuteTimerTest, LeavingEndsTheTimer) {
    createAlarm();
    EXPECT_EQ(liveTimers(), 1);
    tapCancel();
    EXPECT_EQ(liveTimers(), 0);
}

TEST_F(EditorMinuteTimerTest, ThePickedDateSurvivesTheMinute) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
    editAlarm(alarm);
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Thu, Dec 24");
}

TEST_F(EditorMinuteTimerTest, ToleratesAMissingEditor) {
    EXPECT_FALSE(AlarmEditViewController::_updateDateTextTimerCb(nullptr));
    expectLog("Data is NULL !!");
}

/** An alarm without a day of its own whose line has been written all the same. */
class EditorUndatedLineTest : public EditorDateLineTest {
protected:
    /** A new alarm for six, whose line another language brings. */
    void openAtFive() {
        VirtualClock::setNow("Europe/Berlin", "2026-11-18 05:00:00");
        createAlarm();
        ASSERT_EQ(dateText(), "");
        ASSERT_EQ(lineOnLanguageChange(), "Today - Wed, Nov 18");
    }
    std::string lineAfter(ClockEventListener::EventType event, const char* now) {
        VirtualClock::setNow("Europe/Berlin", now);
        ClockEventListener::raise(event);
        stage().settle();
        return dateText();
    }
    void tapDateButton() {
        stage().tapPart(timePickerRow().getCalendarObj(), "date.button");
        stage().settle();
    }
    /** The list takes the content of the row away. */
    void scrollToName() {
        stage().showRow(nameRow().getElmObjectItem());
        while (timePickerRow().getCalendarObj())
            evas_object_del(timePickerRow().getCalendarObj());
    }
    std::string lineAtTheTop() {
        Elm_Object_Item* const row = timePickerRow().getElmObjectItem();
        elm_genlist_item_update(row);
        stage().showRow(row);
        stage().settle();
        return dateText();
    }
};

TEST_F(EditorUndatedLineTest, ANewAlarmsLineStaysBlankWhateverTheTime) {
    createAlarm();
    Stage::advance(61);
    EXPECT_EQ(dateText(), "");
    EXPECT_EQ(lineAfter(ClockEventListener::RESUMED, "2026-11-18 12:00:00"), "");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-19 05:00:00"), "");
}

TEST_F(EditorUndatedLineTest, FollowsAClockThatIsSet) {
    openAtFive();
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-18 06:00:00"),
              "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-24 23:59:50"),
              "Tomorrow - Wed, Nov 25");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-25 00:00:00"),
              "Today - Wed, Nov 25");
}

TEST_F(EditorUndatedLineTest, FollowsTheMinute) {
    openAtFive();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 05:59:00");
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorUndatedLineTest, IsUpToDateWhenTheApplicationComesBack) {
    openAtFive();
    ClockEventListener::raise(ClockEventListener::PAUSED);
    EXPECT_EQ(lineAfter(ClockEventListener::RESUMED, "2026-11-18 06:00:00"),
              "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorUndatedLineTest, TheDatePopupOpensOnTheDayInTheLine) {
    openAtFive();
    lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-24 23:00:00");
    tapDateButton();
    EXPECT_EQ(DatePopupOnFace(stage()).selectedDay(), "2026-11-25");
}

TEST_F(EditorUndatedLineTest, TodayFromTheDatePopupFollowsTheMinute) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 05:59:00");
    createAlarm();
    tapDateButton();
    DatePopupOnFace(stage()).tapSet();
    stage().settle();
    ASSERT_EQ(dateText(), "Today - Wed, Nov 18");
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorUndatedLineTest, ALineWithoutRepeatDaysFollowsAClockThatIsSet) {
    ClockAlarmDbData alarm = alarmAt(9, 42);
    alarm.repeatWeekly = 2;
    editAlarm(alarm);
    flipMonday();
    ASSERT_EQ(dateText(), "Today - Wed, Nov 18");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-18 12:00:00"),
              "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorUndatedLineTest, ARepairedLineFollowsAClockThatIsSet) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-17 00:00:00"));
    editAlarm(alarm);
    expectLog("Set autoDate and manualDate to 0. Time already passed !!");
    ASSERT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-20 12:00:00"),
              "Tomorrow - Sat, Nov 21");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-21 05:00:00"),
              "Today - Sat, Nov 21");
}

TEST_F(EditorUndatedLineTest, RepeatDaysStayWhateverTheTime) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatWeekly = 62;
    editAlarm(alarm);
    EXPECT_EQ(lineAfter(ClockEventListener::RESUMED, "2026-11-20 12:00:00"),
              "Mon Tue Wed Thu Fri ");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-25 12:00:00"),
              "Mon Tue Wed Thu Fri ");
}

TEST_F(EditorUndatedLineTest, RepeatDaysOutliveTheDayThatTheWheelsHadBrought) {
    createAlarm();
    pick(10, 0);
    flipMonday();
    ASSERT_EQ(dateText(), "Mon ");
    EXPECT_EQ(lineOnLanguageChange(), "Mon ");
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-25 12:00:00"), "Mon ");
    flipMonday();
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 26");
    flipMonday();
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms().front().repeatWeekly, 2);
}

TEST_F(EditorUndatedLineTest, RepeatDaysOutliveAPickedDayThatIsOver) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    editAlarm(alarm);
    flipMonday();
    EXPECT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-25 12:00:00"), "Mon ");
}

TEST_F(EditorUndatedLineTest, FollowsWhileItIsOutOfView) {
    openAtFive();
    scrollToName();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 06:00:00");
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_EQ(lineAtTheTop(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorUndatedLineTest, SpeaksTheLanguageThatWasChosenWhileItWasOutOfView) {
    openAtFive();
    scrollToName();
    const TestCatalogue german{{"IDS_CLOCK_BODY_TODAY", "Heute"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    EXPECT_EQ(lineAtTheTop(), "Heute - Wed, Nov 18");
}

TEST_F(EditorUndatedLineTest, WhatItTellsIsWhatIsSaved) {
    openAtFive();
    ASSERT_EQ(lineAfter(ClockEventListener::TIME_CHANGED, "2026-11-18 06:00:00"),
              "Tomorrow - Thu, Nov 19");
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(civil(storedAlarms().front().autoDate), "2026-11-19 00:00:00");
}

} // namespace
