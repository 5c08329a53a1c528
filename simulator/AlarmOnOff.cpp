#include "AlarmOnOff.h"

#include <optional>

#include "base/CivilTime.h"
#include "clock/AlarmRing.h"
#include "rules/SaveTime.h"

namespace simulator {
namespace {

/** The midnight, here, of a picked day whose ring is still to come; 0 when there is none. */
std::int32_t pickedMidnight(const ClockAlarmDbData& alarm, std::time_t now) {
    const auto day = alarm.manualDate != 0 ? clock_common::ringDate(alarm) : std::nullopt;
    if (!day || !clock_common::nextRing(alarm, now))
        return 0;
    return static_cast<std::int32_t>(base::toInstant({*day, 0, 0, 0}, base::currentTimeZone()));
}

void stamp(ClockAlarmDbData& alarm, std::time_t now) {
    alarm.createTime = alarm.updateTime = static_cast<std::int32_t>(now);
    alarm.snoozeCount = 0;
}

} // namespace

void switchOn(ClockAlarmDbData& alarm, std::time_t now) {
    alarm.autoDate = alarm.manualDate = pickedMidnight(alarm, now);
    alarm.enable = 1;
    alarm.timeZone = base::currentTimeZone();
    rules::settleRingDate(alarm, now);
    alarm.alarmTime = alarm.alarmTimeBase =
        static_cast<std::int32_t>(rules::alarmTime(alarm.hour, alarm.min, alarm.timeZone, now));
    stamp(alarm, now);
}

void switchOff(ClockAlarmDbData& alarm, std::time_t now) {
    alarm.enable = 0;
    stamp(alarm, now);
}

} // namespace simulator
