#include "rules/GmtOffset.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <string>
#include <string_view>

#include <clocale>

namespace rules {

namespace {

constexpr std::size_t PREFIX = 3;
constexpr std::size_t MAX_BYTES = 127;
constexpr auto LATEST = static_cast<float>(std::numeric_limits<int>::max());

// The locale of the texts may write decimals with a comma; the offsets do not follow it.
locale_t plainNumbers() {
    static locale_t plain = newlocale(LC_ALL_MASK, "C", nullptr);
    return plain;
}

} // namespace

float gmtOffset(const char* timezone) {
    const std::string_view text = timezone ? timezone : "";
    std::string number(text.substr(std::min(PREFIX, text.size()), MAX_BYTES));
    if (const auto colon = number.find(':'); colon != std::string::npos)
        number[colon] = '.';
    return static_cast<float>(strtod_l(number.c_str(), nullptr, plainNumbers()));
}

std::optional<int> IndexHours::next(const char* timezone) {
    const float hour = std::trunc(gmtOffset(timezone));
    // What is no number of hours, or none that a day could have, is no reason for a label either.
    if (!(hour > static_cast<float>(_last)) || hour >= LATEST)
        return std::nullopt;
    _last = static_cast<int>(hour);
    return _last;
}

} // namespace rules
