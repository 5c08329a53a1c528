/**
 * @file
 * @brief Widget extension: hardware keys.
 */
#pragma once

#include <Evas.h>

#include <device/export.h>

DEVICE_EXTERN_C_BEGIN

/** Hardware key events that an object can listen to. */
typedef enum {
    EEXT_EVENT_BACK = 0, /**< The back key was released. */
} eext_event_type_e;

/** @brief Runs on a hardware key event. @param event_info Always null. */
typedef void (*eext_event_cb)(void* data, Evas_Object* obj, void* event_info);

/**
 * @brief Listens to a hardware key on behalf of an object.
 *
 * A key press reaches one callback only: the one added last, in the focused window, whose object is
 * visible and not hidden behind a clipper. An object's callbacks go with it.
 * @param obj The object; not owned.
 * @param data Passed to the callback; not owned.
 */
DEVICE_API void eext_object_event_callback_add(Evas_Object* obj, eext_event_type_e type,
                                               eext_event_cb callback, void* data);

/**
 * @brief Takes back a callback; safe from inside it.
 * @return The data it was added with, or null when it was not there.
 */
DEVICE_API void* eext_object_event_callback_del(Evas_Object* obj, eext_event_type_e type,
                                                eext_event_cb callback);

/**
 * @brief Takes a hardware key from the system for as long as the window lives.
 *
 * A grabbed key has only its key events; the system does not act on it any more.
 * @param window A window; not owned.
 * @param key Key name, for example "XF86AudioRaiseVolume".
 * @return True when the window has the key now or had it before.
 */
DEVICE_API Eina_Bool eext_window_key_grab(Evas_Object* window, const char* key);

/** @brief Gives a key back to the system. @return False when the window did not have it. */
DEVICE_API Eina_Bool eext_window_key_ungrab(Evas_Object* window, const char* key);

DEVICE_EXTERN_C_END
