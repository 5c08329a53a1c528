/**
 * @file
 * @brief Visibility of the screens.
 */
#pragma once

/** Marks a class or function that the library exports. */
#define CLOCK_UI_EXPORT __attribute__((visibility("default")))
