/**
 * @file
 * @brief The tone files of a test's device and what they say about themselves.
 *
 * Below the device's tone folder there are only the files that the test has added, and the default
 * tone. Elsewhere there are those of this machine as well.
 */
#pragma once

#include <cstddef>
#include <optional>
#include <string>

namespace tones {

/** Adds a file. @param title Its title; it has none by default. */
void add(const std::string& path, std::optional<std::string> title = std::nullopt);
void remove(const std::string& path);
/** Number of readers that were made and not destroyed. */
std::size_t unreleased();
/** Leaves only the default tone, without a title; part of DeviceFake::reset(). */
void reset();

} // namespace tones
