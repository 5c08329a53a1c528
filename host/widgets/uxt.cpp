#include "device/uxt.h"

#include <Elementary.h>

#include "EditField.h"
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

Evas_Object* uxt_edit_field_layout_add(Evas_Object* parent, int type) {
    if (!parent) {
        LOG_ERROR("An edit field needs a parent");
        return nullptr;
    }
    if (type != UXT_EDIT_FIELD_SEARCH) {
        LOG_ERROR("There is no edit field of type %d", type);
        return nullptr;
    }
    return host::addSearchField(parent);
}

void uxt_edit_field_set_clear_button_enabled(Evas_Object* edit_field, Eina_Bool enabled) {
    if (host::entryOfField(edit_field))
        host::setClearButton(edit_field, enabled != EINA_FALSE);
    else
        LOG_ERROR("%p is no edit field", static_cast<void*>(edit_field));
}

Evas_Object* uxt_edit_field_layout_get_entry(Evas_Object* edit_field) {
    Evas_Object* entry = host::entryOfField(edit_field);
    if (!entry)
        LOG_ERROR("%p is no edit field", static_cast<void*>(edit_field));
    return entry;
}
