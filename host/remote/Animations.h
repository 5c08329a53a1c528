/**
 * @file
 * @brief The animations of a canvas.
 */
#pragma once

#include <Evas.h>

namespace host {

/** @brief Whether anything waits for the next frame of a canvas. */
bool isAnimated(Evas* canvas);

} // namespace host
