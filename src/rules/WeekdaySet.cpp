#include "rules/WeekdaySet.h"

#include <base/Text.h>
#include <clock/ClockAlarmDbData.h>

namespace rules {

namespace {

constexpr std::size_t MAX_SUMMARY_BYTES = 1023;
constexpr std::size_t MAX_DAY_BYTES = 63;

struct Weekday {
    int bit;
    const char* textId;
};

constexpr Weekday WEEK_FROM_MONDAY[] = {
    {2, "IDS_CLOCK_SBODY_MON_ABB2"},  {4, "IDS_CLOCK_SBODY_TUE_ABB2"},
    {8, "IDS_CLOCK_SBODY_WED_ABB2"},  {16, "IDS_CLOCK_SBODY_THU_ABB2"},
    {32, "IDS_CLOCK_SBODY_FRI_ABB2"}, {64, "IDS_CLOCK_SBODY_SAT_ABB2"},
    {1, "IDS_CLOCK_SBODY_SUN_ABB2"},
};

} // namespace

std::string weekdaySummary(int weekdays, Translate translate) {
    if (weekdays == CLOCK_ALARM_EVERY_DAY)
        return std::string(base::cutUtf8(translate("IDS_ALM_BODY_EVERYDAY"), MAX_SUMMARY_BYTES));
    std::string summary;
    for (const Weekday& day : WEEK_FROM_MONDAY) {
        if ((weekdays & day.bit) == 0)
            continue;
        const std::string piece = std::string(translate(day.textId)) + " ";
        summary += base::cutUtf8(piece, MAX_DAY_BYTES);
    }
    return std::string(base::cutUtf8(summary, MAX_SUMMARY_BYTES));
}

} // namespace rules
