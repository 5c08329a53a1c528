/**
 * @file
 * @brief Plays an alarm's tone.
 */
#pragma once

#include <string>

#include <device/sound_player.h>

#include <clock/Export.h>

/** @brief What a sound is for. */
enum ClockSoundType {
    CLOCK_SOUND_TYPE_RINGING = 0, /**< An alarm that rings. */
    CLOCK_SOUND_TYPE_PREVIEW = 1, /**< A taste of a tone while an alarm is edited. */
};

/** @brief One tone, heard from initialize() until the player is destroyed. */
class CLOCK_COMMON_EXPORT ClockSoundPlayer {
public:
    ClockSoundPlayer() = default;
    /** @brief Stops. */
    ~ClockSoundPlayer();
    ClockSoundPlayer(const ClockSoundPlayer&) = delete;
    ClockSoundPlayer& operator=(const ClockSoundPlayer&) = delete;

    /**
     * @brief Chooses the tone and begins to play it.
     *
     * What cannot be played is logged, and the player stays silent.
     * @param soundPath Absolute path of the tone.
     * @param fallbackPath Played when there is no file at soundPath; the device's default tone
     * comes after it.
     * @param type What the sound is for.
     * @param volume Level, 0 to 15; others are brought into this range.
     * @param alarmId The alarm that rings, for the log; 0 for none.
     * @param loop Whether the tone starts again when it has ended.
     * @param tonePosition Place of the tone in the tone picker's list, for the log.
     */
    void initialize(const std::string& soundPath, const std::string& fallbackPath,
                    ClockSoundType type, int volume, int alarmId, bool loop, int tonePosition);
    /** @brief Sets the level, at once. @param volume 0 to 15; others are brought into this range.
     */
    void setVolume(int volume);
    /** @brief Plays from the beginning; a tone that is playing goes on. */
    void start();
    /** @brief Stops; start() plays again. */
    void stop();

private:
    void release();

    sound_player_h _player = nullptr;
};
