#include "support/AppControlFake.h"

#include <algorithm>
#include <cstring>
#include <memory>

#include "support/DeviceFake.h"
#include "support/FakeCalls.h"

struct app_control_s {
    std::string name;
    applications::Request content;
    bool replied = false;
};

namespace {

using fakes::quoted;

struct State {
    std::vector<std::unique_ptr<app_control_s>> made;
    int lastNumber = 0;
    std::vector<applications::Request> requests;
    std::vector<applications::Reply> replies;
    std::map<std::string, int> unreadable;
};

State& state() {
    // Never destroyed, like the device.
    static State* state = new State;
    return *state;
}

bool lives(const app_control_s* wanted) {
    return std::ranges::any_of(state().made,
                               [wanted](const auto& one) { return one.get() == wanted; });
}

std::string nameOf(const app_control_s* one) {
    if (!one)
        return "null";
    return lives(one) ? one->name : "destroyed";
}

app_control_s* make(const std::string& name) {
    state().made.push_back(std::make_unique<app_control_s>(app_control_s{name, {}, false}));
    return state().made.back().get();
}

void release(const app_control_s* one) {
    std::erase_if(state().made, [one](const auto& made) { return made.get() == one; });
}

std::string nameOf(app_control_launch_mode_e mode) {
    return mode == APP_CONTROL_LAUNCH_MODE_GROUP ? "APP_CONTROL_LAUNCH_MODE_GROUP"
                                                 : "APP_CONTROL_LAUNCH_MODE_SINGLE";
}

/** Notes a call and does its work, unless it is told to fail or the handle is no good. */
template <typename Work>
int call(const char* function, app_control_s* one, const std::string& arguments, Work&& work) {
    const std::string all = nameOf(one) + (arguments.empty() ? "" : ", " + arguments);
    if (const auto failure = device().record(function, all))
        return *failure;
    return lives(one) ? work() : APP_CONTROL_ERROR_INVALID_PARAMETER;
}

int storeText(const char* function, app_control_s* one, std::string& place, const char* text) {
    return call(function, one, quoted(text), [&] {
        if (!text)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        place = text;
        return APP_CONTROL_ERROR_NONE;
    });
}

} // namespace

const std::vector<applications::Request>& applications::requests() {
    return state().requests;
}

const std::vector<applications::Reply>& applications::replies() {
    return state().replies;
}

void applications::answer(const Extras& extras, app_control_result_e result) {
    if (!state().requests.empty())
        answer(Request(state().requests.back()), extras, result);
}

void applications::answer(const Request& request, const Extras& extras,
                          app_control_result_e result) {
    if (!request.callback)
        return;
    app_control_s* sent = make("request");
    sent->content = request;
    app_control_s* reply = make("reply");
    reply->content.extras = extras;
    request.callback(sent, reply, result, request.data);
    release(sent);
    release(reply);
}

void applications::failExtra(const std::string& key, int result) {
    state().unreadable[key] = result;
}

std::size_t applications::unreleased() {
    return state().made.size();
}

void applications::reset() {
    state() = State();
}

int app_control_create(app_control_h* app_control) {
    if (const auto failure = device().record("app_control_create", ""))
        return *failure;
    if (!app_control)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    *app_control = make("app_control " + std::to_string(++state().lastNumber));
    return APP_CONTROL_ERROR_NONE;
}

int app_control_destroy(app_control_h app_control) {
    return call("app_control_destroy", app_control, "", [&] {
        release(app_control);
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_set_app_id(app_control_h app_control, const char* app_id) {
    std::string id;
    const int result = storeText("app_control_set_app_id", app_control, id, app_id);
    if (result == APP_CONTROL_ERROR_NONE)
        app_control->content.application = id;
    return result;
}

int app_control_set_operation(app_control_h app_control, const char* operation) {
    std::string uri;
    const int result = storeText("app_control_set_operation", app_control, uri, operation);
    if (result == APP_CONTROL_ERROR_NONE)
        app_control->content.operation = uri;
    return result;
}

int app_control_set_launch_mode(app_control_h app_control, app_control_launch_mode_e mode) {
    return call("app_control_set_launch_mode", app_control, nameOf(mode), [&] {
        app_control->content.mode = mode;
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_add_extra_data(app_control_h app_control, const char* key, const char* value) {
    const std::string arguments = quoted(key) + ", " + quoted(value);
    return call("app_control_add_extra_data", app_control, arguments, [&] {
        if (!key || !value)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        app_control->content.extras[key] = value;
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_get_extra_data(app_control_h app_control, const char* key, char** value) {
    return call("app_control_get_extra_data", app_control, quoted(key), [&]() -> int {
        if (!key || !value)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        if (const auto found = state().unreadable.find(key); found != state().unreadable.end())
            return found->second;
        const auto& extras = app_control->content.extras;
        const auto found = extras.find(key);
        if (found == extras.end())
            return APP_CONTROL_ERROR_KEY_NOT_FOUND;
        *value = found->second ? strdup(found->second->c_str()) : nullptr;
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_send_launch_request(app_control_h request, app_control_reply_cb callback,
                                    void* data) {
    const std::string arguments = callback ? "callback" : "null";
    return call("app_control_send_launch_request", request, arguments, [&] {
        applications::Request sent = request->content;
        sent.callback = callback;
        sent.data = data;
        state().requests.push_back(std::move(sent));
        return APP_CONTROL_ERROR_NONE;
    });
}

int app_control_reply_to_launch_request(app_control_h reply, app_control_h request,
                                        app_control_result_e result) {
    const std::string arguments = nameOf(request) + ", " + std::to_string(result);
    return call("app_control_reply_to_launch_request", reply, arguments, [&] {
        if (!lives(request) || request->replied)
            return APP_CONTROL_ERROR_INVALID_PARAMETER;
        request->replied = true;
        state().replies.push_back({reply->content.extras, result});
        return APP_CONTROL_ERROR_NONE;
    });
}
