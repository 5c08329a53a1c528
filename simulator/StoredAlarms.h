/**
 * @file
 * @brief What the list does to stored alarms.
 */
#pragma once

namespace simulator {

/**
 * @brief Switches a stored alarm on or off: its ring, its record, and the count of alarms.
 *
 * A toast tells when an alarm that was switched on rings. What cannot be done is logged, and
 * everything stays as it was.
 * @return True when it is on the disk.
 */
bool switchStoredAlarm(int id, bool on);

/** @brief Removes a stored alarm and its ring. @return False when it cannot be; it is logged. */
bool removeStoredAlarm(int id);

} // namespace simulator
