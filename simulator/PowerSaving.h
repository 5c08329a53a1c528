/**
 * @file
 * @brief The device's ultra power saving mode.
 */
#pragma once

namespace simulator {

/** @brief Switches the mode. @return False when the setting cannot be written. */
bool setPowerSaving(bool on);

/** @brief Whether the mode is on. */
bool isPowerSaving();

/** @brief Switches the mode over and lets the application notice. */
void togglePowerSaving();

} // namespace simulator
