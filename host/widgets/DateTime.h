/**
 * @file
 * @brief The toolkit's date-time functions, taken over for time pickers.
 */
#pragma once

namespace host {

/**
 * @brief Tells whether the program calls the device's date-time functions.
 *
 * It does not when the toolkit comes before the device library in its link order: pickers would
 * then be handed to functions that do not know them.
 */
bool dateTimeIsInterposed();

} // namespace host
