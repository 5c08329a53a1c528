/**
 * @file
 * @brief Texts on their way between processes.
 *
 * A message is its length and its texts, each text is its length and its bytes; lengths have four
 * bytes, the highest first.
 */
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace base {

/** Longest message in bytes; whoever announces a longer one does not speak this protocol. */
inline constexpr std::size_t MESSAGE_LIMIT = 1024UL * 1024;

/** @return The message with its length in front, or nothing when it would be too long. */
std::optional<std::string> encodeMessage(const std::vector<std::string>& texts);

/**
 * @brief The texts of a message.
 * @param message Without the length in front; the texts point into it.
 * @param textLimit Longest text in bytes.
 * @return None when a length is wrong.
 */
std::vector<std::string_view> textsOfMessage(std::string_view message,
                                             std::size_t textLimit = MESSAGE_LIMIT);

/** Puts messages together from the pieces in which they arrive. */
class MessageReader {
public:
    void add(std::string_view bytes) { _bytes.append(bytes); }
    /** The next whole message without its length, if it is there already. */
    std::optional<std::string> next();
    /** True once a message is announced that is longer than any can be. */
    bool isOverlong() const;
    /** True when no part of a message is waiting for its rest. */
    bool isEmpty() const { return _bytes.empty(); }

private:
    std::string _bytes;
};

} // namespace base
