#include "device/ea.h"

#include <cstring>

#include <Elementary.h>

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace {

struct Colour {
    int r = 0;
    int g = 0;
    int b = 0;
    int a = 0;
};

bool colourOfClass(Evas_Object* edje, const char* name, Colour& colour) {
    if (std::strcmp(name, "transparent") == 0)
        return colour = {}, true;
    return edje_object_color_class_get(edje, name, &colour.r, &colour.g, &colour.b, &colour.a,
                                       nullptr, nullptr, nullptr, nullptr, nullptr, nullptr,
                                       nullptr, nullptr);
}

} // namespace

void ea_theme_object_color_replace(Evas_Object* obj, const char* from, const char* to) {
    if (!obj || !from || !to) {
        LOG_ERROR("An object and two colours are needed");
        return;
    }
    Evas_Object* edje = elm_object_widget_check(obj) ? elm_layout_edje_get(obj) : nullptr;
    Colour colour;
    if (!edje || !colourOfClass(edje, to, colour)) {
        LOG_ERROR("Colour %s cannot become %s here", from, to);
        return;
    }
    edje_object_color_class_set(edje, from, colour.r, colour.g, colour.b, colour.a, 0, 0, 0, 0, 0,
                                0, 0, 0);
}

Evas_Object* ea_editfield_add(Evas_Object* parent, ea_editfield_type_e type) {
    Evas_Object* entry = parent ? elm_entry_add(parent) : nullptr;
    if (!entry) {
        LOG_ERROR("An edit field needs a parent");
        return nullptr;
    }
    elm_entry_single_line_set(entry, type != EA_EDITFIELD_MULTILINE);
    elm_entry_scrollable_set(entry, EINA_TRUE);
    elm_scroller_policy_set(entry, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, EVAS_HINT_FILL);
    if (type == EA_EDITFIELD_SEARCHBAR)
        elm_entry_input_panel_return_key_type_set(entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_SEARCH);
    return entry;
}
