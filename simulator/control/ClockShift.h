/**
 * @file
 * @brief How far the device's clock is to be from the real time.
 */
#pragma once

#include <cstdint>
#include <string>

namespace simulator {

/** The clock as it is. */
struct ClockState {
    std::int64_t realNow = 0; ///< Epoch seconds of the computer's clock.
    int shift = 0;            ///< Seconds that the device is ahead of it.
    std::string timeZone;     ///< Of the device.
};

/** A wish understood, or why not. */
struct ClockWish {
    int shift = 0;
    std::string problem; ///< One sentence; empty when the shift is valid.
};

/** What may be wished for, for help texts. */
inline constexpr const char* CLOCK_VALUES =
    "real | YYYY-MM-DD HH:MM[:SS] | +SECONDS | -SECONDS | before-midnight | before-dst";

/**
 * @brief Understands a wish for the clock.
 *
 * "real" ends the shift; a date and time is jumped to; "+3600" is an hour ahead of the real time;
 * "before-midnight" is ten seconds before the day ends that the device shows, and "before-dst" ten
 * seconds before the next change of its zone's offset.
 */
ClockWish clockWish(const std::string& value, const ClockState& state);

/** @brief A shift as a value that can be wished for: "real" or "+3600". */
std::string clockValue(int shift);

} // namespace simulator
