/**
 * @file
 * @brief Taps that the wearer feels.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Result of a successful call; every failure is a negative number. */
#define FEEDBACK_ERROR_NONE 0
/** Unknown pattern. */
#define FEEDBACK_ERROR_INVALID_PARAMETER (-1)
/** feedback_initialize() was not called. */
#define FEEDBACK_ERROR_NOT_INITIALIZED (-2)

/** What is felt. */
typedef enum {
    FEEDBACK_PATTERN_TAP = 0, /**< One short tap. */
} feedback_pattern_e;

/** @brief Prepares the service; may be called again. */
DEVICE_API int feedback_initialize(void);

/** @brief Plays a pattern; returns at once. */
DEVICE_API int feedback_play(feedback_pattern_e pattern);

DEVICE_EXTERN_C_END
