#include "VolumeKeys.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <string_view>
#include <utility>

#include <Ecore_Input.h>

#include "device/sound_manager.h"
#include "device_host.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr double REPEAT_SECONDS = 0.2;
constexpr int LOUDEST = 15;

struct VolumeKey {
    const char* name;
    const char* standIn;
    int step;
};

constexpr std::array<VolumeKey, 2> VOLUME_KEYS{{
    {"XF86AudioLowerVolume", "F2", -1},
    {"XF86AudioRaiseVolume", "F3", +1},
}};

const VolumeKey* findKey(const char* VolumeKey::*member, std::string_view name) {
    const auto* key =
        std::find_if(VOLUME_KEYS.begin(), VOLUME_KEYS.end(),
                     [&](const VolumeKey& candidate) { return name == candidate.*member; });
    return key == VOLUME_KEYS.end() ? nullptr : key;
}

/** Sends the same event again, as one of another key. */
void resend(int type, const Ecore_Event_Key& event, const char* name) {
    auto* copy = static_cast<Ecore_Event_Key*>(std::malloc(sizeof event));
    if (copy == nullptr)
        return;
    *copy = event;
    copy->keyname = name;
    copy->key = name;
    // These belong to the first event and go with it.
    copy->string = "";
    copy->compose = "";
    copy->data = nullptr;
    copy->dev = nullptr;
    ecore_event_add(type, copy, nullptr, nullptr);
}

/** @return The level after the step. */
int stepVolume(int step) {
    int level = 0;
    sound_manager_get_volume(SOUND_TYPE_ALARM, &level);
    const int next = std::clamp(level + step, 0, LOUDEST);
    if (next == level)
        return level;
    if (sound_manager_set_volume(SOUND_TYPE_ALARM, next) != SOUND_MANAGER_ERROR_NONE) {
        LOG_ERROR("The alarm's volume cannot be set to %d", next);
        return level;
    }
    LOG_INFO("The alarm's volume is %d", next);
    return next;
}

} // namespace

VolumeKeys::VolumeKeys(std::function<void(int level)> stepped)
    : _stepped(std::move(stepped)),
      _down(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, _keyDownCb, this)),
      _up(ecore_event_handler_add(ECORE_EVENT_KEY_UP, _keyUpCb, this)) {}

Eina_Bool VolumeKeys::_keyDownCb(void* data, int type, void* info) {
    const auto& event = *static_cast<const Ecore_Event_Key*>(info);
    if (const VolumeKey* key = findKey(&VolumeKey::standIn, event.keyname)) {
        resend(type, event, key->name);
        return ECORE_CALLBACK_DONE;
    }
    const VolumeKey* key = findKey(&VolumeKey::name, event.keyname);
    if (key != nullptr)
        static_cast<VolumeKeys*>(data)->pressed(key->name, key->step);
    return ECORE_CALLBACK_PASS_ON;
}

Eina_Bool VolumeKeys::_keyUpCb(void* data, int type, void* info) {
    const auto& event = *static_cast<const Ecore_Event_Key*>(info);
    if (const VolumeKey* key = findKey(&VolumeKey::standIn, event.keyname)) {
        resend(type, event, key->name);
        return ECORE_CALLBACK_DONE;
    }
    static_cast<VolumeKeys*>(data)->_held.clear();
    return ECORE_CALLBACK_PASS_ON;
}

void VolumeKeys::pressed(const std::string& key, int step) {
    // The keyboard repeats a held key faster than the watch does.
    const double now = ecore_loop_time_get();
    const bool tooEarly = key == _held && now - _lastStep < REPEAT_SECONDS;
    _held = key;
    if (tooEarly || device_host_key_is_grabbed(key.c_str()) != 0)
        return;
    _lastStep = now;
    _stepped(stepVolume(step));
}

std::string volumeKeysHelpText() {
    std::string text;
    for (const VolumeKey& key : VOLUME_KEYS) {
        text += std::string("  ") + key.standIn + ", " + key.name +
                (key.step < 0 ? "  lower" : "  raise") + " the volume\n";
    }
    return text;
}

} // namespace simulator
