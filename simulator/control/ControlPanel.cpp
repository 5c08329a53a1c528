#include "ControlPanel.h"

#include <algorithm>
#include <cstring>
#include <utility>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <Elementary.h>

#include "ControlWidgets.h"
#include "WatchFace.h"
#include "device_host.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr int GAP = 16;
/** Another process may change the settings; the seconds tick. */
constexpr double REFRESH_SECONDS = 0.25;

Evas_Object* addWindow() {
    Evas_Object* window = elm_win_add(nullptr, "clock-sim-controls", ELM_WIN_BASIC);
    elm_win_title_set(window, "Watch controls");
    elm_object_mirrored_automatic_set(window, EINA_FALSE);
    elm_object_mirrored_set(window, EINA_FALSE);
    return window;
}

/** Both windows in the middle of the screen: a window manager puts one of them over the other. */
void placeBeside(Evas_Object* window, Evas_Object* face) {
    int width = 0;
    int height = 0;
    elm_win_screen_size_get(face, nullptr, nullptr, &width, &height);
    const int panelHeight =
        height > 0 ? std::min(ControlPanel::HEIGHT, height) : ControlPanel::HEIGHT;
    const int x = std::max(0, (width - FACE_SIZE - GAP - ControlPanel::WIDTH) / 2);
    const int y = std::max(0, (height - panelHeight) / 2);
    evas_object_move(face, x, y);
    evas_object_resize(window, ControlPanel::WIDTH, panelHeight);
    evas_object_move(window, x + FACE_SIZE + GAP, y);
}

} // namespace

bool hasRoomForPanel(Evas_Object* face) {
    int width = 0;
    int height = 0;
    elm_win_screen_size_get(face, nullptr, nullptr, &width, &height);
    return width >= FACE_SIZE + GAP + ControlPanel::WIDTH && height >= ControlPanel::LEAST_HEIGHT;
}

ControlPanel::ControlPanel(Evas_Object* face, const std::string& theme,
                           const ControlActions& actions, std::function<void()> closed)
    : _face(face), _window(addWindow()), _closed(std::move(closed)),
      _pulse(face, theme, [this] { _readout->pulse(); }) {
    Evas_Object* window = _window.get();
    Evas_Object* layout = elm_layout_add(window);
    if (!elm_layout_file_set(layout, theme.c_str(), "simulator/control"))
        LOG_ERROR("'%s' has no control panel", theme.c_str());
    evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    elm_win_resize_object_add(window, layout);
    evas_object_show(layout);

    Evas_Object* column = control::addColumn(layout);
    elm_box_padding_set(column, 0, GAP / 2);
    elm_object_part_content_set(layout, "control.column", column);
    const control::Tell tell = [this](const std::string& problem) {
        _readout->tell(problem);
        _refreshCb(this);
    };
    _readout = std::make_unique<control::Readout>(column);
    _keys = std::make_unique<control::KeysSection>(column, actions);
    _settings = std::make_unique<control::SettingsSection>(column, tell);
    _clock = std::make_unique<control::ClockSection>(column, tell);
    _log = std::make_unique<control::LogSection>(column, _lines);

    device_host_set_log_callback(_logCb, _lines.get());
    evas_object_smart_callback_add(window, "delete,request", _deleteRequestCb, this);
    evas_object_event_callback_add(layout, EVAS_CALLBACK_KEY_DOWN, _keyDownCb, window);
    evas_object_event_callback_add(layout, EVAS_CALLBACK_MOUSE_DOWN, _mouseDownCb, window);
    _buttonDown.reset(ecore_event_handler_add(ECORE_EVENT_MOUSE_BUTTON_DOWN, _buttonDownCb, this));
    _refresh.reset(ecore_timer_add(REFRESH_SECONDS, _refreshCb, this));
    placeBeside(window, face);
    evas_object_show(window);
}

ControlPanel::~ControlPanel() {
    device_host_set_log_callback(nullptr, nullptr);
}

Eina_Bool ControlPanel::_refreshCb(void* data) {
    auto* self = static_cast<ControlPanel*>(data);
    self->_readout->refresh();
    self->_settings->refresh();
    self->_clock->refresh();
    self->_log->refresh();
    return ECORE_CALLBACK_RENEW;
}

void ControlPanel::_deleteRequestCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<ControlPanel*>(data);
    self->_closing.reset(ecore_job_add(_closedCb, self));
}

void ControlPanel::_closedCb(void* data) {
    auto* self = static_cast<ControlPanel*>(data);
    // The main loop deletes a job that runs.
    static_cast<void>(self->_closing.release());
    // A copy: it may delete the panel, and its own original with it.
    const std::function<void()> closed = self->_closed;
    closed();
}

void ControlPanel::_keyDownCb(void* data, Evas*, Evas_Object*, void* info) {
    // Who walks with keys sees where; who points knows.
    if (std::strstr(static_cast<Evas_Event_Key_Down*>(info)->key, "Tab") != nullptr)
        elm_win_focus_highlight_enabled_set(static_cast<Evas_Object*>(data), EINA_TRUE);
}

void ControlPanel::_mouseDownCb(void* data, Evas*, Evas_Object*, void*) {
    elm_win_focus_highlight_enabled_set(static_cast<Evas_Object*>(data), EINA_FALSE);
}

/** Without a window manager nobody else hands the keys to the window that is used. */
Eina_Bool ControlPanel::_buttonDownCb(void* data, int, void* info) {
    const auto* self = static_cast<ControlPanel*>(data);
    const auto* event = static_cast<const Ecore_Event_Mouse_Button*>(info);
    for (Evas_Object* window : {self->_face, self->window()}) {
        Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(window));
        if (event->window == ecore_evas_window_get(ee) && ecore_evas_focus_get(ee) == EINA_FALSE)
            ecore_evas_focus_set(ee, EINA_TRUE);
    }
    return ECORE_CALLBACK_PASS_ON;
}

void ControlPanel::_logCb(int priority, const char* tag, const char* text, void* data) {
    static_cast<LogLines*>(data)->add(priority, tag, text);
}

} // namespace simulator
