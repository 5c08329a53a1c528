#include "RowParts.h"

#include <cstdlib>
#include <map>
#include <sstream>

namespace host {

namespace {

constexpr const char* BETWEEN = ", ";

/** The parts of a row's style, as its theme lists them. */
struct Parts {
    std::vector<std::string> texts;
    std::vector<std::string> contents;
};

std::vector<std::string> listed(const Evas_Object* look, const char* kind) {
    const char* names = edje_object_data_get(look, kind);
    std::istringstream words(names ? names : "");
    std::vector<std::string> parts;
    for (std::string part; words >> part;)
        parts.push_back(part);
    return parts;
}

const Parts& partsOf(const Evas_Object* list, const char* style) {
    static std::map<std::string, Parts> known;
    const auto [entry, isNew] = known.try_emplace(style);
    if (isNew) {
        const std::string group = std::string("elm/genlist/item/") + style + "/default";
        Evas_Object* look = edje_object_add(evas_object_evas_get(list));
        edje_object_file_set(look, elm_theme_group_path_find(nullptr, group.c_str()),
                             group.c_str());
        entry->second = {listed(look, "texts"), listed(look, "contents")};
        evas_object_del(look);
    }
    return entry->second;
}

/** Null for a row that only takes room. */
const Elm_Genlist_Item_Class* classOf(const Elm_Object_Item* row) {
    const Elm_Genlist_Item_Class* rowClass = elm_genlist_item_item_class_get(row);
    return rowClass && rowClass->item_style && elm_object_item_data_get(row) ? rowClass : nullptr;
}

std::string plain(char* markup) {
    char* text = markup ? elm_entry_markup_to_utf8(markup) : nullptr;
    std::string copy;
    for (const char* letter = text ? text : ""; *letter; ++letter)
        copy += *letter == '\n' ? std::string(BETWEEN) : std::string(1, *letter);
    std::free(text);
    std::free(markup);
    return copy;
}

} // namespace

std::string textsOfRow(const Elm_Object_Item* row) {
    const Elm_Genlist_Item_Class* rowClass = classOf(row);
    if (!rowClass || !rowClass->func.text_get)
        return "";
    Evas_Object* list = elm_object_item_widget_get(row);
    std::string all;
    for (const std::string& part : partsOf(list, rowClass->item_style).texts) {
        const std::string text =
            plain(rowClass->func.text_get(elm_object_item_data_get(row), list, part.c_str()));
        if (!text.empty())
            all += (all.empty() ? "" : BETWEEN) + text;
    }
    return all;
}

std::vector<Evas_Object*> contentsOfRow(const Elm_Object_Item* row) {
    const Elm_Genlist_Item_Class* rowClass = classOf(row);
    if (!rowClass)
        return {};
    std::vector<Evas_Object*> contents;
    for (const std::string& part :
         partsOf(elm_object_item_widget_get(row), rowClass->item_style).contents)
        if (Evas_Object* content = elm_object_item_part_content_get(row, part.c_str()))
            contents.push_back(content);
    return contents;
}

} // namespace host
