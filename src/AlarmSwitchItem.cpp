#include "AlarmSwitchItem.h"

#include <app_assist/WAccessible.h>

#include "CheckLayout.h"

namespace {

bool isOn(std::int32_t option) {
    constexpr std::int32_t LOW_BYTE = 0xff;
    return (option & LOW_BYTE) != 0;
}

} // namespace

AlarmSwitchItem::AlarmSwitchItem(ClockAlarmDbData& alarm, std::int32_t ClockAlarmDbData::*option)
    : _alarm(alarm), _option(option) {}

AlarmSwitchItem::~AlarmSwitchItem() = default;

void AlarmSwitchItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

void AlarmSwitchItem::onSelect(Elm_Object_Item* item) {
    if (_selected)
        _selected();
    elm_genlist_item_selected_set(item, EINA_FALSE);
    flip();
}

Elm_Genlist_Item_Class* AlarmSwitchItem::newItemClass(Elm_Gen_Item_Text_Get_Cb text,
                                                      Elm_Gen_Item_Content_Get_Cb content) {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "multiline_sub.main.1icon";
    itemClass->func.text_get = text;
    itemClass->func.content_get = content;
    itemClass->func.del = deleteCb;
    return itemClass;
}

Evas_Object* AlarmSwitchItem::createSwitch(Evas_Object* genlist, Evas_Smart_Cb changed,
                                           const char* title, const std::string& explanation) {
    Evas_Object* check = elm_check_add(genlist);
    app_assist::setAccessibleName(check, std::string(title) + ", " + explanation);
    elm_object_style_set(check, "on&off");
    elm_check_state_set(check, isOn(_alarm.*_option) ? EINA_TRUE : EINA_FALSE);
    evas_object_repeat_events_set(check, EINA_FALSE);
    evas_object_propagate_events_set(check, EINA_FALSE);
    evas_object_smart_callback_add(check, "changed", changed, this);
    _checks.add(check);
    evas_object_show(check);
    return check;
}

void AlarmSwitchItem::setOption(bool on) {
    _alarm.*_option = on ? 1 : 0;
    if (Evas_Object* check = _checks.newest())
        turnCheck(check, on);
}

bool AlarmSwitchItem::isSwitchOn() const {
    const Evas_Object* check = _checks.newest();
    return check ? elm_check_state_get(check) : isOn(_alarm.*_option);
}

void AlarmSwitchItem::switchTurned(const Evas_Object* check) {
    _alarm.*_option = elm_check_state_get(check) ? 1 : 0;
    if (_selected)
        _selected();
}
