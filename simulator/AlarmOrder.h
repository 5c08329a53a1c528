/**
 * @file
 * @brief Which alarm comes where in the list. No toolkit.
 */
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "clock/ClockAlarmDbData.h"

namespace simulator {

/**
 * @brief When an alarm rings next.
 * @param now Epoch seconds.
 * @return Epoch seconds; nothing when it is switched off, or was for a day that is over.
 */
std::optional<std::int64_t> upcomingRing(const ClockAlarmDbData& alarm, std::int64_t now);

/**
 * @brief Puts alarms into the order in which a person wants to find them.
 *
 * First those that ring, the soonest first, then the others by their time of day. Where that does
 * not decide, the time of day and then the older alarm comes first.
 */
void orderAlarms(std::vector<ClockAlarmDbData>& alarms, std::int64_t now);

/** @brief Keeps an earlier order. @param ids Of the alarms as they were; others go to the end. */
void keepOrder(std::vector<ClockAlarmDbData>& alarms, const std::vector<int>& ids);

/** An alarm that rings before all others. */
struct NextAlarm {
    int id = -1;
    std::int64_t ring = 0; ///< Epoch seconds.

    bool operator==(const NextAlarm&) const = default;
};

/** @brief The next alarm, the first of several at the same time; nothing when none rings. */
std::optional<NextAlarm> nextAlarm(const std::vector<ClockAlarmDbData>& alarms, std::int64_t now);

} // namespace simulator
