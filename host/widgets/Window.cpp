#include <dlfcn.h>

#include <Elementary.h>

#include "FocusNavigator.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// On the device every window answers its keys and its bezel. This function comes before the
// toolkit's own, so that no screen has to know of them.

DEVICE_EXTERN_C_BEGIN

DEVICE_API Evas_Object* elm_win_util_standard_add(const char* name, const char* title) {
    static const auto stock = reinterpret_cast<decltype(&elm_win_util_standard_add)>(
        dlsym(RTLD_NEXT, "elm_win_util_standard_add"));
    if (!stock) {
        LOG_ERROR("elm_win_util_standard_add: the toolkit has no such function");
        return nullptr;
    }
    Evas_Object* window = stock(name, title);
    host::FocusNavigator::install(window);
    return window;
}

DEVICE_EXTERN_C_END
