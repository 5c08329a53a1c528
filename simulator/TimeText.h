/**
 * @file
 * @brief Times of day, as the device's setting wants them.
 */
#pragma once

#include <string>

namespace simulator {

/** @brief Whether the device shows 12 hours. */
bool isTwelveHour();

/** @brief A wall clock reading, for example "07:30" or "7:30 AM". */
std::string timeOfDayText(int hour, int minute, bool twelveHour);

/** @brief The markup that reads as a text. */
std::string markupOf(const std::string& text);

} // namespace simulator
