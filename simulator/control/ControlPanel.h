/**
 * @file
 * @brief The control panel: a window beside the face for what happens to a device.
 *
 * Its own texts are in English whatever the device speaks.
 */
#pragma once

#include <functional>
#include <memory>
#include <string>

#include <Ecore.h>
#include <Evas.h>

#include "ClockSection.h"
#include "ControlActions.h"
#include "HapticPulse.h"
#include "KeysSection.h"
#include "LogLines.h"
#include "LogSection.h"
#include "SettingsSection.h"

namespace simulator {

/** @brief One object per process; it must go before the face's window. */
class ControlPanel {
public:
    static constexpr int WIDTH = 400;
    static constexpr int HEIGHT = 780;       ///< Where the screen has room.
    static constexpr int LEAST_HEIGHT = 680; ///< Below it the log has no room.

    /**
     * @param face The face's window; the panel opens beside it.
     * @param theme Path of the simulator's theme.
     * @param closed Called when a person closes the panel, on the next turn of the main loop; it
     * may delete the panel.
     */
    ControlPanel(Evas_Object* face, const std::string& theme, const ControlActions& actions,
                 std::function<void()> closed);
    ~ControlPanel();
    ControlPanel(const ControlPanel&) = delete;
    ControlPanel& operator=(const ControlPanel&) = delete;

    Evas_Object* window() const { return _window.get(); }

private:
    struct WindowDeleter {
        void operator()(Evas_Object* window) const { evas_object_del(window); }
    };
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    struct JobDeleter {
        void operator()(Ecore_Job* job) const { ecore_job_del(job); }
    };
    static Eina_Bool _refreshCb(void* data);
    static void _deleteRequestCb(void* data, Evas_Object* window, void* info);
    static void _closedCb(void* data);
    static void _keyDownCb(void* data, Evas* canvas, Evas_Object* layout, void* info);
    static void _mouseDownCb(void* data, Evas* canvas, Evas_Object* layout, void* info);
    static Eina_Bool _buttonDownCb(void* data, int type, void* info);
    static void _logCb(int priority, const char* tag, const char* text, void* data);

    std::shared_ptr<LogLines> _lines = std::make_shared<LogLines>();
    Evas_Object* _face;
    std::unique_ptr<Evas_Object, WindowDeleter> _window;
    std::function<void()> _closed;
    std::unique_ptr<control::Readout> _readout;
    std::unique_ptr<control::KeysSection> _keys;
    std::unique_ptr<control::SettingsSection> _settings;
    std::unique_ptr<control::ClockSection> _clock;
    std::unique_ptr<control::LogSection> _log;
    HapticPulse _pulse;
    std::unique_ptr<Ecore_Timer, TimerDeleter> _refresh;
    std::unique_ptr<Ecore_Job, JobDeleter> _closing;
    std::unique_ptr<Ecore_Event_Handler, HandlerDeleter> _buttonDown;
};

/** @brief Whether the screen has room for the panel beside the face. */
bool hasRoomForPanel(Evas_Object* face);

} // namespace simulator
