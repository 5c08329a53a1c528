#include "AlarmListItem.h"

#include <cstring>
#include <string_view>
#include <utility>

#include "AlarmListText.h"
#include "TimeText.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

AlarmListItem::AlarmListItem(ClockAlarmDbData alarm, bool twelveHour, SelectedFunction selected)
    : _alarm(std::move(alarm)), _twelveHour(twelveHour), _selected(std::move(selected)) {}

Elm_Genlist_Item_Class* AlarmListItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "simulator.time";
    itemClass->func.text_get = _textGetCb;
    itemClass->func.state_get = _stateGetCb;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmListItem::onSelect(Elm_Object_Item* item) {
    elm_genlist_item_selected_set(item, EINA_FALSE);
    if (_selected)
        _selected(_alarm.id);
}

char* AlarmListItem::_textGetCb(void* data, Evas_Object*, const char* part) {
    const auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr || part == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return nullptr;
    }
    const std::string_view name(part);
    if (name == "row.time")
        return strdup(alarmTimeText(self->_alarm, self->_twelveHour).c_str());
    if (name == "row.about")
        return strdup(self->aboutMarkup().c_str());
    return nullptr;
}

std::string AlarmListItem::aboutMarkup() const {
    const std::string days = markupOf(alarmDaysText(_alarm));
    return _alarm.name.empty() ? days : "<label>" + markupOf(_alarm.name) + "</label><br>" + days;
}

Eina_Bool AlarmListItem::_stateGetCb(void* data, Evas_Object*, const char*) {
    const auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return EINA_FALSE;
    }
    return self->_alarm.enable == 1 ? EINA_TRUE : EINA_FALSE;
}

} // namespace simulator
