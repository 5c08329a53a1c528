/**
 * @file
 * @brief The hardware volume keys.
 */
#pragma once

#include <functional>
#include <memory>
#include <string>

#include <Ecore.h>

namespace simulator {

/**
 * @brief Does what the system does with volume keys while it lives.
 *
 * A key that no window has taken steps the alarm's level, once more every 0.2 seconds while it is
 * held. Function keys stand in for volume keys on keyboards that lack them: they become real events
 * of the volume keys, which reach everybody.
 */
class VolumeKeys {
public:
    /** @param stepped Gets the alarm's level after each step, also when it stays as it is. */
    explicit VolumeKeys(std::function<void(int level)> stepped);
    VolumeKeys(const VolumeKeys&) = delete;
    VolumeKeys& operator=(const VolumeKeys&) = delete;

private:
    struct HandlerDeleter {
        void operator()(Ecore_Event_Handler* handler) const { ecore_event_handler_del(handler); }
    };
    using Handler = std::unique_ptr<Ecore_Event_Handler, HandlerDeleter>;

    static Eina_Bool _keyDownCb(void* data, int type, void* info);
    static Eina_Bool _keyUpCb(void* data, int type, void* info);
    void pressed(const std::string& key, int step);

    std::function<void(int)> _stepped;
    std::string _held; ///< The key that is down; empty when none is.
    double _lastStep = 0;
    Handler _down;
    Handler _up;
};

/** @brief The lines of --help about volume keys. */
std::string volumeKeysHelpText();

} // namespace simulator
