#include "FocusList.h"

#include <algorithm>
#include <string_view>

#include "EvasLists.h"
#include "RowParts.h"
#include "ThemeNames.h"

namespace host {

namespace {

Elm_Object_Item* stepFrom(Elm_Object_Item* item, int direction) {
    return direction > 0 ? elm_genlist_item_next_get(item) : elm_genlist_item_prev_get(item);
}

bool mayHaveFocus(const Elm_Object_Item* item) {
    return elm_object_item_data_get(item) && !elm_object_item_disabled_get(item);
}

/** Rows are drawn when the list is laid out next: that is asked for now. */
void bringIntoSight(Elm_Object_Item* item) {
    if (boxOfRow(item))
        return;
    elm_genlist_item_show(item, ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
    evas_smart_objects_calculate(evas_object_evas_get(elm_object_item_widget_get(item)));
}

bool isMark(const FocusThing& thing) {
    const char* type = elm_object_widget_type_get(thing.object);
    const std::string_view name = type ? type : "";
    return name == "Elm_Check" || name == "Elm_Radio";
}

FocusBox viewOf(const Evas_Object* list) {
    FocusBox view = boxOf(list);
    elm_scroller_region_get(list, nullptr, nullptr, &view.width, &view.height);
    return view;
}

} // namespace

bool actsForItself(const Evas_Object* mark) {
    for (const Evas_Object* o = evas_object_smart_parent_get(mark); o;
         o = evas_object_smart_parent_get(o)) {
        if (std::string_view(evas_object_type_get(o)) == "edje" &&
            edje_object_data_get(o, theme::DATA_OWN_FOCUS))
            return true;
    }
    return false;
}

bool canPressRow(const Elm_Object_Item* item) {
    const Elm_Object_Select_Mode mode = elm_genlist_item_select_mode_get(item);
    return mayHaveFocus(item) && mode != ELM_OBJECT_SELECT_MODE_NONE &&
           mode != ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY;
}

std::optional<FocusBox> boxOfRow(Elm_Object_Item* item) {
    const auto* tracker = static_cast<Evas_Object*>(elm_object_item_track(item));
    const auto box = tracker ? std::optional(boxOf(tracker)) : std::nullopt;
    elm_object_item_untrack(item);
    return box;
}

std::vector<FocusThing> FocusList::inItem(Elm_Object_Item* item) const {
    const auto box = boxOfRow(item);
    if (!box || !mayHaveFocus(item))
        return {};
    std::vector<FocusThing> things;
    bool rowActs = true;
    for (FocusThing& thing : thingsIn(contentsOfRow(item), elm_object_mirrored_get(_list))) {
        if (!box->contains(box->middleX(), thing.box.middleY()))
            continue;
        if (isMark(thing) && !actsForItself(thing.object))
            continue;
        rowActs = rowActs && isMark(thing);
        things.push_back(thing);
    }
    if (rowActs && canPressRow(item))
        things.insert(things.begin(), {FocusKind::Row, _list, _list, item, 0, *box});
    for (std::size_t place = 0; place < things.size(); ++place) {
        things[place].list = _list;
        things[place].item = item;
        things[place].place = static_cast<int>(place);
    }
    return things;
}

bool FocusList::isInSight(const FocusThing& thing) const {
    const FocusBox view = viewOf(_list);
    return view.contains(view.middleX(), thing.box.middleY());
}

std::vector<FocusThing> FocusList::inSight() const {
    std::vector<FocusThing> all;
    for (Elm_Object_Item* item : takeList<Elm_Object_Item>(elm_genlist_realized_items_get(_list))) {
        for (const FocusThing& thing : inItem(item))
            if (isInSight(thing))
                all.push_back(thing);
    }
    std::stable_sort(all.begin(), all.end(), [](const FocusThing& a, const FocusThing& b) {
        return a.item != b.item && a.box.middleY() < b.box.middleY();
    });
    return all;
}

std::optional<FocusThing> FocusList::edge(int direction) const {
    const std::vector<FocusThing> things = inSight();
    if (things.empty())
        return std::nullopt;
    return direction > 0 ? things.front() : things.back();
}

std::optional<FocusThing> FocusList::beside(const FocusThing& thing, int direction) const {
    const std::vector<FocusThing> here = inItem(thing.item);
    const int place = thing.place + direction;
    if (place >= 0 && place < static_cast<int>(here.size()))
        return here[static_cast<std::size_t>(place)];
    for (Elm_Object_Item* item = stepFrom(thing.item, direction); item;
         item = stepFrom(item, direction)) {
        if (!mayHaveFocus(item))
            continue;
        bringIntoSight(item);
        const std::vector<FocusThing> things = inItem(item);
        if (!things.empty())
            return direction > 0 ? things.front() : things.back();
    }
    return std::nullopt;
}

std::optional<FocusThing> FocusList::find(const FocusThing& thing, bool scroll) const {
    // Its row may be gone: it is only compared until it is found.
    Elm_Object_Item* item = elm_genlist_first_item_get(_list);
    while (item && item != thing.item)
        item = elm_genlist_item_next_get(item);
    if (!item)
        return std::nullopt;
    if (scroll)
        bringIntoSight(item);
    const std::vector<FocusThing> things = inItem(item);
    const auto place = static_cast<std::size_t>(thing.place);
    return place < things.size() ? std::optional(things[place]) : std::nullopt;
}

std::optional<FocusThing> FocusList::inRow(int index, int place) const {
    const int last = static_cast<int>(elm_genlist_items_count(_list)) - 1;
    Elm_Object_Item* item =
        last < 0 ? nullptr
                 : elm_genlist_nth_item_get(_list, static_cast<unsigned>(std::min(index, last)));
    if (!item)
        return std::nullopt;
    bringIntoSight(item);
    const std::vector<FocusThing> things = inItem(item);
    if (things.empty())
        return std::nullopt;
    return things[std::min(static_cast<std::size_t>(place), things.size() - 1)];
}

void bringToMiddle(const FocusThing& thing) {
    if (!thing.list)
        return;
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    elm_scroller_region_get(thing.list, &x, &y, &width, &height);
    const FocusBox view = viewOf(thing.list);
    elm_scroller_region_bring_in(thing.list, x, y + thing.box.middleY() - view.middleY(), width,
                                 height);
}

} // namespace host
