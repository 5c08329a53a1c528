#include "AlarmListText.h"

#include <array>
#include <ctime>

#include "clock/ClockIcuDataModel.h"
#include "clock/ClockText.h"
#include "rules/DateLine.h"
#include "rules/WeekdaySet.h"

namespace simulator {

std::string alarmTimeText(const ClockAlarmDbData& alarm, bool twelveHour) {
    constexpr std::time_t MINUTE = 60;
    constexpr std::time_t HOUR = 60 * MINUTE;
    // A wall clock reading, not an instant: formatted in a zone that skips no hour.
    const std::time_t reading = alarm.hour * HOUR + alarm.min * MINUTE;
    std::array<char, 64> text{};
    ClockIcuDataModel::getFormattedDateString(reading, text.data(), static_cast<int>(text.size()),
                                              nullptr, twelveHour ? "hmm" : "HHmm", "UTC");
    return text.data();
}

std::string alarmDaysText(const ClockAlarmDbData& alarm) {
    std::string text;
    if (alarm.repeatWeekly != 0) {
        text = rules::weekdaySummary(alarm.repeatWeekly);
        text.erase(text.find_last_not_of(' ') + 1);
    } else if (alarm.autoDate != 0) {
        text = rules::dateText(alarm.autoDate);
    }
    if (alarm.enable == 1)
        return text;
    const std::string off = clockText("IDS_ALM_BODY_OFF");
    return text.empty() ? off : off + " - " + text;
}

} // namespace simulator
