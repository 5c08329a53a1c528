#include "AppControl.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdint>

namespace host {

namespace {

constexpr std::string_view requestKind = "clock application request 1";
constexpr std::string_view replyKind = "clock application reply 1";
constexpr std::size_t lengthSize = 4;

void appendLength(std::string& bytes, std::size_t length) {
    for (const int shift : {24, 16, 8, 0})
        bytes += static_cast<char>(length >> shift & 0xFF);
}

std::size_t lengthAt(std::string_view bytes) {
    std::size_t length = 0;
    for (const char byte : bytes.substr(0, lengthSize))
        length = length << 8 | static_cast<unsigned char>(byte);
    return length;
}

void appendText(std::string& message, std::string_view text) {
    appendLength(message, text.size());
    message += text;
}

void appendExtras(std::string& message, const app_control_s& control) {
    for (const auto& [key, value] : control.extras) {
        appendText(message, key);
        appendText(message, value);
    }
}

std::optional<std::string> withLength(const std::string& message) {
    if (message.size() > MESSAGE_LIMIT)
        return std::nullopt;
    std::string framed;
    appendLength(framed, message.size());
    return framed + message;
}

/** The texts of a message, or none when a length is wrong. */
std::vector<std::string_view> textsOf(std::string_view message) {
    std::vector<std::string_view> texts;
    while (!message.empty()) {
        if (message.size() < lengthSize)
            return {};
        const std::size_t length = lengthAt(message);
        message.remove_prefix(lengthSize);
        if (length > message.size() || length > TEXT_LIMIT)
            return {};
        texts.push_back(message.substr(0, length));
        message.remove_prefix(length);
    }
    return texts;
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
    std::string message;
    appendText(message, requestKind);
    appendText(message, request.appId);
    appendText(message, request.operation);
    appendText(message, std::to_string(request.mode));
    appendText(message, std::to_string(request.callerWindow));
    appendExtras(message, request);
    return withLength(message);
}

std::optional<std::string> encodeReply(const Reply& reply) {
    std::string message;
    appendText(message, replyKind);
    appendText(message, std::to_string(reply.result));
    appendExtras(message, reply.texts);
    return withLength(message);
}

std::optional<app_control_s> decodeRequest(std::string_view message) {
    constexpr std::size_t head = 5;
    const auto texts = textsOf(message);
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
    const auto texts = textsOf(message);
    Reply reply;
    int result = 1;
    if (texts.size() < head || texts[0] != replyKind || !readNumber(texts[1], result) ||
        !isResult(result) || !readExtras(texts, head, reply.texts))
        return std::nullopt;
    reply.result = static_cast<app_control_result_e>(result);
    return reply;
}

std::optional<std::string> MessageReader::next() {
    if (_bytes.size() < lengthSize || isOverlong())
        return std::nullopt;
    const std::size_t length = lengthAt(_bytes);
    if (_bytes.size() < lengthSize + length)
        return std::nullopt;
    std::string message = _bytes.substr(lengthSize, length);
    _bytes.erase(0, lengthSize + length);
    return message;
}

bool MessageReader::isOverlong() const {
    return _bytes.size() >= lengthSize && lengthAt(_bytes) > MESSAGE_LIMIT;
}

} // namespace host
