/**
 * @file
 * @brief Texts about alarms.
 */
#pragma once

#include <string>

#include <clock/ClockAlarmDbData.h>
#include <clock/Export.h>

/** Sentences and letters. */
class CLOCK_COMMON_EXPORT ClockStringUtil {
public:
    /**
     * @brief How far the alarm's next ring lies from now, rounded up to whole minutes.
     *
     * The distance is one of instants: a day on which the clock is changed has 23 or 25 hours.
     * @param[out] days,hours,minutes The three counts; all 0 when the alarm will not ring.
     */
    static void getAlertTimeOffset(const ClockAlarmDbData& alarm, int* days, int* hours,
                                   int* minutes);

    /**
     * @brief The sentence that tells how long from now the alarm will ring.
     *
     * Units follow the plural rules of the current locale; counts of 0 are left out.
     */
    static void generateAlertOffsetToastPopupText(int days, int hours, int minutes,
                                                  std::string& text);

    /** @brief The upper-case form of a UTF-8 text by the rules of the current locale. */
    static std::string changeStringToUpper(const std::string& text);
};
