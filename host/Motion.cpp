#include "Motion.h"

#include <Elementary.h>

#include "device/vconf.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* MOTION_KEY = "db/setting/motion";
constexpr const char* POWER_SAVING_KEY = "db/setting/psmode";
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
    if (vconf_get_int(MOTION_KEY, &wanted) == VCONF_OK && wanted == OFF)
        return false;
    return vconf_get_int(POWER_SAVING_KEY, &saving) != VCONF_OK || saving != ULTRA;
}

void applyMotion() {
    motion() = readMotion();
    elm_config_transition_duration_factor_set(motion() ? 1.0 : SHORTEST);
    elm_config_scroll_animation_disabled_set(!motion());
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
    for (const char* key : {MOTION_KEY, POWER_SAVING_KEY})
        if (vconf_notify_key_changed(key, motionChanged, nullptr) != VCONF_OK)
            LOG_ERROR("Changes of %s go unnoticed", key);
}

} // namespace host
