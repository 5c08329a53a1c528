#include "rules/AlarmChange.h"

#include <tuple>

namespace rules {

namespace {

auto comparedFields(const ClockAlarmDbData& alarm) {
    return std::tie(alarm.hour, alarm.min, alarm.repeatOnce, alarm.repeatWeekly, alarm.snooze,
                    alarm.snoozeDuration, alarm.snoozeRepeat, alarm.type, alarm.volume,
                    alarm.increaseVolume, alarm.name, alarm.timeZone, alarm.soundPath);
}

} // namespace

bool isChanged(const ClockAlarmDbData& alarm, const ClockAlarmDbData& before) {
    return comparedFields(alarm) != comparedFields(before);
}

} // namespace rules
