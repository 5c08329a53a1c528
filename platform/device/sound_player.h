/**
 * @file
 * @brief Plays sound files.
 *
 * Nothing here waits for a file, a decoder or a sound card: what cannot be played is a log line and
 * silence.
 */
#pragma once

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Player of one file. */
typedef struct sound_player_s* sound_player_h;

/** Result of a successful call; every failure is a negative number. */
#define SOUND_PLAYER_ERROR_NONE 0
/** A null argument or a level out of range. */
#define SOUND_PLAYER_ERROR_INVALID_PARAMETER (-1)
/** The machine cannot play sound. */
#define SOUND_PLAYER_ERROR_NOT_SUPPORTED (-2)
/** No path was set, or no file is there. */
#define SOUND_PLAYER_ERROR_FILE (-3)

/** @brief Makes a silent player. @param[out] player To be destroyed. */
DEVICE_API int sound_player_create(sound_player_h* player);

/** @brief Chooses the file; what is playing stops. @param path Absolute path. */
DEVICE_API int sound_player_set_path(sound_player_h player, const char* path);

/**
 * @brief Sets how loud it plays, at once.
 * @param level 0 (silent) to 15 (as recorded), the scale of the device's sound types; loudest
 * unless set.
 */
DEVICE_API int sound_player_set_level(sound_player_h player, int level);

/** @brief Whether the file starts again when it has ended. @param loop 1 or 0; 0 unless set. */
DEVICE_API int sound_player_set_loop(sound_player_h player, int loop);

/** @brief Plays from the beginning; a player that is playing goes on. */
DEVICE_API int sound_player_start(sound_player_h player);

/** @brief Stops; nothing of it is heard after the call. */
DEVICE_API int sound_player_stop(sound_player_h player);

/** @brief Stops and frees a player. */
DEVICE_API int sound_player_destroy(sound_player_h player);

DEVICE_EXTERN_C_END
