#include <dlfcn.h>

#include <Elementary.h>

#include "ThemeNames.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The device's sliders raise "focused" and "unfocused" as every other widget does. The toolkit's
// only tell their theme, so the function that makes one comes before the toolkit's own. And they go
// where the pointer is on a press of any button: on a watch that button is the bezel's.

namespace {

constexpr int FINGER = 1;

void focusedCb(void*, Evas_Object* slider, const char*, const char*) {
    evas_object_smart_callback_call(slider, "focused", nullptr);
}

void unfocusedCb(void*, Evas_Object* slider, const char*, const char*) {
    evas_object_smart_callback_call(slider, "unfocused", nullptr);
}

void pressedCb(void*, Evas*, Evas_Object* bar, void* info) {
    if (static_cast<Evas_Event_Mouse_Down*>(info)->button != FINGER)
        efl_event_callback_stop(bar);
}

} // namespace

DEVICE_EXTERN_C_BEGIN

DEVICE_API Evas_Object* elm_slider_add(Evas_Object* parent) {
    static const auto stock =
        reinterpret_cast<decltype(&elm_slider_add)>(dlsym(RTLD_NEXT, "elm_slider_add"));
    if (!parent || !stock) {
        LOG_ERROR("elm_slider_add: %s", parent ? "the toolkit has no such function" : "no parent");
        return nullptr;
    }
    Evas_Object* slider = stock(parent);
    if (!slider)
        return nullptr;
    elm_object_signal_callback_add(slider, "elm,action,focus", "elm", focusedCb, nullptr);
    elm_object_signal_callback_add(slider, "elm,action,unfocus", "elm", unfocusedCb, nullptr);
    Evas_Object* bar =
        edje_object_part_swallow_get(elm_layout_edje_get(slider), host::theme::PART_SLIDER_BAR);
    if (bar)
        evas_object_event_callback_priority_add(bar, EVAS_CALLBACK_MOUSE_DOWN,
                                                EVAS_CALLBACK_PRIORITY_BEFORE, pressedCb, nullptr);
    else
        LOG_ERROR("The theme has no bar of a slider");
    return slider;
}

DEVICE_EXTERN_C_END
