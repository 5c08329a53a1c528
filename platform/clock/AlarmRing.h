/**
 * @file
 * @brief When the alarm of a record rings, as civil time. Internal to the library.
 */
#pragma once

#include <cstdint>
#include <optional>

#include <base/CivilTime.h>

#include "clock/ClockAlarmDbData.h"

namespace clock_common {

/** The day on which a one-time alarm rings, in the zone in which it was saved; none if not set. */
std::optional<base::CivilDate> ringDate(const ClockAlarmDbData& alarm);

/** When a record's alarm rings. */
base::RingRule ringRule(const ClockAlarmDbData& alarm);

/** The next ring after `now` in the current time zone, also of an alarm that is switched off. */
std::optional<std::int64_t> nextRing(const ClockAlarmDbData& alarm, std::int64_t now);

} // namespace clock_common
