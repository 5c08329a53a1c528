#include "clock/AlarmRing.h"

namespace clock_common {

namespace {

// Where summer time begins at midnight, that midnight is stored as the instant an hour before or
// after it.
constexpr std::int64_t MIDNIGHT_TOLERANCE = 7200;

} // namespace

std::optional<base::CivilDate> ringDate(const ClockAlarmDbData& alarm) {
    if (alarm.autoDate == 0 || (alarm.repeatWeekly & CLOCK_ALARM_EVERY_DAY) != 0)
        return std::nullopt;
    return base::toCivil(alarm.autoDate + MIDNIGHT_TOLERANCE, alarm.timeZone).date;
}

base::RingRule ringRule(const ClockAlarmDbData& alarm) {
    return {alarm.hour, alarm.min, alarm.repeatWeekly & CLOCK_ALARM_EVERY_DAY, ringDate(alarm)};
}

std::optional<std::int64_t> nextRing(const ClockAlarmDbData& alarm, std::int64_t now) {
    return base::nextRing(ringRule(alarm), now, base::currentTimeZone());
}

} // namespace clock_common
