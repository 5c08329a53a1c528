#include "ToastView.h"

#include <cstdlib>
#include <utility>

#include <Elementary.h>

#include "WatchFace.h"
#include "app_assist/WAccessible.h"
#include "device_host.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

namespace {
constexpr double TOAST_SECONDS = 3.0;
constexpr const char* TEXT = "toast.text";
} // namespace

ToastView::ToastView(Evas_Object* window, const std::string& theme)
    : _layout(elm_layout_add(window)) {
    if (!elm_layout_file_set(_layout, theme.c_str(), "simulator/toast"))
        LOG_ERROR("'%s' has no toast", theme.c_str());
    app_assist::prepareAnnouncements(_layout);
    evas_object_resize(_layout, FACE_SIZE, FACE_SIZE);
    evas_object_layer_set(_layout, LAYER_TOAST);
    evas_object_show(_layout);
    device_host_set_toast_callback(_toastCb, this);
}

ToastView::~ToastView() {
    device_host_set_toast_callback(nullptr, nullptr);
    evas_object_del(_layout);
}

void ToastView::_toastCb(const char* message, void* data) {
    auto* self = static_cast<ToastView*>(data);
    if (self == nullptr || message == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    self->post(message);
}

void ToastView::post(const std::string& text) {
    // Who does the same again wants to read it once.
    if (_timer && text == (_waiting.empty() ? _shown : _waiting.back().text))
        return;
    _waiting.push_back({text, elm_object_mirrored_get(_layout) != EINA_FALSE});
    if (!_timer)
        showNext();
}

void ToastView::showNext() {
    const bool rightToLeft = _waiting.front().rightToLeft;
    _shown = std::move(_waiting.front().text);
    _waiting.pop_front();
    char* markup = elm_entry_utf8_to_markup(_shown.c_str());
    elm_object_part_text_set(_layout, TEXT, markup);
    std::free(markup);
    direct(rightToLeft);
    app_assist::announce(_layout, _shown);
    elm_object_signal_emit(_layout, "toast,show", "simulator");
    _timer.reset(ecore_timer_add(TOAST_SECONDS, _timeOverCb, this));
}

/** The first letters may be those of a name in another script. */
void ToastView::direct(bool rightToLeft) {
    // The toolkit hands its text out to be read only.
    auto* text =
        const_cast<Evas_Object*>(edje_object_part_object_get(elm_layout_edje_get(_layout), TEXT));
    evas_object_paragraph_direction_set(text, rightToLeft ? EVAS_BIDI_DIRECTION_RTL
                                                          : EVAS_BIDI_DIRECTION_LTR);
}

Eina_Bool ToastView::_timeOverCb(void* data) {
    auto* self = static_cast<ToastView*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return ECORE_CALLBACK_CANCEL;
    }
    // The main loop deletes the timer of a callback that cancels.
    static_cast<void>(self->_timer.release());
    if (self->_waiting.empty()) {
        elm_object_signal_emit(self->_layout, "toast,hide", "simulator");
        app_assist::endAnnouncement(self->_layout);
    } else {
        self->showNext();
    }
    return ECORE_CALLBACK_CANCEL;
}

} // namespace simulator
