/**
 * @file
 * @brief Whether the device moves what it shows.
 *
 * The setting "db/setting/motion" (integer, 0 = off, on when it is missing) decides, and ultra
 * power saving switches it off too. Without motion every transition ends at once in the state that
 * it would have ended in.
 */
#pragma once

namespace host {

/** Makes the toolkit follow the settings. */
void followMotion();

/** False when things have to change without moving. */
bool isMotionOn();

} // namespace host
