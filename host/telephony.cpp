#include "device/telephony.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <cstring>
#include <optional>
#include <string>
#include <vector>

#include <glib.h>

#include "Modems.h"
#include "device/vconf.h"
#include "device_settings.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

struct tel_handle_s {
    host::Modem modem;
};

namespace {

using Clock = std::chrono::steady_clock;
using Modems = std::vector<host::Modem>;

/** Stands for the network of a computer without a modem. */
constexpr const char* PLMN_SETTING = DEVICE_SETTING_NETWORK;
constexpr const char* SIMULATED_MODEM = "simulated";
/** As long as this the modems are not asked again: callers ask for them one by one. */
constexpr auto FRESH = std::chrono::milliseconds(500);

Modems simulatedModems() {
    char* plmn = vconf_get_str(PLMN_SETTING);
    Modems modems = {{SIMULATED_MODEM, plmn ? plmn : ""}};
    std::free(plmn);
    return modems;
}

/** What oFono said a moment ago, or says now. */
const std::optional<Modems>& askedModems() {
    static std::optional<Modems> answer;
    static std::optional<Clock::time_point> asked;
    if (!asked || Clock::now() - *asked > FRESH) {
        answer = host::askModems();
        asked = Clock::now();
    }
    return answer;
}

Modems currentModems() {
    const auto& modems = askedModems();
    if (!modems)
        return {};
    return modems->empty() ? simulatedModems() : *modems;
}

} // namespace

char** tel_get_cp_name_list(void) {
    const Modems all = currentModems();
    auto** names = g_new0(char*, all.size() + 1);
    for (std::size_t i = 0; i < all.size(); ++i)
        names[i] = g_strdup(all[i].name.c_str());
    return names;
}

tel_handle_h tel_init(const char* cp_name) {
    const Modems all = currentModems();
    const auto found = std::find_if(all.begin(), all.end(), [cp_name](const host::Modem& modem) {
        return !cp_name || modem.name == cp_name;
    });
    if (found != all.end())
        return new tel_handle_s{*found};
    LOG_ERROR("There is no modem %s", cp_name ? cp_name : "at all");
    return nullptr;
}

int tel_get_property_string(tel_handle_h handle, const char* property, char** value) {
    if (!handle || !property || !value || std::strcmp(property, TEL_PROPERTY_NETWORK_PLMN) != 0) {
        LOG_ERROR("A modem and a known property are needed, not %s", property ? property : "none");
        return TEL_ERROR_INVALID_PARAMETER;
    }
    if (!handle->modem.plmn) {
        LOG_ERROR("Modem %s does not answer", handle->modem.name.c_str());
        return TEL_ERROR_OPERATION_FAILED;
    }
    *value = strdup(handle->modem.plmn->c_str());
    return *value ? TEL_ERROR_NONE : TEL_ERROR_OPERATION_FAILED;
}

int tel_deinit(tel_handle_h handle) {
    delete handle;
    return TEL_ERROR_NONE;
}
