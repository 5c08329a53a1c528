#include <dlfcn.h>

#include <Elementary.h>

#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The device's sliders raise "focused" and "unfocused" as every other widget does. The toolkit's
// only tell their theme, so the function that makes one comes before the toolkit's own.

namespace {

void focusedCb(void*, Evas_Object* slider, const char*, const char*) {
    evas_object_smart_callback_call(slider, "focused", nullptr);
}

void unfocusedCb(void*, Evas_Object* slider, const char*, const char*) {
    evas_object_smart_callback_call(slider, "unfocused", nullptr);
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
    return slider;
}

DEVICE_EXTERN_C_END
