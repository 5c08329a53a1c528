#include "KeysSection.h"

#include <utility>

#include "ControlWidgets.h"

namespace simulator::control {
namespace {

void addAction(Evas_Object* row, const char* label, const char* name, Action action,
               const char* look) {
    Evas_Object* button = addButton(row, label, name, look);
    if (action)
        onEvent(button, "clicked", std::move(action));
}

} // namespace

// NOLINTBEGIN(clang-analyzer-cplusplus.NewDeleteLeaks): widgets free what they call.
KeysSection::KeysSection(Evas_Object* column, const ControlActions& actions) {
    Evas_Object* content = addSection(column, "KEYS");
    Evas_Object* keys = addRow(content, KEY_HEIGHT);
    addHeld(keys, "Back", "Back key", "XF86Back", actions);
    addHeld(keys, "Vol −", "Lower volume key", "XF86AudioLowerVolume", actions);
    addHeld(keys, "Vol +", "Raise volume key", "XF86AudioRaiseVolume", actions);
    const auto bezel = [turn = actions.bezel](int direction) -> Action {
        return turn ? [turn, direction] { turn(direction); } : Action();
    };
    addAction(keys, "Bezel ↺", "Turn the bezel left", bezel(-1), KEY);
    addAction(keys, "Press", "Press the bezel", actions.bezelPress, KEY);
    addAction(keys, "Bezel ↻", "Turn the bezel right", bezel(1), KEY);

    Evas_Object* row = addRow(content);
    const auto background = [go = actions.background](bool away) -> Action {
        return go ? [go, away] { go(away); } : Action();
    };
    addAction(row, "Quick panel", "Quick panel", actions.quickPanel, PLAIN);
    addAction(row, "To background", "Send to the background", background(true), PLAIN);
    addAction(row, "To front", "Bring to the front", background(false), PLAIN);
}
// NOLINTEND(clang-analyzer-cplusplus.NewDeleteLeaks)

void KeysSection::addHeld(Evas_Object* row, const char* label, const char* name, const char* key,
                          const ControlActions& actions) {
    Evas_Object* button = addButton(row, label, name, KEY);
    if (actions.key)
        _keys.push_back(std::make_unique<HoldKey>(button, key, actions.key));
}

} // namespace simulator::control
