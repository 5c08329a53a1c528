// The list of alarms follows the clock, and stands still under a finger.

#include <cstdint>
#include <string>
#include <vector>

#include <gmock/gmock.h>

#include "AlarmListFixture.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Not;

using AlarmListFollowsTest = AlarmListFixture;

TEST_F(AlarmListFollowsTest, theNextRingComesFirstAndThoseThatAreOffLast) {
    add(8, 0, true);
    add(23, 0, false);
    add(10, 30, true, WEDNESDAY);
    add(6, 30, false);
    openPage();
    EXPECT_THAT(times(), ElementsAre("10:30", "08:00", "06:30", "23:00"));
}

TEST_F(AlarmListFollowsTest, noRowMovesWhileAlarmsAreSwitched) {
    add(10, 30, true, WEDNESDAY);
    add(11, 0, true, WEDNESDAY);
    add(12, 0, false, WEDNESDAY);
    openPage();
    stage().drag(60, 200, 0, -80);
    stage().settle();
    const Spot first = placeOf("10:30");
    const Spot second = placeOf("11:00");
    flip("10:30");
    EXPECT_THAT(times(), ElementsAre("10:30", "11:00", "12:00"));
    EXPECT_EQ(placeOf("10:30").y, first.y) << "rows are as high as before";
    EXPECT_EQ(placeOf("11:00").y, second.y);
    flip("11:00");
    EXPECT_THAT(times(), ElementsAre("10:30", "11:00", "12:00"));
    EXPECT_EQ(placeOf("10:30").y, first.y);
    EXPECT_EQ(placeOf("11:00").y, second.y);
}

TEST_F(AlarmListFollowsTest, theOrderIsRightAgainWhenTheListComesBack) {
    add(10, 30, true, WEDNESDAY);
    add(11, 0, true, WEDNESDAY);
    openPage();
    flip("10:30");
    tapText("World clock");
    stage().backKey();
    stage().settle();
    EXPECT_THAT(times(), ElementsAre("11:00", "10:30"));
    flip("10:30");
    EXPECT_THAT(times(), ElementsAre("11:00", "10:30"));
    ClockEventListener::raise(ClockEventListener::PAUSED);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    stage().settle();
    EXPECT_THAT(times(), ElementsAre("10:30", "11:00"));
}

TEST_F(AlarmListFollowsTest, theNextAlarmTellsHowFarAwayItIs) {
    add(10, 30, true, WEDNESDAY);
    add(12, 0, true, WEDNESDAY);
    openPage();
    EXPECT_TRUE(stage().shows("in 49 min")) << readFace();
    flip("10:30");
    EXPECT_FALSE(stage().shows("in 49 min")) << readFace();
    tapText("World clock");
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(stage().shows("in 2 hr, 19 min")) << readFace();
    const auto next = stage().findText("in 2 hr, 19 min");
    ASSERT_TRUE(next);
    EXPECT_LT(next->area.y, placeOf("12:00").y);
}

TEST_F(AlarmListFollowsTest, aDayThatStandsAboveTheTimeIsSaidOnce) {
    const auto now = VirtualClock::now();
    VirtualClock::setNow("Europe/Berlin", "2026-11-21 00:00:00");
    ClockAlarmDbData alarm = alarmAt(10, 0);
    alarm.autoDate = static_cast<std::int32_t>(VirtualClock::now());
    VirtualClock::setNow(now);
    alarm.manualDate = alarm.autoDate;
    alarm.name = "Train";
    add(alarm);
    openPage();
    const auto day = stage().findText("Sat, Nov 21");
    ASSERT_TRUE(day) << readFace();
    EXPECT_LT(day->area.y, placeOf("10:00").y);
    EXPECT_TRUE(stage().shows("Train")) << "nothing below it: " << readFace();
}

TEST_F(AlarmListFollowsTest, theMarkMovesToTheAlarmThatIsNextNow) {
    add(10, 30, true, WEDNESDAY);
    add(10, 45, true, WEDNESDAY);
    openPage();
    flip("10:30");
    stage().drag(60, 200, 0, -110);
    stage().settle();
    EXPECT_TRUE(stage().shows("in 1 hr, 4 min")) << readFace();
}

TEST_F(AlarmListFollowsTest, everyMinuteIsCounted) {
    add(9, 43, true, WEDNESDAY);
    add(10, 30, true, WEDNESDAY);
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:41:30");
    openPage();
    EXPECT_TRUE(stage().shows("in 2 min")) << readFace();
    Stage::advance(31);
    EXPECT_TRUE(stage().shows("in 1 min")) << readFace();
    Stage::advance(60);
    EXPECT_FALSE(stage().shows("in 1 min")) << readFace();
    EXPECT_THAT(times(), ElementsAre("09:43", "10:30")) << "nothing moves while it is looked at";
}

TEST_F(AlarmListFollowsTest, anAlarmThatHasRungForTheOnlyTimeIsOff) {
    ClockAlarmDbData once;
    once.leading = 0;
    once.hour = 9;
    once.min = 42;
    once.enable = 1;
    once.timeZone = "Europe/Berlin";
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 00:00:00");
    once.autoDate = static_cast<std::int32_t>(VirtualClock::now());
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:41:30");
    add(once);
    openPage();
    EXPECT_TRUE(isOn("09:42"));
    EXPECT_TRUE(stage().shows("Today")) << readFace();
    Stage::advance(31);
    EXPECT_FALSE(isOn("09:42"));
    EXPECT_TRUE(stage().shows("Off")) << readFace();
}

TEST_F(AlarmListFollowsTest, aListThatNobodySeesIsNotDrawn) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    ClockEventListener::raise(ClockEventListener::PAUSED);
    stage().settle();
    int frames = stage().renderedFrames();
    Stage::advance(200);
    EXPECT_EQ(stage().renderedFrames(), frames) << "in the background";
    ClockEventListener::raise(ClockEventListener::RESUMED);
    stage().settle();
    EXPECT_TRUE(stage().shows("in 46 min")) << readFace();
    Stage::advance(60);
    EXPECT_TRUE(stage().shows("in 45 min")) << readFace();
    tapText("World clock");
    frames = stage().renderedFrames();
    Stage::advance(200);
    EXPECT_EQ(stage().renderedFrames(), frames) << "below another page";
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(stage().shows("in 45 min")) << readFace();
    const std::string before = readFace();
    Stage::advance(60);
    EXPECT_NE(readFace(), before) << "the minutes are counted again";
}

TEST_F(AlarmListFollowsTest, aClockThatWasSetAndAnotherZoneShowAtOnce) {
    add(10, 30, true, WEDNESDAY);
    add(9, 50, true, WEDNESDAY);
    openPage();
    EXPECT_THAT(times(), ElementsAre("09:50", "10:30"));
    VirtualClock::jump(20 * 60);
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle();
    EXPECT_THAT(times(), ElementsAre("10:30", "09:50"));
    EXPECT_TRUE(stage().shows("in 29 min")) << readFace();
    VirtualClock::setZone("Europe/London");
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle();
    EXPECT_THAT(times(), ElementsAre("09:50", "10:30"));
    EXPECT_TRUE(stage().shows("in 49 min")) << readFace();
}

TEST_F(AlarmListFollowsTest, aLineBeginsWhereItsRowDoes) {
    add(10, 30, true, WEDNESDAY, "Tea");
    add(11, 30, true, WEDNESDAY, "منبّه");
    openPage();
    EXPECT_THAT(readFace(), HasSubstr("Tea\n")) << "nothing is added where nothing is needed";
    EXPECT_THAT(readFace(), Not(HasSubstr("\u200eTea")));
    elm_config_mirrored_set(EINA_TRUE);
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_THAT(readFace(), HasSubstr("\u200f\u202aTea\u202c"));
    elm_config_mirrored_set(EINA_FALSE);
}
