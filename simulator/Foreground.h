/**
 * @file
 * @brief Whether a person looks at the clock application.
 */
#pragma once

#include <memory>

#include <Ecore.h>
#include <Evas.h>

namespace simulator {

/**
 * @brief Pauses the application while another one is in front of it, and resumes it afterwards.
 *
 * A window manager tells by the focus. Without one the window of the other application covers this
 * one. It must go before its window.
 */
class Foreground {
public:
    explicit Foreground(Evas_Object* window);
    ~Foreground();
    /** @brief Sets a window that a person may use without leaving the application; null for none.
     */
    void setCompanion(Evas_Object* window);
    /** @brief Leaves the application, whatever window is in front; or comes back to it. */
    void leave(bool away);
    bool isInFront() const { return !_paused; }
    Foreground(const Foreground&) = delete;
    Foreground& operator=(const Foreground&) = delete;

private:
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static Eina_Bool _stillUnfocusedCb(void* data);
    void listen(Evas_Object* window);
    void forget(Evas_Object* window);
    static void _focusInCb(void* data, Evas_Object* window, void* info);
    static void _focusOutCb(void* data, Evas_Object* window, void* info);
    static Eina_Bool _visibilityCb(void* data, int type, void* info);
    void update();

    Evas_Object* _window;
    Evas_Object* _companion = nullptr;
    /** Runs while the focus may be on its way from one window to the other. */
    std::unique_ptr<Ecore_Timer, TimerDeleter> _leaving;
    bool _unfocused = false; ///< It had the focus and lost it.
    bool _covered = false;
    bool _away = false; ///< It was sent to the background.
    bool _paused = false;
    std::unique_ptr<Ecore_Event_Handler, HandlerDeleter> _visibility;
};

} // namespace simulator
