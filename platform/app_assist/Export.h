/**
 * @file
 * @brief Visibility of the view framework.
 */
#pragma once

/** Marks a class or function that the library exports. */
#define APP_ASSIST_EXPORT __attribute__((visibility("default")))
