/**
 * @file
 * @brief The platform log.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Priorities of a log line, from the least to the most urgent. */
typedef enum {
    DLOG_DEBUG = 3,
    DLOG_INFO = 4,
    DLOG_WARN = 5,
    DLOG_ERROR = 6,
} log_priority;

/** Log buffers; applications write into the main one. */
typedef enum {
    LOG_ID_MAIN = 0,
} log_id_t;

/**
 * @brief Writes one line to the platform log.
 * @param id Buffer to write to.
 * @param priority A #log_priority value.
 * @param tag Short name of the component; must not be null.
 * @param format printf format of the line, without a line end.
 * @return Number of bytes written, or a negative number on failure.
 */
DEVICE_API int __dlog_print(log_id_t id, int priority, const char* tag, const char* format, ...)
    __attribute__((format(printf, 4, 5)));

DEVICE_EXTERN_C_END
