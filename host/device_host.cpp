#include "device_host.h"

#include <string>

#include <Elementary.h>

#include "Accessibility.h"
#include "DeviceClock.h"
#include "Folders.h"
#include "Language.h"
#include "Motion.h"
#include "Settings.h"
#include "base/Text.h"
#include "remote/FaceAgent.h"
#include "widgets/DateTime.h"
#include "widgets/FontLanguage.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace {

/** The theme in use, empty before device_host_init_toolkit(). */
std::string& themeInUse() {
    static std::string path;
    return path;
}

bool isTheme(const std::string& path) {
    Eina_List* groups = edje_file_collection_list(path.c_str());
    edje_file_collection_list_free(groups);
    return groups != nullptr;
}

/** Symbols that the theme has no picture of: characters of a font that comes with it. */
void addFonts() {
    static std::string added;
    const std::string folder = host::folders().resources + "/fonts";
    host::chooseFonts(folder);
    if (added != folder)
        evas_font_path_global_append(folder.c_str());
    added = folder;
}

void forgetTheme() {
    if (!themeInUse().empty())
        elm_theme_overlay_del(nullptr, themeInUse().c_str());
    themeInUse().clear();
}

/** Set in code, so that the look does not depend on the user's toolkit profile. */
void configureTouch() {
    elm_config_scale_set(1.0);
    elm_config_finger_size_set(40);
    elm_config_longpress_timeout_set(0.6);
    elm_config_scroll_thumbscroll_enabled_set(EINA_TRUE);
    elm_config_scroll_bounce_enabled_set(EINA_TRUE);
    elm_config_scroll_bounce_friction_set(0.5);
    elm_config_scroll_thumbscroll_threshold_set(16);
    elm_config_scroll_thumbscroll_momentum_threshold_set(100.0);
    elm_config_scroll_thumbscroll_friction_set(1.0);
    elm_config_scroll_thumbscroll_border_friction_set(0.5);
    // A desktop's aids for keyboard and mouse, of no use on a watch.
    elm_config_context_menu_disabled_set(EINA_TRUE);
    elm_config_magnifier_enable_set(EINA_FALSE);
    // The device itself leads the focus and rings it.
    elm_config_focus_highlight_enabled_set(EINA_FALSE);
    elm_config_item_select_on_focus_disabled_set(EINA_TRUE);
    // What takes the focus when a field gives it up must not pull the page away from under it.
    elm_config_focus_autoscroll_mode_set(ELM_FOCUS_AUTOSCROLL_MODE_NONE);
}

void configureWindows() {
    elm_config_accel_preference_set("none");
    // Without this a window stays black where no window manager runs.
    elm_config_agressive_withdrawn_set(EINA_FALSE);
    edje_color_class_set("/bg/normal", 0, 0, 0, 255, 0, 0, 0, 0, 0, 0, 0, 0);
}

} // namespace

int device_host_init(const device_host_config_s* config, char* error, size_t error_size) {
    std::string problem;
    host::forgetVolumeCallback();
    host::forgetSettingCallbacks();
    if (!host::prepareFolders(config ? *config : device_host_config_s{}, problem)) {
        // The caller who takes the sentence shows it.
        if (!error)
            LOG_ERROR("%s", problem.c_str());
        base::copyUtf8(error, error_size, problem);
        return -1;
    }
    host::applyLocale();
    host::bindTexts(host::folders().resources + "/locale");
    host::applyClock();
    return 0;
}

int device_host_init_toolkit(void) {
    if (!host::dateTimeIsInterposed()) {
        LOG_ERROR("The toolkit's date-time functions come before the device's: link the device "
                  "library before the toolkit");
        return -1;
    }
    const std::string theme = host::folders().resources + "/edje/device.edj";
    if (!isTheme(theme)) {
        LOG_ERROR("The device's theme %s is missing or damaged", theme.c_str());
        return -1;
    }
    // Starting the toolkit takes the locale from the environment once more.
    host::applyLocale();
    configureTouch();
    configureWindows();
    addFonts();
    forgetTheme();
    elm_theme_overlay_add(nullptr, theme.c_str());
    themeInUse() = theme;
    host::followLanguage();
    host::followMotion();
    // The program may have written settings since the device was started.
    host::applyClock();
    if (!host::followClock())
        LOG_WARNING("Changes of the clock and the time zone go unnoticed");
    host::FaceAgent::listenIfAsked();
    host::followScreenReaders();
    return 0;
}

void device_host_shutdown(void) {
    host::FaceAgent::end();
    host::forgetVolumeCallback();
    host::forgetSettingCallbacks();
    device_host_set_toast_callback(nullptr, nullptr);
    device_host_set_log_callback(nullptr, nullptr);
    host::endFeedback();
    host::forgetClock();
    forgetTheme();
    host::forgetLanguage();
    host::forgetFolders();
}
