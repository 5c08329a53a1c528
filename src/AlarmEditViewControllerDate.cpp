// The editor's date line and the timer that keeps it current.
#define LOG_TAG "alarm-ui-common"
#include "AlarmEditViewController.h"

#include "AlarmTimePickerItem.h"
#include "NullData.h"
#include "rules/DateLine.h"
#include "rules/RingDay.h"
#include "rules/WeekdaySet.h"

void AlarmEditViewController::_updateDateText() {
    constexpr std::size_t MAX_SUMMARY_BYTES = 1023;
    std::string text = rules::weekdaySummary(_alarm.repeatWeekly);
    if (text.empty()) {
        const rules::RingDay ring = rules::ringDay(_alarm.hour, _alarm.min, std::time(nullptr));
        text = rules::dateLineText(ring.today ? rules::DateLine::TodayAndDate
                                              : rules::DateLine::TomorrowAndDate,
                                   ring.midnight, MAX_SUMMARY_BYTES);
        _date = ring.day;
    }
    if (AlarmTimePickerItem* row = timePickerRow())
        row->setDateText(text);
}

void AlarmEditViewController::refreshDateText() {
    if (AlarmTimePickerItem* row = timePickerRow())
        row->updateDateText();
    refreshUndatedText();
}

void AlarmEditViewController::refreshUndatedText() {
    // The row knows the days of dated alarms only. A new alarm's line is blank until it has a day.
    const AlarmTimePickerItem* row = timePickerRow();
    if (row && rules::isUndated(_alarm) && !row->getDateText().empty())
        _updateDateText();
}

void AlarmEditViewController::armMinuteTimer() {
    app_assist::WUiTimer::destroy(_minuteTimer);
    _minuteTimer = app_assist::WUiTimer::addTimer(rules::secondsToNextMinute(std::time(nullptr)),
                                                  _updateDateTextTimerCb, this);
}

bool AlarmEditViewController::_updateDateTextTimerCb(void* data) {
    RETURN_IF_NULL(data, false);
    auto* self = static_cast<AlarmEditViewController*>(data);
    self->refreshDateText();
    self->armMinuteTimer();
    return false;
}
