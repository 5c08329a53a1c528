#include "FocusView.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <string_view>

#include "BackKey.h"
#include "EvasLists.h"
#include "FocusList.h"
#include "ThemeNames.h"
#include "TimePicker.h"
#include "TimeWheel.h"

namespace host {

namespace {

struct WidgetKind {
    std::string_view type;
    FocusKind kind;
};

constexpr std::array WIDGET_KINDS = {
    WidgetKind{"Elm_Button", FocusKind::Button},     WidgetKind{"Elm_Check", FocusKind::Button},
    WidgetKind{"Elm_Slider", FocusKind::Slider},     WidgetKind{"Elm_Entry", FocusKind::Field},
    WidgetKind{"Elm_Calendar", FocusKind::Calendar}, WidgetKind{"Elm_Index", FocusKind::Index},
};

std::string_view typeOf(const Evas_Object* object) {
    const char* type =
        elm_object_widget_check(object) ? elm_object_widget_type_get(object) : nullptr;
    return type ? type : "";
}

std::optional<FocusKind> kindOf(const Evas_Object* object) {
    if (TimeWheel::of(object))
        return FocusKind::Wheel;
    const std::string_view type = typeOf(object);
    for (const WidgetKind& known : WIDGET_KINDS)
        if (known.type == type)
            return known.kind;
    return std::nullopt;
}

bool isHidden(const Evas_Object* object) {
    if (!evas_object_visible_get(object))
        return true;
    for (const Evas_Object* clip = evas_object_clip_get(object); clip;
         clip = evas_object_clip_get(clip))
        if (!evas_object_visible_get(clip))
            return true;
    return false;
}

/** Where a part of a layout is on the canvas; the whole object when it has no such part. */
FocusBox boxOfPart(Evas_Object* object, const char* part) {
    FocusBox box = boxOf(object);
    FocusBox inside;
    if (edje_object_part_geometry_get(elm_layout_edje_get(object), part, &inside.x, &inside.y,
                                      &inside.width, &inside.height)) {
        inside.x += box.x;
        inside.y += box.y;
        box = inside;
    }
    return box;
}

FocusBox boxOfThing(Evas_Object* object, FocusKind kind) {
    if (kind == FocusKind::Calendar)
        return boxOfPart(object, theme::PART_CALENDAR_WEEKS);
    if (kind == FocusKind::Index)
        return boxOfPart(object, theme::PART_INDEX_TOUCH);
    return boxOf(object);
}

Evas_Object* topPage(Evas_Object* pages) {
    Elm_Object_Item* top = elm_naviframe_top_item_get(pages);
    Evas_Object* content = top ? elm_object_item_content_get(top) : nullptr;
    // The page's own layout has the title buttons as well.
    return content ? elm_object_parent_widget_get(content) : nullptr;
}

} // namespace

/** Goes through the widgets of a page. */
class FocusCollector {
public:
    using Part = FocusView::Part;

    void walk(Evas_Object* object) {
        if (isHidden(object))
            return;
        const std::optional<FocusKind> kind = kindOf(object);
        if (const TimePicker* picker = TimePicker::of(object))
            addPicker(object, *picker);
        else if (typeOf(object) == "Elm_Genlist")
            _parts.push_back({object, {}, boxOf(object)});
        else if (kind)
            add(object, *kind);
        // A calendar has buttons in it.
        if (!kind || *kind == FocusKind::Calendar)
            walkMembers(object);
    }

    void walkMembers(Evas_Object* object) {
        if (typeOf(object) == "Elm_Genlist" || TimePicker::of(object))
            return;
        for (Evas_Object* member : membersOf(object))
            walk(member);
    }

    std::vector<Part> inOrder(bool mirrored) const {
        std::vector<FocusBox> boxes;
        std::transform(_parts.begin(), _parts.end(), std::back_inserter(boxes),
                       [](const Part& part) { return part.box; });
        std::vector<Part> ordered;
        for (const std::size_t i : readingOrder(boxes, mirrored))
            ordered.push_back(_parts[i]);
        putIndexesFirst(ordered);
        return ordered;
    }

private:
    void add(Evas_Object* object, FocusKind kind) {
        if (elm_object_disabled_get(object))
            return;
        const FocusBox box = boxOfThing(object, kind);
        _parts.push_back({nullptr, {{kind, object, nullptr, nullptr, 0, box}}, box});
    }

    void addPicker(Evas_Object* object, const TimePicker& picker) {
        Part part{nullptr, {}, boxOf(object)};
        for (const TimeWheel* wheel : picker.wheels())
            if (!elm_object_disabled_get(wheel->object()))
                part.things.push_back({FocusKind::Wheel, wheel->object(), nullptr, nullptr, 0,
                                       boxOf(wheel->object())});
        if (!part.things.empty())
            _parts.push_back(part);
    }

    /** Whoever has picked an hour goes on to the rows that it has led to. */
    static void putIndexesFirst(std::vector<Part>& parts) {
        for (std::size_t i = 1; i < parts.size(); ++i) {
            const bool isIndex =
                !parts[i].things.empty() && parts[i].things.front().kind == FocusKind::Index;
            if (isIndex && parts[i - 1].list)
                std::swap(parts[i - 1], parts[i]);
        }
    }

    std::vector<Part> _parts;
};

bool isSame(const FocusThing& a, const FocusThing& b) {
    if (a.item || b.item)
        return a.item == b.item && a.place == b.place;
    return a.object == b.object;
}

FocusBox boxOf(const Evas_Object* object) {
    FocusBox box;
    evas_object_geometry_get(object, &box.x, &box.y, &box.width, &box.height);
    return box;
}

std::vector<FocusThing> thingsIn(const std::vector<Evas_Object*>& objects, bool mirrored) {
    FocusCollector collector;
    for (Evas_Object* object : objects)
        collector.walk(object);
    std::vector<FocusThing> things;
    for (const auto& part : collector.inOrder(mirrored))
        things.insert(things.end(), part.things.begin(), part.things.end());
    return things;
}

Evas_Object* focusRoot(const Evas_Object* window) {
    Evas_Object* closed = backKeyObject(window);
    return typeOf(closed) == "Elm_Naviframe" ? topPage(closed) : closed;
}

FocusView::FocusView(Evas_Object* root) : _root(root) {
    FocusCollector collector;
    collector.walkMembers(root);
    _parts = collector.inOrder(mirrored());
}

bool FocusView::mirrored() const {
    return elm_object_mirrored_get(_root);
}

std::optional<FocusThing> FocusView::last() const {
    return _parts.empty() ? std::nullopt : edge(_parts.size() - 1, -1);
}

/** The first thing of a part, or the last one, going on to other parts while there is none. */
std::optional<FocusThing> FocusView::edge(std::size_t part, int direction) const {
    for (; part < _parts.size(); part += static_cast<std::size_t>(direction)) {
        const Part& here = _parts[part];
        if (here.list) {
            if (const auto thing = FocusList(here.list).edge(direction))
                return thing;
        } else {
            return direction > 0 ? here.things.front() : here.things.back();
        }
    }
    return std::nullopt;
}

std::vector<FocusThing> FocusView::inSight() const {
    std::vector<FocusThing> things;
    for (const Part& part : _parts) {
        const auto some = part.list ? FocusList(part.list).inSight() : part.things;
        things.insert(things.end(), some.begin(), some.end());
    }
    return things;
}

std::optional<FocusThing> FocusView::nearest() const {
    const std::vector<FocusThing> things = inSight();
    std::vector<FocusBox> boxes;
    std::transform(things.begin(), things.end(), std::back_inserter(boxes),
                   [](const FocusThing& thing) { return thing.box; });
    int width = 0;
    int height = 0;
    evas_output_viewport_get(evas_object_evas_get(_root), nullptr, nullptr, &width, &height);
    const auto place = nearestBox(boxes, width / 2, height / 2);
    return place ? std::optional(things[*place]) : std::nullopt;
}

std::optional<FocusThing> FocusView::beside(const FocusThing& thing, int direction) const {
    for (std::size_t i = 0; i < _parts.size(); ++i) {
        const Part& part = _parts[i];
        if (part.list && part.list == thing.list) {
            const auto next = FocusList(part.list).beside(thing, direction);
            return next ? next : edge(i + static_cast<std::size_t>(direction), direction);
        }
        const auto here = std::find_if(part.things.begin(), part.things.end(),
                                       [&](const FocusThing& t) { return isSame(t, thing); });
        if (here == part.things.end())
            continue;
        const auto next = (here - part.things.begin()) + direction;
        if (next >= 0 && next < static_cast<std::ptrdiff_t>(part.things.size()))
            return part.things[static_cast<std::size_t>(next)];
        return edge(i + static_cast<std::size_t>(direction), direction);
    }
    return std::nullopt;
}

std::optional<FocusThing> FocusView::find(const FocusThing& thing, bool scroll) const {
    for (const Part& part : _parts) {
        if (part.list && part.list == thing.list)
            return FocusList(part.list).find(thing, scroll);
        for (const FocusThing& here : part.things)
            if (isSame(here, thing))
                return here;
    }
    return std::nullopt;
}

std::optional<FocusThing> FocusView::inRow(int index, int place) const {
    for (const Part& part : _parts)
        if (part.list)
            return FocusList(part.list).inRow(index, place);
    return std::nullopt;
}

Evas_Object* FocusView::button() const {
    for (const Part& part : _parts)
        for (const FocusThing& thing : part.things)
            if (thing.kind == FocusKind::Button)
                return thing.object;
    return nullptr;
}

std::optional<FocusThing> FocusView::under(int x, int y) const {
    for (const FocusThing& thing : inSight())
        if (thing.box.contains(x, y))
            return thing;
    return std::nullopt;
}

} // namespace host
