#include "support/SoundFake.h"

#include <algorithm>
#include <optional>

#include <clock/ClockSoundPlayer.h>
#include <device/eext.h>

#include "support/DeviceFake.h"
#include "support/FakeCalls.h"

namespace {

using fakes::quoted;
using fakes::real;
using fakes::typeOf;

using KeyFunction = Eina_Bool(Evas_Object*, const char*);
using Initialize = void(ClockSoundPlayer*, const std::string&, const std::string&, ClockSoundType,
                        int, int, bool, int);

constexpr int LOUDEST = 15;

} // namespace

/** Lets the device's functions, which are not members, reach the fake's state. */
struct SoundCalls {
    static std::list<sound_player_s>& players() { return soundDevice()._players; }

    /** Notes a call on a player and does it, unless it is to fail or there is no such player. */
    template <typename Work>
    static int onPlayer(const char* function, sound_player_h player, const std::string& argument,
                        Work&& work) {
        const std::string arguments = argument.empty() ? "player" : "player, " + argument;
        if (auto failure = device().record(function, player ? arguments : "null"))
            return *failure;
        const bool alive = std::any_of(players().begin(), players().end(),
                                       [player](const auto& other) { return &other == player; });
        return alive ? work(*player) : SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    }

    static void tell(sound_manager_volume_changed_cb callback, void* data) {
        soundDevice()._volumeChanged = callback;
        soundDevice()._volumeChangedData = data;
    }

    static std::set<std::string>& grabbedKeys() { return soundDevice()._grabbedKeys; }
};

SoundFake& soundDevice() {
    static SoundFake fake;
    return fake;
}

void SoundFake::reset() {
    _players.clear();
    SoundCalls::tell(nullptr, nullptr);
    _grabbedKeys.clear();
}

void SoundFake::changeVolume(sound_type_e type, unsigned level) {
    device().setVolume(type, static_cast<int>(level));
    if (_volumeChanged)
        _volumeChanged(type, level, _volumeChangedData);
}

// Comes before the library's, which is called from here, to see what screens pass.
void ClockSoundPlayer::initialize(const std::string& soundPath, const std::string& fallbackPath,
                                  ClockSoundType type, int volume, int alarmId, bool loop,
                                  int tonePosition) {
    const std::string arguments = quoted(soundPath.c_str()) + ", " + quoted(fallbackPath.c_str()) +
                                  ", " + std::to_string(type) + ", " + std::to_string(volume) +
                                  ", " + std::to_string(alarmId) +
                                  (loop ? ", true, " : ", false, ") + std::to_string(tonePosition);
    if (device().record("ClockSoundPlayer::initialize", arguments))
        return;
    real<Initialize>("_ZN16ClockSoundPlayer10initializeERKNSt7__cxx1112basic_stringIcSt11char_"
                     "traitsIcESaIcEEES7_14ClockSoundTypeiibi")(
        this, soundPath, fallbackPath, type, volume, alarmId, loop, tonePosition);
}

// Players.

int sound_player_create(sound_player_h* player) {
    if (auto failure = device().record("sound_player_create", ""))
        return *failure;
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    *player = &SoundCalls::players().emplace_back();
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_set_path(sound_player_h player, const char* path) {
    return SoundCalls::onPlayer("sound_player_set_path", player, quoted(path), [path](auto& p) {
        if (!path)
            return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
        p.path = path;
        p.playing = false;
        return SOUND_PLAYER_ERROR_NONE;
    });
}

int sound_player_set_level(sound_player_h player, int level) {
    return SoundCalls::onPlayer("sound_player_set_level", player, std::to_string(level),
                                [level](auto& p) {
                                    if (level < 0 || level > LOUDEST)
                                        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
                                    p.level = level;
                                    return SOUND_PLAYER_ERROR_NONE;
                                });
}

int sound_player_set_loop(sound_player_h player, int loop) {
    return SoundCalls::onPlayer("sound_player_set_loop", player, std::to_string(loop),
                                [loop](auto& p) {
                                    p.loop = loop != 0;
                                    return SOUND_PLAYER_ERROR_NONE;
                                });
}

int sound_player_start(sound_player_h player) {
    return SoundCalls::onPlayer("sound_player_start", player, "", [](auto& p) {
        if (p.path.empty())
            return SOUND_PLAYER_ERROR_FILE;
        p.playing = true;
        return SOUND_PLAYER_ERROR_NONE;
    });
}

int sound_player_stop(sound_player_h player) {
    return SoundCalls::onPlayer("sound_player_stop", player, "", [](auto& p) {
        p.playing = false;
        return SOUND_PLAYER_ERROR_NONE;
    });
}

int sound_player_destroy(sound_player_h player) {
    return SoundCalls::onPlayer("sound_player_destroy", player, "", [](auto& p) {
        SoundCalls::players().remove_if([&p](const auto& other) { return &other == &p; });
        return SOUND_PLAYER_ERROR_NONE;
    });
}

// Volumes.

int sound_manager_set_volume_changed_cb(sound_manager_volume_changed_cb callback, void* data) {
    if (auto failure = device().record("sound_manager_set_volume_changed_cb", ""))
        return *failure;
    if (!callback)
        return SOUND_MANAGER_ERROR_INVALID_PARAMETER;
    SoundCalls::tell(callback, data);
    return SOUND_MANAGER_ERROR_NONE;
}

int sound_manager_unset_volume_changed_cb(void) {
    if (auto failure = device().record("sound_manager_unset_volume_changed_cb", ""))
        return *failure;
    SoundCalls::tell(nullptr, nullptr);
    return SOUND_MANAGER_ERROR_NONE;
}

// Keys.

Eina_Bool eext_window_key_grab(Evas_Object* window, const char* key) {
    if (device().record("eext_window_key_grab", typeOf(window) + ", " + quoted(key)))
        return EINA_FALSE;
    const bool grabbed = real<KeyFunction>("eext_window_key_grab")(window, key);
    if (grabbed)
        SoundCalls::grabbedKeys().insert(key);
    return grabbed;
}

Eina_Bool eext_window_key_ungrab(Evas_Object* window, const char* key) {
    if (device().record("eext_window_key_ungrab", typeOf(window) + ", " + quoted(key)))
        return EINA_FALSE;
    const bool ungrabbed = real<KeyFunction>("eext_window_key_ungrab")(window, key);
    if (ungrabbed)
        SoundCalls::grabbedKeys().erase(key);
    return ungrabbed;
}
