/**
 * @file
 * @brief Screen readers.
 */
#pragma once

namespace host {

/**
 * @brief Lets screen readers of the desktop read the windows.
 *
 * Costs nothing and says nothing where there is no session that could have one; else the toolkit
 * asks the session whether a screen reader is on, and again whenever that changes.
 */
void followScreenReaders();

} // namespace host
