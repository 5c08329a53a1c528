/**
 * @file
 * @brief A finger, a bezel and keys: input events as a display sends them.
 */
#pragma once

#include <string>

namespace host {

/** What happens to a button or a key. */
enum class Press { Down, Up };

/** @brief Moves the pointer, which a button may hold down. Pixels of the face. */
void movePointer(int x, int y);
/** @brief Presses or releases a button of the pointer at a place; 1 is the finger. */
void pressPointer(int button, Press press, int x, int y);
/** @brief Turns the bezel by one detent; positive = clockwise, which moves lists on. */
void turnBezel(int direction, int x, int y);
/** @brief Presses or releases a key. @param text What the key writes, UTF-8; may be empty. */
void pressKey(const std::string& name, const std::string& text, Press press);

} // namespace host
