#include "DeviceClock.h"

#include <array>
#include <atomic>
#include <cstdlib>
#include <ctime>
#include <string>

#include <unicode/ucal.h>
#include <unicode/ustring.h>

#include "base/CivilTime.h"
#include "device/vconf.h"
#include "device_host.h"
#include "device_settings.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {
namespace {

std::atomic<std::int64_t> shift = 0;
static_assert(std::atomic<std::int64_t>::is_always_lock_free, "signal handlers may ask the time");

void applyShift() {
    int seconds = 0;
    vconf_get_int(DEVICE_SETTING_CLOCK_SHIFT, &seconds);
    shift.store(seconds, std::memory_order_relaxed);
}

void setIcuZone(const std::string& zone) {
    std::array<UChar, 128> name{};
    UErrorCode status = U_ZERO_ERROR;
    u_strFromUTF8(name.data(), static_cast<std::int32_t>(name.size()), nullptr, zone.c_str(), -1,
                  &status);
    ucal_setDefaultTimeZone(name.data(), &status);
    if (U_FAILURE(status))
        LOG_WARNING("Dates are not written in the zone %s: %s", zone.c_str(), u_errorName(status));
}

void applyTimeZone() {
    char* stored = vconf_get_str(DEVICE_SETTING_TIME_ZONE);
    const std::string zone = stored ? stored : "";
    std::free(stored);
    // Without a setting the device is where the computer is.
    if (zone.empty())
        return;
    if (!base::isTimeZone(zone)) {
        LOG_ERROR("There is no time zone %s; the last one stays", zone.c_str());
        return;
    }
    setenv("TZ", zone.c_str(), 1);
    tzset();
    setIcuZone(zone);
}

void changedCb(keynode_t* /*node*/, void* /*data*/) {
    applyClock();
}

} // namespace

std::int64_t clockShift() {
    return shift.load(std::memory_order_relaxed);
}

void applyClock() {
    applyTimeZone();
    applyShift();
}

bool followClock() {
    return vconf_notify_key_changed(DEVICE_SETTING_CLOCK_SHIFT, changedCb, nullptr) == VCONF_OK &&
           vconf_notify_key_changed(DEVICE_SETTING_TIME_ZONE, changedCb, nullptr) == VCONF_OK;
}

void forgetClock() {
    shift.store(0, std::memory_order_relaxed);
}

} // namespace host

int64_t device_host_real_time(void) {
    return static_cast<std::int64_t>(std::time(nullptr)) - host::clockShift();
}
