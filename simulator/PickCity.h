/**
 * @file
 * @brief The city picker as an application of its own.
 */
#pragma once

#include <string>

namespace app_assist {
class WContentViewController;
class WWindowController;
} // namespace app_assist

namespace simulator {

/** Name of the picker's window. */
inline constexpr const char* CITY_PICKER_NAME = "city-picker";

/** @brief Whether a program was started as the city picker, which is an application's id. */
bool isCityPicker(const std::string& program);

/**
 * @brief The picker's page; it answers the request that started this process, if there is one.
 *
 * A person who chooses without a request just closes the page.
 */
app_assist::WContentViewController* makeCityPicker();

/** @brief Puts a window over the caller's, and ends the main loop when the caller goes. */
void attachToCaller(const app_assist::WWindowController& window);

/** @brief Forgets the caller; before the window goes. */
void detachFromCaller();

} // namespace simulator
