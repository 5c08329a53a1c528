/**
 * @file
 * @brief What can be done to the device from outside the face, by the panel and by scripts.
 *
 * On the main loop. Keys and the bezel go to the application in front.
 */
#pragma once

#include <string>

namespace simulator {

class Foreground;
class QuickPanel;

/** @brief Presses a key and keeps it down. @param name As of an X key, for example "XF86Back". */
void pressKey(const std::string& name);
void releaseKey(const std::string& name);

/** @brief Turns the bezel by one detent; 1 = clockwise, -1 = back. */
void turnBezel(int direction);
void pressBezel();

/** @brief Names the panel that the two functions below move; null when it goes. */
void setQuickPanel(QuickPanel* panel);
void openQuickPanel();
void closeQuickPanel();

/** @brief Names who tells the clock application whether it is looked at; null when it goes. */
void setForeground(Foreground* foreground);
/** @brief Shows the time instead of the applications, and tells the clock that nobody looks. */
void goToBackground();
/** @brief Shows the applications again, and tells the clock that a person looks at it. */
void comeToForeground();
/** @brief Whether a person looks at the clock application. */
bool isInForeground();

} // namespace simulator
