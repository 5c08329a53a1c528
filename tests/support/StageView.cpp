#include "support/Stage.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <set>
#include <string_view>

#include <Ecore_Evas.h>
#include <gtest/gtest.h>

#include "support/FaceInk.h"
#include "support/Picture.h"

namespace {

using Visitor = std::function<void(Evas_Object*)>;

/** An object that draws something itself; the others only group objects. */
bool isPrimitive(const Evas_Object* object) {
    static const std::set<std::string_view> types = {
        "rectangle", "line",    "polygon", "text",     "textblock", "textgrid",
        "image",     "vectors", "vg",      "snapshot", "node",      "efl.canvas.image"};
    return types.contains(evas_object_type_get(object));
}

void walk(Evas_Object* object, const Visitor& visit) {
    visit(object);
    if (isPrimitive(object)) {
        return;
    }
    Eina_List* const members = evas_object_smart_members_get(object);
    for (const Eina_List* l = members; l != nullptr; l = eina_list_next(l)) {
        walk(static_cast<Evas_Object*>(eina_list_data_get(l)), visit);
    }
    eina_list_free(members);
}

void walkCanvas(const Evas* canvas, const Visitor& visit) {
    for (Evas_Object* object = evas_object_bottom_get(canvas); object != nullptr;
         object = evas_object_above_get(object)) {
        // The list of a canvas holds what is in no smart object, and in some versions the rest too.
        if (evas_object_smart_parent_get(object) == nullptr) {
            walk(object, visit);
        }
    }
}

/** The text that an object draws; empty for any other object. */
std::string drawnText(Evas_Object* object) {
    const std::string_view type = evas_object_type_get(object);
    if (type == "text") {
        const char* const text = evas_object_text_text_get(object);
        return text == nullptr ? "" : text;
    }
    if (type != "textblock") {
        return {};
    }
    const char* const markup = evas_object_textblock_text_markup_get(object);
    char* const plain =
        markup == nullptr ? nullptr : evas_textblock_text_markup_to_utf8(object, markup);
    std::string text = plain == nullptr ? "" : plain;
    std::free(plain);
    return text;
}

/** Where it is drawn: rows shrink near the rim. */
Area geometry(const Evas_Object* object) {
    Area plain;
    evas_object_geometry_get(object, &plain.x, &plain.y, &plain.width, &plain.height);
    const InkArea drawn =
        drawnArea(object, {1.0 * plain.x, 1.0 * plain.y, 1.0 * plain.width, 1.0 * plain.height});
    const auto whole = [](double length) {
        return static_cast<int>(std::lround(length));
    };
    return {whole(drawn.x), whole(drawn.y), whole(drawn.width), whole(drawn.height)};
}

Area intersection(const Area& a, const Area& b) {
    const int left = std::max(a.x, b.x);
    const int top = std::max(a.y, b.y);
    const int right = std::min(a.x + a.width, b.x + b.width);
    const int bottom = std::min(a.y + a.height, b.y + b.height);
    return {left, top, std::max(0, right - left), std::max(0, bottom - top)};
}

/** What is left of an object inside its clippers; nothing when one of them is hidden. */
Area visibleArea(const Evas_Object* object) {
    Area area = intersection(geometry(object), {0, 0, Stage::SIZE, Stage::SIZE});
    for (const Evas_Object* o = object; o != nullptr; o = evas_object_clip_get(o)) {
        int alpha = 0;
        evas_object_color_get(o, nullptr, nullptr, nullptr, &alpha);
        if (!evas_object_visible_get(o) || alpha == 0) {
            return {};
        }
        area = intersection(area, geometry(o));
    }
    // A smart object hides its members without touching them.
    for (const Evas_Object* o = evas_object_smart_parent_get(object); o != nullptr;
         o = evas_object_smart_parent_get(o)) {
        if (!evas_object_visible_get(o)) {
            return {};
        }
    }
    return area;
}

bool isEmpty(const Area& area) {
    return area.width <= 0 || area.height <= 0;
}

Evas_Object* widgetAround(Evas_Object* object) {
    while (object != nullptr && !elm_object_widget_check(object)) {
        object = evas_object_smart_parent_get(object);
    }
    return object;
}

void appendText(std::vector<FoundText>& found, Evas_Object* object) {
    const std::string text = drawnText(object);
    const Area area = text.empty() ? Area{} : visibleArea(object);
    if (!isEmpty(area)) {
        found.push_back({text, object, widgetAround(object), area});
    }
}

void sortFromTheTop(std::vector<FoundText>& found) {
    std::ranges::stable_sort(found, [](const FoundText& a, const FoundText& b) {
        return std::pair(a.area.y, a.area.x) < std::pair(b.area.y, b.area.x);
    });
}

Picture pictureOf(Evas* canvas) {
    Ecore_Evas* const ee = ecore_evas_ecore_evas_get(canvas);
    ecore_evas_manual_render(ee);
    const auto* const pixels = static_cast<const std::uint32_t*>(ecore_evas_buffer_pixels_get(ee));
    Picture picture;
    ecore_evas_geometry_get(ee, nullptr, nullptr, &picture.width, &picture.height);
    if (pixels != nullptr) {
        picture.pixels.assign(pixels, pixels + static_cast<std::size_t>(picture.width) *
                                                   static_cast<std::size_t>(picture.height));
    }
    return picture;
}

std::string outputPath(const std::string& name) {
    return std::string(CLOCK_TEST_OUTPUT_DIR "/screens/") + name + ".png";
}

} // namespace

Area Stage::area(Evas_Object* object) {
    return geometry(object);
}

bool Stage::canBeSeen(Evas_Object* object) const {
    return !isEmpty(visibleArea(object));
}

std::vector<FoundText> Stage::texts() const {
    std::vector<FoundText> found;
    walkCanvas(canvas(), [&](Evas_Object* object) { appendText(found, object); });
    sortFromTheTop(found);
    return found;
}

std::optional<FoundText> Stage::findText(const std::string& text) const {
    for (const FoundText& candidate : texts()) {
        if (candidate.text == text) {
            return candidate;
        }
    }
    return std::nullopt;
}

std::vector<Evas_Object*> Stage::widgets(const std::string& type) const {
    std::vector<Evas_Object*> found;
    walkCanvas(canvas(), [&](Evas_Object* object) {
        if (elm_object_widget_check(object) && canBeSeen(object) &&
            std::string_view(elm_object_widget_type_get(object)).find(type) !=
                std::string_view::npos) {
            found.push_back(object);
        }
    });
    return found;
}

std::vector<Row> Stage::rows(Evas_Object* genlist) {
    std::vector<FoundText> found;
    walk(genlist, [&](Evas_Object* object) { appendText(found, object); });
    sortFromTheTop(found);
    std::vector<Row> rows;
    for (Elm_Object_Item* item = elm_genlist_first_item_get(genlist); item != nullptr;
         item = elm_genlist_item_next_get(item)) {
        Row& row = rows.emplace_back();
        row.item = item;
        // The tracker has the row's place, but none of its texts.
        const auto* const tracker = static_cast<Evas_Object*>(elm_object_item_track(item));
        if (tracker != nullptr) {
            row.realized = true;
            row.area = geometry(tracker);
            for (const FoundText& text : found) {
                const int y = geometry(text.object).middle().y;
                if (y >= row.area.y && y < row.area.y + row.area.height) {
                    row.texts.push_back(text.text);
                }
            }
        }
        elm_object_item_untrack(item);
    }
    return rows;
}

void Stage::showRow(Elm_Object_Item* item) {
    elm_genlist_item_show(item, ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
    settle(1);
}

std::string Stage::screenshot(const std::string& name) {
    std::string path = outputPath(name);
    EXPECT_TRUE(pictureOf(canvas()).save(path)) << path;
    return path;
}

void Stage::expectPicture(const std::string& name, int tolerance, double fraction) {
    const std::string approvedPath = CLOCK_SOURCE_DIR "/tests/screens/approved/" + name + ".png";
    const Picture actual = pictureOf(canvas());
    const char* const update = std::getenv("CLOCK_UPDATE_PICTURES");
    if (update != nullptr && std::string_view(update) == "1") {
        EXPECT_TRUE(actual.save(approvedPath)) << approvedPath;
        return;
    }
    const std::string differencePath = outputPath(name + "-difference");
    std::filesystem::remove(differencePath);
    const Picture approved = Picture::load(approvedPath);
    const PictureDifference difference = comparePictures(actual, approved, tolerance);
    if (difference.fraction <= fraction) {
        return;
    }
    actual.save(outputPath(name));
    difference.picture.save(differencePath);
    ADD_FAILURE() << (approved.empty() ? "no approved picture " : "unlike ") << approvedPath << ": "
                  << difference.fraction * 100 << " % of the pixels differ, see "
                  << outputPath(name);
}

unsigned Stage::pixel(int x, int y) {
    const Picture picture = pictureOf(canvas());
    return picture.pixels.at(static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                             static_cast<std::size_t>(x));
}

std::vector<unsigned> Stage::pixels(int x, int y, int width, int height) {
    const Picture picture = pictureOf(canvas());
    std::vector<unsigned> found;
    for (int row = y; row < y + height; ++row) {
        const auto begin = static_cast<std::size_t>(row) * static_cast<std::size_t>(picture.width);
        for (int column = x; column < x + width; ++column)
            found.push_back(picture.pixels.at(begin + static_cast<std::size_t>(column)));
    }
    return found;
}
