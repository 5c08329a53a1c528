/**
 * @file
 * @brief Requests and replies between applications, and their form on the way.
 */
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "base/Message.h"
#include "device/app_control.h"

/** What a handle of application control points to. */
struct app_control_s {
    std::string appId;
    std::string operation;
    app_control_launch_mode_e mode = APP_CONTROL_LAUNCH_MODE_SINGLE;
    /** X window of the one who asks; 0 when there is none to stay above. */
    unsigned long callerWindow = 0;
    /** In the order in which the keys were first added. */
    std::vector<std::pair<std::string, std::string>> extras;
};

namespace host {

/** Longest text in bytes: no key or value of an application comes near it. */
inline constexpr std::size_t TEXT_LIMIT = 64UL * 1024;
using base::MESSAGE_LIMIT;
using base::MessageReader;

/** An answer as it travels. */
struct Reply {
    app_control_result_e result = APP_CONTROL_RESULT_FAILED;
    app_control_s texts;
};

/** Whether this is one of the results that the interface knows. */
bool isResult(int result);

/**
 * @name Messages
 * The first text of a message tells what it is.
 * @{
 */
/** @return The whole message with its length in front, or nothing when it would be too long. */
std::optional<std::string> encodeRequest(const app_control_s& request);
std::optional<std::string> encodeReply(const Reply& reply);
/** @param message Without the length in front. @return Nothing when it is not such a message. */
std::optional<app_control_s> decodeRequest(std::string_view message);
std::optional<Reply> decodeReply(std::string_view message);
/** @} */

} // namespace host
