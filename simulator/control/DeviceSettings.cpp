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
#include "device_settings.h"

namespace simulator {
namespace {

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

std::string checkSwitch(const std::string& value) {
    return value == "on" || value == "off" ? "" : "'" + value + "' is neither on nor off";
}

const char* switchText(bool on) {
    return on ? "on" : "off";
}

std::string checkLanguage(const std::string& value) {
    const auto isCode = [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_';
    };
    if (!std::all_of(value.begin(), value.end(), isCode) || languageOf(value) == nullptr)
        return "'" + value + "' is not a language of this watch";
    return "";
}

/** What a watch is started in comes before the setting, until that is changed. */
std::string startLanguage() {
    const char* startedIn = std::getenv("CLOCK_LANGUAGE");
    return startedIn == nullptr ? "" : startedIn;
}

std::string setLanguage(const std::string& value) {
    // A setting that stays as it is tells nobody: it must change for a moment to be heard.
    if (!startLanguage().empty() && textOf(DEVICE_SETTING_LANGUAGE, "") == value &&
        vconf_set_str(DEVICE_SETTING_LANGUAGE, "") != VCONF_OK)
        return written(-1);
    return written(vconf_set_str(DEVICE_SETTING_LANGUAGE, value.c_str()));
}

std::string language() {
    const std::string startedIn = startLanguage();
    return startedIn.empty() ? textOf(DEVICE_SETTING_LANGUAGE, base::messageLocale()) : startedIn;
}

std::string checkRegion(const std::string& value) {
    const auto separator = value.find('_');
    // ICU completes and corrects what it is asked about: a name must be whole before.
    const bool whole = separator != std::string::npos && separator > 0 &&
                       separator + 1 < value.size() && value.find_first_of(".@- ") == value.npos;
    if (!whole || *uloc_getISO3Language(value.c_str()) == '\0' ||
        *uloc_getISO3Country(value.c_str()) == '\0')
        return "'" + value + "' is not a language and a country such as de_DE";
    return "";
}

std::string setRegion(const std::string& value) {
    return written(vconf_set_str(DEVICE_SETTING_REGION, value.c_str()));
}

std::string checkTimeForm(const std::string& value) {
    return value == "12" || value == "24" ? "" : "'" + value + "' is neither 12 nor 24";
}

std::string setTimeForm(const std::string& value) {
    return written(
        vconf_set_int(DEVICE_SETTING_TIME_FORM, value == "12" ? TWELVE_HOURS : TWENTY_FOUR_HOURS));
}

std::optional<int> levelIn(const std::string& value) {
    int level = 0;
    const char* end = value.data() + value.size();
    const auto [stop, failure] = std::from_chars(value.data(), end, level);
    if (failure != std::errc() || stop != end || level < 0 || level > LOUDEST)
        return std::nullopt;
    return level;
}

std::string checkVolume(const std::string& value) {
    return levelIn(value) ? "" : "'" + value + "' is not a level from 0 to 15";
}

std::string setVolume(const std::string& value) {
    return written(sound_manager_set_volume(SOUND_TYPE_ALARM, levelIn(value).value_or(0)));
}

std::string volume() {
    int level = 0;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    return std::to_string(level);
}

std::string checkNetwork(const std::string& value) {
    const bool digits =
        std::all_of(value.begin(), value.end(), [](char c) { return c >= '0' && c <= '9'; });
    if (value != "none" && (!digits || value.size() < 5 || value.size() > 6))
        return "'" + value + "' is not a network of five or six digits such as 26201";
    return "";
}

std::string setNetwork(const std::string& value) {
    return written(vconf_set_str(DEVICE_SETTING_NETWORK, value == "none" ? "" : value.c_str()));
}

std::string network() {
    const std::string digits = textOf(DEVICE_SETTING_NETWORK, "");
    return digits.empty() ? "none" : digits;
}

std::string timeZone() {
    return textOf(DEVICE_SETTING_TIME_ZONE, base::currentTimeZone());
}

std::string checkTimeZone(const std::string& value) {
    if (value.empty() || !base::isTimeZone(value))
        return "'" + value + "' is not a time zone such as Europe/Berlin";
    return "";
}

std::string setTimeZone(const std::string& value) {
    return written(vconf_set_str(DEVICE_SETTING_TIME_ZONE, value.c_str()));
}

std::string checkClock(const std::string& value) {
    // Whether there is a change ahead is a question of the device's zone.
    if (value == "before-dst")
        return "";
    return clockWish(value, {device_host_real_time(), 0, base::currentTimeZone()}).problem;
}

std::string setClock(const std::string& value) {
    const ClockWish wish = clockWish(
        value, {device_host_real_time(), numberOf(DEVICE_SETTING_CLOCK_SHIFT, 0), timeZone()});
    if (!wish.problem.empty())
        return wish.problem;
    return written(vconf_set_int(DEVICE_SETTING_CLOCK_SHIFT, wish.shift));
}

} // namespace

const std::vector<DeviceSetting>& deviceSettings() {
    static const std::vector<DeviceSetting> rows{
        {"language", "a code such as de or pt_BR", checkLanguage, setLanguage, language},
        {"region", "a locale such as de_DE", checkRegion, setRegion,
         [] {
             return textOf(DEVICE_SETTING_REGION, base::messageLocale());
         }},
        {"time-form", "12 | 24", checkTimeForm, setTimeForm,
         [] {
             return std::string(numberOf(DEVICE_SETTING_TIME_FORM, 0) == TWELVE_HOURS ? "12"
                                                                                      : "24");
         }},
        {"power-saving", "on | off", checkSwitch,
         [](const std::string& value) { return written(setPowerSaving(value == "on") ? 0 : -1); },
         [] {
             return std::string(switchText(isPowerSaving()));
         }},
        {"volume", "0 to 15", checkVolume, setVolume, volume},
        {"network", "country and network digits such as 26201 | none", checkNetwork, setNetwork,
         network},
        {"time-zone", "a name such as Europe/Berlin", checkTimeZone, setTimeZone, timeZone},
        {"clock", CLOCK_VALUES, checkClock, setClock,
         [] {
             return clockValue(numberOf(DEVICE_SETTING_CLOCK_SHIFT, 0));
         }},
        {"motion", "on | off", checkSwitch,
         [](const std::string& value) {
             return written(vconf_set_int(DEVICE_SETTING_MOTION, value == "on" ? 1 : 0));
         },
         [] {
             return std::string(switchText(numberOf(DEVICE_SETTING_MOTION, 1) != 0));
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

std::string checkDevice(const std::string& name, const std::string& value) {
    const DeviceSetting* row = findSetting(name);
    return row == nullptr ? "there is no setting '" + name + "'" : row->check(value);
}

std::string setDevice(const std::string& name, const std::string& value) {
    std::string problem = checkDevice(name, value);
    return problem.empty() ? findSetting(name)->set(value) : problem;
}

std::string deviceSetting(const std::string& name) {
    const DeviceSetting* row = findSetting(name);
    return row == nullptr ? "" : row->get();
}

} // namespace simulator
