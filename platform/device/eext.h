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

DEVICE_EXTERN_C_END
