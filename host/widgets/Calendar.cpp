#include <ctime>

#include <dlfcn.h>

#include <Elementary.h>

#include "Accessible.h"
#include "CalendarDays.h"
#include "CalendarTexts.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The arrows of the toolkit's calendar have no names, nor has its day, and its words are the C
// library's. These functions come before the toolkit's own.

namespace {

/** Screen readers are told the day. */
void dayChanged(void*, Evas_Object* calendar, void*) {
    std::tm day{};
    if (elm_calendar_selected_time_get(calendar, &day))
        host::setReadName(calendar, host::dayText(day));
}

} // namespace

DEVICE_EXTERN_C_BEGIN

DEVICE_API Evas_Object* elm_calendar_add(Evas_Object* parent) {
    static const auto stock =
        reinterpret_cast<decltype(&elm_calendar_add)>(dlsym(RTLD_NEXT, "elm_calendar_add"));
    Evas_Object* calendar = stock && parent ? stock(parent) : nullptr;
    if (!calendar) {
        LOG_ERROR("A calendar needs a parent");
        return nullptr;
    }
    const struct {
        const char* part;
        const char* textId;
    } arrows[] = {{"elm,calendar,button,left", "IDS_ACC_BODY_PREVIOUS_MONTH"},
                  {"elm,calendar,button,right", "IDS_ACC_BODY_NEXT_MONTH"}};
    for (const auto& [part, textId] : arrows)
        if (Evas_Object* arrow = elm_layout_content_get(calendar, part))
            host::setReadTextId(arrow, textId);
    host::followLanguageInCalendar(calendar);
    host::paleDaysGoneBy(calendar);
    for (const char* event : {"changed", "language,changed"})
        evas_object_smart_callback_add(calendar, event, dayChanged, nullptr);
    dayChanged(nullptr, calendar, nullptr);
    return calendar;
}

DEVICE_API void elm_calendar_selected_time_set(Evas_Object* calendar, std::tm* day) {
    static const auto stock = reinterpret_cast<decltype(&elm_calendar_selected_time_set)>(
        dlsym(RTLD_NEXT, "elm_calendar_selected_time_set"));
    if (!stock || !calendar || !day) {
        LOG_ERROR("A calendar and a day are needed");
        return;
    }
    stock(calendar, day);
    dayChanged(nullptr, calendar, nullptr);
}

DEVICE_EXTERN_C_END
