/**
 * @file
 * @brief Volume levels of the device's sound types.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Kinds of sound that have a volume level of their own. */
typedef enum {
    SOUND_TYPE_SYSTEM = 0,
    SOUND_TYPE_NOTIFICATION = 1,
    SOUND_TYPE_ALARM = 2,
    SOUND_TYPE_RINGTONE = 3,
    SOUND_TYPE_MEDIA = 4,
} sound_type_e;

/** Result of a successful call; every failure is a negative number. */
#define SOUND_MANAGER_ERROR_NONE 0
/** Unknown sound type, level out of range, or a null argument. */
#define SOUND_MANAGER_ERROR_INVALID_PARAMETER (-1)
/** The level cannot be stored. */
#define SOUND_MANAGER_ERROR_INTERNAL (-2)

/**
 * @brief Reads the current level of a sound type.
 * @param[out] volume Level, 0 to 15; left untouched on failure.
 */
DEVICE_API int sound_manager_get_volume(sound_type_e type, int* volume);

/** @brief Sets the level of a sound type. @param volume Level, 0 to 15. */
DEVICE_API int sound_manager_set_volume(sound_type_e type, int volume);

/**
 * @brief Called on the main loop after the level of a sound type has changed.
 * @param volume The new level.
 * @param data The pointer given to sound_manager_set_volume_changed_cb().
 */
typedef void (*sound_manager_volume_changed_cb)(sound_type_e type, unsigned int volume, void* data);

/**
 * @brief Sets who is told about changes of any sound type by any process, this one included;
 * replaces the earlier one.
 */
DEVICE_API int sound_manager_set_volume_changed_cb(sound_manager_volume_changed_cb callback,
                                                   void* data);

/** @brief Tells nobody any more. Succeeds also when nobody was told. */
DEVICE_API int sound_manager_unset_volume_changed_cb(void);

DEVICE_EXTERN_C_END
