#include "support/Stage.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <gtest/gtest.h>

#include "support/VirtualClock.h"

namespace {

constexpr double FRAME_MS = VirtualClock::FRAME * 1000;
/** A finger that rests this long has no speed left. */
constexpr int HOLD_FRAMES = 15;

/** Timestamp of the next event in ms; it never stands still. */
unsigned stamp() {
    static unsigned last = 0;
    last = std::max(last + 1, static_cast<unsigned>(VirtualClock::elapsed() * 1000));
    return last;
}

const char* keyOfCharacter(const std::string& character) {
    if (character == " ") {
        return "space";
    }
    return character == "\n" ? "Return" : character.c_str();
}

std::size_t lengthOfCharacter(char first) {
    const auto byte = static_cast<unsigned char>(first);
    if (byte < 0xC0) {
        return 1;
    }
    if (byte < 0xE0) {
        return 2;
    }
    return byte < 0xF0 ? 3 : 4;
}

} // namespace

void Stage::tap(int x, int y) {
    press(x, y);
    frames(3);
    release();
    frames(3);
}

void Stage::tap(Evas_Object* object) {
    if (object == nullptr || !canBeSeen(object)) {
        ADD_FAILURE() << "cannot tap what cannot be seen";
        return;
    }
    tap(area(object).middle());
}

void Stage::tapPart(Evas_Object* layout, const std::string& part) {
    const auto* const edje = elm_object_widget_check(layout) ? elm_layout_edje_get(layout) : layout;
    Area inside;
    if (edje == nullptr || !edje_object_part_geometry_get(edje, part.c_str(), &inside.x, &inside.y,
                                                          &inside.width, &inside.height)) {
        ADD_FAILURE() << "no part \"" << part << "\"";
        return;
    }
    int x = 0;
    int y = 0;
    evas_object_geometry_get(edje, &x, &y, nullptr, nullptr);
    tap(x + inside.middle().x, y + inside.middle().y);
}

void Stage::tapText(const std::string& text) {
    if (const auto found = findText(text)) {
        tap(found->area.middle());
    } else {
        ADD_FAILURE() << "the face does not show \"" << text << "\"";
    }
}

void Stage::tapRow(Elm_Object_Item* item) {
    showRow(item);
    for (const Row& row : rows(elm_object_item_widget_get(item))) {
        if (row.item == item && row.realized) {
            tap(row.area.middle());
            return;
        }
    }
    ADD_FAILURE() << "the row cannot be seen";
}

void Stage::feedMove(int x, int y) {
    _finger = {x, y};
    evas_event_feed_mouse_move(canvas(), x, y, stamp(), nullptr);
}

void Stage::press(int x, int y) {
    evas_event_feed_mouse_in(canvas(), stamp(), nullptr);
    feedMove(x, y);
    evas_event_feed_mouse_down(canvas(), 1, EVAS_BUTTON_NONE, stamp(), nullptr);
    frames(1);
}

void Stage::moveTo(int x, int y) {
    feedMove(x, y);
    frames(1);
}

void Stage::release() {
    if (window() == nullptr) {
        return;
    }
    evas_event_feed_mouse_up(canvas(), 1, EVAS_BUTTON_NONE, stamp(), nullptr);
    frames(1);
}

void Stage::drag(int x, int y, int dx, int dy, int milliseconds) {
    press(x, y);
    const int steps = std::max(1, static_cast<int>(milliseconds / FRAME_MS));
    for (int step = 1; step <= steps; ++step) {
        moveTo(x + dx * step / steps, y + dy * step / steps);
    }
    frames(HOLD_FRAMES);
    feedMove(x + dx, y + dy);
    release();
    frames(2);
}

void Stage::flick(int x, int y, int dx, int dy, int milliseconds) {
    press(x, y);
    const int steps = std::max(2, static_cast<int>(milliseconds / FRAME_MS));
    for (int step = 1; step <= steps; ++step) {
        moveTo(x + dx * step / steps, y + dy * step / steps);
    }
    release();
}

void Stage::wheel(int x, int y, int steps) {
    evas_event_feed_mouse_in(canvas(), stamp(), nullptr);
    feedMove(x, y);
    for (int i = 0; i < std::abs(steps); ++i) {
        evas_event_feed_mouse_wheel(canvas(), 0, steps < 0 ? -1 : 1, stamp(), nullptr);
        frames(1);
    }
}

void Stage::bezel(int steps) {
    for (int i = 0; i < std::abs(steps); ++i) {
        wheel(SIZE / 2, SIZE / 2, steps < 0 ? -1 : 1);
        settle();
    }
}

void Stage::pressBezel() {
    evas_event_feed_mouse_in(canvas(), stamp(), nullptr);
    feedMove(SIZE / 2, SIZE / 2);
    evas_event_feed_mouse_down(canvas(), 2, EVAS_BUTTON_NONE, stamp(), nullptr);
    frames(1);
    if (window() != nullptr) {
        evas_event_feed_mouse_up(canvas(), 2, EVAS_BUTTON_NONE, stamp(), nullptr);
    }
    settle();
}

void Stage::keySettled(const std::string& name) {
    key(name);
    settle();
}

void Stage::key(const std::string& name) {
    keyDown(name);
    keyUp(name);
}

void Stage::keyDown(const std::string& name) {
    sendKey(ECORE_EVENT_KEY_DOWN, name, name == "Return" ? "\n" : "");
}

void Stage::keyUp(const std::string& name) {
    sendKey(ECORE_EVENT_KEY_UP, name, "");
}

void Stage::type(const std::string& text) {
    for (std::size_t at = 0; at < text.size();) {
        const std::string character = text.substr(at, lengthOfCharacter(text[at]));
        sendKey(ECORE_EVENT_KEY_DOWN, keyOfCharacter(character), character);
        sendKey(ECORE_EVENT_KEY_UP, keyOfCharacter(character), character);
        at += character.size();
    }
}

// The toolkit's own handler leads an Ecore event on to the canvas, so one event reaches both the
// key handlers and the focused widget.
void Stage::sendKey(int type, const std::string& name, const std::string& text) {
    if (window() == nullptr) {
        return;
    }
    // The event's strings live in the block that is freed with it.
    const std::size_t size = sizeof(Ecore_Event_Key) + name.size() + text.size() + 2;
    auto* const event = static_cast<Ecore_Event_Key*>(std::calloc(1, size));
    auto* const nameCopy = reinterpret_cast<char*>(event + 1);
    std::memcpy(nameCopy, name.c_str(), name.size() + 1);
    event->keyname = event->key = nameCopy;
    if (!text.empty()) {
        char* const textCopy = nameCopy + name.size() + 1;
        std::memcpy(textCopy, text.c_str(), text.size() + 1);
        event->string = event->compose = textCopy;
    }
    event->timestamp = stamp();
    event->window = event->event_window =
        ecore_evas_window_get(ecore_evas_ecore_evas_get(canvas()));
    ecore_event_add(type, event, nullptr, nullptr);
    frames(1);
}
