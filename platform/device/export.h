/**
 * @file
 * @brief Visibility of the device's C interfaces.
 */
#pragma once

#ifdef __cplusplus
#define DEVICE_EXTERN_C_BEGIN extern "C" {
#define DEVICE_EXTERN_C_END }
#else
#define DEVICE_EXTERN_C_BEGIN
#define DEVICE_EXTERN_C_END
#endif

/** Marks a function that the device (or its stand-in) exports. */
#define DEVICE_API __attribute__((visibility("default")))
