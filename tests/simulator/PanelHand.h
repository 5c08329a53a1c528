// A mouse and a keyboard on the control panel's own window.
#pragma once

#include <string>
#include <vector>

#include <Ecore_Evas.h>
#include <Elementary.h>
#include <gtest/gtest.h>

#include "support/Stage.h"

class PanelHand {
public:
    explicit PanelHand(Evas_Object* window)
        : _window(window), _canvas(evas_object_evas_get(window)) {
        ecore_evas_focus_set(ecore_evas_ecore_evas_get(_canvas), EINA_TRUE);
    }

    Evas_Object* widget(const std::string& name) const {
        return evas_object_name_find(_canvas, name.c_str());
    }
    void press(const std::string& name, double across = 0.5,
               Evas_Button_Flags flags = EVAS_BUTTON_NONE) {
        Evas_Object* object = widget(name);
        if (object == nullptr) {
            ADD_FAILURE() << "the panel has no " << name;
            return;
        }
        const Area area = Stage::area(object);
        const int x = area.x + static_cast<int>((area.width - 1) * across);
        evas_event_feed_mouse_move(_canvas, x, area.y + area.height / 2, next(), nullptr);
        evas_event_feed_mouse_down(_canvas, 1, flags, next(), nullptr);
        Stage::frames(2);
    }
    void release(Evas_Button_Flags flags = EVAS_BUTTON_NONE) {
        evas_event_feed_mouse_up(_canvas, 1, flags, next(), nullptr);
        Stage::frames(3);
    }
    void click(const std::string& name, double across = 0.5) {
        press(name, across);
        release();
    }
    /** A click so soon after another one that a display calls it the second half of that. */
    void clickSoon(const std::string& name, Evas_Button_Flags flags = EVAS_BUTTON_DOUBLE_CLICK) {
        press(name, 0.5, flags); // NOLINT(readability-magic-numbers)
        release(flags);
    }
    void key(const char* name, const char* text = nullptr) {
        evas_event_feed_key_down(_canvas, name, name, text, text, next(), nullptr);
        evas_event_feed_key_up(_canvas, name, name, text, text, next(), nullptr);
        Stage::frames(2);
    }
    /** Replaces what a field holds. */
    void type(const std::string& field, const std::string& text) {
        click(field);
        Stage::advance(0.3);
        elm_entry_select_all(widget(field));
        write(text);
    }
    /** Types where the focus is. */
    void write(const std::string& text) {
        for (const char c : text) {
            const std::string letter(1, c);
            key(c == ' ' ? "space" : letter.c_str(), letter.c_str());
        }
    }
    std::string part(const std::string& layout, const char* name) const {
        const char* text = elm_object_part_text_get(widget(layout), name);
        return text == nullptr ? "" : text;
    }
    std::string focused() const {
        const char* name = evas_object_name_get(elm_object_focused_object_get(_window));
        return name == nullptr ? "" : name;
    }

private:
    static unsigned next() {
        static unsigned time = 100000;
        return time += 20;
    }

    Evas_Object* _window;
    Evas* _canvas;
};
