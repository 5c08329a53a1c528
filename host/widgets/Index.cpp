#include <algorithm>
#include <cmath>
#include <cstring>
#include <string>
#include <vector>

#include <dlfcn.h>

#include <Elementary.h>

#include "Accessible.h"
#include "Index.h"
#include "ThemeNames.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The toolkit's index is a straight column. This function comes before the toolkit's own and bends
// the column along the rim of the face: each text keeps its height and is moved in from the edge.

namespace {

constexpr const char* ENTRIES_KEY = "device.index.entries";

/** The toolkit does not tell what an index has in it. */
struct Entries {
    std::vector<Elm_Object_Item*> items;
    int place = -1;   ///< Of the one that was turned to last.
    std::string name; ///< What a screen had called the index before that.
};

Entries* entriesOf(const Evas_Object* index) {
    return index ? static_cast<Entries*>(evas_object_data_get(index, ENTRIES_KEY)) : nullptr;
}

/** Screen readers are told where it was turned to. */
void tellPlace(Evas_Object* index, Entries& entries, const std::string& text) {
    if (entries.name.empty())
        entries.name = host::readName(index);
    host::setReadName(index, entries.name.empty() ? text : entries.name + ", " + text);
}

void indexDeleted(void* entries, Evas*, Evas_Object* index, void*) {
    evas_object_data_del(index, ENTRIES_KEY);
    delete static_cast<Entries*>(entries);
}

/** From the rim to the middle of a label, and half of a label. */
constexpr double RIM = 16;
constexpr double HALF_LABEL = 12;

/** How the toolkit writes labels that it leaves out, and how the face shows them. */
constexpr const char* LEFT_OUT = "*";
constexpr const char* DOT = "\u2022";

/** Where the middle of a label lies, counted from the middle of the face, `height` away from it. */
double reach(Evas* canvas, double height) {
    int width = 0;
    int length = 0;
    evas_output_viewport_get(canvas, nullptr, nullptr, &width, &length);
    const double radius = std::min(width, length) / 2.0 - RIM;
    return height < radius ? std::sqrt(radius * radius - height * height) : 0;
}

/** How far a label is moved in from the edge of the column: 0 not at all, 1 to the other edge. */
double indent(Evas_Object* label) {
    Evas* canvas = evas_object_evas_get(label);
    int left = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    int faceWidth = 0;
    int faceHeight = 0;
    evas_object_geometry_get(label, &left, &y, &width, &height);
    evas_output_viewport_get(canvas, nullptr, nullptr, &faceWidth, &faceHeight);
    const double way = width - 2 * HALF_LABEL;
    if (way <= 0)
        return 0;
    const double x = reach(canvas, std::abs(y + height / 2.0 - faceHeight / 2.0)) + HALF_LABEL;
    const double edge =
        edje_object_mirrored_get(label) ? faceWidth / 2.0 - left : left + width - faceWidth / 2.0;
    return std::clamp((edge - x) / way, 0.0, 1.0);
}

void writeDot(Evas_Object* label) {
    const char* text = edje_object_part_text_get(label, host::theme::PART_INDEX_LABEL);
    if (text && std::strcmp(text, LEFT_OUT) == 0)
        edje_object_part_text_set(label, host::theme::PART_INDEX_LABEL, DOT);
}

/** Its text alone moves: the toolkit tells by the places of labels which one a finger is on. */
void placeLabel(void*, Evas*, Evas_Object* label, void*) {
    writeDot(label);
    Edje_Message_Float message = {indent(label)};
    edje_object_message_send(label, EDJE_MESSAGE_FLOAT, host::theme::MESSAGE_INDENT, &message);
    edje_object_message_signal_process(label);
}

void labelAdded(void*, Evas_Object*, void* place) {
    Evas_Object* object = static_cast<Evas_Object_Box_Option*>(place)->obj;
    evas_object_event_callback_add(object, EVAS_CALLBACK_MOVE, placeLabel, nullptr);
    evas_object_event_callback_add(object, EVAS_CALLBACK_RESIZE, placeLabel, nullptr);
}

} // namespace

bool host::turnIndex(Evas_Object* index, int steps) {
    Entries* entries = entriesOf(index);
    if (!entries || entries->items.empty())
        return false;
    const int last = static_cast<int>(entries->items.size()) - 1;
    entries->place = std::clamp(entries->place + steps, 0, last);
    // Selecting raises what a finger raises.
    elm_index_item_selected_set(entries->items[static_cast<std::size_t>(entries->place)],
                                EINA_TRUE);
    tellPlace(index, *entries, indexText(index));
    return true;
}

std::string host::indexText(const Evas_Object* index) {
    const Entries* entries = entriesOf(index);
    if (!entries || entries->items.empty())
        return "";
    const auto place = static_cast<std::size_t>(std::max(entries->place, 0));
    const char* letter = elm_index_item_letter_get(entries->items[place]);
    return letter ? letter : "";
}

DEVICE_EXTERN_C_BEGIN

DEVICE_API Evas_Object* elm_index_add(Evas_Object* parent) {
    auto* stock = reinterpret_cast<decltype(&elm_index_add)>(dlsym(RTLD_NEXT, "elm_index_add"));
    Evas_Object* index = stock && parent ? stock(parent) : nullptr;
    if (!index) {
        LOG_ERROR("An index needs a parent");
        return nullptr;
    }
    auto* entries = new Entries;
    evas_object_data_set(index, ENTRIES_KEY, entries);
    evas_object_event_callback_add(index, EVAS_CALLBACK_DEL, indexDeleted, entries);
    // More hours than fit: those between two labels are reached by moving the finger.
    elm_index_omit_enabled_set(index, EINA_TRUE);
    Evas_Object* labels =
        edje_object_part_swallow_get(elm_layout_edje_get(index), host::theme::PART_INDEX_LABELS);
    if (labels)
        evas_object_smart_callback_add(labels, "child,added", labelAdded, nullptr);
    else
        LOG_ERROR("The theme has no place for the labels of an index");
    return index;
}

DEVICE_API Elm_Object_Item* elm_index_item_append(Evas_Object* obj, const char* letter,
                                                  Evas_Smart_Cb func, const void* data) {
    static const auto stock = reinterpret_cast<decltype(&elm_index_item_append)>(
        dlsym(RTLD_NEXT, "elm_index_item_append"));
    Elm_Object_Item* item = stock && obj ? stock(obj, letter, func, data) : nullptr;
    if (Entries* entries = item ? entriesOf(obj) : nullptr)
        entries->items.push_back(item);
    return item;
}

DEVICE_API void elm_index_item_clear(Evas_Object* obj) {
    static const auto stock =
        reinterpret_cast<decltype(&elm_index_item_clear)>(dlsym(RTLD_NEXT, "elm_index_item_clear"));
    if (Entries* entries = entriesOf(obj)) {
        if (!entries->name.empty())
            host::setReadName(obj, entries->name);
        *entries = {};
    }
    if (stock && obj)
        stock(obj);
}

DEVICE_EXTERN_C_END
