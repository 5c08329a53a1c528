#include "Keys.h"

#include <algorithm>
#include <array>
#include <string_view>
#include <utility>

#include <Ecore_Input.h>

#include "PowerSaving.h"
#include "VolumeKeys.h"
#include "clock/ClockEventListener.h"
#include "control/DeviceActions.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

using QuickPanel = std::function<void()>;

struct KeyRow {
    const char* key;
    const char* help;
    void (*act)(const QuickPanel& quickPanel);
};

template <ClockEventListener::EventType EVENT>
void raise(const QuickPanel&) {
    ClockEventListener::raise(EVENT);
}

constexpr std::array<KeyRow, 7> KEY_ROWS{{
    {"F4", "the quick panel is pulled down or pushed up",
     [](const QuickPanel& quickPanel) {
         quickPanel();
     }},
    {"F5", "the application goes to the background",
     [](const QuickPanel&) {
         goToBackground();
     }},
    {"F6", "the application comes back",
     [](const QuickPanel&) {
         comeToForeground();
     }},
    {"F7", "the language was changed", raise<ClockEventListener::LANGUAGE_CHANGED>},
    {"F8", "the clock or the time zone was set", raise<ClockEventListener::TIME_CHANGED>},
    {"F9", "a setting was changed", raise<ClockEventListener::SETTINGS_CHANGED>},
    {"F10", "ultra power saving is switched on or off",
     [](const QuickPanel&) {
         togglePowerSaving();
     }},
}};

} // namespace

Keys::Keys(std::function<void()> quickPanel)
    : _quickPanel(std::move(quickPanel)),
      _handler(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, _keyDownCb, this)) {}

Eina_Bool Keys::_keyDownCb(void* data, int, void* info) {
    const auto* event = static_cast<const Ecore_Event_Key*>(info);
    const auto* row = std::find_if(KEY_ROWS.begin(), KEY_ROWS.end(), [event](const KeyRow& r) {
        return std::string_view(event->keyname) == r.key;
    });
    if (row != KEY_ROWS.end()) {
        LOG_INFO("%s: %s", row->key, row->help);
        row->act(static_cast<Keys*>(data)->_quickPanel);
    }
    return ECORE_CALLBACK_PASS_ON;
}

std::string keysHelpText() {
    constexpr std::size_t NAME_WIDTH = 26;
    const auto line = [](std::string name, const char* help) {
        name.resize(NAME_WIDTH, ' ');
        return "  " + name + help + "\n";
    };
    std::string text = line("Escape, XF86Back", "the back key") + volumeKeysHelpText();
    for (const KeyRow& row : KEY_ROWS)
        text += line(row.key, row.help);
    return text;
}

} // namespace simulator
