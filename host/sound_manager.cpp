#include "device/sound_manager.h"

#include <array>
#include <memory>
#include <string>
#include <utility>

#include "Settings.h"
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

int levelOf(sound_type_e type) {
    int level = soundTypes.at(type).defaultLevel;
    sound_manager_get_volume(type, &level);
    return level;
}

/** Who is told of changes, and what they know. */
struct Listener {
    sound_manager_volume_changed_cb callback;
    void* data;
    std::array<int, soundTypes.size()> levels;
};

std::unique_ptr<Listener>& listener() {
    static std::unique_ptr<Listener> instance;
    return instance;
}

/** Settings cannot be unwatched one by one: they stay watched when nobody listens. */
bool& isWatching() {
    static bool watching = false;
    return watching;
}

void settingChangedCb(keynode_t* /*node*/, void* data) {
    if (!listener())
        return;
    const auto type =
        static_cast<sound_type_e>(static_cast<const SoundType*>(data) - soundTypes.data());
    const int level = levelOf(type);
    if (level == std::exchange(listener()->levels.at(type), level))
        return;
    // A copy: the callback may end the listening.
    const Listener told = *listener();
    told.callback(type, static_cast<unsigned int>(level), told.data);
}

bool watchLevels() {
    if (isWatching())
        return true;
    for (std::size_t index = 0; index < soundTypes.size(); ++index) {
        const std::string setting = settingOf(static_cast<sound_type_e>(index));
        auto* type = const_cast<SoundType*>(&soundTypes.at(index));
        if (vconf_notify_key_changed(setting.c_str(), settingChangedCb, type) != VCONF_OK)
            return false;
    }
    isWatching() = true;
    return true;
}

} // namespace

namespace host {

void forgetVolumeCallback() {
    listener().reset();
    isWatching() = false;
}

} // namespace host

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

int sound_manager_set_volume_changed_cb(sound_manager_volume_changed_cb callback, void* data) {
    if (!callback)
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    if (!watchLevels())
        return SOUND_MANAGER_ERROR_INTERNAL;
    auto changed = std::make_unique<Listener>(Listener{callback, data, {}});
    for (std::size_t index = 0; index < soundTypes.size(); ++index)
        changed->levels.at(index) = levelOf(static_cast<sound_type_e>(index));
    listener() = std::move(changed);
    return SOUND_MANAGER_ERROR_NONE;
}

int sound_manager_unset_volume_changed_cb(void) {
    listener().reset();
    return SOUND_MANAGER_ERROR_NONE;
}
