/**
 * @file
 * @brief Finds the application's themes and images by relative name.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Kinds of resources; themes are kept with the images. */
typedef enum {
    APP_RESOURCE_TYPE_IMAGE = 0,
} app_resource_e;

/** Result of a successful call; every failure is a negative number. */
#define APP_RESOURCE_ERROR_NONE 0
/** A null argument or an unknown kind. */
#define APP_RESOURCE_ERROR_INVALID_PARAMETER (-1)
/** No such resource, or the manager is not initialised. */
#define APP_RESOURCE_ERROR_NOT_FOUND (-2)

/** @brief Starts the resource manager; calls are counted. */
DEVICE_API int app_resource_manager_init(void);

/** @brief Ends one app_resource_manager_init(). */
DEVICE_API int app_resource_manager_release(void);

/**
 * @brief Looks up the absolute path of a resource.
 * @param type Kind of the resource.
 * @param id Relative name, for example "edje/AlarmEditViewController.edj".
 * @param[out] path Text to be freed with free(); set to null on failure.
 */
DEVICE_API int app_resource_manager_get(app_resource_e type, const char* id, char** path);

DEVICE_EXTERN_C_END
