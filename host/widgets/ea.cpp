#include "device/ea.h"

#include <cstring>
#include <map>
#include <optional>
#include <string>
#include <utility>

#include <Elementary.h>

#include "../Folders.h"
#include "EditField.h"

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

/** What a colour class is made of. */
struct Colours {
    Colour text;
    Colour outline;
    Colour shadow;
};

using Palette = std::map<std::string, Colours, std::less<>>;

Palette readPalette(const std::string& theme) {
    Palette palette;
    Eina_File* file = eina_file_open(theme.c_str(), EINA_FALSE);
    Eina_Iterator* classes = file ? edje_mmap_color_class_iterator_new(file) : nullptr;
    const Edje_Color_Class* c = nullptr;
    void* next = nullptr;
    while (classes && eina_iterator_next(classes, &next)) {
        c = static_cast<const Edje_Color_Class*>(next);
        palette[c->name] = {
            {c->r, c->g, c->b, c->a}, {c->r2, c->g2, c->b2, c->a2}, {c->r3, c->g3, c->b3, c->a3}};
    }
    eina_iterator_free(classes);
    eina_file_close(file);
    return palette;
}

/** Rows ask for colours while a list scrolls: the theme is read once. */
const Palette& palette() {
    static std::string theme;
    static Palette colours;
    const std::string path = host::folders().resources + "/edje/device.edj";
    if (theme != path || colours.empty()) {
        colours = readPalette(path);
        theme = path;
    }
    return colours;
}

/** A colour that the program has set for every object comes before the theme's. */
std::optional<Colours> coloursOfTheme(const char* name) {
    Colours set;
    if (edje_color_class_get(name, &set.text.r, &set.text.g, &set.text.b, &set.text.a,
                             &set.outline.r, &set.outline.g, &set.outline.b, &set.outline.a,
                             &set.shadow.r, &set.shadow.g, &set.shadow.b, &set.shadow.a))
        return set;
    const auto found = palette().find(name);
    return found == palette().end() ? std::nullopt : std::optional(found->second);
}

void store(const Colour& colour, int* r, int* g, int* b, int* a) {
    for (const auto& [place, value] : {std::pair(r, colour.r), std::pair(g, colour.g),
                                       std::pair(b, colour.b), std::pair(a, colour.a)})
        if (place)
            *place = value;
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
    Evas_Object* entry = host::addEntry(parent, type != EA_EDITFIELD_MULTILINE);
    if (entry && type == EA_EDITFIELD_SEARCHBAR)
        elm_entry_input_panel_return_key_type_set(entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_SEARCH);
    return entry;
}

Eina_Bool ea_theme_color_get(const char* name, int* r, int* g, int* b, int* a, int* r2, int* g2,
                             int* b2, int* a2, int* r3, int* g3, int* b3, int* a3) {
    const auto colours = name ? coloursOfTheme(name) : std::nullopt;
    if (!colours) {
        LOG_ERROR("The theme has no colour %s", name ? name : "without a name");
        return EINA_FALSE;
    }
    store(colours->text, r, g, b, a);
    store(colours->outline, r2, g2, b2, a2);
    store(colours->shadow, r3, g3, b3, a3);
    return EINA_TRUE;
}
