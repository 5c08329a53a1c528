// The toolkit still calls its interface for screen readers a beta.
#define EFL_BETA_API_SUPPORT
#define EFL_ACCESS_OBJECT_PROTECTED
#include <Elementary.h>

#include <array>
#include <cstdlib>
#include <map>
#include <sstream>
#include <string_view>
#include <vector>

#include <libintl.h>

#include "Accessible.h"
#include "EvasLists.h"
#include "FocusList.h"

namespace host {

namespace {

/** Of longer lists only what is in sight is named. */
constexpr unsigned FEW_ROWS = 64;
constexpr std::array<std::string_view, 3> NAMELESS = {"Elm_Check", "Elm_Radio", "Elm_Entry"};

bool isNameless(const Evas_Object* object) {
    const char* type =
        elm_object_widget_check(object) ? elm_object_widget_type_get(object) : nullptr;
    return type && std::find(NAMELESS.begin(), NAMELESS.end(), type) != NAMELESS.end();
}

/** Names what is in a row; the row is known by its height. */
void nameInside(Evas_Object* object, const FocusBox& row, const char* name) {
    const FocusBox box = boxOf(object);
    if (isNameless(object)) {
        if (row.contains(row.middleX(), box.middleY()))
            efl_access_object_i18n_name_set(object, name);
        return;
    }
    for (Evas_Object* member : membersOf(object))
        nameInside(member, row, name);
}

/** The parts of a row's style that show texts, as its theme lists them. */
std::string partsOf(Evas_Object* list, const char* style) {
    const std::string group = std::string("elm/genlist/item/") + style + "/default";
    const char* file = elm_theme_group_path_find(nullptr, group.c_str());
    Evas_Object* look = edje_object_add(evas_object_evas_get(list));
    edje_object_file_set(look, file, group.c_str());
    const char* parts = edje_object_data_get(look, "texts");
    std::string found = parts ? parts : "";
    evas_object_del(look);
    return found;
}

/** A row's texts, also of one that is out of sight and has no picture. */
std::string textsOf(Evas_Object* list, Elm_Object_Item* item) {
    const Elm_Genlist_Item_Class* rowClass = elm_genlist_item_item_class_get(item);
    if (!rowClass || !rowClass->func.text_get || !rowClass->item_style ||
        !elm_object_item_data_get(item))
        return "";
    static std::map<std::string, std::string> known;
    const auto [style, isNew] = known.try_emplace(rowClass->item_style);
    if (isNew)
        style->second = partsOf(list, rowClass->item_style);
    std::istringstream parts(style->second);
    std::string all;
    for (std::string part; parts >> part;) {
        char* markup = rowClass->func.text_get(elm_object_item_data_get(item), list, part.c_str());
        char* text = markup ? elm_entry_markup_to_utf8(markup) : nullptr;
        if (text && *text)
            all += (all.empty() ? "" : ", ") + std::string(text);
        std::free(text);
        std::free(markup);
    }
    return all;
}

void nameRow(Evas_Object* list, Elm_Object_Item* item) {
    const std::string name = textsOf(list, item);
    if (name.empty())
        return;
    efl_access_object_i18n_name_set(item, name.c_str());
    if (const auto box = boxOfRow(item))
        nameInside(list, *box, name.c_str());
}

std::vector<Elm_Object_Item*> allRows(const Evas_Object* list) {
    std::vector<Elm_Object_Item*> rows;
    for (Elm_Object_Item* item = elm_genlist_first_item_get(list); item;
         item = elm_genlist_item_next_get(item))
        rows.push_back(item);
    return rows;
}

/** A row has its place, and its contents theirs, once the list is laid out. */
void laidOut(void* list, Evas*, void*) {
    auto* object = static_cast<Evas_Object*>(list);
    if (!elm_config_atspi_mode_get())
        return;
    const auto rows = elm_genlist_items_count(object) <= FEW_ROWS
                          ? allRows(object)
                          : takeList<Elm_Object_Item>(elm_genlist_realized_items_get(object));
    for (Elm_Object_Item* item : rows)
        nameRow(object, item);
}

void listDeleted(void*, Evas* canvas, Evas_Object* list, void*) {
    evas_event_callback_del_full(canvas, EVAS_CALLBACK_RENDER_POST, laidOut, list);
}

} // namespace

void setReadName(Evas_Object* widget, const std::string& name) {
    efl_access_object_i18n_name_set(widget, name.c_str());
    // The toolkit's own macro for it is C.
    static char property[] = "i18n_name";
    if (elm_config_atspi_mode_get())
        efl_access_object_event_emit(widget, EFL_ACCESS_OBJECT_EVENT_PROPERTY_CHANGED, property);
}

void setReadTextId(Evas_Object* widget, const char* textId) {
    efl_access_object_translation_domain_set(widget, textdomain(nullptr));
    efl_access_object_i18n_name_set(widget, textId);
}

void setReadAsSpinner(Evas_Object* widget) {
    efl_access_object_role_set(widget, EFL_ACCESS_ROLE_SPIN_BUTTON);
}

void nameRowsForReaders(Evas_Object* list) {
    evas_event_callback_add(evas_object_evas_get(list), EVAS_CALLBACK_RENDER_POST, laidOut, list);
    evas_object_event_callback_add(list, EVAS_CALLBACK_DEL, listDeleted, nullptr);
}

} // namespace host
