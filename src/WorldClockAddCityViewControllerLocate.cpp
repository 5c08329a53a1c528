// Narrowing the city list to the country of the mobile network.
#define LOG_TAG "WORLDCLOCK"
#include "WorldClockAddCityViewController.h"

#include <cstdlib>
#include <memory>
#include <utility>

#include <glib.h>

#include <base/Log.h>
#include <base/Text.h>
#include <clock/ClockText.h>
#include <device/feedback.h>
#include <device/notification.h>
#include <device/telephony.h>
#include <device/vconf.h>

#include "NullData.h"

namespace {

constexpr const char* TELEPHONY_READY_KEY = "memory/telephony/telephony_ready";
// The country's part of a network's code.
constexpr std::size_t COUNTRY_CODE_LENGTH = 3;

using Text = std::unique_ptr<char, decltype(&std::free)>;

// Connections through the first modem and, where there is one, the second.
class Modems {
public:
    Modems() {
        if (isTelephonyReady()) {
            char** names = tel_get_cp_name_list();
            if (names && names[0]) {
                _first = tel_init(names[0]);
                _second = names[1] ? tel_init(names[1]) : nullptr;
            }
            g_strfreev(names);
        } else {
            LOG_ERROR("tapi state is not ready. just init tapi with NULL parameter");
            _first = tel_init(nullptr);
        }
    }
    ~Modems() {
        tel_deinit(_first);
        tel_deinit(_second);
    }
    Modems(const Modems&) = delete;
    Modems& operator=(const Modems&) = delete;

    Text plmn() const {
        Text code(nullptr, &std::free);
        if (_first)
            code = read(_first);
        else
            LOG_ERROR("tapi handler1 is null");
        if (!_second)
            LOG_ERROR("tapi handler2 is null");
        else if (!code || *code == '\0')
            if (Text second = read(_second))
                code = std::move(second);
        return code;
    }

private:
    static bool isTelephonyReady() {
        int ready = 0;
        if (vconf_get_bool(TELEPHONY_READY_KEY, &ready) != VCONF_OK)
            LOG_ERROR("return value is not 0");
        return ready != 0;
    }

    static Text read(tel_handle_h modem) {
        char* value = nullptr;
        tel_get_property_string(modem, TEL_PROPERTY_NETWORK_PLMN, &value);
        return {value, &std::free};
    }

    tel_handle_h _first = nullptr;
    tel_handle_h _second = nullptr;
};

} // namespace

void WorldClockAddCityViewController::_locationBtnClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<WorldClockAddCityViewController*>(data);
    const Text plmn = Modems().plmn();
    feedback_play(FEEDBACK_PATTERN_TAP);
    if (!plmn) {
        LOG_ERROR("Failed to get network PLMN. Show error popup!");
        self->_showLocationErrorToast();
        return;
    }
    self->_mcc = base::cutUtf8(plmn.get(), COUNTRY_CODE_LENGTH);
    LOG_ERROR("MCC from networ PLMN = %s, length = %d", self->_mcc.c_str(),
              static_cast<int>(self->_mcc.size()));
    if (self->_mcc.empty()) {
        LOG_ERROR("MCC from Network PLMN is not correct. Show error popup!");
        self->_showLocationErrorToast();
        return;
    }
    elm_entry_entry_set(self->_searchEntry, "");
    self->_updateGenlist("");
}

void WorldClockAddCityViewController::_showLocationErrorToast() {
    notification_status_message_post(clockText("IDS_CLOCK_POP_LOCATION_SERVICES_NOT_AVAILABLE"));
}
