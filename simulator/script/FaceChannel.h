/**
 * @file
 * @brief A connection to one application of the watch.
 */
#pragma once

#include <memory>
#include <optional>
#include <string>

#include "Device.h"
#include "base/Message.h"

namespace simulator {

/** Asks and waits for the answer. */
class FaceChannel {
public:
    /** @return Null when nobody listens there any more. */
    static std::unique_ptr<FaceChannel> open(const std::string& folder, const std::string& name);
    ~FaceChannel();
    FaceChannel(const FaceChannel&) = delete;
    FaceChannel& operator=(const FaceChannel&) = delete;

    const std::string& name() const { return _name; }
    /** @return Nothing when the application has gone. */
    std::optional<Reply> ask(const Request& request);

private:
    FaceChannel(std::string name, int channel);
    bool send(const Request& request) const;
    std::optional<std::string> receive();

    std::string _name;
    int _channel;
    base::MessageReader _reader;
};

} // namespace simulator
