#include "CalendarDays.h"

#include <string>

#include <Elementary.h>

#include "ThemeNames.h"

namespace host {

namespace {

constexpr int DAYS_OF_WEEK = 7;
constexpr int MONTHS_OF_YEAR = 12;
constexpr int CELLS = 42;

int monthsOf(const std::tm& time) {
    return time.tm_year * MONTHS_OF_YEAR + time.tm_mon;
}

int lengthOfMonth(std::tm month) {
    ++month.tm_mon;
    month.tm_mday = 0;
    month.tm_hour = 12;
    timegm(&month);
    return month.tm_mday;
}

/** How many days of a month lie before today. */
int daysGoneBy(const std::tm& month) {
    const std::time_t now = std::time(nullptr);
    std::tm today{};
    localtime_r(&now, &today);
    if (monthsOf(month) == monthsOf(today))
        return today.tm_mday - 1;
    return monthsOf(month) < monthsOf(today) ? lengthOfMonth(month) : 0;
}

void tellCells(Evas_Object* calendar) {
    std::tm month{};
    if (!elm_calendar_displayed_time_get(calendar, &month))
        return;
    const int first =
        cellOfDay(month, 1, static_cast<int>(elm_calendar_first_day_of_week_get(calendar)));
    const int coming = first + daysGoneBy(month);
    for (int cell = 0; cell < CELLS; ++cell) {
        const bool isPast = cell >= first && cell < coming;
        const std::string signal = "cit_" + std::to_string(cell) + (isPast ? ",past" : ",coming");
        elm_layout_signal_emit(calendar, signal.c_str(), theme::SIGNAL_SOURCE);
    }
}

void monthChanged(void*, Evas_Object* calendar, void*) {
    tellCells(calendar);
}

void calendarShown(void*, Evas*, Evas_Object* calendar, void*) {
    tellCells(calendar);
}

} // namespace

int cellOfDay(std::tm month, int day, int firstWeekday) {
    month.tm_mday = 1;
    month.tm_hour = 12;
    timegm(&month);
    return (month.tm_wday - firstWeekday + DAYS_OF_WEEK) % DAYS_OF_WEEK + day - 1;
}

void paleDaysGoneBy(Evas_Object* calendar) {
    evas_object_event_callback_add(calendar, EVAS_CALLBACK_SHOW, calendarShown, nullptr);
    for (const char* event : {"display,changed", "changed"})
        evas_object_smart_callback_add(calendar, event, monthChanged, nullptr);
}

} // namespace host
