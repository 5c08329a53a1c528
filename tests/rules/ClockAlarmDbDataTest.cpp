#include "clock/ClockAlarmDbData.h"

#include <type_traits>

#include <gtest/gtest.h>

namespace {

TEST(ClockAlarmDbDataTest, ANewRecordHasTheDefaults) {
    ClockAlarmDbData alarm;
    EXPECT_EQ(alarm.id, -1);
    EXPECT_EQ(alarm.alarmMgrId, -1);
    EXPECT_EQ(alarm.enable, 0);
    EXPECT_EQ(alarm.alarmTime, 0);
    EXPECT_EQ(alarm.alarmTimeBase, 0);
    EXPECT_EQ(alarm.createTime, 0);
    EXPECT_EQ(alarm.updateTime, 0);
    EXPECT_EQ(alarm.autoDate, 0);
    EXPECT_EQ(alarm.manualDate, 0);
    EXPECT_EQ(alarm.hour, 6);
    EXPECT_EQ(alarm.min, 0);
    EXPECT_EQ(alarm.name, "");
    EXPECT_EQ(alarm.timeZone, "");
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_EQ(alarm.snooze, 1);
    EXPECT_EQ(alarm.snoozeDuration, 5);
    EXPECT_EQ(alarm.snoozeRepeat, 3);
    EXPECT_EQ(alarm.snoozeCount, 0);
    EXPECT_EQ(alarm.type, 0);
    EXPECT_EQ(alarm.soundPath, "/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg");
    EXPECT_EQ(alarm.volume, 0);
    EXPECT_EQ(alarm.trailing, 0);
    EXPECT_EQ(alarm.increaseVolume, 0);
    EXPECT_EQ(alarm.tonePosition, 0);
}

ClockAlarmDbData filledRecord() {
    // In the order of declaration: a member that moves or is left out breaks this.
    return {1,     2,  3,  4,  5,  6,  7,  8,  9,        10, 11, 12, "label",
            "UTC", 15, 16, 17, 18, 19, 20, 21, "/a.ogg", 23, 24, 25, 26};
}

void expectFilled(const ClockAlarmDbData& alarm) {
    EXPECT_EQ(alarm.leading, 1);
    EXPECT_EQ(alarm.id, 2);
    EXPECT_EQ(alarm.alarmMgrId, 3);
    EXPECT_EQ(alarm.enable, 4);
    EXPECT_EQ(alarm.alarmTime, 5);
    EXPECT_EQ(alarm.alarmTimeBase, 6);
    EXPECT_EQ(alarm.createTime, 7);
    EXPECT_EQ(alarm.updateTime, 8);
    EXPECT_EQ(alarm.autoDate, 9);
    EXPECT_EQ(alarm.manualDate, 10);
    EXPECT_EQ(alarm.hour, 11);
    EXPECT_EQ(alarm.min, 12);
    EXPECT_EQ(alarm.name, "label");
    EXPECT_EQ(alarm.timeZone, "UTC");
    EXPECT_EQ(alarm.repeatOnce, 15);
    EXPECT_EQ(alarm.repeatWeekly, 16);
    EXPECT_EQ(alarm.snooze, 17);
    EXPECT_EQ(alarm.snoozeDuration, 18);
    EXPECT_EQ(alarm.snoozeRepeat, 19);
    EXPECT_EQ(alarm.snoozeCount, 20);
    EXPECT_EQ(alarm.type, 21);
    EXPECT_EQ(alarm.soundPath, "/a.ogg");
    EXPECT_EQ(alarm.volume, 23);
    EXPECT_EQ(alarm.trailing, 24);
    EXPECT_EQ(alarm.increaseVolume, 25);
    EXPECT_EQ(alarm.tonePosition, 26);
}

TEST(ClockAlarmDbDataTest, MembersStandInTheirOrder) {
    expectFilled(filledRecord());
}

TEST(ClockAlarmDbDataTest, CopiesCarryEveryMember) {
    const auto original = filledRecord();
    // NOLINTNEXTLINE(performance-unnecessary-copy-initialization): copying is what is tested.
    const ClockAlarmDbData copy(original);
    expectFilled(copy);
    ClockAlarmDbData assigned;
    assigned = original;
    expectFilled(assigned);
}

TEST(ClockAlarmDbDataTest, CopiesAreIndependent) {
    auto original = filledRecord();
    const auto copy = original;
    original.name = "another";
    original.hour = 0;
    expectFilled(copy);
}

TEST(ClockAlarmDbDataTest, AlertTypesHaveFixedValues) {
    EXPECT_EQ(CLOCK_ALARM_TYPE_SOUND, 0);
    EXPECT_EQ(CLOCK_ALARM_TYPE_VIBRATION, 1);
    EXPECT_EQ(CLOCK_ALARM_TYPE_VIBRATION_AND_SOUND, 2);
    EXPECT_EQ(CLOCK_ALARM_EVERY_DAY, 127);
}

} // namespace
