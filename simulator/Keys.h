/**
 * @file
 * @brief Keyboard keys that stand for what happens to a device.
 */
#pragma once

#include <memory>
#include <string>

#include <Ecore.h>

namespace simulator {

/** @brief While it lives, function keys raise application-wide events. */
class Keys {
public:
    Keys();

private:
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    std::unique_ptr<Ecore_Event_Handler, HandlerDeleter> _handler;
};

/** @brief The lines of --help about keys. */
std::string keysHelpText();

} // namespace simulator
