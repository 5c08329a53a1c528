/**
 * @file
 * @brief The end of scripts and commands that lies in the watch.
 */
#pragma once

#include <string>

#include <Ecore.h>

namespace simulator {

/** @brief Lets scripts and commands of other processes use the watch while it lives. */
class RemoteControl {
public:
    /**
     * @param channel Tells a waiting process where to find the watch; the watch ends when the other
     * end is closed. -1 = nobody waits. Owned by this object.
     */
    explicit RemoteControl(int channel);
    ~RemoteControl();
    RemoteControl(const RemoteControl&) = delete;
    RemoteControl& operator=(const RemoteControl&) = delete;

private:
    static Eina_Bool _channelCb(void* data, Ecore_Fd_Handler* handler);
    static char* _requestCb(const char* const* words, int count, void* data);
    void announce();

    int _channel;
    std::string _folder;
    Ecore_Fd_Handler* _handler = nullptr;
};

} // namespace simulator
