/**
 * @file
 * @brief The toolkit's lists as vectors.
 */
#pragma once

#include <algorithm>
#include <array>
#include <string_view>
#include <vector>

#include <Elementary.h>

namespace host {

/** @brief Takes a list over and frees it. */
template <typename Element>
std::vector<Element*> takeList(Eina_List* list) {
    std::vector<Element*> elements;
    while (list) {
        elements.push_back(static_cast<Element*>(eina_list_data_get(list)));
        list = eina_list_remove_list(list, list);
    }
    return elements;
}

/** @brief What an object groups; empty for an object that draws itself. */
inline std::vector<Evas_Object*> membersOf(const Evas_Object* object) {
    // The toolkit complains when it is asked for the members of one of these.
    constexpr std::array<std::string_view, 11> DRAWN = {
        "rectangle", "line",    "polygon", "text",     "textblock",       "textgrid",
        "image",     "vectors", "vg",      "snapshot", "efl.canvas.image"};
    const char* type = evas_object_type_get(object);
    if (!type || std::find(DRAWN.begin(), DRAWN.end(), type) != DRAWN.end())
        return {};
    return takeList<Evas_Object>(evas_object_smart_members_get(object));
}

} // namespace host
