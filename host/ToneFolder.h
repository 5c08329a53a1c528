/**
 * @file
 * @brief The device's tones, which this machine keeps in a folder of its own.
 */
#pragma once

#include <string>
#include <string_view>

namespace host {

/** The tone folder as applications on the device name it. */
inline constexpr std::string_view DEVICE_TONE_FOLDER = "/opt/usr/share/settings/Ringtones";

/**
 * @brief Where a file of the device is on this machine.
 *
 * Paths in the device's tone folder lead to CLOCK_TONE_DIR, else to the tones that were built; all
 * others are as they are.
 */
std::string pathHere(std::string_view devicePath);

} // namespace host
