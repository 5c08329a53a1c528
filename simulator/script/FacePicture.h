/**
 * @file
 * @brief Pictures of the face in files.
 */
#pragma once

#include <string>

#include "Device.h"

namespace simulator {

/** A picture of the face. */
struct FacePicture {
    int width = 0;
    int height = 0;
    std::string bytes; ///< Blue, green, red and opacity of each pixel, row by row.
};

/** @brief Takes a picture of what is in front. @return Empty, or why not. */
std::string takePicture(Device& device, FacePicture& picture);

/** @brief Makes what lies outside the circle transparent, with a soft edge. */
void cutRound(FacePicture& picture);

/** @brief Writes a PNG file. @return Empty, or why not. */
std::string writePng(const std::string& file, const FacePicture& picture);

} // namespace simulator
