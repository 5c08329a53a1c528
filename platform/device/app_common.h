/**
 * @file
 * @brief Folders that the device gives to the application.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/**
 * @brief The folder in which the application keeps its data.
 * @return Absolute path with a trailing slash, to be freed with free(); null when there is none.
 */
DEVICE_API char* app_get_data_path(void);

DEVICE_EXTERN_C_END
