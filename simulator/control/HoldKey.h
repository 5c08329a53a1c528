/**
 * @file
 * @brief A button of the panel that is a key of the device.
 */
#pragma once

#include <functional>
#include <memory>
#include <string>

#include <Ecore.h>
#include <Evas.h>

namespace simulator::control {

/**
 * @brief Holds a key down for as long as a button is pressed, and repeats it as a keyboard does.
 *
 * Used from the keyboard, the button presses and releases the key at once. Destroyed while it is
 * held, it releases the key. The button must live as long.
 */
class HoldKey {
public:
    using Press = std::function<void(const std::string& key, bool down)>;

    HoldKey(Evas_Object* button, std::string key, Press press);
    ~HoldKey();
    HoldKey(const HoldKey&) = delete;
    HoldKey& operator=(const HoldKey&) = delete;

private:
    struct TimerDeleter {
        void operator()(Ecore_Timer* timer) const { ecore_timer_del(timer); }
    };
    static void _pressedCb(void* data, Evas_Object* button, void* info);
    static void _unpressedCb(void* data, Evas_Object* button, void* info);
    static void _clickedCb(void* data, Evas_Object* button, void* info);
    static Eina_Bool _repeatCb(void* data);
    void release();

    Evas_Object* _button;
    std::string _key;
    Press _press;
    bool _byPointer = false; ///< The next click ends a press that was already told of.
    std::unique_ptr<Ecore_Timer, TimerDeleter> _repeat; ///< Runs while the key is down.
};

} // namespace simulator::control
