/**
 * @file
 * @brief The device's clock and time zone, which settings can put apart from the computer's.
 *
 * The clock is the computer's, shifted by some seconds: every process of the device, and every
 * library in it, sees it so. Clocks that only measure how long something takes stay as they are.
 */
#pragma once

#include <cstdint>

namespace host {

/** Seconds that the device's clock is ahead of the computer's. From any thread or signal. */
std::int64_t clockShift();

/** Takes over the settings as they are now. */
void applyClock();

/** Takes them over whenever they change from now on. @return False when they cannot be watched. */
bool followClock();

/** Goes back to the computer's clock; the time zone stays until the next applyClock(). */
void forgetClock();

} // namespace host
