#include "HoldKey.h"

#include <utility>

namespace simulator::control {
namespace {

constexpr double FIRST_REPEAT_SECONDS = 0.4;
constexpr double REPEAT_SECONDS = 0.1;

} // namespace

HoldKey::HoldKey(Evas_Object* button, std::string key, Press press)
    : _button(button), _key(std::move(key)), _press(std::move(press)) {
    evas_object_smart_callback_add(button, "pressed", _pressedCb, this);
    evas_object_smart_callback_add(button, "unpressed", _unpressedCb, this);
    evas_object_smart_callback_add(button, "clicked", _clickedCb, this);
}

HoldKey::~HoldKey() {
    evas_object_smart_callback_del_full(_button, "pressed", _pressedCb, this);
    evas_object_smart_callback_del_full(_button, "unpressed", _unpressedCb, this);
    evas_object_smart_callback_del_full(_button, "clicked", _clickedCb, this);
    release();
}

void HoldKey::_pressedCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<HoldKey*>(data);
    self->_byPointer = true;
    self->_repeat.reset(ecore_timer_add(FIRST_REPEAT_SECONDS, _repeatCb, self));
    self->_press(self->_key, true);
}

void HoldKey::_unpressedCb(void* data, Evas_Object*, void*) {
    static_cast<HoldKey*>(data)->release();
}

void HoldKey::_clickedCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<HoldKey*>(data);
    if (std::exchange(self->_byPointer, false))
        return;
    self->_press(self->_key, true);
    self->_press(self->_key, false);
}

Eina_Bool HoldKey::_repeatCb(void* data) {
    auto* self = static_cast<HoldKey*>(data);
    ecore_timer_interval_set(self->_repeat.get(), REPEAT_SECONDS);
    self->_press(self->_key, true);
    return ECORE_CALLBACK_RENEW;
}

void HoldKey::release() {
    if (!_repeat)
        return;
    _repeat.reset();
    _press(_key, false);
}

} // namespace simulator::control
