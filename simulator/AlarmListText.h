/**
 * @file
 * @brief Texts of the alarm list.
 */
#pragma once

#include <string>

#include "clock/ClockAlarmDbData.h"

namespace simulator {

/** @brief The alarm's time of day, for example "07:30" or "7:30 AM". */
std::string alarmTimeText(const ClockAlarmDbData& alarm, bool twelveHour);

/** @brief When the alarm rings: its weekdays or its date; says so when it is switched off. */
std::string alarmDaysText(const ClockAlarmDbData& alarm);

} // namespace simulator
