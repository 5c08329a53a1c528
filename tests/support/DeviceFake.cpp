#include "support/DeviceFake.h"

#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <filesystem>
#include <utility>

#include <dlfcn.h>

#include "base/CivilTime.h"
#include "device/app_common.h"
#include "device/app_resource_manager.h"
#include "device/dlog.h"
#include "device/ea.h"
#include "device/eext.h"
#include "device/notification.h"
#include "device/uxt.h"
#include "support/AppControlFake.h"
#include "support/CityDeviceFake.h"
#include "support/FakeCalls.h"
#include "support/SoundFake.h"
#include "support/ToneFake.h"

struct keynode_s {
    const char* name;
};

namespace {

using fakes::quoted;
using fakes::real;
using fakes::typeOf;

std::string nameOf(sound_type_e type) {
    switch (type) {
    case SOUND_TYPE_SYSTEM:
        return "SOUND_TYPE_SYSTEM";
    case SOUND_TYPE_NOTIFICATION:
        return "SOUND_TYPE_NOTIFICATION";
    case SOUND_TYPE_ALARM:
        return "SOUND_TYPE_ALARM";
    case SOUND_TYPE_RINGTONE:
        return "SOUND_TYPE_RINGTONE";
    case SOUND_TYPE_MEDIA:
        return "SOUND_TYPE_MEDIA";
    }
    return std::to_string(static_cast<int>(type));
}

std::string nameOf(ea_editfield_type_e type) {
    switch (type) {
    case EA_EDITFIELD_MULTILINE:
        return "EA_EDITFIELD_MULTILINE";
    case EA_EDITFIELD_SEARCHBAR:
        return "EA_EDITFIELD_SEARCHBAR";
    case EA_EDITFIELD_SINGLELINE:
        return "EA_EDITFIELD_SINGLELINE";
    }
    return std::to_string(static_cast<int>(type));
}

std::string nameOf(eext_event_type_e type) {
    return type == EEXT_EVENT_BACK ? "EEXT_EVENT_BACK" : std::to_string(static_cast<int>(type));
}

std::string describe(const alarm_schedule_s* schedule) {
    if (!schedule)
        return "null";
    char text[160];
    std::snprintf(text, sizeof text, "{alarm %d, %s, %02d:%02d, weekdays %d", schedule->alarm_id,
                  schedule->enabled ? "on" : "off", schedule->hour, schedule->minute,
                  schedule->weekdays);
    std::string description = text;
    if (schedule->year != 0) {
        std::snprintf(text, sizeof text, ", date %04d-%02d-%02d", schedule->year, schedule->month,
                      schedule->day);
        description += text;
    }
    return description + "}";
}

bool within(int value, int least, int most) {
    return value >= least && value <= most;
}

bool isValid(const alarm_schedule_s& schedule) {
    const bool dateValid =
        schedule.year == 0 || (within(schedule.month, 1, 12) && within(schedule.day, 1, 31));
    return within(schedule.enabled, 0, 1) && within(schedule.hour, 0, 23) &&
           within(schedule.minute, 0, 59) && within(schedule.weekdays, 0, 127) && dateValid;
}

/** What lies between the escapes and markers that the log macros put around a message. */
std::string messageOf(const std::string& line) {
    const auto arrow = line.find(" > ");
    std::string text = arrow == std::string::npos ? line : line.substr(arrow + 3);
    for (auto escape = text.find('\033'); escape != std::string::npos; escape = text.find('\033')) {
        const auto end = text.find('m', escape);
        text.erase(escape, end == std::string::npos ? end : end - escape + 1);
    }
    const std::string marker = "* Critical * ";
    if (text.starts_with(marker))
        text.erase(0, marker.size());
    return text;
}

} // namespace

/** Lets the device's functions, which are not members, reach the fake's state. */
struct DeviceCalls {
    static std::optional<int> record(const char* function, const std::string& arguments) {
        return device().record(function, arguments);
    }

    template <typename T>
    static int read(const char* function, const char* key, T&& take) {
        if (auto failure = record(function, quoted(key)))
            return *failure;
        if (!key)
            return VCONF_ERROR;
        const auto& settings = device()._settings;
        const auto found = settings.find(key);
        return found == settings.end() ? VCONF_ERROR : take(found->second);
    }

    static int write(const char* function, const char* key, const std::string& shown,
                     DeviceSetting value) {
        if (auto failure = record(function, quoted(key) + ", " + shown))
            return *failure;
        if (!key)
            return VCONF_ERROR;
        device().setSetting(key, std::move(value), DeviceFake::Deliver::Later);
        return VCONF_OK;
    }

    static int watch(const char* key, vconf_callback_fn callback, void* data) {
        if (auto failure = record("vconf_notify_key_changed", quoted(key)))
            return *failure;
        if (!key || !callback)
            return VCONF_ERROR;
        device()._watchers[key].push_back({callback, data});
        return VCONF_OK;
    }

    static int resourceManagers(const char* function, int change) {
        if (auto failure = record(function, ""))
            return *failure;
        int& count = device()._resourceManagers;
        if (count + change < 0)
            return APP_RESOURCE_ERROR_NOT_FOUND;
        count += change;
        return APP_RESOURCE_ERROR_NONE;
    }

    static void toast(const char* message) { device()._toasts.emplace_back(message); }
    static std::map<std::string, std::string>& notifications() { return device()._notifications; }
    static std::map<std::int32_t, alarm_schedule_s>& schedules() { return device()._schedules; }
    static void log(DeviceLogLine line) { device()._log.push_back(std::move(line)); }
    static bool hasDataPath() { return !device()._dataPathSet || device()._dataPath; }
};

DeviceFake& device() {
    // Never destroyed: libraries may log while the program ends.
    static DeviceFake* fake = new DeviceFake;
    return *fake;
}

DeviceFake::DeviceFake() : _resourceRoot(CLOCK_RESOURCE_DIR) {
    std::atexit([] { device().removeTemporaryFolder(); });
}

void DeviceFake::reset() {
    _calls.clear();
    _failures.clear();
    _actions.clear();
    _settings.clear();
    _watchers.clear();
    _changes.clear();
    _volumes.clear();
    _toasts.clear();
    _notifications.clear();
    _schedules.clear();
    _lastScheduleId = 0;
    _resourceRoot = CLOCK_RESOURCE_DIR;
    _resourceManagers = 0;
    _dataPathSet = false;
    _dataPath.reset();
    removeTemporaryFolder();
    _log.clear();
    _errorsTaken = 0;
    applications::reset();
    cityDevice().reset();
    soundDevice().reset();
    tones::reset();
}

std::optional<int> DeviceFake::record(const std::string& function, const std::string& arguments) {
    _calls.push_back(function + "(" + arguments + ")");
    if (const auto action = _actions.find(function); action != _actions.end()) {
        const auto run = action->second;
        run();
    }
    const auto failure = _failures.find(function);
    if (failure == _failures.end())
        return std::nullopt;
    const int result = failure->second.result;
    if (failure->second.once)
        _failures.erase(failure);
    return result;
}

std::vector<std::string> DeviceFake::callsTo(const std::string& function) const {
    std::vector<std::string> matching;
    for (const auto& call : _calls) {
        if (call.starts_with(function + "("))
            matching.push_back(call);
    }
    return matching;
}

void DeviceFake::onCall(const std::string& function, std::function<void()> action) {
    if (action)
        _actions[function] = std::move(action);
    else
        _actions.erase(function);
}

void DeviceFake::fail(const std::string& function, int result) {
    _failures[function] = {result, false};
}

void DeviceFake::failOnce(const std::string& function, int result) {
    _failures[function] = {result, true};
}

void DeviceFake::setSetting(const std::string& key, DeviceSetting value, Deliver deliver) {
    const auto found = _settings.find(key);
    const bool same = found != _settings.end() && found->second == value;
    _settings[key] = std::move(value);
    if (same)
        return;
    if (deliver == Deliver::Now)
        notifyChange(key);
    else
        _changes.push_back(key);
}

std::optional<DeviceSetting> DeviceFake::setting(const std::string& key) const {
    const auto found = _settings.find(key);
    return found == _settings.end() ? std::nullopt : std::optional(found->second);
}

void DeviceFake::deliverChanges() {
    for (const auto& key : std::exchange(_changes, {}))
        notifyChange(key);
}

void DeviceFake::notifyChange(const std::string& key) {
    // A copy: callbacks may add callbacks, or reset the device.
    const auto found = _watchers.find(key);
    const auto watchers = found == _watchers.end() ? std::vector<Watcher>() : found->second;
    keynode_t node{key.c_str()};
    for (const auto& watcher : watchers)
        watcher.callback(&node, watcher.data);
}

std::size_t DeviceFake::watchers(const std::string& key) const {
    const auto found = _watchers.find(key);
    return found == _watchers.end() ? 0 : found->second.size();
}

int DeviceFake::volume(sound_type_e type) const {
    constexpr int unset = 9;
    const auto found = _volumes.find(type);
    return found == _volumes.end() ? unset : found->second;
}

void DeviceFake::postNotification(const std::string& tag, const std::string& text) {
    _notifications[tag] = text;
}

std::int64_t DeviceFake::nextRing(std::int32_t scheduleId) const {
    const auto found = _schedules.find(scheduleId);
    if (found == _schedules.end() || !found->second.enabled)
        return 0;
    const alarm_schedule_s& schedule = found->second;
    base::RingRule rule{schedule.hour, schedule.minute, schedule.weekdays, std::nullopt};
    if (schedule.year != 0)
        rule.date = base::CivilDate{schedule.year, schedule.month, schedule.day};
    return base::nextRing(rule, time(nullptr), base::currentTimeZone()).value_or(0);
}

std::int32_t DeviceFake::addSchedule(const alarm_schedule_s& schedule) {
    _schedules[++_lastScheduleId] = schedule;
    return _lastScheduleId;
}

std::string DeviceFake::dataPath() {
    if (_dataPathSet)
        return _dataPath.value_or("");
    if (_temporaryFolder.empty()) {
        std::string folder =
            (std::filesystem::temp_directory_path() / "clock-test-XXXXXX").string();
        if (!mkdtemp(folder.data())) {
            std::perror("DeviceFake: no temporary folder");
            std::abort();
        }
        _temporaryFolder = folder;
    }
    return _temporaryFolder + "/";
}

void DeviceFake::setDataPath(std::optional<std::string> folder) {
    _dataPathSet = true;
    _dataPath = std::move(folder);
}

void DeviceFake::removeTemporaryFolder() {
    if (_temporaryFolder.empty())
        return;
    std::error_code ignored;
    std::filesystem::remove_all(_temporaryFolder, ignored);
    _temporaryFolder.clear();
}

bool DeviceFake::logged(int priority, const std::string& text) const {
    for (const auto& line : _log) {
        if (line.priority >= priority && line.text.find(text) != std::string::npos)
            return true;
    }
    return false;
}

std::vector<std::string> DeviceFake::takeErrors() {
    std::vector<std::string> errors;
    for (; _errorsTaken < _log.size(); ++_errorsTaken) {
        const auto& line = _log[_errorsTaken];
        if (line.priority >= DLOG_ERROR && !line.text.starts_with("path: "))
            errors.push_back(line.text);
    }
    return errors;
}

// Log.

int __dlog_print(log_id_t /*id*/, int priority, const char* tag, const char* format, ...) {
    if (!tag || !format)
        return -1;
    va_list arguments;
    va_start(arguments, format);
    char* line = nullptr;
    const int length = vasprintf(&line, format, arguments);
    va_end(arguments);
    if (length < 0)
        return -1;
    if (std::getenv("CLOCK_TEST_LOG"))
        std::fprintf(stderr, "%s %s\n", tag, line);
    DeviceCalls::log({priority, tag, line, messageOf(line)});
    std::free(line);
    return length;
}

// Settings.

int vconf_get_int(const char* key, int* value) {
    return DeviceCalls::read("vconf_get_int", key, [value](const DeviceSetting& setting) {
        const int* number = std::get_if<int>(&setting);
        if (!number)
            return VCONF_ERROR_WRONG_TYPE;
        if (!value)
            return VCONF_ERROR;
        *value = *number;
        return VCONF_OK;
    });
}

int vconf_get_bool(const char* key, int* value) {
    return DeviceCalls::read("vconf_get_bool", key, [value](const DeviceSetting& setting) {
        const bool* flag = std::get_if<bool>(&setting);
        if (!flag)
            return VCONF_ERROR_WRONG_TYPE;
        if (!value)
            return VCONF_ERROR;
        *value = *flag ? 1 : 0;
        return VCONF_OK;
    });
}

char* vconf_get_str(const char* key) {
    char* copy = nullptr;
    DeviceCalls::read("vconf_get_str", key, [&copy](const DeviceSetting& setting) {
        const std::string* text = std::get_if<std::string>(&setting);
        if (!text)
            return VCONF_ERROR_WRONG_TYPE;
        copy = strdup(text->c_str());
        return VCONF_OK;
    });
    return copy;
}

int vconf_set_int(const char* key, int value) {
    return DeviceCalls::write("vconf_set_int", key, std::to_string(value), value);
}

int vconf_set_bool(const char* key, int value) {
    return DeviceCalls::write("vconf_set_bool", key, std::to_string(value), value != 0);
}

int vconf_set_str(const char* key, const char* value) {
    if (!value) {
        const auto failure = DeviceCalls::record("vconf_set_str", quoted(key) + ", null");
        return failure.value_or(VCONF_ERROR);
    }
    return DeviceCalls::write("vconf_set_str", key, quoted(value), std::string(value));
}

int vconf_notify_key_changed(const char* key, vconf_callback_fn callback, void* data) {
    return DeviceCalls::watch(key, callback, data);
}

const char* vconf_keynode_get_name(const keynode_t* node) {
    return node ? node->name : nullptr;
}

// Sound.

int sound_manager_get_volume(sound_type_e type, int* volume) {
    if (auto failure = DeviceCalls::record("sound_manager_get_volume", nameOf(type)))
        return *failure;
    if (!volume || !within(type, SOUND_TYPE_SYSTEM, SOUND_TYPE_MEDIA))
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    *volume = device().volume(type);
    return SOUND_MANAGER_ERROR_NONE;
}

int sound_manager_set_volume(sound_type_e type, int volume) {
    const std::string arguments = nameOf(type) + ", " + std::to_string(volume);
    if (auto failure = DeviceCalls::record("sound_manager_set_volume", arguments))
        return *failure;
    if (!within(type, SOUND_TYPE_SYSTEM, SOUND_TYPE_MEDIA) || !within(volume, 0, 15))
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    device().setVolume(type, volume);
    return SOUND_MANAGER_ERROR_NONE;
}

// Toasts and notifications.

int notification_status_message_post(const char* message) {
    if (auto failure = DeviceCalls::record("notification_status_message_post", quoted(message)))
        return *failure;
    if (!message)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    DeviceCalls::toast(message);
    return NOTIFICATION_ERROR_NONE;
}

int notification_post_with_tag(const char* tag, const char* text) {
    const std::string arguments = quoted(tag) + ", " + quoted(text);
    if (auto failure = DeviceCalls::record("notification_post_with_tag", arguments))
        return *failure;
    if (!tag || !*tag || !text)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    DeviceCalls::notifications()[tag] = text;
    return NOTIFICATION_ERROR_NONE;
}

int notification_delete_by_tag(const char* tag) {
    if (auto failure = DeviceCalls::record("notification_delete_by_tag", quoted(tag)))
        return *failure;
    if (!tag || !*tag)
        return NOTIFICATION_ERROR_INVALID_PARAMETER;
    return DeviceCalls::notifications().erase(tag) ? NOTIFICATION_ERROR_NONE
                                                   : NOTIFICATION_ERROR_NOT_EXIST_ID;
}

// Resources and folders.

int app_resource_manager_init(void) {
    return DeviceCalls::resourceManagers("app_resource_manager_init", 1);
}

int app_resource_manager_release(void) {
    return DeviceCalls::resourceManagers("app_resource_manager_release", -1);
}

int app_resource_manager_get(app_resource_e type, const char* id, char** path) {
    const std::string kind = type == APP_RESOURCE_TYPE_IMAGE
                                 ? "APP_RESOURCE_TYPE_IMAGE"
                                 : std::to_string(static_cast<int>(type));
    if (path)
        *path = nullptr;
    if (auto failure = DeviceCalls::record("app_resource_manager_get", kind + ", " + quoted(id)))
        return *failure;
    if (type != APP_RESOURCE_TYPE_IMAGE || !id || !path)
        return APP_RESOURCE_ERROR_INVALID_PARAMETER;
    const std::string file = device().resourceRoot() + "/" + id;
    if (device().openResourceManagers() == 0 || !std::filesystem::exists(file))
        return APP_RESOURCE_ERROR_NOT_FOUND;
    *path = strdup(file.c_str());
    return APP_RESOURCE_ERROR_NONE;
}

char* app_get_data_path(void) {
    if (DeviceCalls::record("app_get_data_path", "") || !DeviceCalls::hasDataPath())
        return nullptr;
    return strdup(device().dataPath().c_str());
}

// Alarm server.

int alarm_server_register(const alarm_schedule_s* schedule, int32_t* schedule_id) {
    if (auto failure = DeviceCalls::record("alarm_server_register", describe(schedule)))
        return *failure;
    if (!schedule || !schedule_id || !isValid(*schedule))
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    *schedule_id = device().addSchedule(*schedule);
    return ALARM_SERVER_ERROR_NONE;
}

int alarm_server_update(int32_t schedule_id, const alarm_schedule_s* schedule) {
    const std::string arguments = std::to_string(schedule_id) + ", " + describe(schedule);
    if (auto failure = DeviceCalls::record("alarm_server_update", arguments))
        return *failure;
    if (!schedule || !isValid(*schedule))
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    auto& schedules = DeviceCalls::schedules();
    const auto found = schedules.find(schedule_id);
    if (found == schedules.end())
        return ALARM_SERVER_ERROR_NOT_FOUND;
    found->second = *schedule;
    return ALARM_SERVER_ERROR_NONE;
}

int alarm_server_unregister(int32_t schedule_id) {
    if (auto failure = DeviceCalls::record("alarm_server_unregister", std::to_string(schedule_id)))
        return *failure;
    return DeviceCalls::schedules().erase(schedule_id) ? ALARM_SERVER_ERROR_NONE
                                                       : ALARM_SERVER_ERROR_NOT_FOUND;
}

int alarm_server_get(int32_t schedule_id, alarm_schedule_s* schedule, int64_t* next_ring) {
    if (auto failure = DeviceCalls::record("alarm_server_get", std::to_string(schedule_id)))
        return *failure;
    const auto& schedules = DeviceCalls::schedules();
    const auto found = schedules.find(schedule_id);
    if (found == schedules.end())
        return ALARM_SERVER_ERROR_NOT_FOUND;
    if (schedule)
        *schedule = found->second;
    if (next_ring)
        *next_ring = device().nextRing(schedule_id);
    return ALARM_SERVER_ERROR_NONE;
}

int alarm_server_foreach(int (*callback)(int32_t schedule_id, const alarm_schedule_s* schedule,
                                         int64_t next_ring, void* data),
                         void* data) {
    if (auto failure = DeviceCalls::record("alarm_server_foreach", ""))
        return *failure;
    if (!callback)
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    // A copy: the callback may register and unregister.
    const auto schedules = DeviceCalls::schedules();
    for (const auto& [id, schedule] : schedules) {
        if (!callback(id, &schedule, device().nextRing(id), data))
            break;
    }
    return ALARM_SERVER_ERROR_NONE;
}

// Widget extensions.

void eext_object_event_callback_add(Evas_Object* obj, eext_event_type_e type,
                                    eext_event_cb callback, void* data) {
    if (DeviceCalls::record("eext_object_event_callback_add", typeOf(obj) + ", " + nameOf(type)))
        return;
    real<decltype(eext_object_event_callback_add)>("eext_object_event_callback_add")(
        obj, type, callback, data);
}

void* eext_object_event_callback_del(Evas_Object* obj, eext_event_type_e type,
                                     eext_event_cb callback) {
    if (DeviceCalls::record("eext_object_event_callback_del", typeOf(obj) + ", " + nameOf(type)))
        return nullptr;
    return real<decltype(eext_object_event_callback_del)>("eext_object_event_callback_del")(
        obj, type, callback);
}

void ea_theme_object_color_replace(Evas_Object* obj, const char* from, const char* to) {
    const std::string arguments = typeOf(obj) + ", " + quoted(from) + ", " + quoted(to);
    if (DeviceCalls::record("ea_theme_object_color_replace", arguments))
        return;
    real<decltype(ea_theme_object_color_replace)>("ea_theme_object_color_replace")(obj, from, to);
}

Evas_Object* ea_editfield_add(Evas_Object* parent, ea_editfield_type_e type) {
    if (DeviceCalls::record("ea_editfield_add", typeOf(parent) + ", " + nameOf(type)))
        return nullptr;
    return real<decltype(ea_editfield_add)>("ea_editfield_add")(parent, type);
}

Evas_Object* uxt_date_time_add(Evas_Object* parent, const char* style) {
    if (DeviceCalls::record("uxt_date_time_add", typeOf(parent) + ", " + quoted(style)))
        return nullptr;
    return real<decltype(uxt_date_time_add)>("uxt_date_time_add")(parent, style);
}

void uxt_date_time_set_format_by_locale(Evas_Object* picker, const char* locale, int is_24hour) {
    const std::string arguments =
        typeOf(picker) + ", " + quoted(locale) + ", " + std::to_string(is_24hour);
    if (DeviceCalls::record("uxt_date_time_set_format_by_locale", arguments))
        return;
    real<decltype(uxt_date_time_set_format_by_locale)>("uxt_date_time_set_format_by_locale")(
        picker, locale, is_24hour);
}

Evas_Object* uxt_button_add(Evas_Object* parent, const char* style) {
    if (DeviceCalls::record("uxt_button_add", typeOf(parent) + ", " + quoted(style)))
        return nullptr;
    return real<decltype(uxt_button_add)>("uxt_button_add")(parent, style);
}
