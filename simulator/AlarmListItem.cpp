#include "AlarmListItem.h"

#include <cstring>
#include <ctime>
#include <string_view>
#include <utility>

#include <unicode/ubidi.h>
#include <unicode/unistr.h>

#include "AlarmListText.h"
#include "AlarmOrder.h"
#include "TimeText.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr UChar32 LEFT_TO_RIGHT_MARK = 0x200e;
constexpr UChar32 RIGHT_TO_LEFT_MARK = 0x200f;
constexpr UChar32 LEFT_TO_RIGHT_TEXT = 0x202a;
constexpr UChar32 RIGHT_TO_LEFT_TEXT = 0x202b;
constexpr UChar32 END_OF_TEXT = 0x202c;

/** A line begins where the row does, also when its own letters run the other way. */
std::string lineMarkup(const std::string& text) {
    const auto letters = icu::UnicodeString::fromUTF8(text);
    const auto direction = ubidi_getBaseDirection(letters.getBuffer(), letters.length());
    const bool mirrored = elm_config_mirrored_get() != EINA_FALSE;
    if (direction != (mirrored ? UBIDI_LTR : UBIDI_RTL))
        return markupOf(text);
    icu::UnicodeString line(mirrored ? RIGHT_TO_LEFT_MARK : LEFT_TO_RIGHT_MARK);
    line.append(mirrored ? LEFT_TO_RIGHT_TEXT : RIGHT_TO_LEFT_TEXT);
    line.append(letters).append(END_OF_TEXT);
    std::string utf8;
    return markupOf(line.toUTF8String(utf8));
}

/** Moves the knob there; nobody is told that it has changed. */
void turn(Evas_Object* check, bool on) {
    elm_object_signal_emit(check, on ? "elm,activate,check,on" : "elm,activate,check,off", "elm");
    elm_check_state_set(check, on ? EINA_TRUE : EINA_FALSE);
}

std::string tagged(const std::string& tag, const std::string& markup) {
    return "<" + tag + ">" + markup + "</" + tag + ">";
}

} // namespace

AlarmListItem::AlarmListItem(ClockAlarmDbData alarm, AlarmRowLook look, AlarmRowActions actions)
    : _alarm(std::move(alarm)), _look(std::move(look)), _actions(std::move(actions)) {}

Elm_Genlist_Item_Class* AlarmListItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "simulator.alarm";
    itemClass->func.text_get = _textGetCb;
    itemClass->func.content_get = _contentGetCb;
    itemClass->func.state_get = _stateGetCb;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmListItem::onSelect(Elm_Object_Item* item) {
    elm_genlist_item_selected_set(item, EINA_FALSE);
    if (_actions.tapped)
        _actions.tapped(_alarm.id);
}

void AlarmListItem::onHold() {
    if (_actions.held)
        _actions.held(_alarm.id);
}

void AlarmListItem::show(const ClockAlarmDbData& alarm, const AlarmRowLook& look) {
    _alarm = alarm;
    _look = look;
    elm_genlist_item_fields_update(getElmObjectItem(), "*", ELM_GENLIST_ITEM_FIELD_TEXT);
    elm_genlist_item_fields_update(getElmObjectItem(), "*", ELM_GENLIST_ITEM_FIELD_STATE);
    for (Evas_Object* check : _switches.all()) {
        if ((elm_check_state_get(check) != EINA_FALSE) != isOn())
            turn(check, isOn());
    }
}

bool AlarmListItem::isOn() const {
    return upcomingRing(_alarm, std::time(nullptr)).has_value();
}

char* AlarmListItem::_textGetCb(void* data, Evas_Object*, const char* part) {
    const auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr || part == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return nullptr;
    }
    return strdup(self->textOf(part).c_str());
}

std::string AlarmListItem::textOf(const std::string& part) const {
    if (part == "row.next")
        return _look.next;
    if (part == "row.time")
        return alarmTimeText(_alarm, _look.twelveHour);
    return part == "row.about" ? aboutMarkup() : "";
}

std::string AlarmListItem::aboutMarkup() const {
    const bool on = isOn();
    const std::string days = alarmDaysText(_alarm, std::time(nullptr));
    // The day may stand above the time already.
    const std::string when = days == _look.next ? "" : lineMarkup(days);
    std::string about = on ? when : tagged("off", when);
    if (_alarm.name.empty())
        return about;
    std::string name = tagged(on ? "label" : "label_off", lineMarkup(_alarm.name));
    return about.empty() ? name : name + "<br>" + about;
}

Evas_Object* AlarmListItem::_contentGetCb(void* data, Evas_Object* genlist, const char* part) {
    auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr || part == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return nullptr;
    }
    return std::string_view(part) == "row.switch" ? self->createSwitch(genlist) : nullptr;
}

Evas_Object* AlarmListItem::createSwitch(Evas_Object* genlist) {
    Evas_Object* check = elm_check_add(genlist);
    elm_object_style_set(check, "on&off");
    elm_check_state_set(check, isOn() ? EINA_TRUE : EINA_FALSE);
    // A touch of the switch is none of the row.
    evas_object_propagate_events_set(check, EINA_FALSE);
    evas_object_smart_callback_add(check, "changed", _switchedCb, this);
    _switches.add(check);
    evas_object_show(check);
    return check;
}

void AlarmListItem::_switchedCb(void* data, Evas_Object* check, void*) {
    const auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    if (self->_actions.switched)
        self->_actions.switched(self->_alarm.id, elm_check_state_get(check) != EINA_FALSE);
}

Eina_Bool AlarmListItem::_stateGetCb(void* data, Evas_Object*, const char*) {
    const auto* self = static_cast<AlarmListItem*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return EINA_FALSE;
    }
    return self->isOn() ? EINA_TRUE : EINA_FALSE;
}

} // namespace simulator
