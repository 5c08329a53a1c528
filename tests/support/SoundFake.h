/**
 * @file
 * @brief What the device of a test plays, whom it tells about volumes, and its hardware keys.
 *
 * Calls are noted in device().calls(), and device().fail() makes them fail. Keys are grabbed of the
 * desktop's stand-in as well.
 */
#pragma once

#include <list>
#include <set>
#include <string>
#include <vector>

#include <Evas.h>

#include <device/sound_manager.h>
#include <device/sound_player.h>

/** A player that has been made and not destroyed. */
struct sound_player_s {
    std::string path;
    int level = 15;
    bool loop = false;
    bool playing = false;
};

class SoundFake {
public:
    void reset();

    /** The living players, the oldest first. */
    std::vector<sound_player_s> players() const { return {_players.begin(), _players.end()}; }

    /** Sets a level as the quick panel would, and tells who wants to be told. */
    void changeVolume(sound_type_e type, unsigned level);
    /** Whether somebody is told about changes. */
    bool tellsVolumes() const { return _volumeChanged != nullptr; }

    /** The keys that windows have. */
    const std::set<std::string>& grabbedKeys() const { return _grabbedKeys; }

private:
    friend struct SoundCalls;

    std::list<sound_player_s> _players;
    sound_manager_volume_changed_cb _volumeChanged = nullptr;
    void* _volumeChangedData = nullptr;
    std::set<std::string> _grabbedKeys;
};

/** The only one. */
SoundFake& soundDevice();
