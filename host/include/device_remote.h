/**
 * @file
 * @brief Using the device's applications from another process, as scripts and tests do.
 *
 * Each program of a device listens in one folder. The one that came last is in front.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/**
 * @brief The folder below which every simulated device of this runtime folder has one of its own.
 * @return To be freed with free().
 */
DEVICE_API char* device_remote_folder(void);

/**
 * @brief Makes this process, and the applications that it starts from now on, listen in a folder.
 *
 * After the toolkit's start. device_host_init_toolkit() does it for a started application.
 * @param folder An existing folder of the user's own; null to listen no longer.
 * @return 0, or a negative errno.
 */
DEVICE_API int device_remote_listen(const char* folder);

/**
 * @brief Answers a request that only this program knows.
 * @param words The request's words.
 * @param count Number of words; at least 1.
 * @return Null when the request was done; otherwise why not, or with a leading "=" what was asked
 *         for. The device frees it with free().
 */
typedef char* (*device_remote_request_cb)(const char* const* words, int count, void* data);

/** @brief Sets who answers such requests; null for nobody. */
DEVICE_API void device_remote_set_request_callback(device_remote_request_cb callback, void* data);

/**
 * @brief Sends a request to the application in front, which may be another process.
 * @param words As its own agent understands them, for example "key", "XF86Back", "down".
 * @return 0, or a negative errno. What becomes of it is not told.
 */
DEVICE_API int device_remote_send(const char* const* words, int count);

/**
 * @brief Sends a request to every application of the device, this one included.
 * @return 0, or the last negative errno; the others have got it then.
 */
DEVICE_API int device_remote_send_to_all(const char* const* words, int count);

DEVICE_EXTERN_C_END
