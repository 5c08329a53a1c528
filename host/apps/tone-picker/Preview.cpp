#include "Preview.h"

#include <algorithm>
#include <string_view>

#include <Ecore_Input.h>

#include "device/sound_manager.h"

#define LOG_TAG "tone-picker"
#include "base/Log.h"

namespace tone_picker {
namespace {

constexpr int LOUDEST = 15;

int alarmLevel() {
    int level = LOUDEST;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    return level;
}

} // namespace

Preview::Preview() : _keys(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, _keyDownCb, this)) {
    if (sound_player_create(&_player) != SOUND_PLAYER_ERROR_NONE)
        LOG_ERROR("Tones cannot be heard");
}

Preview::~Preview() {
    ecore_event_handler_del(_keys);
    if (_player)
        sound_player_destroy(_player);
}

void Preview::play(const std::string& path) {
    if (!_player)
        return;
    sound_player_stop(_player);
    sound_player_set_level(_player, alarmLevel());
    if (sound_player_set_path(_player, path.c_str()) != SOUND_PLAYER_ERROR_NONE ||
        sound_player_start(_player) != SOUND_PLAYER_ERROR_NONE)
        LOG_ERROR("%s cannot be played", path.c_str());
}

Eina_Bool Preview::_keyDownCb(void* data, int, void* info) {
    auto* self = static_cast<Preview*>(data);
    const char* name = static_cast<const Ecore_Event_Key*>(info)->keyname;
    const std::string_view key = name ? name : "";
    if (key == "XF86AudioRaiseVolume")
        self->changeLevel(1);
    else if (key == "XF86AudioLowerVolume")
        self->changeLevel(-1);
    return ECORE_CALLBACK_PASS_ON;
}

void Preview::changeLevel(int difference) {
    const int level = std::clamp(alarmLevel() + difference, 0, LOUDEST);
    sound_manager_set_volume(SOUND_TYPE_ALARM, level);
    if (_player)
        sound_player_set_level(_player, level);
}

} // namespace tone_picker
