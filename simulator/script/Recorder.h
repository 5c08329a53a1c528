/**
 * @file
 * @brief Recordings of the face, which go on while commands run.
 *
 * A recorder is a process of its own, so that drawing pictures into a file never holds up the face,
 * and a recording may be begun by one command line and ended by the next.
 */
#pragma once

#include <string>

namespace simulator {

/** Most and fewest pictures a second. */
inline constexpr int RECORD_MOST = 60;
inline constexpr int RECORD_LEAST = 1;
inline constexpr int RECORD_USUAL = 30;

/** @brief Begins. @param folder Where the watch's applications listen. @return Empty, or why not.
 */
std::string startRecording(const std::string& folder, const std::string& file,
                           int picturesPerSecond);

/** @brief Ends, and waits until the file is written. @return Empty, or why it was not. */
std::string stopRecording(const std::string& folder);

} // namespace simulator
