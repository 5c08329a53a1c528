#include "device/app_control.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <new>
#include <string>

#include "AppControl.h"
#include "Launch.h"
#include "LaunchRequest.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace {

bool isText(const char* text) {
    return text && strnlen(text, host::TEXT_LIMIT + 1) <= host::TEXT_LIMIT;
}

bool isOwnRequest(app_control_h control) {
    host::LaunchRequest* own = host::LaunchRequest::get();
    return own && own->request() == control;
}

auto find(app_control_s& control, const char* key) {
    return std::find_if(control.extras.begin(), control.extras.end(),
                        [key](const auto& extra) { return extra.first == key; });
}

} // namespace

int app_control_create(app_control_h* app_control) {
    if (!app_control)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *app_control = new (std::nothrow) app_control_s;
    return *app_control ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_OUT_OF_MEMORY;
}

int app_control_destroy(app_control_h app_control) {
    // The request that started this process is the device's.
    if (!app_control || isOwnRequest(app_control))
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    delete app_control;
    return APP_CONTROL_ERROR_NONE;
}

int app_control_set_app_id(app_control_h app_control, const char* app_id) {
    if (!app_control || !isText(app_id) || !*app_id)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    app_control->appId = app_id;
    return APP_CONTROL_ERROR_NONE;
}

int app_control_set_operation(app_control_h app_control, const char* operation) {
    if (!app_control || !isText(operation))
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    app_control->operation = operation;
    return APP_CONTROL_ERROR_NONE;
}

int app_control_set_launch_mode(app_control_h app_control, app_control_launch_mode_e mode) {
    if (!app_control ||
        (mode != APP_CONTROL_LAUNCH_MODE_SINGLE && mode != APP_CONTROL_LAUNCH_MODE_GROUP))
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    app_control->mode = mode;
    return APP_CONTROL_ERROR_NONE;
}

int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value) {
    if (!app_control || !isText(key) || !*key || !isText(value))
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    const auto found = find(*app_control, key);
    if (found != app_control->extras.end())
        found->second = value;
    else
        app_control->extras.emplace_back(key, value);
    return APP_CONTROL_ERROR_NONE;
}

int app_control_get_extra_data(app_control_h app_control, const char* key, char** value) {
    if (!app_control || !key || !value)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    const auto found = find(*app_control, key);
    if (found == app_control->extras.end())
        return APP_CONTROL_ERROR_KEY_NOT_FOUND;
    char* copy = strdup(found->second.c_str());
    if (!copy)
        return APP_CONTROL_ERROR_OUT_OF_MEMORY;
    *value = copy;
    return APP_CONTROL_ERROR_NONE;
}

int app_control_send_launch_request(app_control_h request, app_control_reply_cb callback,
                                    void* data) {
    if (!request || request->appId.empty()) {
        LOG_ERROR("A request needs the id of an application");
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    }
    return host::launch(*request, {callback, data});
}

int app_control_reply_to_launch_request(app_control_h reply, app_control_h request,
                                        app_control_result_e result) {
    if (!reply || !request || !host::isResult(result) || !isOwnRequest(request))
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    return host::LaunchRequest::get()->answer({result, *reply});
}
