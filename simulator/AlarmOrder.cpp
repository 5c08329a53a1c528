#include "AlarmOrder.h"

#include <algorithm>
#include <limits>
#include <tuple>
#include <unordered_map>

#include "clock/AlarmRing.h"

namespace simulator {

std::optional<std::int64_t> upcomingRing(const ClockAlarmDbData& alarm, std::int64_t now) {
    return alarm.enable == 1 ? clock_common::nextRing(alarm, now) : std::nullopt;
}

void orderAlarms(std::vector<ClockAlarmDbData>& alarms, std::int64_t now) {
    constexpr std::int64_t NEVER = std::numeric_limits<std::int64_t>::max();
    std::unordered_map<int, std::int64_t> rings;
    for (const ClockAlarmDbData& alarm : alarms)
        rings[alarm.id] = upcomingRing(alarm, now).value_or(NEVER);
    const auto rank = [&rings](const ClockAlarmDbData& alarm) {
        return std::tuple(rings.at(alarm.id), alarm.hour, alarm.min, alarm.id);
    };
    std::stable_sort(alarms.begin(), alarms.end(),
                     [&rank](const auto& a, const auto& b) { return rank(a) < rank(b); });
}

void keepOrder(std::vector<ClockAlarmDbData>& alarms, const std::vector<int>& ids) {
    const auto place = [&ids](const ClockAlarmDbData& alarm) {
        return std::find(ids.begin(), ids.end(), alarm.id) - ids.begin();
    };
    std::stable_sort(alarms.begin(), alarms.end(),
                     [&place](const auto& a, const auto& b) { return place(a) < place(b); });
}

std::optional<NextAlarm> nextAlarm(const std::vector<ClockAlarmDbData>& alarms, std::int64_t now) {
    std::optional<NextAlarm> next;
    for (const ClockAlarmDbData& alarm : alarms) {
        const auto ring = upcomingRing(alarm, now);
        if (ring && (!next || *ring < next->ring))
            next = NextAlarm{alarm.id, *ring};
    }
    return next;
}

} // namespace simulator
