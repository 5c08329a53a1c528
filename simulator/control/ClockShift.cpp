#include "ClockShift.h"

#include <charconv>
#include <cstdio>
#include <limits>
#include <optional>

#include "base/CivilTime.h"

namespace simulator {
namespace {

constexpr std::int64_t LEAD_SECONDS = 10;

ClockWish refused(std::string problem) {
    return {0, std::move(problem)};
}

/** The shift that makes the device show an instant. */
ClockWish shiftTo(std::int64_t instant, const ClockState& state) {
    const std::int64_t shift = instant - state.realNow;
    if (instant < 0 || shift > std::numeric_limits<int>::max() ||
        shift < std::numeric_limits<int>::min())
        return refused("the clock cannot be set so far: it goes from 1970 to 68 years from now");
    return {static_cast<int>(shift), ""};
}

std::optional<std::int64_t> signedNumber(const std::string& value) {
    // from_chars knows no plus sign.
    const char* begin = value.data() + (value[0] == '+' ? 1 : 0);
    const char* end = value.data() + value.size();
    std::int64_t number = 0;
    const auto [stop, failure] = std::from_chars(begin, end, number);
    if (failure != std::errc() || stop != end || begin[0] == (value[0] == '+' ? '-' : '\0'))
        return std::nullopt;
    return number;
}

bool isReading(const base::CivilTime& reading) {
    return reading.date.month >= 1 && reading.date.month <= 12 &&
           base::addDays(reading.date, 0) == reading.date && reading.hour < 24 &&
           reading.minute < 60 && reading.second < 60;
}

/** Digits where the form has a 0, and its other characters as they are. */
bool hasForm(const std::string& value, const std::string& form) {
    if (value.size() != form.size())
        return false;
    for (std::size_t i = 0; i < form.size(); ++i) {
        const bool digit = value[i] >= '0' && value[i] <= '9';
        if (form[i] == '0' ? !digit : value[i] != form[i])
            return false;
    }
    return true;
}

std::optional<base::CivilTime> readingOf(const std::string& value) {
    if (!hasForm(value, "0000-00-00 00:00") && !hasForm(value, "0000-00-00 00:00:00"))
        return std::nullopt;
    base::CivilTime reading;
    // The form leaves nothing that could go wrong here.
    std::sscanf(value.c_str(), "%d-%d-%d %d:%d:%d", // NOLINT(cert-err34-c)
                &reading.date.year, &reading.date.month, &reading.date.day, &reading.hour,
                &reading.minute, &reading.second);
    return reading;
}

ClockWish beforeMidnight(const ClockState& state) {
    const auto shown = base::toCivil(state.realNow + state.shift, state.timeZone);
    const auto midnight = base::toInstant({base::addDays(shown.date, 1), 0, 0, 0}, state.timeZone);
    return shiftTo(midnight - LEAD_SECONDS, state);
}

ClockWish beforeChange(const ClockState& state) {
    // From inside the last seconds before a change the wish is for the one after.
    const auto from = state.realNow + state.shift + LEAD_SECONDS;
    const auto change = base::nextOffsetChange(from, state.timeZone);
    if (!change)
        return refused("there is no daylight-saving change ahead in " + state.timeZone);
    return shiftTo(*change - LEAD_SECONDS, state);
}

} // namespace

ClockWish clockWish(const std::string& value, const ClockState& state) {
    if (value == "real")
        return {};
    if (value == "before-midnight")
        return beforeMidnight(state);
    if (value == "before-dst")
        return beforeChange(state);
    if (value.starts_with('+') || value.starts_with('-')) {
        const auto seconds = signedNumber(value);
        constexpr std::int64_t FARTHEST = std::numeric_limits<int>::max();
        if (seconds && *seconds <= FARTHEST && *seconds >= -FARTHEST)
            return shiftTo(state.realNow + *seconds, state);
        return refused("'" + value + "' is not a number of seconds");
    }
    const auto reading = readingOf(value);
    if (!reading)
        return refused("'" + value + "' is not one of: " + CLOCK_VALUES);
    if (!isReading(*reading))
        return refused("there is no " + value + " in the calendar");
    return shiftTo(base::toInstant(*reading, state.timeZone), state);
}

std::string clockValue(int shift) {
    if (shift == 0)
        return "real";
    std::string value(shift > 0 ? "+" : "");
    return value.append(std::to_string(shift));
}

} // namespace simulator
