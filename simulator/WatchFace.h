/**
 * @file
 * @brief The round face.
 */
#pragma once

#include <Evas.h>

namespace simulator {

/** Width and height of the display in pixels. */
inline constexpr int FACE_SIZE = 360;

/**
 * @brief Covers what lies outside the circle with the body of the watch.
 * @param window The window, FACE_SIZE pixels square; owns the cover, which lets input through.
 */
void addBezel(Evas_Object* window);

} // namespace simulator
