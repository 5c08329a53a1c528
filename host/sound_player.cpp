#include "device/sound_player.h"

#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>

#include "SoundFile.h"
#include "ToneFolder.h"
#include "sound/SoundThread.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

struct sound_player_s {
    std::shared_ptr<host::SoundThread> thread;
};

namespace {

constexpr int LOUDEST = 15;

/**
 * The ear hears steps alike when the factor of the samples is the third power of the level, which
 * is what GStreamer calls GST_STREAM_VOLUME_FORMAT_CUBIC.
 */
double gainOf(int level) {
    const double share = static_cast<double>(level) / LOUDEST;
    return share * share * share;
}

} // namespace

int sound_player_create(sound_player_h* player) {
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    const char* sink = std::getenv("CLOCK_AUDIO_SINK");
    auto thread = host::SoundThread::start(sink ? sink : "");
    if (!thread)
        return SOUND_PLAYER_ERROR_NOT_SUPPORTED;
    *player = std::make_unique<sound_player_s>(sound_player_s{std::move(thread)}).release();
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_set_path(sound_player_h player, const char* path) {
    if (!player || !path)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    const std::string here = host::pathHere(path);
    const host::SoundFile file(here);
    if (file.problem() != 0) {
        LOG_WARNING("%s cannot be played: %s", here.c_str(), std::strerror(file.problem()));
        return SOUND_PLAYER_ERROR_FILE;
    }
    player->thread->setPath(here);
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_set_level(sound_player_h player, int level) {
    if (!player || level < 0 || level > LOUDEST)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    player->thread->setGain(gainOf(level));
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_set_loop(sound_player_h player, int loop) {
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    player->thread->setLoop(loop != 0);
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_start(sound_player_h player) {
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    if (!player->thread->hasPath())
        return SOUND_PLAYER_ERROR_FILE;
    player->thread->play();
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_stop(sound_player_h player) {
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    player->thread->stop();
    return SOUND_PLAYER_ERROR_NONE;
}

int sound_player_destroy(sound_player_h player) {
    if (!player)
        return SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    const std::unique_ptr<sound_player_s> gone(player);
    gone->thread->quit();
    return SOUND_PLAYER_ERROR_NONE;
}
