/**
 * @file
 * @brief The round face.
 */
#pragma once

#include <Evas.h>

namespace simulator {

/** Width and height of the display in pixels. */
inline constexpr int FACE_SIZE = 360;

/** What the system draws lies above all that the application draws; toasts and the body follow. */
inline constexpr short LAYER_SYSTEM = EVAS_LAYER_MAX - 2;
inline constexpr short LAYER_TOAST = EVAS_LAYER_MAX - 1;

} // namespace simulator
