// The device's tone picker: lists the tones of a folder, lets a person hear them, and answers the
// application that asked with the chosen one.
#include <cstdio>
#include <cstdlib>
#include <string>

#include <Ecore_X.h>
#include <Efreet.h>
#include <Elementary.h>

#include "Preview.h"
#include "ToneList.h"
#include "TonePage.h"
#include "device_app.h"
#include "device_host.h"

namespace {

using namespace tone_picker;

constexpr int FACE_SIZE = 360;
constexpr const char* NAME = "tone-picker";
constexpr const char* DEFAULT_FOLDER = "/opt/usr/share/settings/Ringtones";

/** A text of the request, or what is used when it does not say. */
std::string requested(const char* key, const std::string& otherwise) {
    char* value = nullptr;
    app_control_h request = device_app_launch_request();
    if (!request || app_control_get_extra_data(request, key, &value) != APP_CONTROL_ERROR_NONE)
        return otherwise;
    std::string text = value;
    std::free(value);
    return text.empty() ? otherwise : text;
}

/** Answers the request, if there is one, and ends the program. */
void leave(app_control_result_e result, const std::string& path = "", int position = 0) {
    app_control_h reply = nullptr;
    if (app_control_create(&reply) == APP_CONTROL_ERROR_NONE) {
        if (result == APP_CONTROL_RESULT_SUCCEEDED) {
            app_control_add_extra_data(reply, "result", path.c_str());
            app_control_add_extra_data(reply, "position", std::to_string(position).c_str());
        }
        app_control_reply_to_launch_request(reply, device_app_launch_request(), result);
        app_control_destroy(reply);
    }
    elm_exit();
}

/** A desktop's services that the toolkit looks for and a watch does not have. */
void quietToolkit() {
    setenv("EINA_LOG_LEVELS",
           "eldbus:0,eina_safety:0,ecore_system_upower:0,ecore_system_systemd:0,ecore_con:0", 0);
    setenv("EINA_LOG_BACKTRACE", "-1", 0);
}

bool hasDisplay() {
    if (std::getenv("ELM_ENGINE"))
        return true;
    setenv("ELM_DISPLAY", "x11", 0);
    const char* name = std::getenv("DISPLAY");
    return name && *name && ecore_x_init(nullptr) > 0;
}

void windowClosedCb(void*, Evas_Object*, void*) {
    leave(APP_CONTROL_RESULT_CANCELED);
}

Evas_Object* createWindow() {
    Evas_Object* window = elm_win_util_standard_add(NAME, NAME);
    if (!window)
        return nullptr;
    evas_object_smart_callback_add(window, "delete,request", windowClosedCb, nullptr);
    evas_object_resize(window, FACE_SIZE, FACE_SIZE);
    device_app_place_window(window);
    device_app_add_bezel(window);
    return window;
}

/** Shows the tones until the person has chosen or the caller has gone. */
void pick(Evas_Object* window) {
    const std::string folder = requested("path", DEFAULT_FOLDER);
    const auto tones = tonesIn(folder);
    const auto pathOf = [&](int position) {
        return join(folder, tones.at(static_cast<std::size_t>(position)).file);
    };
    Preview preview;
    TonePage page(
        tones, positionOf(tones, folder, requested("marked_mode", "")),
        {.marked = [&](int position) { preview.play(pathOf(position)); },
         .done =
             [&](int position) { leave(APP_CONTROL_RESULT_SUCCEEDED, pathOf(position), position); },
         .cancelled =
             [] {
                 leave(APP_CONTROL_RESULT_CANCELED);
             }});
    page.show(window);
    evas_object_show(window);
    device_app_set_caller_gone_callback([](void*) { elm_exit(); }, nullptr);
    elm_run();
    device_app_set_caller_gone_callback(nullptr, nullptr);
    // Nothing of the page may be called after it has gone.
    evas_object_del(window);
}

int fail(const char* why) {
    std::fprintf(stderr, "%s: %s\n", NAME, why);
    return EXIT_FAILURE;
}

/** The toolkit's time, from its start to its end. */
int run() {
    if (!hasDisplay())
        return fail("there is no X display");
    // A watch has no menus: without this a helper starts that collects the desktop's.
    efreet_cache_disable();
    if (elm_init(0, nullptr) <= 0)
        return fail("the toolkit cannot be started");
    Evas_Object* window = device_host_init_toolkit() == 0 ? createWindow() : nullptr;
    if (window)
        pick(window);
    device_host_shutdown();
    elm_shutdown();
    return window ? EXIT_SUCCESS : fail("there is no theme or no window");
}

} // namespace

int main() {
    // Before anything else: what this process opens and starts must not get at the caller's
    // channel.
    device_app_launch_request();
    quietToolkit();
    char error[512] = "";
    if (device_host_init(nullptr, error, sizeof error) != 0)
        return fail(error);
    return run();
}
