/**
 * @file
 * @brief Keyboard keys that stand for what happens to a device.
 */
#pragma once

#include <functional>
#include <memory>
#include <string>

#include <Ecore.h>

namespace simulator {

/** @brief While it lives, function keys do what happens to a device. */
class Keys {
public:
    /** @param quickPanel Pulls the quick panel down or pushes it up. */
    explicit Keys(std::function<void()> quickPanel);
    Keys(const Keys&) = delete;
    Keys& operator=(const Keys&) = delete;

private:
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    static Eina_Bool _keyDownCb(void* data, int type, void* info);

    std::function<void()> _quickPanel;
    std::unique_ptr<Ecore_Event_Handler, HandlerDeleter> _handler;
};

/** @brief The lines of --help about keys. */
std::string keysHelpText();

} // namespace simulator
