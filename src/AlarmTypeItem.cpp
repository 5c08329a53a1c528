#define LOG_TAG "alarm-ui-common"
#include "AlarmTypeItem.h"

#include <cstring>
#include <string_view>

#include <clock/ClockText.h>

#include "NullData.h"
#include "rules/AlertType.h"

AlarmTypeItem::AlarmTypeItem(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmTypeItem::~AlarmTypeItem() = default;

Elm_Genlist_Item_Class* AlarmTypeItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "2line.top";
    itemClass->func.text_get = _getTypeItemText;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmTypeItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

void AlarmTypeItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

char* AlarmTypeItem::_getTypeItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const auto* self = static_cast<AlarmTypeItem*>(data);
    const std::string_view name(part ? part : "");
    const char* textId = nullptr;
    if (name == "elm.text.main.left.top")
        textId = "IDS_CLOCK_TMBODY_ALARM_TYPE";
    else if (name == "elm.text.sub.left.bottom")
        textId = rules::alertTypeTextId(self->_alarm.type);
    return textId ? strdup(clockText(textId)) : nullptr;
}
