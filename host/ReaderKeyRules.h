/**
 * @file
 * @brief Keys as the accessibility bus has them.
 */
#pragma once

#include <cstdint>

namespace host {

/** Whether a key went down or up; the values are those of the accessibility bus. */
enum class KeyMove : std::uint32_t { Down = 0, Up = 1 };

/**
 * @brief The modifiers of a key as the accessibility bus counts them.
 * @param modifiers ECORE_EVENT_MODIFIER_*.
 * @return Bits of AtspiModifierType (libatspi's documentation); others are left out.
 */
std::int16_t readerModifiers(unsigned modifiers);

/** @brief Whether a text that a key types is one to be read: control characters are not. */
bool isReadable(const char* text);

} // namespace host
