/**
 * @file
 * @brief Visibility of the clock common library.
 */
#pragma once

/** Marks a class or function that the library exports. */
#define CLOCK_COMMON_EXPORT __attribute__((visibility("default")))
