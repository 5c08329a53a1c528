/**
 * @file
 * @brief Translations of the clock's texts.
 */
#pragma once

#include <libintl.h>

/** Text domain of the clock's message catalogues. */
inline constexpr const char* CLOCK_TEXT_DOMAIN = "clock";

/** @brief The translation of a message identifier ("IDS_..."), owned by the catalogue. */
inline const char* clockText(const char* id) {
    return dgettext(CLOCK_TEXT_DOMAIN, id);
}
