/**
 * @file
 * @brief Something to touch below what the system draws over a page.
 */
#pragma once

#include <Elementary.h>

#include "support/Stage.h"

/** A button that fills the window and counts its clicks. */
class ButtonBelow {
public:
    explicit ButtonBelow(Evas_Object* window) : _button(elm_button_add(window)) {
        evas_object_resize(_button, Stage::SIZE, Stage::SIZE);
        evas_object_show(_button);
        evas_object_smart_callback_add(
            _button, "clicked",
            [](void* count, Evas_Object*, void*) { ++*static_cast<int*>(count); }, &_clicks);
    }
    ~ButtonBelow() { evas_object_del(_button); }
    ButtonBelow(const ButtonBelow&) = delete;
    ButtonBelow& operator=(const ButtonBelow&) = delete;

    int clicks() const { return _clicks; }

private:
    Evas_Object* _button;
    int _clicks = 0;
};
