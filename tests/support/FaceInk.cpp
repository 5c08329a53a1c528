#include "support/FaceInk.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <sstream>
#include <string_view>

#include <Edje.h>

namespace {

constexpr double MIDDLE = 180;
constexpr double RADIUS = 180;
/** What is fainter than this is on its way out. */
constexpr double FAINT = 0.08;

InkArea areaOf(const Evas_Object* object) {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    evas_object_geometry_get(object, &x, &y, &width, &height);
    return {1.0 * x, 1.0 * y, 1.0 * width, 1.0 * height};
}

InkArea intersection(const InkArea& a, const InkArea& b) {
    const double left = std::max(a.x, b.x);
    const double top = std::max(a.y, b.y);
    const double right = std::min(a.x + a.width, b.x + b.width);
    const double bottom = std::min(a.y + a.height, b.y + b.height);
    return {left, top, std::max(0.0, right - left), std::max(0.0, bottom - top)};
}

bool isEmpty(const InkArea& area) {
    return area.width <= 0 || area.height <= 0;
}

/** The map that an object is drawn through; null when it is drawn as it is. */
const Evas_Map* mapOf(const Evas_Object* object) {
    return evas_object_map_enable_get(object) ? evas_object_map_get(object) : nullptr;
}

/** Maps here shrink and move, and never turn: two corners tell all. */
InkArea through(const Evas_Map* map, const Evas_Object* object, const InkArea& area) {
    const InkArea whole = areaOf(object);
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;
    evas_map_point_coord_get(map, 0, &left, &top, nullptr);
    evas_map_point_coord_get(map, 2, &right, &bottom, nullptr);
    const double scaleX = (right - left) / whole.width;
    const double scaleY = (bottom - top) / whole.height;
    return {left + (area.x - whole.x) * scaleX, top + (area.y - whole.y) * scaleY,
            area.width * scaleX, area.height * scaleY};
}

double alphaOf(const Evas_Object* object) {
    int alpha = 255;
    evas_object_color_get(object, nullptr, nullptr, nullptr, &alpha);
    return alpha / 255.0;
}

double alphaOf(const Evas_Map* map) {
    int alpha = 255;
    evas_map_point_color_get(map, 0, nullptr, nullptr, nullptr, &alpha);
    return alpha / 255.0;
}

/** 0 when the object, or something it is part of or clipped by, is hidden. */
double opacityOf(const Evas_Object* object) {
    double opacity = 1;
    for (const Evas_Object* o = object; o != nullptr; o = evas_object_clip_get(o)) {
        if (!evas_object_visible_get(o))
            return 0;
        opacity *= alphaOf(o);
    }
    for (const Evas_Object* o = evas_object_smart_parent_get(object); o != nullptr;
         o = evas_object_smart_parent_get(o)) {
        if (!evas_object_visible_get(o))
            return 0;
        if (const Evas_Map* map = mapOf(o))
            opacity *= alphaOf(map);
    }
    return opacity;
}

const Evas_Object* mappedAround(const Evas_Object* object) {
    while (object != nullptr && mapOf(object) == nullptr)
        object = evas_object_smart_parent_get(object);
    return object;
}

/** What clippers leave of a rectangle of an object. */
InkArea seen(const Evas_Object* object, const InkArea& area) {
    InkArea left = intersection(drawnArea(object, area), {0, 0, 2 * MIDDLE, 2 * MIDDLE});
    for (const Evas_Object* o = evas_object_clip_get(object); o != nullptr;
         o = evas_object_clip_get(o))
        left = intersection(left, drawnArea(o, areaOf(o)));
    return left;
}

void add(std::vector<Ink>& found, Evas_Object* object, const std::string& what, const InkArea& area,
         bool isText) {
    const double opacity = opacityOf(object);
    const InkArea visible = opacity > 0 ? seen(object, area) : InkArea{};
    if (!isEmpty(visible))
        found.push_back({what, object, visible, opacity, isText});
}

std::string plainText(Evas_Object* block) {
    const char* markup = evas_object_textblock_text_markup_get(block);
    char* plain = markup == nullptr ? nullptr : evas_textblock_text_markup_to_utf8(block, markup);
    std::string text = plain == nullptr ? "" : plain;
    std::free(plain);
    return text;
}

void addLines(std::vector<Ink>& found, Evas_Object* block) {
    const std::string text = plainText(block);
    if (text.find_first_not_of(" \n") == std::string::npos)
        return;
    const InkArea whole = areaOf(block);
    Evas_Textblock_Cursor* cursor = evas_object_textblock_cursor_new(block);
    for (int line = 0; evas_textblock_cursor_line_set(cursor, line); ++line) {
        int x = 0;
        int y = 0;
        int width = 0;
        int height = 0;
        evas_textblock_cursor_line_geometry_get(cursor, &x, &y, &width, &height);
        const InkArea area{whole.x + x, whole.y + y, 1.0 * width, 1.0 * height};
        add(found, block, text, intersection(area, whole), true);
    }
    evas_textblock_cursor_free(cursor);
}

/** Clips others, softens them in the colour of the ground, or is what is around the face. */
bool isHelper(const Evas_Object* object) {
    int red = 0;
    int green = 0;
    int blue = 0;
    evas_object_color_get(object, &red, &green, &blue, nullptr);
    return evas_object_clipees_has(object) || red + green + blue == 0 ||
           evas_object_layer_get(object) == EVAS_LAYER_MAX;
}

/** A theme names in "bleed" what the rim is meant to cut: the grounds of what reaches the rim. */
bool isMeantToBeCut(Evas_Object* object) {
    Evas_Object* const group = evas_object_smart_parent_get(object);
    if (group == nullptr || std::string_view(evas_object_type_get(group)) != "edje")
        return false;
    const char* const parts = edje_object_data_get(group, "bleed");
    std::istringstream names(parts == nullptr ? "" : parts);
    for (std::string name; names >> name;) {
        if (edje_object_part_object_get(group, name.c_str()) == object)
            return true;
    }
    return false;
}

std::string groupOf(const Evas_Object* object) {
    const Evas_Object* const parent = evas_object_smart_parent_get(object);
    const char* group = nullptr;
    if (parent != nullptr && std::string_view(evas_object_type_get(parent)) == "edje")
        edje_object_file_get(parent, nullptr, &group);
    return group == nullptr ? "no group" : group;
}

void addRectangle(std::vector<Ink>& found, Evas_Object* rectangle) {
    if (!isHelper(rectangle) && !isMeantToBeCut(rectangle))
        add(found, rectangle, "rectangle of " + groupOf(rectangle), areaOf(rectangle), false);
}

/** Shapes are cut in nine one pixel inside their round corners. What a clipper has cut has none. */
double roundingOf(const Evas_Object* image, const InkArea& visible) {
    int border = 0;
    evas_object_image_border_get(image, &border, nullptr, nullptr, nullptr);
    const InkArea whole = areaOf(image);
    const InkArea drawn = drawnArea(image, whole);
    const bool isCut = visible.width < drawn.width || visible.height < drawn.height;
    return border == 0 || isCut ? 0 : (border + 1) * drawn.width / whole.width;
}

void addImage(std::vector<Ink>& found, Evas_Object* image) {
    if (isHelper(image))
        return;
    const char* file = nullptr;
    evas_object_image_file_get(image, &file, nullptr);
    const std::size_t before = found.size();
    add(found, image, file == nullptr ? "image" : file, areaOf(image), false);
    if (found.size() > before)
        found.back().rounding = roundingOf(image, found.back().area);
}

void addText(std::vector<Ink>& found, Evas_Object* object) {
    const char* text = evas_object_text_text_get(object);
    if (text != nullptr && *text != '\0')
        add(found, object, text, areaOf(object), true);
}

void visit(std::vector<Ink>& found, Evas_Object* object) {
    const std::string_view type = evas_object_type_get(object);
    if (type == "text")
        return addText(found, object);
    if (type == "textblock")
        return addLines(found, object);
    if (type == "image")
        return addImage(found, object);
    if (type == "rectangle")
        return addRectangle(found, object);
    if (type == "vg" || type == "line" || type == "polygon")
        return;
    Eina_List* members = evas_object_smart_members_get(object);
    for (const Eina_List* l = members; l != nullptr; l = eina_list_next(l))
        visit(found, static_cast<Evas_Object*>(eina_list_data_get(l)));
    eina_list_free(members);
}

std::string describe(const Ink& ink) {
    const auto number = [](double value) {
        return std::to_string(std::lround(value));
    };
    return ink.what + " at " + number(ink.area.x) + ", " + number(ink.area.y) + ", " +
           number(ink.area.width) + " x " + number(ink.area.height) + ", seen " +
           std::to_string(ink.opacity) + ", reaches " + number(ink.reach());
}

} // namespace

double InkArea::reach() const {
    const double across = std::max(std::abs(x - MIDDLE), std::abs(x + width - MIDDLE));
    const double down = std::max(std::abs(y - MIDDLE), std::abs(y + height - MIDDLE));
    return std::hypot(across, down);
}

double Ink::reach() const {
    const double corner = std::min({rounding, area.width / 2, area.height / 2});
    const InkArea middles{area.x + corner, area.y + corner, area.width - 2 * corner,
                          area.height - 2 * corner};
    return middles.reach() + corner;
}

InkArea drawnArea(const Evas_Object* object, InkArea area) {
    const Evas_Object* mapped = mappedAround(object);
    return mapped == nullptr ? area : through(mapOf(mapped), mapped, area);
}

std::vector<Ink> inkOf(const Evas* canvas) {
    std::vector<Ink> found;
    for (Evas_Object* object = evas_object_bottom_get(canvas); object != nullptr;
         object = evas_object_above_get(object)) {
        if (evas_object_smart_parent_get(object) == nullptr)
            visit(found, object);
    }
    return found;
}

std::vector<std::string> cutByCircle(const Evas* canvas) {
    std::vector<std::string> cut;
    for (const Ink& ink : inkOf(canvas)) {
        if (ink.opacity >= FAINT && ink.reach() > RADIUS)
            cut.push_back(describe(ink));
    }
    return cut;
}
