// The day on which a one-time alarm rings.
#pragma once

#include <ctime>

namespace rules {

// The broken-down local time of an instant.
std::tm localTime(std::time_t instant);

// Turns a broken-down local time into the midnight of its day, normalised in place.
std::time_t toMidnight(std::tm& day);

// The same time of day one day (86400 seconds) later, broken down.
std::tm oneDayLater(std::time_t now);

// True when a time of day is still to come today; the current minute has passed.
bool isStillToCome(int hour, int minute, const std::tm& now);

struct RingDay {
    bool today;           // Tomorrow otherwise.
    std::tm day;          // Its midnight, broken down.
    std::time_t midnight; // The same as an instant.
};

// The day on which an alarm without a date of its own rings next.
RingDay ringDay(int hour, int minute, std::time_t now);

// Seconds until the clock shows the next minute, 1 to 60.
int secondsToNextMinute(std::time_t now);

} // namespace rules
