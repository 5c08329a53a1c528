/**
 * @file
 * @brief How a locale writes a time.
 */
#pragma once

#include <array>
#include <string>
#include <vector>

namespace host {

struct TimeTexts {
    std::array<std::string, 10> digits;
    std::string am;
    std::string pm;
    bool halfFirst = false; ///< The half day is written left of the hour.
    std::string hour;       ///< Names of the fields, for screen readers.
    std::string minute;
    std::string half;

    /** A number with at least `width` digits. */
    std::string number(int value, int width) const;
    /** Texts of the hour wheel: 00..23, or 12, 1..11. */
    std::vector<std::string> hours(bool is24Hours) const;
    std::vector<std::string> minutes() const;
};

/** @param locale ICU or POSIX locale id; null for the current one. */
const TimeTexts& timeTextsOf(const char* locale);

} // namespace host
