#define LOG_TAG "alarm-ui-common"
#include "AlarmIncreaseVolumeItem.h"

#include <cstring>
#include <string_view>

#include <clock/ClockText.h>

#include "NullData.h"
#include "rules/Explanation.h"

AlarmIncreaseVolumeItem::AlarmIncreaseVolumeItem(ClockAlarmDbData& alarm)
    : AlarmSwitchItem(alarm, &ClockAlarmDbData::increaseVolume) {}

AlarmIncreaseVolumeItem::~AlarmIncreaseVolumeItem() = default;

Elm_Genlist_Item_Class* AlarmIncreaseVolumeItem::getItemClassNew() {
    return newItemClass(_getIncreaseVolumeItemText, _getIncreaseVolumeItemIcon);
}

char* AlarmIncreaseVolumeItem::_getIncreaseVolumeItemText(void* data, Evas_Object*,
                                                          const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const std::string_view name(part ? part : "");
    if (name == "elm.text.main")
        return strdup(clockText("IDS_CLOCK_MBODY_INCREASE_VOLUME"));
    if (name == "elm.text.multiline")
        return strdup(rules::increaseVolumeExplanation().c_str());
    return nullptr;
}

Evas_Object* AlarmIncreaseVolumeItem::_getIncreaseVolumeItemIcon(void* data, Evas_Object* genlist,
                                                                 const char* part) {
    RETURN_IF_NULL(data, nullptr);
    if (std::string_view(part ? part : "") != "elm.icon")
        return nullptr;
    return static_cast<AlarmIncreaseVolumeItem*>(data)->createSwitch(
        genlist, _onCheckStateChanged, clockText("IDS_CLOCK_MBODY_INCREASE_VOLUME"),
        rules::increaseVolumeExplanation());
}

void AlarmIncreaseVolumeItem::_onCheckStateChanged(void* data, Evas_Object* check, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmIncreaseVolumeItem*>(data)->switchTurned(check);
}

void AlarmIncreaseVolumeItem::_enableIncreaseVolumeOption() {
    setOption(true);
}

void AlarmIncreaseVolumeItem::_disableIncreaseVolumeOption() {
    setOption(false);
}

void AlarmIncreaseVolumeItem::_changeIncreaseVolumeOption() {
    if (isSwitchOn())
        _disableIncreaseVolumeOption();
    else
        _enableIncreaseVolumeOption();
}

void AlarmIncreaseVolumeItem::flip() {
    _changeIncreaseVolumeOption();
}
