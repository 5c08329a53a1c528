#include "DeviceSettings.h"

#include <algorithm>
#include <charconv>
#include <cstdlib>
#include <optional>

#include <unicode/uloc.h>

#include "ClockShift.h"
#include "Languages.h"
#include "PowerSaving.h"
#include "base/CivilTime.h"
#include "base/MessageLocale.h"
#include "device/sound_manager.h"
#include "device/vconf.h"
#include "device_host.h"

namespace simulator {
namespace {

constexpr const char* LANGUAGE_KEY = "db/setting/language";
constexpr const char* REGION_KEY = "db/menu_widget/regionformat";
constexpr const char* TIME_FORM_KEY = "db/menu_widget/regionformat_time1224";
constexpr const char* NETWORK_KEY = "memory/telephony/plmn";
constexpr const char* TIME_ZONE_KEY = "db/setting/time_zone";
constexpr const char* CLOCK_SHIFT_KEY = "db/setting/clock_shift";
constexpr const char* MOTION_KEY = "db/setting/motion";
constexpr int TWELVE_HOURS = 1;
constexpr int TWENTY_FOUR_HOURS = 2;
constexpr int LOUDEST = 15;

std::string written(int result) {
    return result == 0 ? "" : "the setting cannot be written; the log tells why";
}

std::string textOf(const char* key, const std::string& byDefault) {
    char* stored = vconf_get_str(key);
    std::string text = stored == nullptr ? byDefault : stored;
    std::free(stored);
    return text;
}

int numberOf(const char* key, int byDefault) {
    int number = byDefault;
    return vconf_get_int(key, &number) == VCONF_OK ? number : byDefault;
}

/** Calls set with 1 for "on" and 0 for "off". */
template <typename Set>
std::string setSwitch(const std::string& value, Set set) {
    if (value != "on" && value != "off")
        return "'" + value + "' is neither on nor off";
    return written(set(value == "on"));
}

const char* switchText(bool on) {
    return on ? "on" : "off";
}

std::string setLanguage(const std::string& value) {
    const auto isCode = [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_';
    };
    if (!std::all_of(value.begin(), value.end(), isCode) || languageOf(value) == nullptr)
        return "'" + value + "' is not a language of this watch";
    return written(vconf_set_str(LANGUAGE_KEY, value.c_str()));
}

std::string language() {
    // What a watch is started in comes before the setting, until that is changed.
    const char* startedIn = std::getenv("CLOCK_LANGUAGE");
    if (startedIn != nullptr && *startedIn != '\0')
        return startedIn;
    return textOf(LANGUAGE_KEY, base::messageLocale());
}

std::string setRegion(const std::string& value) {
    const auto separator = value.find('_');
    // ICU completes and corrects what it is asked about: a name must be whole before.
    const bool whole = separator != std::string::npos && separator > 0 &&
                       separator + 1 < value.size() && value.find_first_of(".@- ") == value.npos;
    if (!whole || *uloc_getISO3Language(value.c_str()) == '\0' ||
        *uloc_getISO3Country(value.c_str()) == '\0')
        return "'" + value + "' is not a language and a country such as de_DE";
    return written(vconf_set_str(REGION_KEY, value.c_str()));
}

std::string setTimeForm(const std::string& value) {
    if (value != "12" && value != "24")
        return "'" + value + "' is neither 12 nor 24";
    return written(vconf_set_int(TIME_FORM_KEY, value == "12" ? TWELVE_HOURS : TWENTY_FOUR_HOURS));
}

std::string setVolume(const std::string& value) {
    int level = 0;
    const char* end = value.data() + value.size();
    const auto [stop, failure] = std::from_chars(value.data(), end, level);
    if (failure != std::errc() || stop != end || level < 0 || level > LOUDEST)
        return "'" + value + "' is not a level from 0 to 15";
    return written(sound_manager_set_volume(SOUND_TYPE_ALARM, level));
}

std::string volume() {
    int level = 0;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    return std::to_string(level);
}

std::string setNetwork(const std::string& value) {
    const bool digits =
        std::all_of(value.begin(), value.end(), [](char c) { return c >= '0' && c <= '9'; });
    if (value != "none" && (!digits || value.size() < 5 || value.size() > 6))
        return "'" + value + "' is not a network of five or six digits such as 26201";
    return written(vconf_set_str(NETWORK_KEY, value == "none" ? "" : value.c_str()));
}

std::string network() {
    const std::string digits = textOf(NETWORK_KEY, "");
    return digits.empty() ? "none" : digits;
}

std::string timeZone() {
    return textOf(TIME_ZONE_KEY, base::currentTimeZone());
}

std::string setTimeZone(const std::string& value) {
    if (value.empty() || !base::isTimeZone(value))
        return "'" + value + "' is not a time zone such as Europe/Berlin";
    return written(vconf_set_str(TIME_ZONE_KEY, value.c_str()));
}

std::string setClock(const std::string& value) {
    const ClockWish wish =
        clockWish(value, {device_host_real_time(), numberOf(CLOCK_SHIFT_KEY, 0), timeZone()});
    if (!wish.problem.empty())
        return wish.problem;
    return written(vconf_set_int(CLOCK_SHIFT_KEY, wish.shift));
}

} // namespace

const std::vector<DeviceSetting>& deviceSettings() {
    static const std::vector<DeviceSetting> rows{
        {"language", "a code such as de or pt_BR", setLanguage, language},
        {"region", "a locale such as de_DE", setRegion,
         [] {
             return textOf(REGION_KEY, base::messageLocale());
         }},
        {"time-form", "12 | 24", setTimeForm,
         [] {
             return std::string(numberOf(TIME_FORM_KEY, 0) == TWELVE_HOURS ? "12" : "24");
         }},
        {"power-saving", "on | off",
         [](const std::string& value) {
             return setSwitch(value, [](bool on) { return setPowerSaving(on) ? 0 : -1; });
         },
         [] {
             return std::string(switchText(isPowerSaving()));
         }},
        {"volume", "0 to 15", setVolume, volume},
        {"network", "country and network digits such as 26201 | none", setNetwork, network},
        {"time-zone", "a name such as Europe/Berlin", setTimeZone, timeZone},
        {"clock", CLOCK_VALUES, setClock,
         [] {
             return clockValue(numberOf(CLOCK_SHIFT_KEY, 0));
         }},
        {"motion", "on | off",
         [](const std::string& value) {
             return setSwitch(value, [](bool on) { return vconf_set_int(MOTION_KEY, on ? 1 : 0); });
         },
         [] {
             return std::string(switchText(numberOf(MOTION_KEY, 1) != 0));
         }},
    };
    return rows;
}

namespace {

const DeviceSetting* findSetting(const std::string& name) {
    const auto& rows = deviceSettings();
    const auto row = std::find_if(rows.begin(), rows.end(),
                                  [&name](const DeviceSetting& row) { return name == row.name; });
    return row == rows.end() ? nullptr : &*row;
}

} // namespace

std::string setDevice(const std::string& name, const std::string& value) {
    const DeviceSetting* row = findSetting(name);
    return row == nullptr ? "there is no setting '" + name + "'" : row->set(value);
}

std::string deviceSetting(const std::string& name) {
    const DeviceSetting* row = findSetting(name);
    return row == nullptr ? "" : row->get();
}

} // namespace simulator
