/**
 * @file
 * @brief Widget extension: theme colours and edit fields.
 */
#pragma once

#include <Evas.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Kinds of edit fields of ea_editfield_add(). */
typedef enum {
    EA_EDITFIELD_MULTILINE = 0,
    EA_EDITFIELD_SEARCHBAR = 1,
    EA_EDITFIELD_SINGLELINE = 2,
} ea_editfield_type_e;

/**
 * @brief Replaces one colour class of an object by another one.
 * @param from Name of the colour class to replace, for example "B0211".
 * @param to Name of the new one; "transparent" hides what is drawn in the class.
 */
DEVICE_API void ea_theme_object_color_replace(Evas_Object* obj, const char* from, const char* to);

/**
 * @brief Adds a styled entry.
 * @param type One of #ea_editfield_type_e.
 * @return An elm_entry, owned by its parent, or null on failure.
 */
DEVICE_API Evas_Object* ea_editfield_add(Evas_Object* parent, ea_editfield_type_e type);

DEVICE_EXTERN_C_END
