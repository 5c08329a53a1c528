#include <dlfcn.h>

#include <Elementary.h>

#include "Accessible.h"
#include "CalendarDays.h"
#include "CalendarTexts.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The arrows of the toolkit's calendar have no names, and its words are the C library's. This
// function comes before the toolkit's own.

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
    return calendar;
}

DEVICE_EXTERN_C_END
