/**
 * @file
 * @brief Who would get the back key.
 */
#pragma once

#include <Evas.h>

namespace host {

/** @brief What the back key would close in a window: a page stack, a popup; null for nothing. */
Evas_Object* backKeyObject(const Evas_Object* window);

} // namespace host
