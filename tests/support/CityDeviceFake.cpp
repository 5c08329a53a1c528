#include "support/CityDeviceFake.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>

#include <glib.h>

#include <Elementary.h>

#include "device/ea.h"
#include "device/feedback.h"
#include "device/telephony.h"
#include "device/uxt.h"
#include "support/DeviceFake.h"
#include "support/FakeCalls.h"

struct tel_handle_s {
    FakeModem modem;
};

namespace {

using fakes::quoted;
using fakes::real;
using fakes::typeOf;

std::string nameOf(tel_handle_h handle) {
    return handle ? handle->modem.name : "null";
}

} // namespace

/** Lets the device's functions, which are not members, reach the fake's state. */
struct CityDeviceCalls {
    static std::size_t& connections() { return cityDevice()._connections; }
};

CityDeviceFake& cityDevice() {
    // Never destroyed, like the device.
    static CityDeviceFake* fake = new CityDeviceFake;
    return *fake;
}

void CityDeviceFake::reset() {
    _modems = {{"modem1", ""}};
    _connections = 0;
}

// Telephony.

char** tel_get_cp_name_list() {
    if (device().record("tel_get_cp_name_list", ""))
        return nullptr;
    const auto& modems = cityDevice().modems();
    auto** names = g_new0(char*, modems.size() + 1);
    for (std::size_t i = 0; i < modems.size(); ++i)
        names[i] = g_strdup(modems[i].name.c_str());
    return names;
}

tel_handle_h tel_init(const char* cp_name) {
    if (device().record("tel_init", quoted(cp_name)))
        return nullptr;
    const auto& modems = cityDevice().modems();
    const auto found = std::ranges::find_if(
        modems, [cp_name](const FakeModem& modem) { return !cp_name || modem.name == cp_name; });
    if (found == modems.end())
        return nullptr;
    ++CityDeviceCalls::connections();
    return new tel_handle_s{*found};
}

int tel_get_property_string(tel_handle_h handle, const char* property, char** value) {
    const std::string arguments = nameOf(handle) + ", " + quoted(property);
    if (const auto failure = device().record("tel_get_property_string", arguments))
        return *failure;
    if (!handle || !value || !property || std::strcmp(property, TEL_PROPERTY_NETWORK_PLMN) != 0)
        return TEL_ERROR_INVALID_PARAMETER;
    if (!handle->modem.plmn)
        return TEL_ERROR_OPERATION_FAILED;
    *value = strdup(handle->modem.plmn->c_str());
    return TEL_ERROR_NONE;
}

int tel_deinit(tel_handle_h handle) {
    const auto failure = device().record("tel_deinit", nameOf(handle));
    if (handle)
        --CityDeviceCalls::connections();
    delete handle;
    return failure.value_or(TEL_ERROR_NONE);
}

// Feedback.

int feedback_initialize() {
    return device().record("feedback_initialize", "").value_or(FEEDBACK_ERROR_NONE);
}

int feedback_play(feedback_pattern_e pattern) {
    const auto name = pattern == FEEDBACK_PATTERN_TAP ? std::string("FEEDBACK_PATTERN_TAP")
                                                      : std::to_string(static_cast<int>(pattern));
    return device().record("feedback_play", name).value_or(FEEDBACK_ERROR_NONE);
}

// Widget extensions.

Eina_Bool ea_theme_color_get(const char* name, int* r, int* g, int* b, int* a, int* r2, int* g2,
                             int* b2, int* a2, int* r3, int* g3, int* b3, int* a3) {
    if (device().record("ea_theme_color_get", quoted(name)))
        return EINA_FALSE;
    return real<decltype(ea_theme_color_get)>("ea_theme_color_get")(name, r, g, b, a, r2, g2, b2,
                                                                    a2, r3, g3, b3, a3);
}

Evas_Object* uxt_edit_field_layout_add(Evas_Object* parent, int type) {
    const std::string arguments =
        typeOf(parent) + ", " +
        (type == UXT_EDIT_FIELD_SEARCH ? "UXT_EDIT_FIELD_SEARCH" : std::to_string(type));
    if (device().record("uxt_edit_field_layout_add", arguments))
        return nullptr;
    return real<decltype(uxt_edit_field_layout_add)>("uxt_edit_field_layout_add")(parent, type);
}

void uxt_edit_field_set_clear_button_enabled(Evas_Object* edit_field, Eina_Bool enabled) {
    const std::string arguments = typeOf(edit_field) + (enabled ? ", true" : ", false");
    if (device().record("uxt_edit_field_set_clear_button_enabled", arguments))
        return;
    real<decltype(uxt_edit_field_set_clear_button_enabled)>(
        "uxt_edit_field_set_clear_button_enabled")(edit_field, enabled);
}

Evas_Object* uxt_edit_field_layout_get_entry(Evas_Object* edit_field) {
    if (device().record("uxt_edit_field_layout_get_entry", typeOf(edit_field)))
        return nullptr;
    return real<decltype(uxt_edit_field_layout_get_entry)>("uxt_edit_field_layout_get_entry")(
        edit_field);
}
