#define LOG_TAG "alarm-ui-common"
#include "AlarmDatePopupViewController.h"

#include <Elementary.h>

#include <clock/ClockIcuDataModel.h>
#include <clock/ClockText.h>
#include <device/notification.h>

#include "AlarmRepeatItem.h"
#include "AlarmTimePickerItem.h"
#include "NullData.h"
#include "rules/DateLine.h"
#include "rules/RingDay.h"

namespace {

// A Saturday, 3 January 1970 22:30 UTC: the weekly holiday mark starts from it.
constexpr std::time_t HOLIDAY_REFERENCE = 253800;
constexpr int FIRST_YEAR = 1973;
constexpr int LAST_YEAR = 2030;

Elm_Calendar_Weekday firstDayOfWeek() {
    const int first = ClockIcuDataModel::getFirstDayOfWeek();
    if (first < 0) {
        LOG_ERROR("firstDayofWeek is failed, it will set automatically 1");
        return ELM_DAY_SUNDAY;
    }
    return static_cast<Elm_Calendar_Weekday>(first - 1);
}

std::tm selectedDay(Evas_Object* calendar) {
    std::tm selected{};
    elm_calendar_selected_time_get(calendar, &selected);
    return selected;
}

void setStripText(AlarmTimePickerItem* timePicker, const std::string& text) {
    if (timePicker)
        timePicker->setDateText(text);
}

void updateRow(const AlarmRepeatItem* row) {
    if (Elm_Object_Item* item = row ? row->getElmObjectItem() : nullptr)
        elm_genlist_item_update(item);
}

} // namespace

AlarmDatePopupViewController::AlarmDatePopupViewController(ClockAlarmDbData& alarm,
                                                           AlarmTimePickerItem* timePicker,
                                                           AlarmRepeatItem* repeat, struct tm& date)
    : _timePicker(timePicker), _repeat(repeat), _alarm(alarm), _date(date) {}

AlarmDatePopupViewController::~AlarmDatePopupViewController() = default;

void AlarmDatePopupViewController::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

Evas_Object* AlarmDatePopupViewController::onCreateView(Evas_Object* parent, void* param) {
    setContent([this](Evas_Object* popup) { return _createContent(popup); });
    setOnAddProperties([](Evas_Object* popup) {
        elm_object_style_set(popup, "theme,bg");
        elm_object_domain_translatable_part_text_set(popup, "title,text", nullptr,
                                                     "IDS_CLOCK_HEADER_SET_DATE");
    });
    setOnBack([](bool* destroyPopup) { *destroyPopup = true; });
    return WPopupController::onCreateView(parent, param);
}

Evas_Object* AlarmDatePopupViewController::_createContent(Evas_Object* parent) {
    if (!parent) {
        LOG_ERROR("Parent is NULL !!");
        return nullptr;
    }
    std::tm holiday = rules::localTime(HOLIDAY_REFERENCE);
    _calendar = elm_calendar_add(parent);
    evas_object_size_hint_weight_set(_calendar, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_calendar, EVAS_HINT_FILL, EVAS_HINT_FILL);
    elm_calendar_selected_time_set(_calendar, &_date);
    elm_calendar_first_day_of_week_set(_calendar, firstDayOfWeek());
    elm_calendar_mark_add(_calendar, "holiday", &holiday, ELM_CALENDAR_WEEKLY);
    elm_calendar_min_max_year_set(_calendar, FIRST_YEAR, LAST_YEAR);
    evas_object_smart_callback_add(_calendar, "changed", _calendarPopupDateChangedCb, this);
    evas_object_show(_calendar);
    addButton(
        clockText("IDS_COM_SK_CANCEL"), [](bool*) {},
        [this](Evas_Object* button) { _cancelButton = button; });
    addButton(
        clockText("IDS_COM_SK_SET"), [this](bool*) { _calendarPopupSetBtnClickedCb(); },
        [this](Evas_Object* button) { _setButton = button; });
    return _calendar;
}

void AlarmDatePopupViewController::_calendarPopupDateChangedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    const auto* self = static_cast<AlarmDatePopupViewController*>(data);
    const bool past =
        rules::isBeforeDay(selectedDay(self->_calendar), rules::localTime(std::time(nullptr)));
    elm_object_disabled_set(self->_setButton, past ? EINA_TRUE : EINA_FALSE);
}

void AlarmDatePopupViewController::_calendarPopupSetBtnClickedCb() {
    std::tm selected = selectedDay(_calendar);
    const std::time_t midnight = rules::toMidnight(selected);
    const std::time_t now = std::time(nullptr);
    // Without wheels the record holds the time that they showed last.
    std::tm picked{};
    picked.tm_hour = _alarm.hour;
    picked.tm_min = _alarm.min;
    if (Evas_Object* wheels = _timePicker ? _timePicker->getDateTimeObj() : nullptr)
        elm_datetime_value_get(wheels, &picked);
    const rules::DateLine line =
        rules::dateLine(selected, picked.tm_hour, picked.tm_min, rules::localTime(now));
    if (line == rules::DateLine::Past) {
        notification_status_message_post(
            clockText("IDS_CLOCK_TPOP_CANT_SET_ALARMS_FOR_TIME_IN_PAST_TOMORROWS_DATE_SET"));
        rules::clearPastDate(_alarm);
        updateRow(_repeat);
        _date = rules::oneDayLater(now);
        std::tm tomorrow = _date;
        setStripText(_timePicker, rules::dateLineText(rules::DateLine::TomorrowAndDate,
                                                      rules::toMidnight(tomorrow)));
        return;
    }
    setStripText(_timePicker, rules::dateLineText(line, midnight));
    rules::setPickedDate(_alarm, line == rules::DateLine::TodayAndDate ? 0 : midnight);
    updateRow(_repeat);
    _date = selected;
}

void AlarmDatePopupViewController::_updateCalendarBtnText() {
    elm_object_text_set(_setButton, clockText("IDS_COM_SK_SET"));
    elm_object_text_set(_cancelButton, clockText("IDS_COM_SK_CANCEL"));
}

void AlarmDatePopupViewController::onEvent(EventType type) {
    if (type == LANGUAGE_CHANGED && getEvasObj())
        _updateCalendarBtnText();
}
