/**
 * @file
 * @brief The device's alarm server: keeps schedules and rings them, also after a restart.
 *
 * A schedule is civil time. The server derives the next ring from it in the device's current time
 * zone, and derives it again whenever the clock or the zone changes.
 */
#pragma once

#include <stdint.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Result of a successful call; every failure is a negative number. */
#define ALARM_SERVER_ERROR_NONE 0
/** A null argument or a field out of range. */
#define ALARM_SERVER_ERROR_INVALID_PARAMETER (-1)
/** No schedule has the id. */
#define ALARM_SERVER_ERROR_NOT_FOUND (-2)
/** The schedule cannot be stored. */
#define ALARM_SERVER_ERROR_IO (-3)

/** When an alarm rings. */
typedef struct {
    int32_t alarm_id; /**< The application's id of the alarm. */
    int32_t enabled;  /**< 1 = rings, 0 = kept but silent. */
    int32_t hour;     /**< 0 to 23. */
    int32_t minute;   /**< 0 to 59. */
    int32_t weekdays; /**< Bit 0 Sunday to bit 6 Saturday; 0 = rings once. */
    int32_t year;     /**< Year of the one ring, or 0 for the next time the clock shows it. */
    int32_t month;    /**< 1 to 12; used with a year only. */
    int32_t day;      /**< 1 to 31; used with a year only. */
} alarm_schedule_s;

/**
 * @brief Stores a new schedule.
 * @param[out] schedule_id Positive id of the schedule; left untouched on failure.
 */
DEVICE_API int alarm_server_register(const alarm_schedule_s* schedule, int32_t* schedule_id);

/** @brief Replaces a stored schedule. */
DEVICE_API int alarm_server_update(int32_t schedule_id, const alarm_schedule_s* schedule);

/** @brief Removes a stored schedule. */
DEVICE_API int alarm_server_unregister(int32_t schedule_id);

/**
 * @brief Reads a stored schedule.
 * @param[out] schedule The stored values; may be null.
 * @param[out] next_ring Epoch seconds of the next ring, 0 when it will not ring; may be null.
 */
DEVICE_API int alarm_server_get(int32_t schedule_id, alarm_schedule_s* schedule,
                                int64_t* next_ring);

/**
 * @brief Runs a function for every stored schedule, in the order of their ids.
 * @param callback Returns 0 to stop. It may call the functions above.
 */
DEVICE_API int alarm_server_foreach(int (*callback)(int32_t schedule_id,
                                                    const alarm_schedule_s* schedule,
                                                    int64_t next_ring, void* data),
                                    void* data);

DEVICE_EXTERN_C_END
