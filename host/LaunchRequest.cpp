#include "LaunchRequest.h"

#include <array>
#include <cerrno>
#include <chrono>
#include <cstdlib>
#include <string>
#include <utility>

#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include "Program.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

using Clock = std::chrono::steady_clock;
using std::chrono::milliseconds;

/** How long the caller may take to send its request, and to make room for the answer. */
constexpr milliseconds callerPatience(5000);

/** The channel that the caller has opened for this process, or -1. */
int inheritedChannel() {
    const char* variable = std::getenv(CHANNEL_VARIABLE);
    if (!variable)
        return -1;
    const bool isOurs = std::to_string(CHANNEL_DESCRIPTOR) == variable;
    // Programs that this one starts have another caller.
    unsetenv(CHANNEL_VARIABLE);
    struct stat status {};
    if (!isOurs || fstat(CHANNEL_DESCRIPTOR, &status) != 0 || !S_ISSOCK(status.st_mode)) {
        LOG_ERROR("%s names no channel", CHANNEL_VARIABLE);
        return -1;
    }
    fcntl(CHANNEL_DESCRIPTOR, F_SETFD, FD_CLOEXEC);
    fcntl(CHANNEL_DESCRIPTOR, F_SETFL, O_NONBLOCK);
    return CHANNEL_DESCRIPTOR;
}

/** Waits until a channel can be read or written. @return False when it took too long. */
bool waitFor(int channel, short events, Clock::time_point end) {
    for (;;) {
        const auto left = std::chrono::duration_cast<milliseconds>(end - Clock::now());
        if (left.count() <= 0)
            return false;
        pollfd wanted{channel, events, 0};
        const int ready = poll(&wanted, 1, static_cast<int>(left.count()));
        if (ready > 0)
            return true;
        if (ready < 0 && errno != EINTR)
            return false;
    }
}

std::optional<std::string> receiveMessage(int channel) {
    const auto end = Clock::now() + callerPatience;
    MessageReader reader;
    std::array<char, 16UL * 1024> buffer{};
    while (!reader.isOverlong() && waitFor(channel, POLLIN, end)) {
        const ssize_t size = recv(channel, buffer.data(), buffer.size(), 0);
        if (size < 0 && (errno == EINTR || errno == EAGAIN))
            continue;
        if (size <= 0)
            return std::nullopt;
        reader.add({buffer.data(), static_cast<std::size_t>(size)});
        if (auto message = reader.next())
            return message;
    }
    return std::nullopt;
}

bool sendMessage(int channel, std::string_view message) {
    const auto end = Clock::now() + callerPatience;
    while (!message.empty()) {
        const ssize_t sent = send(channel, message.data(), message.size(), MSG_NOSIGNAL);
        if (sent >= 0)
            message.remove_prefix(static_cast<std::size_t>(sent));
        else if (errno != EINTR && (errno != EAGAIN || !waitFor(channel, POLLOUT, end)))
            return false;
    }
    return true;
}

} // namespace

LaunchRequest* LaunchRequest::get() {
    static const std::unique_ptr<LaunchRequest> one = receive();
    return one.get();
}

std::unique_ptr<LaunchRequest> LaunchRequest::receive() {
    const int channel = inheritedChannel();
    if (channel < 0)
        return nullptr;
    const auto message = receiveMessage(channel);
    auto request = message ? decodeRequest(*message) : std::nullopt;
    if (!request) {
        LOG_ERROR("The caller's request did not arrive");
        close(channel);
        return nullptr;
    }
    return std::unique_ptr<LaunchRequest>(new LaunchRequest(std::move(*request), channel));
}

LaunchRequest::LaunchRequest(app_control_s request, int channel)
    : _request(std::move(request)), _channel(channel) {}

LaunchRequest::~LaunchRequest() = default;

int LaunchRequest::answer(const Reply& reply) {
    if (_answered)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    const auto message = encodeReply(reply);
    if (!message)
        return APP_CONTROL_ERROR_INVALID_PARAMETER;
    _answered = true;
    const bool sent = _channel >= 0 && sendMessage(_channel, *message);
    closeChannel();
    if (!sent)
        LOG_ERROR("The caller does not take the answer");
    return sent ? APP_CONTROL_ERROR_NONE : APP_CONTROL_ERROR_IO;
}

void LaunchRequest::setGoneCallback(device_app_caller_gone_cb callback, void* data) {
    _goneCallback = callback;
    _goneData = data;
    if (!callback) {
        stopListening();
        return;
    }
    if (_handler || _channel < 0)
        return;
    // Undone by stopListening().
    ecore_init();
    _handler =
        ecore_main_fd_handler_add(_channel, ECORE_FD_READ, _channelCb, this, nullptr, nullptr);
}

Eina_Bool LaunchRequest::_channelCb(void* data, Ecore_Fd_Handler*) {
    auto* self = static_cast<LaunchRequest*>(data);
    char ignored = 0;
    const ssize_t size = recv(self->_channel, &ignored, sizeof ignored, 0);
    if (size > 0 || (size < 0 && (errno == EINTR || errno == EAGAIN)))
        return ECORE_CALLBACK_RENEW;
    const auto callback = self->_goneCallback;
    self->closeChannel();
    if (callback)
        callback(self->_goneData);
    return ECORE_CALLBACK_CANCEL;
}

void LaunchRequest::stopListening() {
    if (!_handler)
        return;
    ecore_main_fd_handler_del(_handler);
    _handler = nullptr;
    ecore_shutdown();
}

void LaunchRequest::closeChannel() {
    stopListening();
    if (_channel >= 0)
        close(_channel);
    _channel = -1;
}

} // namespace host
