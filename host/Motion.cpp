#include "Motion.h"

#include <Elementary.h>

#include "device/vconf.h"
#include "device_settings.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr int OFF = 0;
constexpr int ULTRA = 2;
/** The toolkit divides by it; a transition as short as this is over with the next frame. */
constexpr double SHORTEST = 1e-6;

bool& motion() {
    static bool on = true;
    return on;
}

bool readMotion() {
    int wanted = 1;
    int saving = 0;
    if (vconf_get_int(DEVICE_SETTING_MOTION, &wanted) == VCONF_OK && wanted == OFF)
        return false;
    return vconf_get_int(DEVICE_SETTING_POWER_SAVING, &saving) != VCONF_OK || saving != ULTRA;
}

void applyMotion() {
    motion() = readMotion();
    elm_config_transition_duration_factor_set(motion() ? 1.0 : SHORTEST);
    elm_config_scroll_animation_disabled_set(!motion());
    // Lists that bring something into sight have a time of their own.
    static const double usual = elm_config_scroll_bring_in_scroll_friction_get();
    elm_config_scroll_bring_in_scroll_friction_set(motion() ? usual : 0);
}

void motionChanged(keynode_t*, void*) {
    applyMotion();
}

} // namespace

bool isMotionOn() {
    return motion();
}

void followMotion() {
    applyMotion();
    for (const char* key : {DEVICE_SETTING_MOTION, DEVICE_SETTING_POWER_SAVING})
        if (vconf_notify_key_changed(key, motionChanged, nullptr) != VCONF_OK)
            LOG_ERROR("Changes of %s go unnoticed", key);
}

} // namespace host
