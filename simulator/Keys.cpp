#include "Keys.h"

#include <algorithm>
#include <array>
#include <string_view>

#include <Ecore_Input.h>

#include "clock/ClockEventListener.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

struct KeyRow {
    const char* key;
    ClockEventListener::EventType event;
    const char* help;
};

constexpr std::array<KeyRow, 5> KEY_ROWS{{
    {"F5", ClockEventListener::PAUSED, "the application goes to the background"},
    {"F6", ClockEventListener::RESUMED, "the application comes back"},
    {"F7", ClockEventListener::LANGUAGE_CHANGED, "the language was changed"},
    {"F8", ClockEventListener::TIME_CHANGED, "the clock or the time zone was set"},
    {"F9", ClockEventListener::SETTINGS_CHANGED, "a setting was changed"},
}};

Eina_Bool keyDownCb(void*, int, void* info) {
    const auto* event = static_cast<const Ecore_Event_Key*>(info);
    const auto* row = std::find_if(KEY_ROWS.begin(), KEY_ROWS.end(), [event](const KeyRow& r) {
        return std::string_view(event->keyname) == r.key;
    });
    if (row != KEY_ROWS.end()) {
        LOG_INFO("%s: %s", row->key, row->help);
        ClockEventListener::raise(row->event);
    }
    return ECORE_CALLBACK_PASS_ON;
}

} // namespace

Keys::Keys() : _handler(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, keyDownCb, nullptr)) {}

std::string keysHelpText() {
    std::string text = "  Escape, XF86Back  the back key\n";
    for (const KeyRow& row : KEY_ROWS)
        text += std::string("  ") + row.key + "                " + row.help + "\n";
    return text;
}

} // namespace simulator
