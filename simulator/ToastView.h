/**
 * @file
 * @brief Toasts on the face.
 */
#pragma once

#include <deque>
#include <memory>
#include <string>

#include <Ecore.h>
#include <Evas.h>

namespace simulator {

/**
 * @brief Shows the device's toasts, one after the other, over everything else in a window.
 *
 * Toasts let input through. One object per process; it must go before its window.
 */
class ToastView {
public:
    /** @param window Owner of what is drawn. @param theme Path of the simulator's theme. */
    ToastView(Evas_Object* window, const std::string& theme);
    ~ToastView();
    ToastView(const ToastView&) = delete;
    ToastView& operator=(const ToastView&) = delete;

    /** @brief Shows a text, or keeps it until the texts before it have been shown.
     * One that reads as the one before is shown once. It stays in the language, and runs in the
     * direction, in which it was posted. */
    void post(const std::string& text);

private:
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    struct Toast {
        std::string text;
        bool rightToLeft = false;
    };
    static void _toastCb(const char* message, void* data);
    static Eina_Bool _timeOverCb(void* data);
    void showNext();
    void direct(bool rightToLeft);

    Evas_Object* _layout;
    std::string _shown;
    std::deque<Toast> _waiting;
    std::unique_ptr<Ecore_Timer, TimerDeleter> _timer;
};

} // namespace simulator
