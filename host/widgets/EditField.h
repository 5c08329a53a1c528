/**
 * @file
 * @brief Edit fields: an entry on a ground of its own, with a button that empties it.
 */
#pragma once

#include <Elementary.h>

namespace host {

/** A scrollable entry as all edit fields have it; null without a parent. */
Evas_Object* addEntry(Evas_Object* parent, bool singleLine);

/** @return A layout, which owns its entry; null when the theme has none. */
Evas_Object* addSearchField(Evas_Object* parent);

/** The entry of a layout that addSearchField() made; null for any other object. */
Evas_Object* entryOfField(const Evas_Object* field);

/** Gives a field its clear button or takes it away. */
void setClearButton(Evas_Object* field, bool enabled);

} // namespace host
