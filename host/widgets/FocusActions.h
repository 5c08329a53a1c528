/**
 * @file
 * @brief What a press and a turn do to what has the focus.
 */
#pragma once

#include "FocusView.h"

namespace host {

/** @brief Does what a tap does. */
void activate(const FocusThing& thing);
/** @brief Does what a finger does that rests on a row. */
void hold(const FocusThing& row);
/** @brief Changes a value by some steps. */
void turn(const FocusThing& thing, int steps);
/** @brief Leads the toolkit's own focus after; characters and the end of a preview depend on it. */
void giveToolkitFocus(const FocusThing& thing);
/**
 * @brief Takes the toolkit's focus from a field or a slider, which do something while they have it.
 * @param taker Takes it, lest the toolkit gives it back to the field; may be null.
 */
void dropToolkitFocus(const Evas_Object* window, Evas_Object* taker);

} // namespace host
