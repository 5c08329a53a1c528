#include "FaceInput.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>

#include <Ecore.h>
#include <Ecore_Input.h>

#include "FaceWindow.h"

namespace host {

namespace {

/** Milliseconds; it never stands still, as some gestures compare times. */
unsigned timestamp() {
    constexpr double MILLISECONDS = 1000;
    static unsigned last = 0;
    last = std::max(last + 1, static_cast<unsigned>(ecore_time_get() * MILLISECONDS));
    return last;
}

template <typename Event>
void address(Event& event) {
    event.timestamp = timestamp();
    event.window = event.event_window = ecore_evas_window_get(faceWindow());
}

template <typename Event>
void place(Event& event, int x, int y) {
    address(event);
    event.same_screen = 1;
    event.x = event.root.x = x;
    event.y = event.root.y = y;
}

template <typename Event>
Event* makeEvent(std::size_t extra = 0) {
    // The main loop frees it.
    return static_cast<Event*>(std::calloc(1, sizeof(Event) + extra));
}

/** Comes to the window, or leaves it. */
void cross(int type, int x, int y) {
    auto* event = makeEvent<Ecore_Event_Mouse_IO>();
    if (!event)
        return;
    address(*event);
    event->x = x;
    event->y = y;
    ecore_event_add(type, event, nullptr, nullptr);
}

} // namespace

void movePointer(int x, int y) {
    cross(ECORE_EVENT_MOUSE_IN, x, y);
    auto* event = makeEvent<Ecore_Event_Mouse_Move>();
    if (!event)
        return;
    place(*event, x, y);
    event->multi.radius = event->multi.radius_x = event->multi.radius_y = 1;
    event->multi.pressure = 1;
    event->multi.x = event->multi.root.x = x;
    event->multi.y = event->multi.root.y = y;
    ecore_event_add(ECORE_EVENT_MOUSE_MOVE, event, nullptr, nullptr);
}

void pressPointer(int button, Press press, int x, int y) {
    movePointer(x, y);
    auto* event = makeEvent<Ecore_Event_Mouse_Button>();
    if (!event)
        return;
    place(*event, x, y);
    event->buttons = static_cast<unsigned>(button);
    event->multi.radius = event->multi.radius_x = event->multi.radius_y = 1;
    event->multi.pressure = 1;
    event->multi.x = event->multi.root.x = x;
    event->multi.y = event->multi.root.y = y;
    ecore_event_add(press == Press::Down ? ECORE_EVENT_MOUSE_BUTTON_DOWN
                                         : ECORE_EVENT_MOUSE_BUTTON_UP,
                    event, nullptr, nullptr);
    // A lifted finger is nowhere. On a display the pointer stays where it is.
    if (press == Press::Up && isInMemory(faceWindow()))
        cross(ECORE_EVENT_MOUSE_OUT, x, y);
}

void turnBezel(int direction, int x, int y) {
    movePointer(x, y);
    auto* event = makeEvent<Ecore_Event_Mouse_Wheel>();
    if (!event)
        return;
    place(*event, x, y);
    event->z = direction < 0 ? -1 : 1;
    ecore_event_add(ECORE_EVENT_MOUSE_WHEEL, event, nullptr, nullptr);
}

void pressKey(const std::string& name, const std::string& text, Press press) {
    // The event's texts live in the block that is freed with it.
    auto* event = makeEvent<Ecore_Event_Key>(name.size() + text.size() + 2);
    if (!event)
        return;
    address(*event);
    auto* room = reinterpret_cast<char*>(event + 1);
    std::memcpy(room, name.c_str(), name.size() + 1);
    event->keyname = event->key = room;
    if (!text.empty()) {
        room += name.size() + 1;
        std::memcpy(room, text.c_str(), text.size() + 1);
        event->string = event->compose = room;
    }
    ecore_event_add(press == Press::Down ? ECORE_EVENT_KEY_DOWN : ECORE_EVENT_KEY_UP, event,
                    nullptr, nullptr);
}

} // namespace host
