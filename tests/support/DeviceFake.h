/**
 * @file
 * @brief The device of a test: records what the code under test asks of it, and does as it is told.
 *
 * The functions of <device/...> are defined in the test executable and so come before the
 * desktop's. Services (settings, sound, notifications, alarm server, resources, data folder, log)
 * are fakes with state. Widget extensions (eext_, ea_, uxt_) are recorded and then do their real
 * work.
 *
 *     device().reset();                                         // before each test
 *     device().setSetting("db/setting/psmode", 2);              // runs the callbacks of the key
 *     device().setSetting("db/setting/psmode", "two");          // a value of the wrong type
 *     device().fail("alarm_server_register", ALARM_SERVER_ERROR_IO);   // until succeed() or
 * reset() device().failOnce("uxt_button_add");                      // pointer functions return
 * null
 *     ... use the screen ...
 *     EXPECT_THAT(device().calls(), Contains(R"(sound_manager_set_volume(SOUND_TYPE_ALARM, 7))"));
 *     EXPECT_THAT(device().callsTo("vconf_set_int"), ElementsAre(R"(vconf_set_int("key", 1))"));
 *     EXPECT_THAT(device().toasts(), ElementsAre("Alarm set."));
 *     EXPECT_THAT(device().takeErrors(), ElementsAre("Data is NULL !!"));
 *
 * With the environment variable CLOCK_TEST_LOG set, log lines are printed as well.
 */
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include <device/alarm_server.h>
#include <device/sound_manager.h>
#include <device/vconf.h>

/** The type and value of a setting. */
using DeviceSetting = std::variant<int, bool, std::string>;

/** One line of the platform log. */
struct DeviceLogLine {
    int priority = 0;
    std::string tag;
    std::string line; ///< As written: "file: function(line) > ", colour escapes and message.
    std::string text; ///< The message alone.
};

/** The device as the code under test meets it; device() is the only one. */
class DeviceFake {
public:
    /** Whether the callbacks of a changed setting run at once or in deliverChanges(). */
    enum class Deliver { Now, Later };

    DeviceFake(const DeviceFake&) = delete;
    DeviceFake& operator=(const DeviceFake&) = delete;

    /** Forgets everything, and removes the data folder. */
    void reset();

    // Calls.

    /** Every call in order, as source text: a text in quotes, an object as its type's name. */
    const std::vector<std::string>& calls() const { return _calls; }
    /** The calls of one function. */
    std::vector<std::string> callsTo(const std::string& function) const;
    void clearCalls() { _calls.clear(); }
    /** Runs in every call to a function, before it does its work; null takes it back. */
    void onCall(const std::string& function, std::function<void()> action);
    /** Makes each further call of a function fail: it returns `result` and does nothing. */
    void fail(const std::string& function, int result = -1);
    /** Makes the next call of a function fail. */
    void failOnce(const std::string& function, int result = -1);
    /** Takes back fail() and failOnce(). */
    void succeed(const std::string& function) { _failures.erase(function); }
    /** Notes a call, for the fakes in other files. @return What it was told to fail with, if so. */
    std::optional<int> record(const std::string& function, const std::string& arguments);

    // Settings.

    /** Changes a setting as another process would. */
    void setSetting(const std::string& key, DeviceSetting value, Deliver deliver = Deliver::Now);
    void removeSetting(const std::string& key) { _settings.erase(key); }
    std::optional<DeviceSetting> setting(const std::string& key) const;
    /** Runs the callbacks of settings that the code under test, or Deliver::Later, has changed. */
    void deliverChanges();
    /** Runs the callbacks of a key. */
    void notifyChange(const std::string& key);
    /** Number of callbacks on a key. */
    std::size_t watchers(const std::string& key) const;

    // Sound.

    /** Level of a sound type; 9 unless set. */
    int volume(sound_type_e type) const;
    /** Sets a level, possibly one out of range. */
    void setVolume(sound_type_e type, int level) { _volumes[type] = level; }

    // Toasts and notifications.

    const std::vector<std::string>& toasts() const { return _toasts; }
    /** Posted notifications by tag. */
    const std::map<std::string, std::string>& notifications() const { return _notifications; }
    void postNotification(const std::string& tag, const std::string& text);

    // Alarm server.

    /** Stored schedules by their ids. */
    const std::map<std::int32_t, alarm_schedule_s>& schedules() const { return _schedules; }
    /** When a schedule rings next in the present time zone; 0 when it will not. */
    std::int64_t nextRing(std::int32_t scheduleId) const;
    /** Stores a schedule under a new id, as an earlier run of the application would have. */
    std::int32_t addSchedule(const alarm_schedule_s& schedule);
    /** Loses a schedule. */
    void dropSchedule(std::int32_t scheduleId) { _schedules.erase(scheduleId); }

    // Folders.

    /** Where resources are looked up; the built ones unless set. */
    const std::string& resourceRoot() const { return _resourceRoot; }
    void setResourceRoot(const std::string& folder) { _resourceRoot = folder; }
    /** Calls of app_resource_manager_init() without their app_resource_manager_release(). */
    int openResourceManagers() const { return _resourceManagers; }
    /** The application's data folder: a new temporary one for each test unless set. */
    std::string dataPath();
    /** Sets the data folder; nothing = the device has none. */
    void setDataPath(std::optional<std::string> folder);

    // Log.

    const std::vector<DeviceLogLine>& log() const { return _log; }
    /** True when a line of at least this priority has the text in its message. */
    bool logged(int priority, const std::string& text) const;
    /**
     * @brief The messages at error priority since the last call, in order.
     *
     * Those which begin with "path: " are left out: screens tell so where they found their themes.
     */
    std::vector<std::string> takeErrors();

private:
    friend DeviceFake& device();
    friend struct DeviceCalls;

    struct Failure {
        int result = -1;
        bool once = false;
    };
    struct Watcher {
        vconf_callback_fn callback = nullptr;
        void* data = nullptr;
    };

    DeviceFake();
    void removeTemporaryFolder();

    std::vector<std::string> _calls;
    std::map<std::string, Failure> _failures;
    std::map<std::string, std::function<void()>> _actions;
    std::map<std::string, DeviceSetting> _settings;
    std::map<std::string, std::vector<Watcher>> _watchers;
    std::vector<std::string> _changes;
    std::map<int, int> _volumes;
    std::vector<std::string> _toasts;
    std::map<std::string, std::string> _notifications;
    std::map<std::int32_t, alarm_schedule_s> _schedules;
    std::int32_t _lastScheduleId = 0;
    std::string _resourceRoot;
    int _resourceManagers = 0;
    bool _dataPathSet = false;
    std::optional<std::string> _dataPath;
    std::string _temporaryFolder;
    std::vector<DeviceLogLine> _log;
    std::size_t _errorsTaken = 0;
};

/** The device of this test executable. */
DeviceFake& device();
