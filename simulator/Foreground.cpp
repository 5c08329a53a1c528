#include "Foreground.h"

#include <Ecore_X.h>
#include <Elementary.h>

#include "clock/ClockEventListener.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

namespace {
/** Window managers take the focus from one window before they give it to the next. */
constexpr double FOCUS_MOVES_SECONDS = 0.3;
} // namespace

Foreground::Foreground(Evas_Object* window) : _window(window) {
    listen(window);
    // There is no such event without an X display.
    if (ECORE_X_EVENT_WINDOW_VISIBILITY_CHANGE != 0) {
        _visibility.reset(
            ecore_event_handler_add(ECORE_X_EVENT_WINDOW_VISIBILITY_CHANGE, _visibilityCb, this));
    }
}

Foreground::~Foreground() {
    setCompanion(nullptr);
    forget(_window);
}

void Foreground::setCompanion(Evas_Object* window) {
    if (_companion != nullptr)
        forget(_companion);
    _companion = window;
    if (window != nullptr)
        listen(window);
}

void Foreground::listen(Evas_Object* window) {
    evas_object_smart_callback_add(window, "focus,in", _focusInCb, this);
    evas_object_smart_callback_add(window, "focus,out", _focusOutCb, this);
}

void Foreground::forget(Evas_Object* window) {
    evas_object_smart_callback_del_full(window, "focus,in", _focusInCb, this);
    evas_object_smart_callback_del_full(window, "focus,out", _focusOutCb, this);
}

void Foreground::_focusInCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<Foreground*>(data);
    self->_leaving.reset();
    self->_unfocused = false;
    self->update();
}

void Foreground::_focusOutCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<Foreground*>(data);
    if (self->_companion != nullptr) {
        self->_leaving.reset(ecore_timer_add(FOCUS_MOVES_SECONDS, _stillUnfocusedCb, self));
        return;
    }
    self->_unfocused = true;
    self->update();
}

Eina_Bool Foreground::_stillUnfocusedCb(void* data) {
    auto* self = static_cast<Foreground*>(data);
    // The main loop deletes the timer of a callback that cancels.
    static_cast<void>(self->_leaving.release());
    self->_unfocused = true;
    self->update();
    return ECORE_CALLBACK_CANCEL;
}

Eina_Bool Foreground::_visibilityCb(void* data, int, void* info) {
    auto* self = static_cast<Foreground*>(data);
    const auto* event = static_cast<const Ecore_X_Event_Window_Visibility_Change*>(info);
    if (event->win == elm_win_xwindow_get(self->_window)) {
        self->_covered = event->fully_obscured != 0;
        self->update();
    }
    return ECORE_CALLBACK_PASS_ON;
}

void Foreground::leave(bool away) {
    _away = away;
    // Who calls it back looks at it.
    if (!away) {
        _leaving.reset();
        _unfocused = false;
    }
    update();
}

void Foreground::update() {
    const bool paused = _unfocused || _covered || _away;
    if (paused == _paused)
        return;
    _paused = paused;
    LOG_INFO("The application %s", paused ? "goes to the background" : "comes back");
    ClockEventListener::raise(paused ? ClockEventListener::PAUSED : ClockEventListener::RESUMED);
}

} // namespace simulator
