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
    Foreground(const Foreground&) = delete;
    Foreground& operator=(const Foreground&) = delete;

private:
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    static void _focusInCb(void* data, Evas_Object* window, void* info);
    static void _focusOutCb(void* data, Evas_Object* window, void* info);
    static Eina_Bool _visibilityCb(void* data, int type, void* info);
    void update();

    Evas_Object* _window;
    bool _unfocused = false; ///< It had the focus and lost it.
    bool _covered = false;
    bool _paused = false;
    std::unique_ptr<Ecore_Event_Handler, HandlerDeleter> _visibility;
};

} // namespace simulator
