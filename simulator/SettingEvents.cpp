#include "SettingEvents.h"

#include "clock/ClockEventListener.h"
#include "control/DeviceActions.h"
#include "device/vconf.h"
#include "device_settings.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

void settingChangedCb(keynode_t*, void*) {
    ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
}

void languageChangedCb(keynode_t*, void*) {
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
}

void timeChangedCb(keynode_t*, void*) {
    // A person sets the clock elsewhere and then comes back: minutes begin at another moment now,
    // and days that were counted from the old time are counted anew before anything is drawn.
    if (isInForeground())
        ClockEventListener::raise(ClockEventListener::RESUMED);
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
}

void follow(const char* key, vconf_callback_fn changed) {
    if (vconf_notify_key_changed(key, changed, nullptr) != VCONF_OK)
        LOG_ERROR("Changes of %s go unnoticed", key);
}

} // namespace

void followSettings() {
    follow(DEVICE_SETTING_TIME_FORM, settingChangedCb);
    follow(DEVICE_SETTING_REGION, settingChangedCb);
    // The device follows these before it tells of them.
    follow(DEVICE_SETTING_LANGUAGE, languageChangedCb);
    follow(DEVICE_SETTING_TIME_ZONE, timeChangedCb);
    follow(DEVICE_SETTING_CLOCK_SHIFT, timeChangedCb);
}

} // namespace simulator
