// What switching an alarm on or off makes of its record.

#include "AlarmOnOff.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "base/CivilTime.h"
#include "clock/AlarmRing.h"
#include "support/VirtualClock.h"

using simulator::switchOff;
using simulator::switchOn;

namespace {

constexpr const char* BERLIN = "Europe/Berlin";
constexpr const char* NEW_YORK = "America/New_York";

std::int32_t midnight(int month, int day, const char* zone = BERLIN) {
    return static_cast<std::int32_t>(base::toInstant({{2026, month, day}, 0, 0, 0}, zone));
}

ClockAlarmDbData offAt(int hour, int minute) {
    ClockAlarmDbData alarm;
    alarm.leading = 17;
    alarm.id = 5;
    alarm.alarmMgrId = 6;
    alarm.hour = hour;
    alarm.min = minute;
    alarm.name = "Tea";
    alarm.timeZone = BERLIN;
    alarm.snoozeCount = 2;
    alarm.volume = 3;
    return alarm;
}

ClockAlarmDbData offOn(std::int32_t autoDate, std::int32_t manualDate, int hour = 7) {
    ClockAlarmDbData alarm = offAt(hour, 0);
    alarm.autoDate = autoDate;
    alarm.manualDate = manualDate;
    return alarm;
}

struct Row {
    const char* what;
    ClockAlarmDbData alarm;
    std::int32_t autoDate;
    std::int32_t manualDate;
};

class AlarmOnOffTest : public testing::Test {
protected:
    // A Wednesday.
    void SetUp() override { VirtualClock::setNow(BERLIN, "2026-11-18 09:41:00"); }
};

} // namespace

TEST_F(AlarmOnOffTest, aOneTimeAlarmGetsTheDayOnWhichItCanRing) {
    const std::vector<Row> rows{
        {"no day, later today", offAt(9, 42), midnight(11, 18), 0},
        {"no day, this minute", offAt(9, 41), midnight(11, 19), 0},
        {"a day that is over", offOn(midnight(11, 3), 0), midnight(11, 19), 0},
        {"tomorrow", offOn(midnight(11, 19), 0), midnight(11, 19), 0},
        {"a day that was not picked follows the time", offOn(midnight(11, 19), 0, 12),
         midnight(11, 18), 0},
        {"a picked day stays", offOn(midnight(12, 24), midnight(12, 24)), midnight(12, 24),
         midnight(12, 24)},
        {"today was picked, its ring is to come", offOn(midnight(11, 18), midnight(11, 18), 10),
         midnight(11, 18), midnight(11, 18)},
        {"today was picked, its ring is over", offOn(midnight(11, 18), midnight(11, 18), 9),
         midnight(11, 19), 0},
        {"a picked day that is over", offOn(midnight(11, 3), midnight(11, 3)), midnight(11, 19), 0},
    };
    for (const Row& row : rows) {
        ClockAlarmDbData alarm = row.alarm;
        switchOn(alarm, VirtualClock::now());
        EXPECT_EQ(alarm.autoDate, row.autoDate) << row.what;
        EXPECT_EQ(alarm.manualDate, row.manualDate) << row.what;
        EXPECT_EQ(alarm.repeatOnce, 1) << row.what;
        EXPECT_EQ(alarm.enable, 1) << row.what;
        EXPECT_TRUE(clock_common::nextRing(alarm, VirtualClock::now())) << row.what;
    }
}

TEST_F(AlarmOnOffTest, aPickedDayIsTheSameDayInAnotherZone) {
    ClockAlarmDbData alarm = offOn(midnight(12, 24), midnight(12, 24));
    VirtualClock::setZone(NEW_YORK);
    switchOn(alarm, VirtualClock::now());
    EXPECT_EQ(alarm.autoDate, midnight(12, 24, NEW_YORK));
    EXPECT_EQ(alarm.manualDate, midnight(12, 24, NEW_YORK));
    EXPECT_EQ(alarm.timeZone, NEW_YORK);
    EXPECT_EQ(clock_common::nextRing(alarm, VirtualClock::now()),
              base::toInstant({{2026, 12, 24}, 7, 0, 0}, NEW_YORK));
}

TEST_F(AlarmOnOffTest, aWeeklyAlarmHasNoDates) {
    ClockAlarmDbData alarm = offOn(midnight(12, 24), midnight(12, 24));
    alarm.repeatWeekly = 2;
    switchOn(alarm, VirtualClock::now());
    EXPECT_EQ(alarm.repeatWeekly, 2);
    EXPECT_EQ(alarm.repeatOnce, 0);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
}

TEST_F(AlarmOnOffTest, theRestIsAsAfterASaveInTheEditor) {
    ClockAlarmDbData alarm = offAt(7, 30);
    VirtualClock::setZone(NEW_YORK);
    switchOn(alarm, VirtualClock::now());
    EXPECT_EQ(alarm.createTime, VirtualClock::now());
    EXPECT_EQ(alarm.updateTime, VirtualClock::now());
    EXPECT_EQ(alarm.snoozeCount, 0);
    EXPECT_EQ(alarm.timeZone, NEW_YORK);
    EXPECT_EQ(alarm.alarmTime, base::toInstant({{2026, 11, 18}, 7, 30, 0}, NEW_YORK));
    EXPECT_EQ(alarm.alarmTimeBase, alarm.alarmTime);
    EXPECT_EQ(alarm.leading, 17);
    EXPECT_EQ(alarm.id, 5);
    EXPECT_EQ(alarm.alarmMgrId, 6);
    EXPECT_EQ(alarm.name, "Tea");
    EXPECT_EQ(alarm.volume, 3);
}

TEST_F(AlarmOnOffTest, switchingOffKeepsTheDays) {
    ClockAlarmDbData alarm = offOn(midnight(12, 24), midnight(12, 24));
    alarm.enable = 1;
    switchOff(alarm, VirtualClock::now());
    EXPECT_EQ(alarm.enable, 0);
    EXPECT_EQ(alarm.autoDate, midnight(12, 24));
    EXPECT_EQ(alarm.manualDate, midnight(12, 24));
    EXPECT_EQ(alarm.timeZone, BERLIN);
    EXPECT_EQ(alarm.snoozeCount, 0);
    EXPECT_EQ(alarm.updateTime, VirtualClock::now());
    EXPECT_EQ(alarm.createTime, VirtualClock::now());
}
