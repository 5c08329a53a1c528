/**
 * @file
 * @brief What the face looks like.
 */
#pragma once

#include <string>

namespace host {

/** A picture of a face. */
struct FacePixels {
    int width = 0;
    int height = 0;
    std::string bytes; ///< Blue, green, red, unused for each pixel, row by row.
};

/**
 * @brief The face of this process as it is drawn now; without pixels when there is none.
 *
 * On a display it is what the display shows of the window, so nothing may lie above it there unless
 * the display keeps windows apart.
 */
FacePixels facePixels();

} // namespace host
