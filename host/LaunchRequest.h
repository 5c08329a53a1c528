/**
 * @file
 * @brief The request that started this process, and the way back to who sent it.
 */
#pragma once

#include <memory>
#include <optional>

#include <Ecore.h>

#include "AppControl.h"
#include "device_app.h"

namespace host {

/** The caller of this process. */
class LaunchRequest {
public:
    /** @return Null when a person started the program, or nothing sensible arrived. */
    static LaunchRequest* get();

    ~LaunchRequest();
    LaunchRequest(const LaunchRequest&) = delete;
    LaunchRequest& operator=(const LaunchRequest&) = delete;

    app_control_h request() { return &_request; }
    /** @return One of app_control_error_e; the second answer is an invalid one. */
    int answer(const Reply& reply);
    void setGoneCallback(device_app_caller_gone_cb callback, void* data);

private:
    LaunchRequest(app_control_s request, int channel);
    static std::unique_ptr<LaunchRequest> receive();
    static Eina_Bool _channelCb(void* data, Ecore_Fd_Handler* handler);
    void stopListening();
    void closeChannel();

    app_control_s _request;
    int _channel;
    Ecore_Fd_Handler* _handler = nullptr;
    device_app_caller_gone_cb _goneCallback = nullptr;
    void* _goneData = nullptr;
    bool _answered = false;
};

} // namespace host
