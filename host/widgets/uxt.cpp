#include "device/uxt.h"

#include <Elementary.h>

#include "TimePicker.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

Evas_Object* uxt_date_time_add(Evas_Object* parent, const char* style) {
    if (!parent) {
        LOG_ERROR("A time picker needs a parent");
        return nullptr;
    }
    return host::TimePicker::create(parent, style);
}

void uxt_date_time_set_format_by_locale(Evas_Object* picker, const char* locale, int is_24hour) {
    if (host::TimePicker* timePicker = host::TimePicker::of(picker))
        timePicker->setLocale(locale, is_24hour != 0);
    else
        LOG_ERROR("%p is no time picker", static_cast<void*>(picker));
}

Evas_Object* uxt_button_add(Evas_Object* parent, const char* style) {
    Evas_Object* button = parent ? elm_button_add(parent) : nullptr;
    if (!button) {
        LOG_ERROR("A button needs a parent");
        return nullptr;
    }
    if (style && !elm_object_style_set(button, style))
        LOG_WARNING("The theme has no button style %s", style);
    return button;
}
