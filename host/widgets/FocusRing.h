/**
 * @file
 * @brief Shows where the focus is.
 */
#pragma once

#include "FocusView.h"

namespace host {

/** @brief Rings a thing. @param turning Steps change its value. */
void showRing(const FocusThing& thing, bool turning);
void hideRing(const FocusThing& thing);

} // namespace host
