/**
 * @file
 * @brief The language of the device on this machine.
 *
 * It is the one of the setting "db/setting/language", or that of the environment where this is
 * empty. CLOCK_LANGUAGE comes before both until the setting is changed.
 */
#pragma once

#include <string>

namespace host {

/** Takes the locale from the environment; where that has none, C in UTF-8. */
void applyLocale();

/**
 * @brief Makes "clock" the default text domain, and the process speak the device's language.
 *
 * English is the last choice of every language.
 * @param catalogues Folder of the message catalogues.
 */
void bindTexts(const std::string& catalogues);

/**
 * @brief Makes the toolkit write in the direction of the language, and follows its setting.
 *
 * Who watches the setting after this call is told when texts, direction and dates are already
 * those of the new language.
 */
void followLanguage();

/** The languages of the environment, for programs that this one starts. */
std::string environmentLanguages();

/** Leaves the environment as it was before bindTexts(). */
void forgetLanguage();

} // namespace host
