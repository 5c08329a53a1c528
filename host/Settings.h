/**
 * @file
 * @brief What starting and ending the device must know of its settings.
 */
#pragma once

namespace host {

/** Runs the callbacks of changes that were made before, without waiting for the main loop. */
void deliverSettingChanges();

/** Drops every change callback. */
void forgetSettingCallbacks();

/** Drops who is told of volume changes. */
void forgetVolumeCallback();

/** Drops who shows taps, and ends the service that plays them. */
void endFeedback();

} // namespace host
