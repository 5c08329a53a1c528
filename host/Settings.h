/**
 * @file
 * @brief What starting and ending the device must know of its settings.
 */
#pragma once

namespace host {

/** Drops every change callback. */
void forgetSettingCallbacks();

/** Drops who is told of volume changes. */
void forgetVolumeCallback();

/** Drops who shows taps, and ends the service that plays them. */
void endFeedback();

} // namespace host
