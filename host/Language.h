/**
 * @file
 * @brief The language of the device on this machine.
 */
#pragma once

#include <string>

namespace host {

/** Takes the locale from the environment; where that has none, C in UTF-8. */
void applyLocale();

/**
 * @brief Makes English the last choice of every language, and "clock" the default text domain.
 * @param catalogues Folder of the message catalogues.
 */
void bindTexts(const std::string& catalogues);

} // namespace host
