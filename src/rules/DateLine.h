// The line that tells on which day an alarm rings.
#pragma once

#include <cstddef>
#include <ctime>
#include <string>

#include <clock/ClockAlarmDbData.h>

namespace rules {

enum class DateLine {
    TodayAndDate,
    TomorrowAndDate,
    Date,
    DateWithYear,
    Past, // The ring day is over, or its time has come already.
};

// How to show the ring day of an alarm. Days are compared by calendar within a month, so the first
// of the next month is a plain date even on the last day of this one.
DateLine dateLine(const std::tm& ringDay, int hour, int minute, const std::tm& now);

// A one-time alarm without dates: what becomes of one whose day is over.
void clearPastDate(ClockAlarmDbData& alarm);

// The current time zone's id.
std::string currentTimeZone();

inline constexpr const char* DAY_SKELETON = "EMMMd";
inline constexpr const char* DAY_AND_YEAR_SKELETON = "EMMMdyyyy";

// A day as the current locale writes it, at most 511 bytes.
std::string dateText(std::time_t day, const char* skeleton = DAY_SKELETON);

// "<word> - <date>", cut to whole characters.
std::string wordAndDate(const std::string& word, const std::string& date,
                        std::size_t maxBytes = 511);

} // namespace rules
