#include "Faces.h"

#include <string_view>
#include <vector>

#include <Ecore_Evas.h>
#include <Elementary.h>

#include "EvasLists.h"

namespace host {

namespace {

/** A list whose theme was applied again forgets how high its rows are, until its width changes. */
void measureAgain(Evas_Object* list) {
    int width = 0;
    int height = 0;
    evas_object_geometry_get(list, nullptr, nullptr, &width, &height);
    evas_object_resize(list, width - 1, height);
    evas_object_resize(list, width, height);
}

bool isList(const Evas_Object* widget) {
    return std::string_view(elm_object_widget_type_get(widget)) == "Elm_Genlist";
}

/** What a row holds beside its texts stays: a person may just be typing into it. */
void readRowsAgain(const Evas_Object* list) {
    for (Elm_Object_Item* row : takeList<Elm_Object_Item>(elm_genlist_realized_items_get(list)))
        elm_genlist_item_fields_update(row, "*", ELM_GENLIST_ITEM_FIELD_TEXT);
}

/** The toolkit leaves parts of a popup as they were. */
void turn(Evas_Object* object, const Evas_Object* widget) {
    if (elm_object_widget_check(object)) {
        widget = object;
        if (elm_object_mirrored_automatic_get(object))
            elm_object_mirrored_set(object, elm_config_mirrored_get());
    }
    if (widget && std::string_view(evas_object_type_get(object)) == "edje")
        edje_object_mirrored_set(object, elm_object_mirrored_get(widget));
    for (Evas_Object* member : membersOf(object))
        turn(member, widget);
}

std::vector<Evas_Object*> windows() {
    std::vector<Evas_Object*> result;
    for (const Ecore_Evas* window : takeList<Ecore_Evas>(ecore_evas_ecore_evas_list_get())) {
        const Evas* canvas = ecore_evas_get(window);
        for (Evas_Object* object = evas_object_bottom_get(canvas); object;
             object = evas_object_above_get(object))
            if (!evas_object_smart_parent_get(object))
                result.push_back(object);
    }
    return result;
}

void collectLists(Evas_Object* object, std::vector<Evas_Object*>& lists) {
    if (elm_object_widget_check(object) && isList(object))
        lists.push_back(object);
    for (Evas_Object* member : membersOf(object))
        collectLists(member, lists);
}

std::vector<Evas_Object*> lists() {
    std::vector<Evas_Object*> result;
    for (Evas_Object* object : windows())
        collectLists(object, result);
    return result;
}

} // namespace

void turnFaces(bool toTheLeft) {
    if (static_cast<bool>(elm_config_mirrored_get()) == toTheLeft)
        return;
    elm_config_mirrored_set(toTheLeft);
    for (Evas_Object* object : windows())
        turn(object, nullptr);
    // Only now: turning what is in a list would spoil it again.
    for (Evas_Object* list : lists())
        measureAgain(list);
}

void readFacesAgain() {
    for (const Evas_Object* list : lists())
        readRowsAgain(list);
}

} // namespace host
