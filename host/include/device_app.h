/**
 * @file
 * @brief What a program needs that other applications start.
 *
 * The functions of <device/app_control.h> answer the request; these tell what it says. A program
 * that a person has started has no request, and every function here copes with that.
 */
#pragma once

#include <stdbool.h>

#include <Evas.h>

#include <device/app_control.h>

DEVICE_EXTERN_C_BEGIN

/**
 * @brief The request that started this process, read at the first call.
 *
 * Waits a few seconds at most for a caller that is slow to send it.
 * @return Owned by the device and valid until the process ends; null when a person started the
 * program.
 */
DEVICE_API app_control_h device_app_launch_request(void);

/** @brief Called once on the main loop. @param data As it was given. */
typedef void (*device_app_caller_gone_cb)(void* data);

/**
 * @brief Sets who is told that the caller has ended or wants no answer any more; null for nobody.
 *
 * Nobody is told after the request was answered.
 */
DEVICE_API void device_app_set_caller_gone_callback(device_app_caller_gone_cb callback, void* data);

/**
 * @brief Where a file of the device is on this machine.
 * @param path As applications on the device name it.
 * @param[out] local_path To be freed with free().
 */
DEVICE_API int device_app_get_local_path(const char* path, char** local_path);

/**
 * @brief Places a window where the caller's is and keeps it above that one, if the caller asked to
 * have the application on top of it.
 * @param window A window of the toolkit that is not shown yet.
 */
DEVICE_API void device_app_place_window(Evas_Object* window);

/**
 * @brief Covers what lies outside the round face with the body of the watch.
 * @param window Owns the cover, which lets input through.
 */
DEVICE_API void device_app_add_bezel(Evas_Object* window);

/** @brief The application that a request names. @param[out] app_id To be freed with free(). */
DEVICE_API int device_app_get_app_id(app_control_h request, char** app_id);

/** @brief What a request asks for, or an empty text. @param[out] operation Free with free(). */
DEVICE_API int device_app_get_operation(app_control_h request, char** operation);

/** @brief How a request wants the application to be shown. */
DEVICE_API int device_app_get_launch_mode(app_control_h request, app_control_launch_mode_e* mode);

/** @brief Gets one text of a request. @return False to see no more of them. */
typedef bool (*device_app_extra_cb)(const char* key, const char* value, void* data);

/** @brief Goes through the texts of a request or reply in the order in which they were added. */
DEVICE_API int device_app_foreach_extra_data(app_control_h app_control,
                                             device_app_extra_cb callback, void* data);

DEVICE_EXTERN_C_END
