/**
 * @file
 * @brief Texts of the world clock.
 */
#pragma once

#include <cstdint>
#include <string>

namespace simulator {

/** @brief The time in a city, for example "07:30" or "7:30 AM". @param now Epoch seconds. */
std::string cityTimeText(std::int64_t now, const std::string& tzPath, bool twelveHour);

/**
 * @brief The city's distance from GMT, and its day where that is not the day here.
 *
 * For example "GMT+05:30", or "Tomorrow, GMT+13:00".
 */
std::string cityOffsetText(std::int64_t now, const std::string& tzPath);

} // namespace simulator
