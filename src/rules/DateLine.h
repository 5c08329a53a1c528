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

// A one-time alarm on a day that was picked; 0 leaves the day to the time of day.
void setPickedDate(ClockAlarmDbData& alarm, std::time_t midnight);

// True for an alarm without repeat days and without a date: the time of day alone decides its day.
bool isUndated(const ClockAlarmDbData& alarm);

// Takes the dates of an alarm with repeat days away.
void dropDatesOfWeekly(ClockAlarmDbData& alarm);

// True when a day lies before another one.
bool isBeforeDay(const std::tm& day, const std::tm& today);

// The current time zone's id.
std::string currentTimeZone();

inline constexpr const char* DAY_SKELETON = "EMMMd";
inline constexpr const char* DAY_AND_YEAR_SKELETON = "EMMMdyyyy";

inline constexpr std::size_t MAX_LINE_BYTES = 511;

// A day as the current locale writes it, at most 511 bytes.
std::string dateText(std::time_t day, const char* skeleton = DAY_SKELETON);

// "<word> - <date>", cut to whole characters.
std::string wordAndDate(const std::string& word, const std::string& date,
                        std::size_t maxBytes = MAX_LINE_BYTES);

// The line for a ring day, given by its midnight. Empty when the day is over.
std::string dateLineText(DateLine line, std::time_t midnight,
                         std::size_t maxBytes = MAX_LINE_BYTES);

} // namespace rules
