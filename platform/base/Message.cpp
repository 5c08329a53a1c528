#include "base/Message.h"

namespace base {

namespace {

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

} // namespace

std::optional<std::string> encodeMessage(const std::vector<std::string>& texts) {
    std::size_t size = 0;
    for (const auto& text : texts)
        size += lengthSize + text.size();
    if (size > MESSAGE_LIMIT)
        return std::nullopt;
    std::string message;
    message.reserve(lengthSize + size);
    appendLength(message, size);
    for (const auto& text : texts) {
        appendLength(message, text.size());
        message += text;
    }
    return message;
}

std::vector<std::string_view> textsOfMessage(std::string_view message, std::size_t textLimit) {
    std::vector<std::string_view> texts;
    while (!message.empty()) {
        if (message.size() < lengthSize)
            return {};
        const std::size_t length = lengthAt(message);
        message.remove_prefix(lengthSize);
        if (length > message.size() || length > textLimit)
            return {};
        texts.push_back(message.substr(0, length));
        message.remove_prefix(length);
    }
    return texts;
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

} // namespace base
