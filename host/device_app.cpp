#include "device_app.h"

#include <cstdlib>
#include <cstring>
#include <string>

#include "AppControl.h"
#include "LaunchRequest.h"
#include "ToneFolder.h"

namespace {

int copyText(const std::string& text, char** copy) {
    char* made = strdup(text.c_str());
    if (!made)
        return APP_CONTROL_ERROR_OUT_OF_MEMORY;
    *copy = made;
    return APP_CONTROL_ERROR_NONE;
}

} // namespace

app_control_h device_app_launch_request(void) {
    host::LaunchRequest* own = host::LaunchRequest::get();
    return own ? own->request() : nullptr;
}

void device_app_set_caller_gone_callback(device_app_caller_gone_cb callback, void* data) {
    if (host::LaunchRequest* own = host::LaunchRequest::get())
        own->setGoneCallback(callback, data);
}

int device_app_get_local_path(const char* path, char** local_path) {
    return path && local_path ? copyText(host::pathHere(path), local_path)
                              : APP_CONTROL_ERROR_INVALID_PARAMETER;
}

int device_app_get_app_id(app_control_h request, char** app_id) {
    return request && app_id ? copyText(request->appId, app_id)
                             : APP_CONTROL_ERROR_INVALID_PARAMETER;
}

int device_app_get_operation(app_control_h request, char** operation) {
    return request && operation ? copyText(request->operation, operation)
                                : APP_CONTROL_ERROR_INVALID_PARAMETER;
}

int device_app_get_launch_mode(app_control_h request, app_control_launch_mode_e* mode) {
    if (!request || !mode)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *mode = request->mode;
    return APP_CONTROL_ERROR_NONE;
}

int device_app_foreach_extra_data(app_control_h app_control, device_app_extra_cb callback,
                                  void* data) {
    if (!app_control || !callback)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    // A copy: the callback may add texts.
    const auto extras = app_control->extras;
    for (const auto& [key, value] : extras)
        if (!callback(key.c_str(), value.c_str(), data))
            break;
    return APP_CONTROL_ERROR_NONE;
}
