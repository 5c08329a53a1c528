/**
 * @file
 * @brief Screen readers.
 */
#pragma once

#include <optional>
#include <string>

namespace host {

/**
 * @brief Where the session's bus is: what DBUS_SESSION_BUS_ADDRESS says, or else "bus" in
 *        XDG_RUNTIME_DIR.
 * @return Nothing when it is a path and there is nothing at it.
 */
std::optional<std::string> sessionBus();

/**
 * @brief Lets screen readers of the desktop read the windows.
 *
 * Costs nothing and says nothing where there is no session that could have one; else the toolkit
 * asks the session whether a screen reader is on, and again whenever that changes.
 */
void followScreenReaders();

} // namespace host
