/**
 * @file
 * @brief What the display shows while nobody looks at any application: the time.
 */
#pragma once

#include <Ecore_Evas.h>

namespace host {

/**
 * @brief Covers a window with the time, or uncovers it.
 *
 * While it is covered, fingers, the bezel and keys do not reach what lies below; keys that only a
 * desktop's keyboard has, such as F6, do. The cover goes with its window.
 */
void showHome(Ecore_Evas* window, bool shown);

} // namespace host
