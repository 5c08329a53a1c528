#include "AppControl.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>

namespace host {

namespace {

constexpr std::string_view requestKind = "clock application request 1";
constexpr std::string_view replyKind = "clock application reply 1";
void appendExtras(std::vector<std::string>& texts, const app_control_s& control) {
    for (const auto& [key, value] : control.extras) {
        texts.push_back(key);
        texts.push_back(value);
    }
}

template <typename Number>
bool readNumber(std::string_view text, Number& number) {
    const char* end = text.data() + text.size();
    const auto [last, problem] = std::from_chars(text.data(), end, number);
    return problem == std::errc() && last == end;
}

/** A key twice or a text with a zero in it cannot have come from this interface. */
bool readExtras(const std::vector<std::string_view>& texts, std::size_t first,
                app_control_s& control) {
    if ((texts.size() - first) % 2 != 0)
        return false;
    for (std::size_t at = first; at < texts.size(); at += 2) {
        const std::string_view key = texts[at];
        const bool isThere = std::any_of(control.extras.begin(), control.extras.end(),
                                         [key](const auto& extra) { return extra.first == key; });
        if (key.empty() || isThere || key.find('\0') != std::string_view::npos ||
            texts[at + 1].find('\0') != std::string_view::npos)
            return false;
        control.extras.emplace_back(key, texts[at + 1]);
    }
    return true;
}

bool isMode(int mode) {
    return mode == APP_CONTROL_LAUNCH_MODE_SINGLE || mode == APP_CONTROL_LAUNCH_MODE_GROUP;
}

} // namespace

bool isResult(int result) {
    constexpr std::array results{APP_CONTROL_RESULT_SUCCEEDED, APP_CONTROL_RESULT_FAILED,
                                 APP_CONTROL_RESULT_CANCELED};
    return std::find(results.begin(), results.end(), result) != results.end();
}

std::optional<std::string> encodeRequest(const app_control_s& request) {
    std::vector<std::string> texts{std::string(requestKind), request.appId, request.operation,
                                   std::to_string(request.mode),
                                   std::to_string(request.callerWindow)};
    appendExtras(texts, request);
    return base::encodeMessage(texts);
}

std::optional<std::string> encodeReply(const Reply& reply) {
    std::vector<std::string> texts{std::string(replyKind), std::to_string(reply.result)};
    appendExtras(texts, reply.texts);
    return base::encodeMessage(texts);
}

std::optional<app_control_s> decodeRequest(std::string_view message) {
    constexpr std::size_t head = 5;
    const auto texts = base::textsOfMessage(message, TEXT_LIMIT);
    app_control_s request;
    int mode = -1;
    if (texts.size() < head || texts[0] != requestKind || !readNumber(texts[3], mode) ||
        !isMode(mode) || !readNumber(texts[4], request.callerWindow) ||
        !readExtras(texts, head, request))
        return std::nullopt;
    request.appId = texts[1];
    request.operation = texts[2];
    request.mode = static_cast<app_control_launch_mode_e>(mode);
    return request;
}

std::optional<Reply> decodeReply(std::string_view message) {
    constexpr std::size_t head = 2;
    const auto texts = base::textsOfMessage(message, TEXT_LIMIT);
    Reply reply;
    int result = 1;
    if (texts.size() < head || texts[0] != replyKind || !readNumber(texts[1], result) ||
        !isResult(result) || !readExtras(texts, head, reply.texts))
        return std::nullopt;
    reply.result = static_cast<app_control_result_e>(result);
    return reply;
}

} // namespace host
