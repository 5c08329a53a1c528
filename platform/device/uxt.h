/**
 * @file
 * @brief Widget extension: the date-time picker and styled buttons.
 */
#pragma once

#include <Evas.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/**
 * @brief Adds a time picker.
 *
 * The picker answers to elm_object_style_set(), elm_datetime_value_set(),
 * elm_datetime_value_get() and elm_datetime_format_set(), and raises "changed" whenever a person
 * has turned one of its wheels to another value. Setting its value raises nothing.
 * @param style "time_layout" for 12 hours with a half-day wheel, "time_layout_24hr" for 24 hours.
 * @return The picker, owned by its parent, or null on failure.
 */
DEVICE_API Evas_Object* uxt_date_time_add(Evas_Object* parent, const char* style);

/**
 * @brief Shows a picker in the form of a locale.
 * @param locale ICU or POSIX locale id; null for the current one.
 * @param is_24hour 1 for 24 hours, 0 for 12.
 */
DEVICE_API void uxt_date_time_set_format_by_locale(Evas_Object* picker, const char* locale,
                                                   int is_24hour);

/**
 * @brief Adds a styled button.
 * @param style Style name, for example "on_gradient_bg".
 * @return An elm_button, owned by its parent, or null on failure.
 */
DEVICE_API Evas_Object* uxt_button_add(Evas_Object* parent, const char* style);

/** Kinds of edit fields of uxt_edit_field_layout_add(). */
typedef enum {
    UXT_EDIT_FIELD_SEARCH = 5, /**< One line to search with. */
} uxt_edit_field_type_e;

/**
 * @brief Adds an edit field: an entry with a ground of its own and room for a clear button.
 * @param type One of #uxt_edit_field_type_e.
 * @return A layout, owned by its parent, or null on failure.
 */
DEVICE_API Evas_Object* uxt_edit_field_layout_add(Evas_Object* parent, int type);

/**
 * @brief Shows a button that empties the entry while there is text in it, or does not.
 *
 * The button keeps the entry focused.
 */
DEVICE_API void uxt_edit_field_set_clear_button_enabled(Evas_Object* edit_field, Eina_Bool enabled);

/** @brief The entry of an edit field; owned by it. Null when it is none. */
DEVICE_API Evas_Object* uxt_edit_field_layout_get_entry(Evas_Object* edit_field);

DEVICE_EXTERN_C_END
