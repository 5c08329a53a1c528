#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"

namespace {

class EditorDateLineTest : public EditorFixture {
protected:
    /** An alarm that is not in the store. */
    static ClockAlarmDbData anAlarm(int hour, int minute) {
        ClockAlarmDbData alarm{};
        alarm.hour = hour;
        alarm.min = minute;
        return alarm;
    }

    std::string lineOnLanguageChange() {
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
        stage().settle();
        return dateText();
    }
};

TEST_F(EditorDateLineTest, ALaterTimeIsToday) {
    editAlarm(anAlarm(9, 42));
    EXPECT_EQ(lineOnLanguageChange(), "Today - Wed, Nov 18");
}

TEST_F(EditorDateLineTest, TheCurrentMinuteIsTomorrow) {
    editAlarm(anAlarm(9, 41));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, AtSevenAnAlarmForSevenIsTomorrow) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 07:00:00");
    editAlarm(anAlarm(7, 0));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, AnEarlierHourIsTomorrow) {
    editAlarm(anAlarm(8, 59));
    EXPECT_EQ(lineOnLanguageChange(), "Tomorrow - Thu, Nov 19");
}

TEST_F(EditorDateLineTest, ALaterHourIsTodayWhateverTheMinute) {
    editAlarm(anAlarm(10, 0));
    EXPECT_EQ(lineOnLanguageChange(), "Today - Wed, Nov 18");
}

TEST_F(EditorDateLineTest, RepeatDaysAreListedFromMondayToSunday) {
    ClockAlarmDbData alarm = anAlarm(7, 0);
    alarm.repeatWeekly = 3;
    editAlarm(alarm);
    EXPECT_EQ(lineOnLanguageChange(), "Mon Sun ");
}

TEST_F(EditorDateLineTest, AllDaysAreEveryDay) {
    ClockAlarmDbData alarm = anAlarm(7, 0);
    alarm.repeatWeekly = 127;
    editAlarm(alarm);
    EXPECT_EQ(lineOnLanguageChange(), "Every day");
}

TEST_F(EditorDateLineTest, ALineOfTranslationsIsCutAtOneKilobyte) {
    editAlarm(anAlarm(10, 0));
    const TestCatalogue wordy{{"IDS_CLOCK_BODY_TODAY", std::string(1022, 'x') + "ä"}};
    EXPECT_EQ(lineOnLanguageChange(), std::string(1022, 'x'));
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
    ClockAlarmDbData alarm = anAlarm(7, 0);
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
    editAlarm(alarm);
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Thu, Dec 24");
}

TEST_F(EditorMinuteTimerTest, ToleratesAMissingEditor) {
    EXPECT_FALSE(AlarmEditViewController::_updateDateTextTimerCb(nullptr));
    expectLog("Data is NULL !!");
}

} // namespace
