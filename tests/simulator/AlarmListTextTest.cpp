// What the alarm list says about an alarm.

#include "AlarmListText.h"

#include <string>

#include "support/ScreenTest.h"

using simulator::alarmDaysText;
using simulator::alarmTimeText;

// Keeps a time in one piece.
#define NARROW_SPACE "\u202f"

namespace {

class AlarmListTextTest : public ScreenTest {
protected:
    static ClockAlarmDbData alarmAt(int hour, int minute) {
        ClockAlarmDbData alarm;
        alarm.leading = 0;
        alarm.enable = 1;
        alarm.hour = hour;
        alarm.min = minute;
        return alarm;
    }
    static ClockAlarmDbData alarmOn(int weekdays) {
        ClockAlarmDbData alarm = alarmAt(6, 0);
        alarm.repeatWeekly = weekdays;
        return alarm;
    }
};

} // namespace

TEST_F(AlarmListTextTest, twentyFourHoursHaveTwoDigits) {
    EXPECT_EQ(alarmTimeText(alarmAt(0, 0), false), "00:00");
    EXPECT_EQ(alarmTimeText(alarmAt(7, 5), false), "07:05");
    EXPECT_EQ(alarmTimeText(alarmAt(12, 0), false), "12:00");
    EXPECT_EQ(alarmTimeText(alarmAt(23, 59), false), "23:59");
}

TEST_F(AlarmListTextTest, twelveHoursHaveHalves) {
    EXPECT_EQ(alarmTimeText(alarmAt(0, 0), true), "12:00" NARROW_SPACE "AM");
    EXPECT_EQ(alarmTimeText(alarmAt(7, 5), true), "7:05" NARROW_SPACE "AM");
    EXPECT_EQ(alarmTimeText(alarmAt(12, 0), true), "12:00" NARROW_SPACE "PM");
    EXPECT_EQ(alarmTimeText(alarmAt(23, 59), true), "11:59" NARROW_SPACE "PM");
}

TEST_F(AlarmListTextTest, aTimeThatSummerTimeSkipsTodayIsShownAsItIs) {
    VirtualClock::setNow("Europe/Berlin", "2026-03-29 12:00:00");
    EXPECT_EQ(alarmTimeText(alarmAt(2, 30), false), "02:30");
}

TEST_F(AlarmListTextTest, weekdaysAreNamedFromMonday) {
    EXPECT_EQ(alarmDaysText(alarmOn(1 | 2 | 64)), "Mon Sat Sun");
    EXPECT_EQ(alarmDaysText(alarmOn(CLOCK_ALARM_EVERY_DAY)), "Every day");
}

TEST_F(AlarmListTextTest, aOneTimeAlarmHasADate) {
    ClockAlarmDbData alarm = alarmAt(6, 0);
    EXPECT_EQ(alarmDaysText(alarm), "");
    VirtualClock::setNow("Europe/Berlin", "2026-11-21 00:00:00");
    alarm.autoDate = static_cast<std::int32_t>(VirtualClock::now());
    EXPECT_EQ(alarmDaysText(alarm), "Sat, Nov 21");
}

TEST_F(AlarmListTextTest, anAlarmThatIsSwitchedOffSaysSo) {
    ClockAlarmDbData alarm = alarmOn(2);
    alarm.enable = 0;
    EXPECT_EQ(alarmDaysText(alarm), "Off - Mon");
    alarm.repeatWeekly = 0;
    EXPECT_EQ(alarmDaysText(alarm), "Off");
}
