/**
 * @file
 * @brief The fonts of languages that share characters and draw them differently.
 */
#pragma once

#include <string>

namespace host {

/**
 * @brief Lets the toolkit choose fonts by "fonts.conf" of a folder; before it draws the first text.
 *
 * A choice that the environment has made already (FONTCONFIG_FILE) stays.
 */
void chooseFonts(const std::string& folder);

/**
 * @brief Draws every text in the forms of a language, now and from now on.
 * @param locale Such as "ja" or "zh_CN". Languages whose characters no other one shares need none.
 */
void setFontLanguage(const std::string& locale);

} // namespace host
