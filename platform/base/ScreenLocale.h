/**
 * @file
 * @brief Locales for numbers that a person sees.
 */
#pragma once

#include <string_view>

#include <unicode/locid.h>

namespace base {

/**
 * @brief A locale with the digits that all numbers on a screen have.
 *
 * Both kinds of digits are usual in Arabic. Offsets from GMT, counts in messages and the days of a
 * calendar have European ones, so everything else has them too.
 */
inline icu::Locale screenLocale(icu::Locale locale) {
    UErrorCode status = U_ZERO_ERROR;
    if (std::string_view(locale.getLanguage()) == "ar")
        locale.setKeywordValue("numbers", "latn", status);
    return locale;
}

} // namespace base
