#include "device/sound_manager.h"

#include <array>
#include <string>

#include "device/vconf.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace {

struct SoundType {
    const char* name;
    int defaultLevel;
};

/** In the order of sound_type_e. */
constexpr std::array<SoundType, 5> soundTypes{{
    {"system", 5},
    {"notification", 7},
    {"alarm", 7},
    {"ringtone", 7},
    {"media", 7},
}};

constexpr int loudest = 15;

bool isSoundType(sound_type_e type) {
    return type >= 0 && static_cast<std::size_t>(type) < soundTypes.size();
}

std::string settingOf(sound_type_e type) {
    return std::string("db/private/sound/volume/") + soundTypes.at(type).name;
}

} // namespace

int sound_manager_get_volume(sound_type_e type, int* volume) {
    if (!isSoundType(type) || !volume)
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    const std::string setting = settingOf(type);
    int level = soundTypes.at(type).defaultLevel;
    const int result = vconf_get_int(setting.c_str(), &level);
    if (level < 0 || level > loudest || result == VCONF_ERROR_WRONG_TYPE) {
        LOG_WARNING("%s is not a level from 0 to %d, using %d", setting.c_str(), loudest,
                    soundTypes.at(type).defaultLevel);
        level = soundTypes.at(type).defaultLevel;
    }
    *volume = level;
    return SOUND_MANAGER_ERROR_NONE;
}

int sound_manager_set_volume(sound_type_e type, int volume) {
    if (!isSoundType(type) || volume < 0 || volume > loudest)
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    const int result = vconf_set_int(settingOf(type).c_str(), volume);
    return result == VCONF_OK ? SOUND_MANAGER_ERROR_NONE : SOUND_MANAGER_ERROR_INTERNAL;
}
