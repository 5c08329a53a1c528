/**
 * @file
 * @brief An animated picture in a file.
 */
#pragma once

#include <memory>
#include <string>

#include "FacePicture.h"

namespace simulator {

/** Collects pictures, and writes an animated WebP file without loss. */
class AnimatedPicture {
public:
    /** @param width, height Of every picture. */
    AnimatedPicture(int width, int height);
    ~AnimatedPicture();
    AnimatedPicture(const AnimatedPicture&) = delete;
    AnimatedPicture& operator=(const AnimatedPicture&) = delete;

    /** @brief Shows a picture from a time on. @return Empty, or why not. */
    std::string add(const FacePicture& picture, double seconds);
    /** @brief Writes the file. @param seconds How long all of it lasts. @return As add(). */
    std::string write(const std::string& file, double seconds);

private:
    struct Encoder;
    std::unique_ptr<Encoder> _encoder;
};

} // namespace simulator
