/**
 * @file
 * @brief What switching an alarm on or off makes of its record. No toolkit.
 */
#pragma once

#include <ctime>

#include "clock/ClockAlarmDbData.h"

namespace simulator {

/**
 * @brief Switches an alarm on, as if it had been opened in the editor and saved.
 *
 * A day that a person has picked stays, also in another time zone, unless its ring is over; any
 * other one-time alarm gets the day on which the clock next shows its time.
 */
void switchOn(ClockAlarmDbData& alarm, std::time_t now);

/** @brief Switches an alarm off. Its days stay. */
void switchOff(ClockAlarmDbData& alarm, std::time_t now);

} // namespace simulator
