/**
 * @file
 * @brief The cities that came with the application.
 */
#pragma once

#include <string>
#include <vector>

#include "clock/ClockWorldClockDbData.h"

namespace clock_common {

/**
 * @brief Every city, with its offset from GMT at this moment; none of them selected.
 *
 * The file is built with the application and only read. When it is missing, of another version or
 * damaged, the reason is logged and there are no cities: half a list would look like a whole one. A
 * city whose time zone the system does not know is left out.
 */
std::vector<ClockWorldClockDbData> readCities();

/** @brief An offset as "GMT+05:30", cut to whole minutes. */
std::string gmtOffsetText(int seconds);

} // namespace clock_common
