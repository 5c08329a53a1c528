/**
 * @file
 * @brief Dates, times and time zones, on ICU.
 */
#pragma once

#include <ctime>

#include <clock/ClockAlarmDbData.h>
#include <clock/Export.h>

/** Date and time-zone utilities. */
class CLOCK_COMMON_EXPORT ClockIcuDataModel {
public:
    /** @brief The id of the current time zone. @return Text to be freed with free(), never null. */
    static char* getCurrentTimeZone();

    /**
     * @brief The alarm's hour:min as an instant of the current day, in the current time zone.
     *
     * A time that a daylight-saving change skips is moved to the first instant after the gap.
     */
    static std::time_t verifyExistingTimeForDst(const ClockAlarmDbData& alarm);

    /**
     * @brief Writes an instant in the form of an ICU skeleton.
     * @param instant Epoch seconds.
     * @param[out] buffer Gets UTF-8 text, cut to whole characters; empty on failure.
     * @param size Size of the buffer in bytes.
     * @param locale ICU locale id; null for the current one.
     * @param skeleton For example "EMMMd", "hhmm" or "HHmm".
     * @param timeZone Time-zone id; null for the current one.
     */
    static bool getFormattedDateString(std::time_t instant, char* buffer, int size,
                                       const char* locale, const char* skeleton,
                                       const char* timeZone);

    /** @brief First day of the week of the current locale: 1 Sunday to 7; negative on failure. */
    static int getFirstDayOfWeek();

    /**
     * @brief The locale of the screens' dates: that of the process's messages.
     * @return ICU locale id, for example "en_US"; "en" for the "C" locale.
     */
    static const char* getCurrentLocale();
};
