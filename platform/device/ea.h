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

/**
 * @brief Reads a colour of the theme.
 * @param name Name of a colour class, for example "T1067".
 * @param[out] r, g, b, a Colour, 0 to 255 each, not premultiplied; each may be null.
 * @param[out] r2, g2, b2, a2 Outline colour; each may be null.
 * @param[out] r3, g3, b3, a3 Shadow colour; each may be null.
 * @return False when the theme has no such colour; what the pointers lead to is then untouched.
 */
DEVICE_API Eina_Bool ea_theme_color_get(const char* name, int* r, int* g, int* b, int* a, int* r2,
                                        int* g2, int* b2, int* a2, int* r3, int* g3, int* b3,
                                        int* a3);

DEVICE_EXTERN_C_END
