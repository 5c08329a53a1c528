#include "AlarmListText.h"

#include "TimeText.h"
#include "clock/ClockText.h"
#include "rules/DateLine.h"
#include "rules/WeekdaySet.h"

namespace simulator {

std::string alarmTimeText(const ClockAlarmDbData& alarm, bool twelveHour) {
    return timeOfDayText(alarm.hour, alarm.min, twelveHour);
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
