/**
 * @file
 * @brief Toasts and posted notifications.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Result of a successful call; every failure is a negative number. */
#define NOTIFICATION_ERROR_NONE 0
/** A null argument or a tag that cannot be a tag. */
#define NOTIFICATION_ERROR_INVALID_PARAMETER (-1)
/** Nothing is posted under the tag. */
#define NOTIFICATION_ERROR_NOT_EXIST_ID (-2)
/** The notification store cannot be written. */
#define NOTIFICATION_ERROR_IO_ERROR (-3)

/**
 * @brief Shows a toast: one sentence that goes away by itself.
 * @param message UTF-8 text; copied.
 */
DEVICE_API int notification_status_message_post(const char* message);

/**
 * @brief Posts a notification that stays until it is removed.
 * @param tag Name to remove it by; posting a tag again replaces the earlier one.
 * @param text UTF-8 text; copied.
 */
DEVICE_API int notification_post_with_tag(const char* tag, const char* text);

/** @brief Removes the notification posted under a tag. */
DEVICE_API int notification_delete_by_tag(const char* tag);

DEVICE_EXTERN_C_END
