#define LOG_TAG "alarm-ui-common"
#include "AlarmRepeatItem.h"

#include <cstring>
#include <string>
#include <string_view>

#include <clock/ClockText.h>

#include "NullData.h"
#include "rules/WeekdaySet.h"

AlarmRepeatItem::AlarmRepeatItem(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmRepeatItem::~AlarmRepeatItem() = default;

Elm_Genlist_Item_Class* AlarmRepeatItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "2line.top";
    itemClass->func.text_get = _getRepeatWeeklyItemText;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmRepeatItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

void AlarmRepeatItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

char* AlarmRepeatItem::_getRepeatWeeklyItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const auto* self = static_cast<AlarmRepeatItem*>(data);
    const std::string_view name(part ? part : "");
    if (name == "elm.text.main.left.top")
        return strdup(clockText("IDS_CLOCK_BODY_REPEAT_WEEKLY"));
    if (name != "elm.text.sub.left.bottom")
        return nullptr;
    const std::string summary = rules::weekdaySummary(self->_alarm.repeatWeekly);
    return strdup(summary.empty() ? clockText("IDS_CLOCK_MBODY_NEVER") : summary.c_str());
}
