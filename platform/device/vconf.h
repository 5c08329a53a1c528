/**
 * @file
 * @brief The device's key-value store of settings.
 *
 * A key is a slash-separated name. Keys below "db/" outlive a restart of the device, keys below
 * "memory/" live until the device restarts. A value has one type; reading it as another type fails.
 * Change callbacks run on the main loop.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Result of a successful call; every failure is a negative number. */
#define VCONF_OK 0
/** The call failed: the key is missing, malformed, unreadable, or the argument is null. */
#define VCONF_ERROR (-1)
/** The key holds a value of another type. */
#define VCONF_ERROR_WRONG_TYPE (-2)

/** A changed key, valid only during the callback that receives it. */
typedef struct keynode_s keynode_t;

/**
 * @brief Called after the value of a watched key has changed.
 * @param node The changed key.
 * @param data The pointer given to vconf_notify_key_changed().
 */
typedef void (*vconf_callback_fn)(keynode_t* node, void* data);

/** @brief Reads an integer key. @param[out] value Left untouched on failure. */
DEVICE_API int vconf_get_int(const char* key, int* value);

/** @brief Reads a boolean key as 0 or 1. @param[out] value Left untouched on failure. */
DEVICE_API int vconf_get_bool(const char* key, int* value);

/** @brief Reads a string key. @return Text to be freed with free(), or null on failure. */
DEVICE_API char* vconf_get_str(const char* key);

/** @brief Writes an integer key, creating it if it is missing. */
DEVICE_API int vconf_set_int(const char* key, int value);

/** @brief Writes a boolean key, creating it if it is missing. */
DEVICE_API int vconf_set_bool(const char* key, int value);

/** @brief Writes a string key, creating it if it is missing. */
DEVICE_API int vconf_set_str(const char* key, const char* value);

/**
 * @brief Asks for a callback whenever a key changes, in this or in another process.
 * @param key Name of the key; it need not exist yet.
 * @param callback Function to run; one key may have several.
 * @param data Passed to the callback; not owned.
 */
DEVICE_API int vconf_notify_key_changed(const char* key, vconf_callback_fn callback, void* data);

/** @brief Name of a changed key, owned by the node. */
DEVICE_API const char* vconf_keynode_get_name(const keynode_t* node);

DEVICE_EXTERN_C_END
