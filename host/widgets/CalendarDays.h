/**
 * @file
 * @brief Tells the days of calendars that have gone by.
 */
#pragma once

#include <ctime>

#include <Evas.h>

namespace host {

/** @brief Pales the days before today, as they are drawn in each month that a calendar shows. */
void paleDaysGoneBy(Evas_Object* calendar);

/**
 * @brief The cell of a day of the month that a calendar shows.
 * @param month Any day of that month.
 * @param firstWeekday 0 is Sunday.
 */
int cellOfDay(std::tm month, int day, int firstWeekday);

} // namespace host
