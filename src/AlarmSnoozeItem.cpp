#define LOG_TAG "alarm-ui-common"
#include "AlarmSnoozeItem.h"

#include <cstring>
#include <string_view>

#include <clock/ClockText.h>

#include "NullData.h"
#include "rules/Explanation.h"

AlarmSnoozeItem::AlarmSnoozeItem(ClockAlarmDbData& alarm)
    : AlarmSwitchItem(alarm, &ClockAlarmDbData::snooze) {}

AlarmSnoozeItem::~AlarmSnoozeItem() = default;

Elm_Genlist_Item_Class* AlarmSnoozeItem::getItemClassNew() {
    return newItemClass(_getSnoozeItemText, _getSnoozeItemIcon);
}

char* AlarmSnoozeItem::_getSnoozeItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const ClockAlarmDbData& alarm = static_cast<AlarmSnoozeItem*>(data)->alarm();
    const std::string_view name(part ? part : "");
    if (name == "elm.text.main")
        return strdup(clockText("IDS_ALM_BODY_SNOOZE"));
    if (name == "elm.text.multiline")
        return strdup(rules::snoozeExplanation(alarm.snoozeRepeat, alarm.snoozeDuration).c_str());
    return nullptr;
}

Evas_Object* AlarmSnoozeItem::_getSnoozeItemIcon(void* data, Evas_Object* genlist,
                                                 const char* part) {
    RETURN_IF_NULL(data, nullptr);
    if (std::string_view(part ? part : "") != "elm.icon")
        return nullptr;
    auto* self = static_cast<AlarmSnoozeItem*>(data);
    const ClockAlarmDbData& alarm = self->alarm();
    return self->createSwitch(genlist, _onCheckStateChanged, clockText("IDS_ALM_BODY_SNOOZE"),
                              rules::snoozeExplanation(alarm.snoozeRepeat, alarm.snoozeDuration));
}

void AlarmSnoozeItem::_onCheckStateChanged(void* data, Evas_Object* check, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmSnoozeItem*>(data)->switchTurned(check);
}

void AlarmSnoozeItem::_enableSnoozeOption() {
    setOption(true);
}

void AlarmSnoozeItem::_disableSnoozeOption() {
    setOption(false);
}

void AlarmSnoozeItem::_changeSnoozeOption() {
    if (isSwitchOn())
        _disableSnoozeOption();
    else
        _enableSnoozeOption();
}

void AlarmSnoozeItem::flip() {
    _changeSnoozeOption();
}
