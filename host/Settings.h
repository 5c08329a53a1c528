/**
 * @file
 * @brief What starting and ending the device must know of its settings.
 */
#pragma once

namespace host {

/** Drops every change callback. */
void forgetSettingCallbacks();

} // namespace host
