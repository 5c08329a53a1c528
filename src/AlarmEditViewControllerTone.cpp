// The editor's way to the tone picker and back.
#define LOG_TAG "alarm-ui-common"
#include "AlarmEditViewController.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <memory>
#include <utility>
#include <vector>

#include <base/Log.h>

#include "NullData.h"
#include "rules/EditorRows.h"
#include "rules/ToneName.h"

namespace {

constexpr const char* TONE_PICKER = "com.vendra.setting.sound-tone-list";
constexpr const char* TONE_FOLDER = "/opt/usr/share/settings/Ringtones";

bool isDone(int result, const char* step) {
    if (result != APP_CONTROL_ERROR_NONE)
        LOG_ERROR("%s failed(ret = %x)", step, result);
    return result == APP_CONTROL_ERROR_NONE;
}

// What the tone picker is asked for. A request that cannot be completed is given up as it is.
bool describe(app_control_h request, const char* markedTone) {
    if (!isDone(app_control_set_app_id(request, TONE_PICKER), "app_control_set_app_id"))
        return false;
    const std::array<std::pair<const char*, const char*>, 4> extras{{
        {"caller", "alarm_setting"},
        {"silent", "silent none"},
        {"path", TONE_FOLDER},
        {"marked_mode", markedTone},
    }};
    for (const auto& [key, value] : extras)
        if (!isDone(app_control_add_extra_data(request, key, value), "app_control_add_extra_data"))
            return false;
    app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
    return true;
}

using Text = std::unique_ptr<char, decltype(&std::free)>;

int readExtra(app_control_h reply, const char* key, Text& text) {
    char* value = nullptr;
    const int result = app_control_get_extra_data(reply, key, &value);
    text.reset(value);
    return result;
}

// A request that is to be answered. A new editor may lie in memory where its sender has been.
struct Awaited {
    const void* address;
    app_assist::WWeakPtr<app_assist::WViewController> sender;
};

std::vector<Awaited>& awaitedAnswers() {
    static std::vector<Awaited> awaited;
    return awaited;
}

void awaitAnswer(app_assist::WViewController& sender, const void* address) {
    // A picker that has not answered by now would only take the answer away from this request.
    std::erase_if(awaitedAnswers(),
                  [](const Awaited& awaited) { return awaited.sender.expired(); });
    awaitedAnswers().push_back({address, sender.getWeakPtr()});
}

// True when the answer's request came from an editor that has gone.
bool answersGoneEditor(const void* address) {
    const auto awaited = std::ranges::find(awaitedAnswers(), address, &Awaited::address);
    if (awaited == awaitedAnswers().end())
        return false;
    const bool gone = awaited->sender.expired();
    awaitedAnswers().erase(awaited);
    return gone;
}

} // namespace

void AlarmEditViewController::_onRingToneViewSelectedCb() {
    app_control_h request = nullptr;
    if (!isDone(app_control_create(&request), "app_control_create") ||
        !describe(request, _alarm.soundPath.c_str()) ||
        !isDone(app_control_send_launch_request(request, _onRingToneAppReplyCb, this),
                "app_control_send_launch_request"))
        return;
    app_control_destroy(request);
    awaitAnswer(*this, this);
    if (sound_manager_set_volume_changed_cb(_soundManagerVolumeChangedCb, this) !=
        SOUND_MANAGER_ERROR_NONE)
        LOG_ERROR("Failed to register volume change callback");
}

void AlarmEditViewController::_onRingToneAppReplyCb(app_control_h, app_control_h reply,
                                                    app_control_result_e, void* data) {
    RETURN_IF_NULL(data);
    if (answersGoneEditor(data)) {
        LOG_WARNING("The editor has gone, nothing to do");
        return;
    }
    AlarmEditViewController* self = liveEditor(data);
    if (!self)
        return;
    Text text(nullptr, &std::free);
    if (!isDone(readExtra(reply, "result", text), "app_control_get_extra_data"))
        return;
    if (!text) {
        LOG_ERROR("app_control_get_extra_data(result) is NULL !!");
        return;
    }
    self->_alarm.soundPath = text.get();
    self->refreshRow(rules::EditorRow::Tone);
    const int result = readExtra(reply, "position", text);
    // A reply without a position is whole: the new tone has none.
    if (result != APP_CONTROL_ERROR_NONE && result != APP_CONTROL_ERROR_KEY_NOT_FOUND) {
        LOG_ERROR("Failed to get position(ret = %x)", result);
        return;
    }
    if (!text)
        LOG_ERROR("Position value from tone select app control is null");
    self->_alarm.tonePosition = text ? rules::tonePosition(text.get()) : 0;
}
