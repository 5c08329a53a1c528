/**
 * @file
 * @brief The window of this process that a person looks at.
 */
#pragma once

#include <Ecore_Evas.h>

namespace host {

/** @return Null while no window is shown. */
Ecore_Evas* faceWindow();

/** Whether a window draws into memory, with no display behind it. */
bool isInMemory(const Ecore_Evas* window);

} // namespace host
