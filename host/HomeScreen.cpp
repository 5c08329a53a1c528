#include "HomeScreen.h"

#include <array>
#include <cstdio>
#include <ctime>
#include <memory>
#include <set>
#include <string>

#include <Ecore.h>
#include <Ecore_Input.h>
#include <Evas.h>

#include "device/vconf.h"
#include "device_settings.h"

namespace host {

namespace {

constexpr double REFRESH_SECONDS = 0.5;
constexpr int FONT_SIZE = 76;
/** Below toasts and the watch's body. */
constexpr short LAYER = EVAS_LAYER_MAX - 2;

class HomeScreen {
public:
    explicit HomeScreen(Ecore_Evas* window)
        : _window(window), _ground(evas_object_rectangle_add(ecore_evas_get(window))),
          _time(evas_object_text_add(ecore_evas_get(window))),
          _timer(ecore_timer_add(REFRESH_SECONDS, _refreshCb, this)),
          _filter(ecore_event_filter_add(nullptr, _filterCb, nullptr, this)) {
        int width = 0;
        int height = 0;
        ecore_evas_geometry_get(window, nullptr, nullptr, &width, &height);
        evas_object_color_set(_ground, 0, 0, 0, 255);
        evas_object_resize(_ground, width, height);
        evas_object_text_font_set(_time, "Roboto:style=Light", FONT_SIZE);
        evas_object_color_set(_time, 255, 255, 255, 255);
        evas_object_pass_events_set(_time, EINA_TRUE);
        refresh();
        for (Evas_Object* object : {_ground, _time}) {
            evas_object_layer_set(object, LAYER);
            evas_object_show(object);
        }
        evas_object_event_callback_add(_ground, EVAS_CALLBACK_DEL, _goneCb, this);
    }
    ~HomeScreen() {
        ecore_event_filter_del(_filter);
        ecore_timer_del(_timer);
        if (_gone)
            return;
        evas_object_event_callback_del_full(_ground, EVAS_CALLBACK_DEL, _goneCb, this);
        evas_object_del(_time);
        evas_object_del(_ground);
    }
    HomeScreen(const HomeScreen&) = delete;
    HomeScreen& operator=(const HomeScreen&) = delete;

private:
    static Eina_Bool _refreshCb(void* data);
    static Eina_Bool _filterCb(void* data, void* turn, int type, void* info);
    static void _goneCb(void* data, Evas* canvas, Evas_Object* ground, void* info);
    void refresh();
    bool takesKey(const Ecore_Event_Key& key);
    bool isForWindow(Ecore_Window window) const { return window == ecore_evas_window_get(_window); }

    Ecore_Evas* _window;
    Evas_Object* _ground;
    Evas_Object* _time;
    Ecore_Timer* _timer;
    Ecore_Event_Filter* _filter;
    std::set<std::string> _taken; ///< Keys that were pressed here.
    bool _gone = false;
};

std::unique_ptr<HomeScreen>& home() {
    // Never destroyed by itself: at the process's end the toolkit is gone before statics are.
    static auto* const instance = new std::unique_ptr<HomeScreen>;
    return *instance;
}

bool isTwelveHour() {
    constexpr int TWELVE_HOURS = 1;
    int form = 0;
    return vconf_get_int(DEVICE_SETTING_TIME_FORM, &form) == VCONF_OK && form == TWELVE_HOURS;
}

void HomeScreen::refresh() {
    const std::time_t now = std::time(nullptr);
    std::tm local{};
    localtime_r(&now, &local);
    constexpr int HALF = 12;
    const int hour = isTwelveHour() ? (local.tm_hour + HALF - 1) % HALF + 1 : local.tm_hour;
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), isTwelveHour() ? "%d:%02d" : "%02d:%02d", hour,
                  local.tm_min);
    evas_object_text_text_set(_time, text.data());
    int width = 0;
    int height = 0;
    int textWidth = 0;
    int textHeight = 0;
    evas_object_geometry_get(_ground, nullptr, nullptr, &width, &height);
    evas_object_geometry_get(_time, nullptr, nullptr, &textWidth, &textHeight);
    evas_object_move(_time, (width - textWidth) / 2, (height - textHeight) / 2);
}

bool HomeScreen::takesKey(const Ecore_Event_Key& key) {
    // "F6", but not the letter.
    const bool function = key.keyname[0] == 'F' && key.keyname[1] != '\0';
    if (function || !isForWindow(key.event_window))
        return false;
    _taken.insert(key.keyname);
    return true;
}

Eina_Bool HomeScreen::_refreshCb(void* data) {
    static_cast<HomeScreen*>(data)->refresh();
    return ECORE_CALLBACK_RENEW;
}

/** @return False for what must not reach the application. */
Eina_Bool HomeScreen::_filterCb(void* data, void* /*turn*/, int type, void* info) {
    auto* self = static_cast<HomeScreen*>(data);
    if (type == ECORE_EVENT_KEY_DOWN)
        return self->takesKey(*static_cast<const Ecore_Event_Key*>(info)) ? EINA_FALSE : EINA_TRUE;
    // A key that was held before is released below, too.
    if (type == ECORE_EVENT_KEY_UP)
        return self->_taken.erase(static_cast<const Ecore_Event_Key*>(info)->keyname) > 0
                   ? EINA_FALSE
                   : EINA_TRUE;
    if (type == ECORE_EVENT_MOUSE_WHEEL) {
        const auto* event = static_cast<const Ecore_Event_Mouse_Wheel*>(info);
        return self->isForWindow(event->event_window) ? EINA_FALSE : EINA_TRUE;
    }
    return EINA_TRUE;
}

void HomeScreen::_goneCb(void* data, Evas* /*canvas*/, Evas_Object* /*ground*/, void* /*info*/) {
    static_cast<HomeScreen*>(data)->_gone = true;
    home().reset();
}

} // namespace

void showHome(Ecore_Evas* window, bool shown) {
    if (shown == (home() != nullptr))
        return;
    if (shown)
        home() = std::make_unique<HomeScreen>(window);
    else
        home().reset();
}

} // namespace host
