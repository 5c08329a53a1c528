#include "support/TextInk.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <memory>
#include <set>
#include <string_view>
#include <utility>

#include <Ecore_Evas.h>

#include "support/FaceInk.h"

namespace {

/** Room around a text for what reaches out of it. */
constexpr int MARGIN = 40;
/** Paler pixels are the soft edge of a letter. */
constexpr std::uint32_t INK = 96;
/** A soft corner of a letter is no loss. */
constexpr std::size_t MOST_LOST = 2;
constexpr std::size_t MOST_SHARED = 2;

struct CanvasDeleter {
    void operator()(Ecore_Evas* canvas) const { ecore_evas_free(canvas); }
};
using Canvas = std::unique_ptr<Ecore_Evas, CanvasDeleter>;

bool isA(const Evas_Object* object, std::string_view type) {
    return evas_object_type_get(object) == type;
}

Evas_Object* lineCopy(Evas* canvas, const Evas_Object* text) {
    const char* font = nullptr;
    Evas_Font_Size size = 0;
    evas_object_text_font_get(text, &font, &size);
    Evas_Object* copy = evas_object_text_add(canvas);
    evas_object_text_font_set(copy, font, size);
    evas_object_text_text_set(copy, evas_object_text_text_get(text));
    evas_object_color_set(copy, 255, 255, 255, 255);
    return copy;
}

/** With dots where the original has them. */
Evas_Object* blockCopy(Evas* canvas, Evas_Object* block) {
    Evas_Object* copy = evas_object_textblock_add(canvas);
    evas_object_textblock_legacy_newline_set(copy, evas_object_textblock_legacy_newline_get(block));
    // What is shared is only read.
    evas_object_textblock_style_set(
        copy, const_cast<Evas_Textblock_Style*>(evas_object_textblock_style_get(block)));
    if (const Evas_Textblock_Style* user = evas_object_textblock_style_user_peek(block))
        evas_object_textblock_style_user_push(copy, const_cast<Evas_Textblock_Style*>(user));
    evas_object_textblock_valign_set(copy, evas_object_textblock_valign_get(block));
    unsigned fit = TEXTBLOCK_FIT_MODE_NONE;
    evas_textblock_fit_options_get(block, &fit);
    if (fit != TEXTBLOCK_FIT_MODE_NONE) {
        std::size_t count = 0;
        evas_textblock_fit_size_array_get(block, nullptr, &count, 0);
        std::vector<unsigned> sizes(count);
        evas_textblock_fit_size_array_get(block, sizes.data(), &count, count);
        evas_textblock_fit_size_array_set(copy, sizes.data(), sizes.size());
        evas_textblock_fit_options_set(copy, fit);
    }
    int width = 0;
    int height = 0;
    evas_object_geometry_get(block, nullptr, nullptr, &width, &height);
    evas_object_resize(copy, width, height);
    evas_object_textblock_text_markup_set(copy, evas_object_textblock_text_markup_get(block));
    return copy;
}

/** Coloured pixels, counted from the corner of the object. */
std::vector<Spot> pixelsOf(Evas_Object* object) {
    int width = 0;
    int height = 0;
    evas_object_geometry_get(object, nullptr, nullptr, &width, &height);
    const int across = std::max(1, width) + 2 * MARGIN;
    const int down = std::max(1, height) + 2 * MARGIN;
    const Canvas canvas(ecore_evas_buffer_new(across, down));
    ecore_evas_alpha_set(canvas.get(), EINA_TRUE);
    Evas* evas = ecore_evas_get(canvas.get());
    Evas_Object* copy = isA(object, "text") ? lineCopy(evas, object) : blockCopy(evas, object);
    evas_object_move(copy, MARGIN, MARGIN);
    evas_object_show(copy);
    ecore_evas_manual_render(canvas.get());
    const auto* drawn =
        static_cast<const std::uint32_t*>(ecore_evas_buffer_pixels_get(canvas.get()));
    std::vector<Spot> pixels;
    for (int y = 0; drawn && y < down; ++y)
        for (int x = 0; x < across; ++x)
            if (drawn[y * across + x] >> 24U >= INK)
                pixels.push_back({x - MARGIN, y - MARGIN});
    return pixels;
}

InkArea areaOf(const Evas_Object* object) {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    evas_object_geometry_get(object, &x, &y, &width, &height);
    return {1.0 * x, 1.0 * y, 1.0 * width, 1.0 * height};
}

const Evas_Object* rowAround(const Evas_Object* object) {
    for (; object; object = evas_object_smart_parent_get(object)) {
        const char* group = nullptr;
        if (isA(object, "edje"))
            edje_object_file_get(object, nullptr, &group);
        if (group && std::string_view(group).starts_with("elm/genlist/item"))
            return object;
    }
    return nullptr;
}

const Evas_Object* listAround(const Evas_Object* row) {
    for (; row; row = evas_object_smart_parent_get(row))
        if (elm_object_widget_check(row) &&
            std::string_view(elm_object_widget_type_get(row)) == "Elm_Genlist")
            return row;
    return nullptr;
}

bool isInside(const InkArea& inner, const InkArea& outer) {
    return inner.y >= outer.y && inner.y + inner.height <= outer.y + outer.height;
}

/** Null for what lies on the canvas itself. */
const Evas_Object* surfaceOf(const Evas_Object* object) {
    const Evas_Object* surface = nullptr;
    while ((object = evas_object_smart_parent_get(object)))
        surface = object;
    return surface;
}

/** What is left of the face by what an object is clipped by, and by its row. */
InkArea roomOf(const Evas_Object* object) {
    std::vector<InkArea> borders;
    for (const Evas_Object* clip = evas_object_clip_get(object); clip;
         clip = evas_object_clip_get(clip))
        borders.push_back(drawnArea(clip, areaOf(clip)));
    if (const Evas_Object* row = rowAround(object))
        borders.push_back(drawnArea(row, areaOf(row)));
    InkArea room{0, 0, Stage::SIZE, Stage::SIZE};
    for (const InkArea& border : borders) {
        const double right = std::min(room.x + room.width, border.x + border.width);
        const double bottom = std::min(room.y + room.height, border.y + border.height);
        room.x = std::max(room.x, border.x);
        room.y = std::max(room.y, border.y);
        room.width = right - room.x;
        room.height = bottom - room.y;
    }
    return room;
}

bool holds(const InkArea& room, double x, double y) {
    return x >= room.x && x < room.x + room.width && y >= room.y && y < room.y + room.height;
}

TextInk inkOf(const FoundText& found) {
    TextInk ink;
    ink.text = found.text;
    ink.object = found.object;
    ink.surface = surfaceOf(found.object);
    const Evas_Object* row = rowAround(found.object);
    const Evas_Object* list = listAround(row);
    ink.isScrolledOut = list && !isInside(areaOf(row), areaOf(list));
    const InkArea room = roomOf(found.object);
    const InkArea place = areaOf(found.object);
    for (const Spot& pixel : pixelsOf(found.object)) {
        const InkArea drawn = drawnArea(found.object, {place.x + pixel.x, place.y + pixel.y, 1, 1});
        const double x = drawn.x + drawn.width / 2;
        const double y = drawn.y + drawn.height / 2;
        if (!holds(room, x, y))
            ++ink.lost;
        else
            ink.pixels.push_back({static_cast<int>(x), static_cast<int>(y)});
    }
    return ink;
}

std::size_t sharedPixels(const TextInk& a, const TextInk& b) {
    std::set<std::pair<int, int>> first;
    for (const Spot& pixel : a.pixels)
        first.emplace(pixel.x, pixel.y);
    std::set<std::pair<int, int>> shared;
    for (const Spot& pixel : b.pixels)
        if (first.contains({pixel.x, pixel.y}))
            shared.emplace(pixel.x, pixel.y);
    return shared.size();
}

std::string withoutDots(std::string style) {
    const std::string_view attribute = "ellipsis=";
    const auto start = style.find(attribute);
    if (start == std::string::npos)
        return style;
    return style.erase(start, style.find_first_of(" '", start) - start);
}

} // namespace

std::vector<TextInk> textInkOf(const std::vector<FoundText>& texts) {
    std::vector<TextInk> inks;
    inks.reserve(texts.size());
    for (const FoundText& found : texts)
        inks.push_back(inkOf(found));
    return inks;
}

std::vector<std::string> inkFaultsOf(const std::vector<FoundText>& texts) {
    std::vector<TextInk> inks = textInkOf(texts);
    std::erase_if(inks, [](const TextInk& ink) { return ink.isScrolledOut; });
    std::vector<std::string> faults;
    for (auto ink = inks.begin(); ink != inks.end(); ++ink) {
        if (ink->lost == 0 && ink->pixels.empty())
            faults.push_back(ink->text + " colours no pixel");
        if (ink->lost > MOST_LOST)
            faults.push_back(ink->text + " loses " + std::to_string(ink->lost) + " pixels");
        for (auto other = ink + 1; other != inks.end(); ++other)
            if (ink->surface == other->surface && sharedPixels(*ink, *other) > MOST_SHARED)
                faults.push_back(ink->text + " overlaps " + other->text);
    }
    return faults;
}

bool endsInDots(const FoundText& found) {
    if (!isA(found.object, "textblock"))
        return false;
    const Evas_Textblock_Style* style = evas_object_textblock_style_get(found.object);
    const char* text = style ? evas_textblock_style_get(style) : nullptr;
    if (!text || withoutDots(text) == text)
        return false;
    Evas_Object* copy = blockCopy(evas_object_evas_get(found.object), found.object);
    Evas_Textblock_Style* whole = evas_textblock_style_new();
    evas_textblock_style_set(whole, withoutDots(text).c_str());
    evas_object_textblock_style_set(copy, whole);
    int width = 0;
    int height = 0;
    evas_object_textblock_size_formatted_get(copy, &width, &height);
    const InkArea place = areaOf(found.object);
    evas_object_del(copy);
    evas_textblock_style_free(whole);
    return width > place.width || height > place.height;
}
