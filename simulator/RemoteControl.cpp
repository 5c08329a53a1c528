#include "RemoteControl.h"

#include <array>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <vector>

#include <Elementary.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include "control/DeviceActions.h"
#include "control/DeviceSettings.h"
#include "device_remote.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace fs = std::filesystem;

namespace simulator {

namespace {

using Words = std::vector<std::string>;

/** What the watch answers; a leading "=" marks what was asked for. */
std::string getSetting(const Words& words) {
    for (const DeviceSetting& setting : deviceSettings())
        if (words[1] == setting.name)
            return std::string("=").append(setting.get());
    std::string all;
    for (const DeviceSetting& setting : deviceSettings())
        all += (all.empty() ? "" : ", ") + std::string(setting.name);
    return "there is no setting '" + words[1] + "'; there are " + all;
}

std::string setSetting(const Words& words) {
    const std::string known = getSetting(words);
    return known.starts_with("=") ? setDevice(words[1], words[2]) : known;
}

std::string moveQuickPanel(const Words& words) {
    if (words[1] == "open")
        openQuickPanel();
    else
        closeQuickPanel();
    return "";
}

std::string toBackground(const Words& /*words*/) {
    goToBackground();
    return "";
}

std::string toForeground(const Words& /*words*/) {
    comeToForeground();
    return "";
}

struct WatchRequest {
    const char* name;
    std::size_t words;
    std::string (*act)(const Words& words);
};

constexpr std::array<WatchRequest, 5> REQUESTS{{
    {"set", 3, setSetting},
    {"get", 2, getSetting},
    {"quick-panel", 2, moveQuickPanel},
    {"background", 1, toBackground},
    {"foreground", 1, toForeground},
}};

std::string answer(const Words& words) {
    for (const WatchRequest& request : REQUESTS)
        if (words[0] == request.name && words.size() == request.words)
            return request.act(words);
    return "the watch does not know this request";
}

/** A folder of this process's own. */
std::string makeFolder() {
    char* all = device_remote_folder();
    std::string folder = std::string(all) + "/" + std::to_string(getpid());
    // What an earlier process of this number has left behind.
    std::error_code ignored;
    fs::remove_all(folder, ignored);
    mkdir(all, S_IRWXU);
    std::free(all);
    return mkdir(folder.c_str(), S_IRWXU) == 0 ? folder : "";
}

} // namespace

RemoteControl::RemoteControl(int channel) : _channel(channel), _folder(makeFolder()) {
    const int result = _folder.empty() ? -errno : device_remote_listen(_folder.c_str());
    if (result < 0)
        LOG_ERROR("No script can use the watch: %s", std::strerror(-result));
    device_remote_set_request_callback(_requestCb, this);
    if (_channel < 0)
        return;
    _handler =
        ecore_main_fd_handler_add(_channel, ECORE_FD_READ, _channelCb, this, nullptr, nullptr);
    announce();
}

RemoteControl::~RemoteControl() {
    device_remote_set_request_callback(nullptr, nullptr);
    if (_handler != nullptr)
        ecore_main_fd_handler_del(_handler);
    if (_channel >= 0)
        close(_channel);
    std::error_code ignored;
    if (!_folder.empty())
        fs::remove_all(_folder, ignored);
}

void RemoteControl::announce() {
    const std::string line = _folder + "\n";
    if (send(_channel, line.data(), line.size(), MSG_NOSIGNAL) < 0)
        LOG_ERROR("Whoever started the watch has gone: %s", std::strerror(errno));
}

Eina_Bool RemoteControl::_channelCb(void* data, Ecore_Fd_Handler* handler) {
    auto* self = static_cast<RemoteControl*>(data);
    char byte = 0;
    if (recv(ecore_main_fd_handler_fd_get(handler), &byte, 1, MSG_DONTWAIT) != 0)
        return ECORE_CALLBACK_RENEW;
    self->_handler = nullptr;
    elm_exit();
    return ECORE_CALLBACK_CANCEL;
}

char* RemoteControl::_requestCb(const char* const* words, int count, void* /*data*/) {
    const std::string problem = answer(Words(words, words + count));
    return problem.empty() ? nullptr : strdup(problem.c_str());
}

} // namespace simulator
