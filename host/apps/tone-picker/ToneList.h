/**
 * @file
 * @brief The tones of a folder.
 */
#pragma once

#include <string>
#include <vector>

namespace tone_picker {

/** One tone. */
struct Tone {
    std::string file;  ///< Name in its folder.
    std::string title; ///< What a person reads; never empty.
};

/**
 * @brief The sound files of a folder, sorted by their titles as the language sorts.
 *
 * A tone without a title has its file's name without extension. Hidden files, folders and files
 * that are no sound are left out; a folder that cannot be read has none.
 * @param folder Path as the device names it.
 */
std::vector<Tone> tonesIn(const std::string& folder);

/** @brief The place of a tone in a list, or -1. @param path As the device names the file. */
int positionOf(const std::vector<Tone>& tones, const std::string& folder, const std::string& path);

/** @brief The path of a file in a folder, with one slash between them. */
std::string join(const std::string& folder, const std::string& file);

} // namespace tone_picker
