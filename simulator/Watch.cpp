#include "Watch.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <optional>
#include <vector>

#include <Ecore_X.h>
#include <Efreet.h>
#include <Elementary.h>

#include "AlarmListViewController.h"
#include "Foreground.h"
#include "Keys.h"
#include "PickCity.h"
#include "PowerSaving.h"
#include "QuickPanel.h"
#include "QuickPanelMessage.h"
#include "RemoteControl.h"
#include "SettingEvents.h"
#include "ToastView.h"
#include "VolumeKeys.h"
#include "VolumeView.h"
#include "WatchFace.h"
#include "app_assist/WNaviframeController.h"
#include "app_assist/WWindowController.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockAlarmManagerModel.h"
#include "control/ControlPanel.h"
#include "control/DeviceActions.h"
#include "control/DeviceSettings.h"
#include "device/app_resource_manager.h"
#include "device/sound_manager.h"
#include "device/vconf.h"
#include "device_app.h"
#include "device_host.h"
#include "device_settings.h"

namespace simulator {
namespace {

constexpr int TWELVE_HOURS = 1;
constexpr int TWENTY_FOUR_HOURS = 2;

int fail(const std::string& reason) {
    std::fprintf(stderr, "clock-sim: %s\n", reason.c_str());
    return EXIT_FAILURE;
}

const char* orNull(const std::string& text) {
    return text.empty() ? nullptr : text.c_str();
}

/** The device and the toolkit, ended in the order that they need. */
class Device {
public:
    Device() = default;
    ~Device() {
        if (_started)
            device_host_shutdown();
        if (_toolkitUp)
            elm_shutdown();
    }
    Device(const Device&) = delete;
    Device& operator=(const Device&) = delete;

    /** @return What is wrong; empty when the device stands. */
    std::string start(const Options& options) {
        if (!options.language.empty())
            setenv("CLOCK_LANGUAGE", options.language.c_str(), 1);
        device_host_config_s config{};
        config.data_dir = orNull(options.dataDir);
        config.resource_dir = orNull(options.resourceDir);
        std::array<char, 512> error{};
        if (device_host_init(&config, error.data(), error.size()) != 0)
            return error.data();
        _started = true;
        return writeSettings(options);
    }

    bool startToolkit() {
        // A watch has no menus: without this a helper starts that collects the desktop's.
        efreet_cache_disable();
        _toolkitUp = elm_init(0, nullptr) > 0;
        return _toolkitUp && device_host_init_toolkit() == 0;
    }

private:
    static bool setTimeForm(bool twelveHour) {
        const int form = twelveHour ? TWELVE_HOURS : TWENTY_FOUR_HOURS;
        return vconf_set_int(DEVICE_SETTING_TIME_FORM, form) == VCONF_OK;
    }
    /** A watch leaves the factory with a region; screens do not follow the hours without one. */
    static void setMissingRegion() {
        char* region = vconf_get_str(DEVICE_SETTING_REGION);
        if (region == nullptr)
            vconf_set_str(DEVICE_SETTING_REGION, "en_US.UTF-8");
        std::free(region);
    }
    static std::string writeSettings(const Options& options) {
        if (options.twelveHour && !setTimeForm(*options.twelveHour))
            return "the 12/24-hour setting cannot be written";
        if (options.volume &&
            sound_manager_set_volume(SOUND_TYPE_ALARM, *options.volume) != SOUND_MANAGER_ERROR_NONE)
            return "the alarm's volume cannot be written";
        if (options.powerSaving && !setPowerSaving(*options.powerSaving))
            return "the power saving setting cannot be written";
        setMissingRegion();
        for (const auto& [setting, value] : options.settings) {
            std::string problem = setDevice(setting, value);
            if (!problem.empty())
                return problem;
        }
        return "";
    }

    bool _started = false;
    bool _toolkitUp = false;
};

/** A desktop's services that the toolkit looks for and a watch does not have. */
void quietToolkit() {
    setenv("EINA_LOG_LEVELS",
           "eldbus:0,eina_safety:0,ecore_system_upower:0,ecore_system_systemd:0,ecore_con:0", 0);
    setenv("EINA_LOG_BACKTRACE", "-1", 0);
}

/** The toolkit reports a missing display in many lines: ask before it does. */
bool hasDisplay() {
    if (std::getenv("ELM_ENGINE") != nullptr)
        return true;
    setenv("ELM_DISPLAY", "x11", 0);
    const char* name = std::getenv("DISPLAY");
    return name != nullptr && *name != '\0' && ecore_x_init(nullptr) > 0;
}

std::string themePath() {
    app_resource_manager_init();
    char* path = nullptr;
    app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "edje/simulator.edj", &path);
    std::string result = path == nullptr ? "" : path;
    std::free(path);
    app_resource_manager_release();
    return result;
}

bool isStored(int id) {
    std::vector<ClockAlarmDbData> alarms;
    ClockAlarmDbModel().getAllAlarmList(alarms);
    return std::any_of(alarms.begin(), alarms.end(),
                       [id](const ClockAlarmDbData& alarm) { return alarm.id == id; });
}

void closedCb(void*, Evas_Object*, void*) {
    elm_exit();
}

/** What the control panel does to the application in front. */
ControlActions controlActions(QuickPanel& quickPanel) {
    return {[](const std::string& key, bool down) { down ? pressKey(key) : releaseKey(key); },
            turnBezel, pressBezel, [&quickPanel] { quickPanel.toggle(); },
            [](bool background) {
                background ? goToBackground() : comeToForeground();
            }};
}

/** What the system draws over the application and does with keys that nobody has taken. */
class System {
public:
    System(Evas_Object* window, const std::string& theme, std::optional<bool> controls)
        : _toasts(window, theme), _volume(window, theme),
          _panel(window, theme, [window](bool shown) { sendQuickPanelMessage(window, shown); }),
          _keys([this] { _panel.toggle(); }), _volumeKeys([this](int level) { showVolume(level); }),
          _foreground(window) {
        device_app_add_bezel(window);
        setQuickPanel(&_panel);
        setForeground(&_foreground);
        if (controls.value_or(hasRoomForPanel(window)))
            openControls(window, theme);
    }
    ~System() {
        closeControls();
        setForeground(nullptr);
        setQuickPanel(nullptr);
    }
    System(const System&) = delete;
    System& operator=(const System&) = delete;

private:
    void showVolume(int level) {
        if (_panel.isShown())
            _panel.refresh();
        else
            _volume.show(level);
    }

    void openControls(Evas_Object* window, const std::string& theme) {
        _controls = std::make_unique<ControlPanel>(window, theme, controlActions(_panel),
                                                   [this] { closeControls(); });
        _foreground.setCompanion(_controls->window());
    }
    void closeControls() {
        _foreground.setCompanion(nullptr);
        _controls.reset();
    }

    ToastView _toasts;
    VolumeView _volume;
    QuickPanel _panel;
    Keys _keys;
    VolumeKeys _volumeKeys;
    Foreground _foreground;
    std::unique_ptr<ControlPanel> _controls; ///< Null while there is none.
};

/** A window with pages in it. */
class Face {
public:
    explicit Face(const char* name) : _window(name, FACE_SIZE, FACE_SIZE) {}

    bool create() {
        if (!_window.create(nullptr, nullptr))
            return false;
        evas_object_smart_callback_add(_window.getEvasObj(), "delete,request", closedCb, nullptr);
        _pages = new app_assist::WNaviframeController();
        _pages->setOnEmpty([] { elm_exit(); });
        _window.setBaseController(_pages);
        return true;
    }
    app_assist::WWindowController& window() { return _window; }
    void push(app_assist::WContentViewController* page) { _pages->push(page); }
    /** Until the main loop ends. */
    void run(const std::string& theme, std::optional<bool> controls) {
        const System system(_window.getEvasObj(), theme, controls);
        evas_object_show(_window.getEvasObj());
        elm_run();
    }

private:
    app_assist::WWindowController _window;
    app_assist::WNaviframeController* _pages = nullptr;
};

void openFirst(const Options& options, AlarmListViewController& alarms) {
    if (options.create)
        alarms.createAlarm();
    else if (options.editId)
        alarms.editAlarm(*options.editId);
    else if (options.worldClock)
        alarms.openWorldClock();
}

void showClock(const Options& options, const std::string& theme) {
    ClockAlarmManagerModel::synchronize();
    Face face("clock-sim");
    if (!face.create())
        return;
    auto* alarms = new AlarmListViewController(theme);
    face.push(alarms);
    openFirst(options, *alarms);
    const RemoteControl remote(options.channel);
    face.run(theme, options.channel < 0 ? options.panel : options.panel.value_or(false));
}

/** Started by another application it belongs to that one's watch. */
bool isOwnWatch() {
    return device_app_launch_request() == nullptr;
}

void showCityPicker(const Options& options, const std::string& theme) {
    Face face(CITY_PICKER_NAME);
    if (!face.create())
        return;
    attachToCaller(face.window());
    face.push(makeCityPicker());
    std::optional<RemoteControl> remote;
    if (isOwnWatch())
        remote.emplace(options.channel);
    // Another application's watch has a panel already.
    face.run(theme, isOwnWatch() ? options.panel : false);
    detachFromCaller();
}

} // namespace

int runWatch(const Options& options) {
    quietToolkit();
    Device device;
    const std::string problem = device.start(options);
    if (!problem.empty())
        return fail(problem);
    if (options.onlySets())
        return EXIT_SUCCESS;
    const std::string theme = themePath();
    if (theme.empty())
        return fail("the theme edje/simulator.edj is missing from the resources");
    if (options.editId && !isStored(*options.editId))
        return fail("alarm " + std::to_string(*options.editId) + " is not stored");
    if (!hasDisplay())
        return fail("there is no X display; ./run starts a virtual one");
    if (!device.startToolkit())
        return fail("the toolkit cannot be started with the device's theme");
    elm_theme_extension_add(nullptr, theme.c_str());
    followSettings();
    prepareQuickPanelMessage();
    if (options.pickCity)
        showCityPicker(options, theme);
    else
        showClock(options, theme);
    return EXIT_SUCCESS;
}

} // namespace simulator
