#define LOG_TAG "alarm-ui-common"
#include "AlarmTimePickerItem.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string_view>
#include <unordered_set>

#include <Elementary.h>

#include <app_assist/WAccessible.h>
#include <base/Text.h>
#include <clock/ClockStringUtil.h>
#include <clock/ClockText.h>
#include <device/ea.h>
#include <device/uxt.h>

#include "NullData.h"
#include "ThemePath.h"
#include "rules/DateLine.h"
#include "rules/RingDay.h"
#include "rules/WeekdaySet.h"

namespace {

constexpr const char* REGION_KEY = "db/menu_widget/regionformat";
constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";
constexpr int TWELVE_HOURS = 1;
constexpr int TWENTY_FOUR_HOURS = 2;

constexpr const char* STYLE_12 = "time_layout";
constexpr const char* STYLE_24 = "time_layout_24hr";

using Text = std::unique_ptr<char, decltype(&std::free)>;

Text regionLocale() {
    return Text(vconf_get_str(REGION_KEY), &std::free);
}

// Settings callbacks are never taken back, so they also arrive for pickers that are gone.
std::unordered_set<const Evas_Object*>& livePickers() {
    static std::unordered_set<const Evas_Object*> pickers;
    return pickers;
}

void pickerDeletedCb(void*, Evas*, Evas_Object* picker, void*) {
    livePickers().erase(picker);
}

std::string dateButtonLabel() {
    constexpr std::size_t MAX_LABEL_BYTES = 255;
    const auto label = base::cutUtf8(clockText("IDS_COM_BODY_DATE"), MAX_LABEL_BYTES);
    return ClockStringUtil::changeStringToUpper(std::string(label));
}

void writeDateText(Evas_Object* calendar, const std::string& text) {
    elm_object_part_text_set(calendar, "date.text", text.c_str());
}

std::string dateTextOf(const Evas_Object* calendar) {
    const char* text = elm_object_part_text_get(calendar, "date.text");
    return text ? text : "";
}

} // namespace

AlarmTimePickerItem::AlarmTimePickerItem(ClockAlarmDbData& alarm, std::tm& date)
    : _alarm(alarm), _date(date) {}

AlarmTimePickerItem::~AlarmTimePickerItem() {
    // The list may delete the row before the widgets.
    for (Evas_Object* picker : _datetimes.all())
        evas_object_smart_callback_del_full(picker, "changed", _datetimeChangedCb, this);
    for (Evas_Object* button : _dateButtons.all())
        evas_object_smart_callback_del_full(button, "clicked", _dateBtnClickedCb, this);
    for (Evas_Object* calendar : _calendars.all())
        evas_object_event_callback_del_full(calendar, EVAS_CALLBACK_DEL, _calendarDeletedCb, this);
}

Elm_Genlist_Item_Class* AlarmTimePickerItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "edit.theme.time";
    itemClass->decorate_item_style = "mode/slide";
    itemClass->func.content_get = _getTimePickerItemContent;
    // A list makes and drops a row several times to measure it; wheels are too costly for that.
    itemClass->func.reusable_content_get = _keepTimePickerItemContent;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmTimePickerItem::setDateBtnSelectedCb(const std::function<void()>& selected) {
    _dateBtnSelected = selected;
}

void AlarmTimePickerItem::updateDateText() {
    if (_alarm.autoDate != 0)
        _datetimeChangedCb(this, getDateTimeObj(), nullptr);
    if (Evas_Object* button = _dateButtons.newest())
        elm_object_text_set(button, dateButtonLabel().c_str());
}

Evas_Object* AlarmTimePickerItem::_getTimePickerItemContent(void* data, Evas_Object* genlist,
                                                            const char* part) {
    RETURN_IF_NULL(data, nullptr);
    auto* self = static_cast<AlarmTimePickerItem*>(data);
    const std::string_view name(part ? part : "");
    if (name == "timepicker.area")
        return self->createTimePicker(genlist);
    if (name == "calendar.area")
        return self->createCalendar(genlist);
    return nullptr;
}

Evas_Object* AlarmTimePickerItem::_keepTimePickerItemContent(void* data, Evas_Object*, const char*,
                                                             Evas_Object* old) {
    RETURN_IF_NULL(data, nullptr);
    const auto* self = static_cast<AlarmTimePickerItem*>(data);
    Evas_Object* picker = self->_datetimes.reusable(old);
    return picker ? picker : self->_calendars.reusable(old);
}

void AlarmTimePickerItem::renewContent() {
    _datetimes.renew();
    _calendars.renew();
}

Evas_Object* AlarmTimePickerItem::createTimePicker(Evas_Object* genlist) {
    const Text locale = regionLocale();
    int hours = 0;
    vconf_get_int(HOURS_KEY, &hours);
    const bool twelve = hours == TWELVE_HOURS;
    Evas_Object* picker = uxt_date_time_add(genlist, twelve ? STYLE_12 : STYLE_24);
    if (!picker) {
        LOG_ERROR("datetime is NULL !!");
        return nullptr;
    }
    uxt_date_time_set_format_by_locale(picker, locale.get(), twelve ? 0 : 1);
    _datetimes.add(picker);
    livePickers().insert(picker);
    evas_object_event_callback_add(picker, EVAS_CALLBACK_DEL, pickerDeletedCb, nullptr);

    ea_theme_object_color_replace(picker, "B0211", "transparent");
    std::tm shown = rules::localTime(std::time(nullptr));
    shown.tm_hour = _alarm.hour;
    shown.tm_min = _alarm.min;
    elm_datetime_value_set(picker, &shown);

    evas_object_smart_callback_add(picker, "changed", _datetimeChangedCb, this);
    vconf_notify_key_changed(REGION_KEY, _datetimeFormatChangedCb, picker);
    vconf_notify_key_changed(HOURS_KEY, _datetimeFormatChangedCb, picker);
    return picker;
}

Evas_Object* AlarmTimePickerItem::createCalendar(Evas_Object* genlist) {
    const std::string path = themePath("edje/AlarmEditViewController.edj");
    Evas_Object* calendar = elm_layout_add(genlist);
    elm_layout_file_set(calendar, path.c_str(), "edit.layout.calendar");
    showDate(calendar);
    _calendars.add(calendar);
    evas_object_event_callback_add(calendar, EVAS_CALLBACK_DEL, _calendarDeletedCb, this);
    if (Evas_Object* button = createDateButton(calendar))
        elm_object_part_content_set(calendar, "date.button", button);
    return calendar;
}

Evas_Object* AlarmTimePickerItem::createDateButton(Evas_Object* calendar) {
    Evas_Object* button = uxt_button_add(calendar, "on_gradient_bg");
    if (!button)
        return nullptr;
    elm_object_text_set(button, dateButtonLabel().c_str());
    evas_object_smart_callback_add(button, "clicked", _dateBtnClickedCb, this);
    _dateButtons.add(button);
    return button;
}

void AlarmTimePickerItem::showDate(Evas_Object* calendar) {
    if (_alarm.autoDate != 0)
        writeDateText(calendar, ringDateText());
    else if (_alarm.repeatWeekly != 0)
        writeDateText(calendar, rules::weekdaySummary(_alarm.repeatWeekly));
    else if (const std::string before = getDateText(); !before.empty())
        writeDateText(calendar, before);
}

std::string AlarmTimePickerItem::getDateText() const {
    const Evas_Object* calendar = getCalendarObj();
    return calendar ? dateTextOf(calendar) : _lastDateText;
}

void AlarmTimePickerItem::setDateText(const std::string& text) {
    if (Evas_Object* calendar = getCalendarObj())
        writeDateText(calendar, text);
    else
        _lastDateText = text;
}

void AlarmTimePickerItem::_calendarDeletedCb(void* data, Evas*, Evas_Object* calendar, void*) {
    static_cast<AlarmTimePickerItem*>(data)->_lastDateText = dateTextOf(calendar);
}

std::string AlarmTimePickerItem::ringDateText() {
    _date = rules::localTime(_alarm.autoDate);
    const std::tm now = rules::localTime(std::time(nullptr));
    const rules::DateLine line = rules::dateLine(_date, _alarm.hour, _alarm.min, now);
    if (line != rules::DateLine::Past)
        return rules::dateLineText(line, _alarm.autoDate);
    return repairedDateText();
}

std::string AlarmTimePickerItem::repairedDateText() {
    LOG_ERROR("Set autoDate and manualDate to 0. Time already passed !!");
    // autoDate stays 0 on purpose: the next turn of a wheel, or saving, fills it in.
    rules::clearPastDate(_alarm);
    std::tm tomorrow = rules::oneDayLater(std::time(nullptr));
    _date = tomorrow;
    const std::time_t midnight = rules::toMidnight(tomorrow);
    return rules::dateLineText(rules::DateLine::TomorrowAndDate, midnight);
}

void AlarmTimePickerItem::onSetElmObjectItem(Elm_Object_Item* /*item*/) {
    nameRow();
}

/** The row itself has no text that a screen reader could read. */
void AlarmTimePickerItem::nameRow() {
    std::array<char, 32> time{};
    std::snprintf(time.data(), time.size(), "%02d:%02d", _alarm.hour, _alarm.min);
    app_assist::setAccessibleName(getElmObjectItem(), time.data());
}

void AlarmTimePickerItem::_datetimeChangedCb(void* data, Evas_Object* datetime, void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmTimePickerItem*>(data);
    ClockAlarmDbData& alarm = self->_alarm;
    std::tm picked{};
    // Without wheels the record holds the time that they showed last.
    if (datetime && elm_datetime_value_get(datetime, &picked)) {
        alarm.hour = picked.tm_hour;
        alarm.min = picked.tm_min;
        self->nameRow();
    }
    if (alarm.repeatWeekly != 0 || alarm.manualDate != 0)
        return;
    const rules::RingDay ring = rules::ringDay(alarm.hour, alarm.min, std::time(nullptr));
    alarm.autoDate = static_cast<std::int32_t>(ring.midnight);
    self->_date = ring.day;
    const auto line = ring.today ? rules::DateLine::TodayAndDate : rules::DateLine::TomorrowAndDate;
    self->setDateText(rules::dateLineText(line, ring.midnight));
}

void AlarmTimePickerItem::_dateBtnClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmTimePickerItem*>(data)->_dateBtnSelected();
}

void AlarmTimePickerItem::_datetimePickerRegionFormatSet(Evas_Object* datetime) {
    if (!datetime) {
        LOG_ERROR("datetime is NULL !!");
        return;
    }
    const Text locale = regionLocale();
    int hours = 0;
    const bool readable = vconf_get_int(HOURS_KEY, &hours) == VCONF_OK;
    if (!locale || !readable) {
        elm_object_style_set(datetime, STYLE_12);
        elm_datetime_format_set(datetime, "%d/%b/%Y %I:%M %p");
    } else if (hours == TWELVE_HOURS) {
        elm_object_style_set(datetime, STYLE_12);
        uxt_date_time_set_format_by_locale(datetime, locale.get(), 0);
    } else if (hours == TWENTY_FOUR_HOURS) {
        elm_object_style_set(datetime, STYLE_24);
        uxt_date_time_set_format_by_locale(datetime, locale.get(), 1);
    }
}

void AlarmTimePickerItem::_datetimeFormatChangedCb(keynode_t*, void* data) {
    RETURN_IF_NULL(data);
    auto* picker = static_cast<Evas_Object*>(data);
    if (!livePickers().contains(picker)) {
        LOG_INFO("The time picker is gone. Ignore callback");
        return;
    }
    _datetimePickerRegionFormatSet(picker);
}
