#define LOG_TAG "clock-common"
#include "clock/ClockSoundPlayer.h"

#include <algorithm>
#include <array>

#include <base/Log.h>
#include <clock/ClockAlarmDbData.h>

namespace {

constexpr int LOUDEST = 15;

int levelFrom(int volume) {
    return std::clamp(volume, 0, LOUDEST);
}

const char* nameOf(ClockSoundType type) {
    return type == CLOCK_SOUND_TYPE_PREVIEW ? "preview" : "alarm";
}

/** Gives the player the first of the tones that there is. @return Its path, or null. */
const char* chooseTone(sound_player_h player, const std::string& path,
                       const std::string& fallbackPath) {
    const std::array tones{path.c_str(), fallbackPath.c_str(), CLOCK_ALARM_DEFAULT_TONE};
    std::string tried;
    for (const char* tone : tones) {
        if (tone == tried)
            continue;
        tried = tone;
        if (sound_player_set_path(player, tone) == SOUND_PLAYER_ERROR_NONE)
            return tone;
        LOG_WARNING("There is no tone at \"%s\"", tone);
    }
    return nullptr;
}

} // namespace

ClockSoundPlayer::~ClockSoundPlayer() {
    release();
}

void ClockSoundPlayer::release() {
    if (_player)
        sound_player_destroy(_player);
    _player = nullptr;
}

void ClockSoundPlayer::initialize(const std::string& soundPath, const std::string& fallbackPath,
                                  ClockSoundType type, int volume, int alarmId, bool loop,
                                  int tonePosition) {
    release();
    if (const int result = sound_player_create(&_player); result != SOUND_PLAYER_ERROR_NONE) {
        LOG_ERROR("sound_player_create failed(ret = %d)", result);
        _player = nullptr;
        return;
    }
    const char* tone = chooseTone(_player, soundPath, fallbackPath);
    if (!tone) {
        LOG_ERROR("There is no tone to play");
        return;
    }
    LOG_INFO("Playing %s [%s, alarm = %d, position = %d, volume = %d]", tone, nameOf(type), alarmId,
             tonePosition, volume);
    setVolume(volume);
    sound_player_set_loop(_player, loop ? 1 : 0);
    start();
}

void ClockSoundPlayer::setVolume(int volume) {
    if (!_player)
        return;
    const int result = sound_player_set_level(_player, levelFrom(volume));
    if (result != SOUND_PLAYER_ERROR_NONE)
        LOG_ERROR("sound_player_set_level failed(ret = %d)", result);
}

void ClockSoundPlayer::start() {
    if (!_player)
        return;
    const int result = sound_player_start(_player);
    if (result != SOUND_PLAYER_ERROR_NONE)
        LOG_ERROR("sound_player_start failed(ret = %d)", result);
}

void ClockSoundPlayer::stop() {
    if (_player)
        sound_player_stop(_player);
}
