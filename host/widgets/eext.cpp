#include "device/eext.h"

#include <algorithm>
#include <cstring>
#include <string>
#include <string_view>
#include <vector>

#include <Ecore.h>
#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <Elementary.h>

#include "BackKey.h"
#include "FocusNavigator.h"
#include "device_host.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// A desktop has no back key: XF86Back stands in for it, and Escape for keyboards without that one.
// The release counts, so that a key held down goes back once.

namespace {

struct Listener {
    Evas_Object* object;
    eext_event_cb callback;
    void* data;
};

/** In the order they were added. */
std::vector<Listener>& listeners() {
    static std::vector<Listener> all;
    return all;
}

struct KeyHandlers {
    Ecore_Event_Handler* pressed = nullptr;
    Ecore_Event_Handler* released = nullptr;
};

KeyHandlers& keyHandlers() {
    static KeyHandlers handlers;
    return handlers;
}

bool isBackKey(const char* name) {
    return name && (std::strcmp(name, "XF86Back") == 0 || std::strcmp(name, "Escape") == 0);
}

/** Shown, and so is everything it is part of or clipped by. */
bool isShown(const Evas_Object* object) {
    for (const Evas_Object* o = object; o; o = evas_object_smart_parent_get(o)) {
        if (!evas_object_visible_get(o))
            return false;
        for (const Evas_Object* clip = evas_object_clip_get(o); clip;
             clip = evas_object_clip_get(clip))
            if (!evas_object_visible_get(clip))
                return false;
    }
    return true;
}

Ecore_Window windowOf(const Evas_Object* object) {
    Ecore_Evas* evas = ecore_evas_ecore_evas_get(evas_object_evas_get(object));
    return evas ? ecore_evas_window_get(evas) : 0;
}

/** The one that a back key in a window is for; null for none. */
const Listener* listenerIn(Ecore_Window window) {
    const auto& all = listeners();
    const auto found = std::find_if(all.rbegin(), all.rend(), [window](const Listener& listener) {
        return windowOf(listener.object) == window && isShown(listener.object);
    });
    return found == all.rend() ? nullptr : &*found;
}

/** The toolkit's own page stack pops on a press of Escape; the device's back key is the release. */
Eina_Bool keyPressed(void*, int, void* info) {
    return isBackKey(static_cast<Ecore_Event_Key*>(info)->keyname) ? ECORE_CALLBACK_DONE
                                                                   : ECORE_CALLBACK_PASS_ON;
}

Eina_Bool keyReleased(void*, int, void* info) {
    const auto* event = static_cast<Ecore_Event_Key*>(info);
    if (!isBackKey(event->keyname))
        return ECORE_CALLBACK_PASS_ON;
    const Listener* found = listenerIn(event->event_window);
    if (!found || host::FocusNavigator::stopTurning(found->object))
        return ECORE_CALLBACK_PASS_ON;
    // A copy: the callback may add and remove listeners.
    const Listener listener = *found;
    listener.callback(listener.data, listener.object, nullptr);
    return ECORE_CALLBACK_PASS_ON;
}

void listenToKeys() {
    KeyHandlers& handlers = keyHandlers();
    if (handlers.released)
        return;
    handlers.pressed = ecore_event_handler_prepend(ECORE_EVENT_KEY_DOWN, keyPressed, nullptr);
    // Before everybody else: an application may keep every key event to itself.
    handlers.released = ecore_event_handler_prepend(ECORE_EVENT_KEY_UP, keyReleased, nullptr);
}

void dropUnusedHandlers() {
    KeyHandlers& handlers = keyHandlers();
    if (!listeners().empty() || !handlers.released)
        return;
    ecore_event_handler_del(handlers.pressed);
    ecore_event_handler_del(handlers.released);
    handlers = {};
}

void objectDeleted(void*, Evas*, Evas_Object* object, void*) {
    std::erase_if(listeners(), [object](const Listener& l) { return l.object == object; });
    dropUnusedHandlers();
}

bool hasListener(Evas_Object* object) {
    return std::any_of(listeners().begin(), listeners().end(),
                       [object](const Listener& l) { return l.object == object; });
}

// Hardware keys of windows. There is nothing to take from the desktop, whose own volume keys stay
// its own: it is the simulated system that leaves a grabbed key alone.

struct GrabbedKey {
    const Evas_Object* window;
    std::string key;

    bool operator==(const GrabbedKey&) const = default;
};

std::vector<GrabbedKey>& grabbedKeys() {
    static std::vector<GrabbedKey> keys;
    return keys;
}

bool hasKey(const GrabbedKey& key) {
    return std::find(grabbedKeys().begin(), grabbedKeys().end(), key) != grabbedKeys().end();
}

bool hasAnyKey(const Evas_Object* window) {
    return std::any_of(grabbedKeys().begin(), grabbedKeys().end(),
                       [window](const GrabbedKey& key) { return key.window == window; });
}

bool isWindow(const Evas_Object* object) {
    const char* type = object ? evas_object_type_get(object) : nullptr;
    return type && std::string_view(type) == "elm_win";
}

void windowDeleted(void*, Evas*, Evas_Object* window, void*) {
    std::erase_if(grabbedKeys(), [window](const GrabbedKey& key) { return key.window == window; });
}

} // namespace

Evas_Object* host::backKeyObject(const Evas_Object* window) {
    const Listener* found = window ? listenerIn(windowOf(window)) : nullptr;
    return found ? found->object : nullptr;
}

void eext_object_event_callback_add(Evas_Object* obj, eext_event_type_e type,
                                    eext_event_cb callback, void* data) {
    if (!obj || !callback || type != EEXT_EVENT_BACK) {
        LOG_ERROR("An object, the back key and a callback are needed");
        return;
    }
    if (!hasListener(obj))
        evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, objectDeleted, nullptr);
    listeners().push_back({obj, callback, data});
    listenToKeys();
}

void* eext_object_event_callback_del(Evas_Object* obj, eext_event_type_e type,
                                     eext_event_cb callback) {
    auto& all = listeners();
    const auto found = std::find_if(all.rbegin(), all.rend(), [=](const Listener& listener) {
        return listener.object == obj && listener.callback == callback;
    });
    if (type != EEXT_EVENT_BACK || found == all.rend())
        return nullptr;
    void* data = found->data;
    all.erase(std::next(found).base());
    if (!hasListener(obj))
        evas_object_event_callback_del_full(obj, EVAS_CALLBACK_DEL, objectDeleted, nullptr);
    dropUnusedHandlers();
    return data;
}

Eina_Bool eext_window_key_grab(Evas_Object* window, const char* key) {
    if (!isWindow(window) || !key || !*key) {
        LOG_ERROR("A window and the name of a key are needed");
        return EINA_FALSE;
    }
    const GrabbedKey grabbed{window, key};
    if (hasKey(grabbed))
        return EINA_TRUE;
    if (!hasAnyKey(window))
        evas_object_event_callback_add(window, EVAS_CALLBACK_DEL, windowDeleted, nullptr);
    grabbedKeys().push_back(grabbed);
    return EINA_TRUE;
}

Eina_Bool eext_window_key_ungrab(Evas_Object* window, const char* key) {
    if (!window || !key) {
        LOG_ERROR("A window and the name of a key are needed");
        return EINA_FALSE;
    }
    if (std::erase(grabbedKeys(), GrabbedKey{window, key}) == 0)
        return EINA_FALSE;
    if (!hasAnyKey(window))
        evas_object_event_callback_del_full(window, EVAS_CALLBACK_DEL, windowDeleted, nullptr);
    return EINA_TRUE;
}

int device_host_key_is_grabbed(const char* key) {
    const auto& keys = grabbedKeys();
    return key && std::any_of(keys.begin(), keys.end(),
                              [key](const GrabbedKey& grabbed) { return grabbed.key == key; });
}
