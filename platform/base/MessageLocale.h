/**
 * @file
 * @brief The locale of the texts that a person sees.
 */
#pragma once

#include <string>

namespace base {

/**
 * @brief The locale in which gettext looks for the process's texts.
 * @return ICU locale id, for example "en_US" or "sr_Latn_RS"; "en" where nothing is translated.
 */
std::string messageLocale();

} // namespace base
