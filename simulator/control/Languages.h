/**
 * @file
 * @brief The languages that the watch speaks.
 */
#pragma once

#include <array>
#include <string>

namespace simulator {

struct Language {
    const char* code; ///< As the catalogues are named: "de", "pt_BR".
    const char* name; ///< In the language itself.
};

/** By their code; English first. */
inline constexpr std::array<Language, 14> LANGUAGES{{
    {"en", "English"},
    {"ar", "العربية"},
    {"de", "Deutsch"},
    {"es", "Español"},
    {"fr", "Français"},
    {"hi", "हिन्दी"},
    {"it", "Italiano"},
    {"ja", "日本語"},
    {"ko", "한국어"},
    {"pl", "Polski"},
    {"pt_BR", "Português (BR)"},
    {"ru", "Русский"},
    {"tr", "Türkçe"},
    {"zh_CN", "简体中文"},
}};

/**
 * @brief The language whose texts a locale gets: that of its full name, else of its language.
 * @param locale For example "pt_BR", "de_AT" or "en_US.UTF-8".
 * @return Null for one that the watch does not speak.
 */
const Language* languageOf(const std::string& locale);

} // namespace simulator
