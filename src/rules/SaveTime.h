// Times and dates that an alarm gets when it is saved.
#pragma once

#include <ctime>
#include <string>

#include <clock/ClockAlarmDbData.h>

namespace rules {

enum class RingDate {
    NotChosen, // The days follow from the time of day or the weekly repeat.
    Chosen,    // The user has picked the day.
};

// Settles repeatOnce, autoDate and manualDate of an alarm that is about to be saved.
RingDate settleRingDate(ClockAlarmDbData& alarm, std::time_t now);

// Today's hour:minute in a time zone. "Today" is the day in that zone. Of the two instants that an
// hour repeated by the end of daylight saving gives, the later one.
std::time_t alarmTime(int hour, int minute, const std::string& timeZone, std::time_t now);

} // namespace rules
