/**
 * @file
 * @brief An ordinary Linux desktop as the device: starting and observing it.
 *
 * Only programs call this; libraries use the interfaces of <device/...>.
 */
#pragma once

#include <stddef.h>
#include <stdint.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Where the device keeps things. Every null or empty member means its default. */
typedef struct {
    /** Settings and application data. Default: CLOCK_DATA_DIR, else below XDG_DATA_HOME. */
    const char* data_dir;
    /** State until the next restart. Default: CLOCK_RUNTIME_DIR, else below XDG_RUNTIME_DIR. */
    const char* runtime_dir;
    /** Themes and catalogues. Default: CLOCK_RESOURCE_DIR, else where they were built to. */
    const char* resource_dir;
} device_host_config_s;

/**
 * @brief Prepares the folders and the language; before the toolkit is initialised.
 *
 * Creates missing folders, checks that they can be written, sets the locale from the environment,
 * binds the text domain "clock" as the default one, and speaks the language of CLOCK_LANGUAGE, of
 * the setting "db/setting/language", or of the environment: the first of them that is not empty,
 * with English as the language of last resort.
 * @param config May be null.
 * @param[out] error Gets one sentence about what is unusable and why; null = it is logged.
 * @return 0, or a negative number.
 */
DEVICE_API int device_host_init(const device_host_config_s* config, char* error, size_t error_size);

/**
 * @brief Gives the toolkit the device's look and feel; after elm_init(), before the first window.
 *
 * From here on the language's setting is followed. Who watches it after this call is told when
 * texts, dates and the direction of the toolkit are already those of the new language.
 * @return 0, or a negative number when the theme is missing or the toolkit's date-time functions
 *         come before the device's in the program's link order.
 */
DEVICE_API int device_host_init_toolkit(void);

/** @brief Ends what the two functions above started. */
DEVICE_API void device_host_shutdown(void);

/** @brief Receives the text of every toast. */
typedef void (*device_host_toast_cb)(const char* message, void* data);

/** @brief Sets who shows toasts, besides their log line; null for nobody. */
DEVICE_API void device_host_set_toast_callback(device_host_toast_cb callback, void* data);

/** @brief Receives the pattern of every tap that the wearer would feel; see <device/feedback.h>. */
typedef void (*device_host_haptic_cb)(int pattern, void* data);

/** @brief Sets who shows such taps, besides their log line; null for nobody. */
DEVICE_API void device_host_set_haptic_callback(device_host_haptic_cb callback, void* data);

/**
 * @brief Receives every line of the platform log: its #log_priority, tag and text in one line.
 *
 * Called from the thread that logs. It must return soon; what it logs itself is not told to it.
 */
typedef void (*device_host_log_cb)(int priority, const char* tag, const char* text, void* data);

/** @brief Sets who gets log lines, besides standard error; null for nobody. Returns once nobody
 * else is being called. From any thread but that of a running callback. */
DEVICE_API void device_host_set_log_callback(device_host_log_cb callback, void* data);

/**
 * @brief The computer's own time in epoch seconds, whatever the device's clock is set to.
 *
 * The setting "db/setting/clock_shift" says how many seconds the device is ahead of it, and
 * "db/setting/time_zone" where the device is. Programs and their libraries see both everywhere.
 */
DEVICE_API int64_t device_host_real_time(void);

/** @brief 1 while a window has taken a hardware key, which the system then leaves alone; else 0. */
DEVICE_API int device_host_key_is_grabbed(const char* key);

DEVICE_EXTERN_C_END
