/**
 * @file
 * @brief The words of a calendar.
 */
#pragma once

#include <ctime>
#include <string>

#include <Evas.h>

namespace host {

/**
 * @brief Writes the month and the names of the days in the language of the texts, now and after
 *        each change of it.
 *
 * The toolkit takes them from the locale of the C library, which often knows English alone.
 */
void followLanguageInCalendar(Evas_Object* calendar);

/** @brief A day in words, with its weekday, in the language of the texts. */
std::string dayText(const std::tm& day);

} // namespace host
