/**
 * @file
 * @brief Texts of the alarm list.
 */
#pragma once

#include <cstdint>
#include <string>

#include "clock/ClockAlarmDbData.h"

namespace simulator {

/** @brief The alarm's time of day, for example "07:30" or "7:30 AM". */
std::string alarmTimeText(const ClockAlarmDbData& alarm, bool twelveHour);

/**
 * @brief When the alarm rings: its weekdays, or "Today", "Tomorrow" or a date.
 *
 * One that is switched off has its weekdays, or its date while that can still come, or says so.
 * @param now Epoch seconds.
 */
std::string alarmDaysText(const ClockAlarmDbData& alarm, std::int64_t now);

/**
 * @brief How far away a ring is: "in 7 hr, 25 min", or its day when that is more than a day.
 * @param ring,now Epoch seconds; a minute that has begun counts as a whole one.
 */
std::string nextRingText(std::int64_t ring, std::int64_t now);

} // namespace simulator
