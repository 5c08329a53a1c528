#include "PowerSaving.h"

#include "clock/ClockEventListener.h"
#include "device/vconf.h"
#include "device_settings.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

namespace {
constexpr int OFF = 0;
constexpr int ULTRA = 2;
} // namespace

bool setPowerSaving(bool on) {
    return vconf_set_int(DEVICE_SETTING_POWER_SAVING, on ? ULTRA : OFF) == VCONF_OK;
}

bool isPowerSaving() {
    int mode = OFF;
    return vconf_get_int(DEVICE_SETTING_POWER_SAVING, &mode) == VCONF_OK && mode == ULTRA;
}

void togglePowerSaving() {
    const bool on = !isPowerSaving();
    if (!setPowerSaving(on)) {
        LOG_ERROR("Ultra power saving cannot be switched");
        return;
    }
    LOG_INFO("Ultra power saving is %s", on ? "on" : "off");
    // A person switches the mode in the settings and then comes back to the clock.
    ClockEventListener::raise(ClockEventListener::RESUMED);
}

} // namespace simulator
