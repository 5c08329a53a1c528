#include "FaceTexts.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdlib>
#include <string_view>
#include <utility>

#include <Elementary.h>

namespace host {

namespace {

/** An object that draws something itself; the others only group objects. */
bool isPrimitive(const Evas_Object* object) {
    static constexpr std::array<std::string_view, 12> TYPES = {
        "rectangle", "line",    "polygon", "text",     "textblock", "textgrid",
        "image",     "vectors", "vg",      "snapshot", "node",      "efl.canvas.image"};
    const std::string_view type = evas_object_type_get(object);
    return std::find(TYPES.begin(), TYPES.end(), type) != TYPES.end();
}

void walk(Evas_Object* object, void (*visit)(Evas_Object*, void*), void* data) {
    visit(object, data);
    if (isPrimitive(object))
        return;
    Eina_List* const members = evas_object_smart_members_get(object);
    for (const Eina_List* at = members; at; at = eina_list_next(at))
        walk(static_cast<Evas_Object*>(eina_list_data_get(at)), visit, data);
    eina_list_free(members);
}

/** The text that an object draws; empty for any other object. */
std::string drawnText(Evas_Object* object) {
    const std::string_view type = evas_object_type_get(object);
    if (type == "text") {
        const char* text = evas_object_text_text_get(object);
        return text ? text : "";
    }
    if (type != "textblock")
        return {};
    const char* markup = evas_object_textblock_text_markup_get(object);
    char* plain = markup ? evas_textblock_text_markup_to_utf8(object, markup) : nullptr;
    std::string text = plain ? plain : "";
    std::free(plain);
    return text;
}

Area geometryOf(const Evas_Object* object) {
    Area area;
    evas_object_geometry_get(object, &area.x, &area.y, &area.width, &area.height);
    return area;
}

/** What a map makes of an area of its object. Such maps only move and scale. */
Area mapped(const Area& area, const Evas_Object* object) {
    constexpr int CORNERS = 4;
    constexpr int LOWER_RIGHT = 2;
    const Evas_Map* map = evas_object_map_get(object);
    const Area whole = geometryOf(object);
    if (!map || evas_map_count_get(map) != CORNERS || whole.isEmpty())
        return area;
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;
    evas_map_point_coord_get(map, 0, &left, &top, nullptr);
    evas_map_point_coord_get(map, LOWER_RIGHT, &right, &bottom, nullptr);
    const double scaleX = static_cast<double>(right - left) / whole.width;
    const double scaleY = static_cast<double>(bottom - top) / whole.height;
    const auto rounded = [](double number) {
        return static_cast<int>(std::lround(number));
    };
    return {rounded(left + scaleX * (area.x - whole.x)), rounded(top + scaleY * (area.y - whole.y)),
            rounded(scaleX * area.width), rounded(scaleY * area.height)};
}

/** Where an object is drawn: rows near the rim are drawn smaller than they are. */
Area drawnArea(const Evas_Object* object) {
    Area area = geometryOf(object);
    for (const Evas_Object* at = object; at; at = evas_object_smart_parent_get(at))
        if (evas_object_map_enable_get(at))
            area = mapped(area, at);
    return area;
}

/** How much of an object's colours its maps leave, 0 to 255. */
int opacityOf(const Evas_Object* object) {
    int opacity = 255;
    for (const Evas_Object* at = object; at; at = evas_object_smart_parent_get(at)) {
        int own = 255;
        if (evas_object_map_enable_get(at))
            evas_map_point_color_get(evas_object_map_get(at), 0, nullptr, nullptr, nullptr, &own);
        opacity = std::min(opacity, own);
    }
    return opacity;
}

Area intersection(const Area& a, const Area& b) {
    const int left = std::max(a.x, b.x);
    const int top = std::max(a.y, b.y);
    const int right = std::min(a.x + a.width, b.x + b.width);
    const int bottom = std::min(a.y + a.height, b.y + b.height);
    return {left, top, std::max(0, right - left), std::max(0, bottom - top)};
}

/** From the object itself to what lies directly on the canvas. */
std::vector<Evas_Object*> ancestry(Evas_Object* object) {
    std::vector<Evas_Object*> chain;
    for (; object; object = evas_object_smart_parent_get(object))
        chain.push_back(object);
    return chain;
}

/** What a touch of a place gets; null for nothing. */
Evas_Object* touchedAt(Evas* canvas, int x, int y) {
    Eina_List* const touched = evas_tree_objects_at_xy_get(canvas, nullptr, x, y);
    Evas_Object* taker = nullptr;
    for (const Eina_List* at = touched; at && !taker; at = eina_list_next(at)) {
        auto* object = static_cast<Evas_Object*>(eina_list_data_get(at));
        // One that repeats events listens, and leaves them to what lies below.
        if (!evas_object_repeat_events_get(object))
            taker = object;
    }
    eina_list_free(touched);
    return taker;
}

Evas_Object* widgetAround(Evas_Object* object) {
    while (object && !elm_object_widget_check(object))
        object = evas_object_smart_parent_get(object);
    return object;
}

/** True when one object is drawn above another that has nothing to do with it. */
bool isAbove(const Evas_Object* object, const Evas_Object* other) {
    const short layer = evas_object_layer_get(object);
    const short otherLayer = evas_object_layer_get(other);
    if (layer != otherLayer)
        return layer > otherLayer;
    for (const Evas_Object* at = evas_object_above_get(other); at; at = evas_object_above_get(at))
        if (at == object)
            return true;
    return false;
}

bool isCovered(Evas_Object* text, const Area& seen) {
    Evas_Object* touched =
        touchedAt(evas_object_evas_get(text), seen.x + seen.width / 2, seen.y + seen.height / 2);
    if (!touched)
        return false;
    const auto below = ancestry(text);
    const auto above = ancestry(touched);
    if (below.back() != above.back())
        return isAbove(above.back(), below.back());
    // A button over the rows of a list takes what is meant for them.
    const Evas_Object* widget = widgetAround(touched);
    return widget && std::find(below.begin(), below.end(), widget) == below.end() &&
           std::find(above.begin(), above.end(), widgetAround(text)) == above.end();
}

void appendText(Evas_Object* object, void* data) {
    const std::string text = drawnText(object);
    const Area seen = text.empty() ? Area{} : seenArea(object);
    if (seen.isEmpty())
        return;
    constexpr int READABLE = 128;
    static_cast<std::vector<FaceText>*>(data)->push_back(
        {text, drawnArea(object), seen, isCovered(object, seen), opacityOf(object) < READABLE});
}

} // namespace

Area seenArea(const Evas_Object* object) {
    Evas* canvas = evas_object_evas_get(object);
    Area face;
    evas_output_size_get(canvas, &face.width, &face.height);
    if (opacityOf(object) == 0)
        return {};
    Area area = intersection(drawnArea(object), face);
    for (const Evas_Object* at = object; at; at = evas_object_clip_get(at)) {
        int alpha = 0;
        evas_object_color_get(at, nullptr, nullptr, nullptr, &alpha);
        if (!evas_object_visible_get(at) || alpha == 0)
            return {};
        area = intersection(area, drawnArea(at));
    }
    // A smart object hides its members without touching them.
    for (const Evas_Object* at = evas_object_smart_parent_get(object); at;
         at = evas_object_smart_parent_get(at))
        if (!evas_object_visible_get(at))
            return {};
    return area;
}

void walkCanvas(Evas* canvas, void (*visit)(Evas_Object*, void*), void* data) {
    for (Evas_Object* object = evas_object_bottom_get(canvas); object;
         object = evas_object_above_get(object))
        if (!evas_object_smart_parent_get(object))
            walk(object, visit, data);
}

std::vector<FaceText> faceTexts(Evas* canvas) {
    std::vector<FaceText> texts;
    walkCanvas(canvas, appendText, &texts);
    std::stable_sort(texts.begin(), texts.end(), [](const FaceText& a, const FaceText& b) {
        return std::pair(a.seen.y, a.seen.x) < std::pair(b.seen.y, b.seen.x);
    });
    return texts;
}

} // namespace host
