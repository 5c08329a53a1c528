/**
 * @file
 * @brief What the application hears of the device's settings.
 */
#pragma once

namespace simulator {

/** @brief Raises the application's events for changes of settings, whoever makes them. */
void followSettings();

} // namespace simulator
