/**
 * @file
 * @brief Pictures in memory and in files.
 */
#pragma once

#include <cstdint>
#include <string>
#include <vector>

/** A picture without transparency. */
struct Picture {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels; ///< 0xAARRGGBB, row by row.

    bool empty() const { return pixels.empty(); }
    bool save(const std::string& path) const;
    /** Reads a PNG file; empty when it cannot be read. */
    static Picture load(const std::string& path);
};

/** Greatest difference of a channel between approved pictures and what is drawn. */
inline constexpr int PICTURE_TOLERANCE = 24;
/** Greatest part of their pixels that may differ: less than a short word that has moved. */
inline constexpr double PICTURE_FRACTION = 0.0004;

/** What comparePictures() found. */
struct PictureDifference {
    double fraction = 1; ///< Part of the pixels that differ; 1 when the sizes do.
    Picture picture;     ///< Those pixels in red over a dim copy.
};

/**
 * @brief Compares as the eye does, not bit by bit.
 *
 * Another version of the font rasteriser moves edges by a part of a pixel: a pixel counts as equal
 * when it lies between the colours that the other picture has half a pixel around the same place,
 * or the other way round. What has moved by a pixel is unlike.
 * @param tolerance Greatest difference of a channel that counts as equal.
 */
PictureDifference comparePictures(const Picture& actual, const Picture& approved, int tolerance);
