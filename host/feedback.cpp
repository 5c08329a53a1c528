#include "device/feedback.h"

#include "Settings.h"
#include "device_host.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// A desktop cannot be felt: who shows the device is told instead.

namespace {

bool initialized = false;
device_host_haptic_cb hapticCallback = nullptr;
void* hapticData = nullptr;

} // namespace

void device_host_set_haptic_callback(device_host_haptic_cb callback, void* data) {
    hapticCallback = callback;
    hapticData = data;
}

void host::endFeedback() {
    initialized = false;
    device_host_set_haptic_callback(nullptr, nullptr);
}

int feedback_initialize(void) {
    initialized = true;
    return FEEDBACK_ERROR_NONE;
}

int feedback_play(feedback_pattern_e pattern) {
    if (!initialized) {
        LOG_ERROR("Pattern %d: the service is not initialized", pattern);
        return FEEDBACK_ERROR_NOT_INITIALIZED;
    }
    if (pattern != FEEDBACK_PATTERN_TAP) {
        LOG_ERROR("There is no pattern %d", pattern);
        return FEEDBACK_ERROR_INVALID_PARAMETER;
    }
    LOG_INFO("Haptic tap");
    if (hapticCallback)
        hapticCallback(pattern, hapticData);
    return FEEDBACK_ERROR_NONE;
}
