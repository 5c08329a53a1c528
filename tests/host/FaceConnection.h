// One who uses a face from outside.
#pragma once

#include <array>
#include <cerrno>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>
#include <sys/socket.h>
#include <unistd.h>

#include "base/Message.h"
#include "host/Helper.h"

/** One end of a connection, and the words that have arrived there. */
class FaceConnection {
public:
    using Words = std::vector<std::string>;

    explicit FaceConnection(int channel) : _channel(channel) {}
    ~FaceConnection() { hangUp(); }
    FaceConnection(const FaceConnection&) = delete;
    FaceConnection& operator=(const FaceConnection&) = delete;

    void hangUp() {
        if (_channel >= 0)
            close(std::exchange(_channel, -1));
    }
    void sendBytes(const std::string& bytes) const {
        EXPECT_EQ(send(_channel, bytes.data(), bytes.size(), MSG_NOSIGNAL),
                  static_cast<ssize_t>(bytes.size()));
    }
    void ask(const std::vector<Words>& requests) const {
        std::string bytes;
        for (const Words& request : requests)
            bytes += *base::encodeMessage(request);
        sendBytes(bytes);
    }
    /** The next words, for which the main loop runs; nothing when none come. */
    std::optional<Words> hear(double seconds = 5) {
        std::optional<std::string> message;
        iterateUntil([&] { return (message = _reader.next()).has_value() || !read(); }, seconds);
        if (!message)
            return std::nullopt;
        Words words;
        for (const auto text : base::textsOfMessage(*message))
            words.emplace_back(text);
        return words;
    }
    /** Whether the other end hangs up. */
    bool isLeft() {
        return iterateUntil([this] { return !read(); });
    }

private:
    /** @return False when the other end has gone. */
    bool read() {
        std::array<char, 64UL * 1024> bytes{};
        const ssize_t size = recv(_channel, bytes.data(), bytes.size(), MSG_DONTWAIT);
        if (size > 0)
            _reader.add({bytes.data(), static_cast<std::size_t>(size)});
        return size > 0 || (size < 0 && errno == EAGAIN);
    }

    int _channel;
    base::MessageReader _reader;
};
