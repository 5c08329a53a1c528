#include "FaceChannel.h"

#include <array>
#include <cerrno>
#include <utility>

#include <sys/socket.h>
#include <sys/time.h>
#include <unistd.h>

#include "base/LocalSocket.h"

namespace simulator {

namespace {

/** An application that is silent for so long hangs: no request takes more than a part of it. */
constexpr int PATIENCE_SECONDS = 90;

} // namespace

std::unique_ptr<FaceChannel> FaceChannel::open(const std::string& folder, const std::string& name) {
    const int channel = base::connectTo(folder, name);
    if (channel < 0)
        return nullptr;
    const timeval patience{PATIENCE_SECONDS, 0};
    setsockopt(channel, SOL_SOCKET, SO_RCVTIMEO, &patience, sizeof patience);
    setsockopt(channel, SOL_SOCKET, SO_SNDTIMEO, &patience, sizeof patience);
    return std::unique_ptr<FaceChannel>(new FaceChannel(name, channel));
}

FaceChannel::FaceChannel(std::string name, int channel)
    : _name(std::move(name)), _channel(channel) {}

FaceChannel::~FaceChannel() {
    close(_channel);
}

bool FaceChannel::send(const Request& request) const {
    const std::string message = base::encodeMessage(request).value_or("");
    for (std::size_t sent = 0; sent < message.size();) {
        const ssize_t size =
            ::send(_channel, message.data() + sent, message.size() - sent, MSG_NOSIGNAL);
        if (size < 0 && errno != EINTR)
            return false;
        sent += size < 0 ? 0 : static_cast<std::size_t>(size);
    }
    return !message.empty();
}

std::optional<std::string> FaceChannel::receive() {
    std::array<char, 64UL * 1024> buffer{};
    while (true) {
        if (auto message = _reader.next())
            return message;
        const ssize_t size = recv(_channel, buffer.data(), buffer.size(), 0);
        if (size < 0 && errno == EINTR)
            continue;
        if (size <= 0 || _reader.isOverlong())
            return std::nullopt;
        _reader.add({buffer.data(), static_cast<std::size_t>(size)});
    }
}

std::optional<Reply> FaceChannel::ask(const Request& request) {
    const auto message = send(request) ? receive() : std::nullopt;
    if (!message)
        return std::nullopt;
    const auto texts = base::textsOfMessage(*message);
    if (texts.empty())
        return std::nullopt;
    return Reply{std::string(texts.front()), {texts.begin() + 1, texts.end()}};
}

} // namespace simulator
