#include "ControlWidgets.h"

#include <cstdlib>
#include <utility>
#include <vector>

#include <Elementary.h>

#include "AccessibleName.h"
#include "TimeText.h"

namespace simulator::control {
namespace {

constexpr int GAP = 4;
/** Rows are laid out for this width and stretch to that of the panel. */
constexpr int ROW_WIDTH = 372;

void runCb(void* data, Evas_Object*, void*) {
    // A copy: the action may delete the widget, and this with it.
    const Action action = *static_cast<Action*>(data);
    action();
}

void deletedCb(void* data, Evas*, Evas_Object*, void*) {
    delete static_cast<Action*>(data);
}

/** As wide as the column. */
void fill(Evas_Object* widget) {
    evas_object_size_hint_weight_set(widget, EVAS_HINT_EXPAND, 0);
    evas_object_size_hint_align_set(widget, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_show(widget);
}

struct Cell {
    Evas_Object* widget;
    int width; ///< 0 = a share of what is left.
};

/** What stands in a row, from the left. */
struct Cells {
    std::vector<Cell> all;
};

constexpr const char* CELLS = "cells";
/** Set on a field that holds what nobody has confirmed yet. */
constexpr const char* TYPED = "typed";
/** Set from the focus until the click that has brought it. */
constexpr const char* ENTERED = "simulator.control.entered";

void freeCellsCb(void* data, Evas*, Evas_Object*, void*) {
    delete static_cast<Cells*>(data);
}

void packRow(Evas_Object* row, const std::vector<Cell>& cells) {
    int width = 0;
    int height = 0;
    elm_grid_size_get(row, &width, &height);
    int left = width - GAP * static_cast<int>(cells.size() - 1);
    int shares = 0;
    for (const Cell& cell : cells) {
        left -= cell.width;
        shares += cell.width == 0 ? 1 : 0;
    }
    int x = 0;
    for (const Cell& cell : cells) {
        int cellWidth = cell.width;
        if (cellWidth == 0) {
            // What does not divide evenly goes to the last ones.
            cellWidth = left / shares;
            left -= cellWidth;
            --shares;
        }
        elm_grid_pack(row, cell.widget, x, 0, cellWidth, height);
        x += cellWidth + GAP;
    }
}

} // namespace

void onEvent(Evas_Object* widget, const char* event, Action action) {
    auto* kept = new Action(std::move(action));
    evas_object_smart_callback_add(widget, event, runCb, kept);
    evas_object_event_callback_add(widget, EVAS_CALLBACK_FREE, deletedCb, kept);
}

Evas_Object* addColumn(Evas_Object* parent) {
    Evas_Object* column = elm_box_add(parent);
    elm_box_padding_set(column, 0, GAP);
    evas_object_show(column);
    return column;
}

Evas_Object* addRow(Evas_Object* column, int height) {
    Evas_Object* row = elm_grid_add(column);
    elm_object_mirrored_automatic_set(row, EINA_FALSE);
    elm_object_mirrored_set(row, EINA_FALSE);
    elm_grid_size_set(row, ROW_WIDTH, height);
    evas_object_size_hint_min_set(row, 0, height);
    auto* cells = new Cells;
    evas_object_data_set(row, CELLS, cells);
    evas_object_event_callback_add(row, EVAS_CALLBACK_FREE, freeCellsCb, cells);
    fill(row);
    elm_box_pack_end(column, row);
    return row;
}

void place(Evas_Object* row, Evas_Object* widget, int width) {
    auto& cells = static_cast<Cells*>(evas_object_data_get(row, CELLS))->all;
    cells.push_back({widget, width});
    packRow(row, cells);
    evas_object_show(widget);
}

Evas_Object* addSection(Evas_Object* column, const char* title) {
    Evas_Object* section = elm_layout_add(column);
    elm_layout_theme_set(section, "simulator", "control", "section");
    // Its title is in English, whichever way the face is read.
    elm_object_mirrored_automatic_set(section, EINA_FALSE);
    elm_object_mirrored_set(section, EINA_FALSE);
    elm_object_part_text_set(section, "section.title", title);
    fill(section);
    elm_box_pack_end(column, section);
    Evas_Object* content = addColumn(section);
    elm_object_part_content_set(section, "section.content", content);
    return content;
}

void addCaption(Evas_Object* row, const char* text, int width) {
    Evas_Object* caption = elm_layout_add(row);
    elm_layout_theme_set(caption, "simulator", "control", "caption");
    elm_object_part_text_set(caption, "caption.text", text);
    place(row, caption, width);
}

void prepare(Evas_Object* widget, const std::string& name) {
    elm_object_mirrored_automatic_set(widget, EINA_FALSE);
    elm_object_mirrored_set(widget, EINA_FALSE);
    evas_object_name_set(widget, name.c_str());
    setAccessibleName(widget, name);
}

Evas_Object* addButton(Evas_Object* row, const char* label, const std::string& name,
                       const char* look, int width) {
    Evas_Object* button = elm_button_add(row);
    prepare(button, name);
    elm_object_style_set(button, look);
    elm_object_text_set(button, label);
    place(row, button, width);
    return button;
}

Evas_Object* addSwitch(Evas_Object* row, const char* label, const std::string& name, int width) {
    Evas_Object* check = elm_check_add(row);
    prepare(check, name);
    elm_object_style_set(check, PLAIN);
    elm_object_text_set(check, label);
    place(row, check, width);
    return check;
}

Evas_Object* addRadio(Evas_Object* row, const char* label, const std::string& name,
                      Evas_Object* group, int value, int width) {
    Evas_Object* radio = elm_radio_add(row);
    prepare(radio, name);
    elm_object_style_set(radio, PLAIN);
    elm_object_text_set(radio, label);
    elm_radio_state_value_set(radio, value);
    if (group != nullptr)
        elm_radio_group_add(radio, group);
    place(row, radio, width);
    return radio;
}

namespace {

Eina_Bool selectAllCb(void* field, Evas*) {
    elm_entry_select_all(static_cast<Evas_Object*>(field));
    return EINA_TRUE;
}

/** The toolkit takes a click soon after any other one for the half of a double click alone. */
void enterCb(void*, Evas*, Evas_Object* field, void* info) {
    if (static_cast<Evas_Event_Mouse_Up*>(info)->flags != EVAS_BUTTON_NONE &&
        elm_object_focus_get(field) == EINA_FALSE)
        elm_object_focus_set(field, EINA_TRUE);
}

/** What is typed first replaces what a field shows. */
void selectWhenEntered(Evas_Object* field) {
    evas_object_event_callback_add(field, EVAS_CALLBACK_MOUSE_UP, enterCb, nullptr);
    onEvent(field, "focused", [field] {
        evas_object_data_set(field, ENTERED, field);
        elm_entry_select_all(field);
    });
    // The click that has brought the focus puts the cursor where it was, once all have heard of it.
    onEvent(field, "clicked", [field] {
        if (evas_object_data_del(field, ENTERED) != nullptr)
            evas_post_event_callback_push(evas_object_evas_get(field), selectAllCb, field);
    });
    onEvent(field, "unfocused", [field] {
        evas_object_data_del(field, ENTERED);
        confirm(field);
        elm_entry_select_none(field);
    });
}

} // namespace

Evas_Object* addField(Evas_Object* row, const char* hint, const std::string& name) {
    Evas_Object* field = elm_entry_add(row);
    prepare(field, name);
    elm_entry_single_line_set(field, EINA_TRUE);
    elm_entry_scrollable_set(field, EINA_TRUE);
    elm_object_style_set(field, PLAIN);
    // What is pasted is plain text.
    elm_entry_cnp_mode_set(field, ELM_CNP_MODE_PLAINTEXT);
    elm_object_part_text_set(field, "guide", hint);
    selectWhenEntered(field);
    onEvent(field, "changed,user", [field] { evas_object_data_set(field, TYPED, field); });
    onEvent(field, "activated", [field] { confirm(field); });
    place(row, field);
    return field;
}

std::string textOf(Evas_Object* field) {
    char* text = elm_entry_markup_to_utf8(elm_entry_entry_get(field));
    std::string result = text == nullptr ? "" : text;
    std::free(text);
    return result;
}

void confirm(Evas_Object* field) {
    evas_object_data_del(field, TYPED);
}

void showText(Evas_Object* field, const std::string& text) {
    const bool typing = evas_object_data_get(field, TYPED) != nullptr;
    if (!typing && textOf(field) != text)
        elm_entry_entry_set(field, markupOf(text).c_str());
}

} // namespace simulator::control
