/**
 * @file
 * @brief Small rules about UTF-8 text and translations used as formats.
 */
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace base {

/**
 * @brief Cuts a text to at most `maxBytes` bytes, never inside a UTF-8 sequence.
 * @return The longest such head of the text.
 */
std::string_view cutUtf8(std::string_view text, std::size_t maxBytes);

/**
 * @brief Copies a text into a buffer of `size` bytes, cut as cutUtf8() does, always terminated.
 *
 * A null buffer or a size of zero does nothing.
 */
void copyUtf8(char* buffer, std::size_t size, std::string_view text);

/** A value for a placeholder of a translation. */
using FormatArgument = std::variant<int, std::string>;

/**
 * @brief Fills the placeholders of a translation.
 *
 * The conversions may be %d and %i for integers and %s for texts, plain or positional (%1$d), with
 * flags and width but without "*", and %% for a percent sign. They must agree with the arguments in
 * number and type. Otherwise the translation is returned as it is, so that a broken catalogue can
 * spoil a text but nothing else.
 * @param translation The translated text.
 * @param arguments The values, in the order of the original text.
 * @param maxBytes The result is cut to this many bytes, as cutUtf8() does.
 */
std::string formatTranslation(std::string_view translation,
                              const std::vector<FormatArgument>& arguments,
                              std::size_t maxBytes = 511);

} // namespace base
