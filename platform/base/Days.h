/**
 * @file
 * @brief Day numbers of the proleptic Gregorian calendar: day 0 is 1 January 1970.
 */
#pragma once

#include <cstdint>

#include "base/CivilTime.h"

namespace base {

/** Division that rounds down, also for negative values. */
constexpr std::int64_t floorDivide(std::int64_t value, std::int64_t divisor) {
    return value / divisor - (value % divisor < 0 ? 1 : 0);
}

constexpr bool isLeapYear(std::int64_t year) {
    return year % 4 == 0 && (year % 100 != 0 || year % 400 == 0);
}

constexpr int daysInMonth(std::int64_t year, int month) {
    if (month == 2)
        return isLeapYear(year) ? 29 : 28;
    return month == 4 || month == 6 || month == 9 || month == 11 ? 30 : 31;
}

/** The number of a date's day. */
std::int64_t daysFromCivil(const CivilDate& date);

/** The date with a day number. */
CivilDate civilFromDays(std::int64_t days);

} // namespace base
