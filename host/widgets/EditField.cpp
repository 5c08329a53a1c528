#include "EditField.h"

#include <algorithm>
#include <string_view>

#include "Accessible.h"
#include "EvasLists.h"
#include "ThemeNames.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* ENTRY_KEY = "device-host.edit-field.entry";
constexpr const char* CURSOR_KEY = "device-host.edit-field.cursor";

/** Not elm_entry_is_empty(), which moves the cursor. */
bool hasText(const Evas_Object* field) {
    const char* markup = elm_entry_entry_get(entryOfField(field));
    return markup && *markup;
}

void showClearButton(Evas_Object* field) {
    const bool shown =
        elm_object_part_content_get(field, theme::PART_FIELD_BUTTON) && hasText(field);
    elm_layout_signal_emit(
        field, shown ? theme::SIGNAL_FIELD_BUTTON_SHOW : theme::SIGNAL_FIELD_BUTTON_HIDE,
        theme::SIGNAL_SOURCE);
}

void textChanged(void* field, Evas_Object*, void*) {
    showClearButton(static_cast<Evas_Object*>(field));
}

void entryFocused(void* field, Evas_Object*, void*) {
    elm_layout_signal_emit(static_cast<Evas_Object*>(field), theme::SIGNAL_FIELD_FOCUSED,
                           theme::SIGNAL_SOURCE);
}

void entryUnfocused(void* field, Evas_Object*, void*) {
    elm_layout_signal_emit(static_cast<Evas_Object*>(field), theme::SIGNAL_FIELD_UNFOCUSED,
                           theme::SIGNAL_SOURCE);
}

/** The field goes: what its entry still raises is for nobody. */
void fieldDeleted(void* data, Evas*, Evas_Object* field, void*) {
    auto* entry = static_cast<Evas_Object*>(data);
    for (const char* event : {"changed", "preedit,changed"})
        evas_object_smart_callback_del_full(entry, event, textChanged, field);
    evas_object_smart_callback_del_full(entry, "focused", entryFocused, field);
    evas_object_smart_callback_del_full(entry, "unfocused", entryUnfocused, field);
    evas_object_data_del(field, ENTRY_KEY);
}

void bringCursorIn(void* data) {
    auto* entry = static_cast<Evas_Object*>(data);
    evas_object_data_del(entry, CURSOR_KEY);
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    if (elm_object_focus_get(entry) &&
        elm_entry_cursor_geometry_get(entry, &x, &y, &width, &height))
        elm_scroller_region_show(entry, x, y, std::max(width, 1), height);
}

void bringCursorInLater(Evas_Object* entry) {
    if (!evas_object_data_get(entry, CURSOR_KEY))
        evas_object_data_set(entry, CURSOR_KEY, ecore_job_add(bringCursorIn, entry));
}

/** The toolkit looks for the cursor before a line that ends at the right has its new width. */
void lineResized(void* entry, Evas*, Evas_Object*, void*) {
    bringCursorInLater(static_cast<Evas_Object*>(entry));
}

void entryDeleted(void*, Evas*, Evas_Object* entry, void*) {
    if (auto* job = static_cast<Ecore_Job*>(evas_object_data_del(entry, CURSOR_KEY)))
        ecore_job_del(job);
}

/** What draws the line and its guide, within an entry that scrolls. */
Evas_Object* lineOf(Evas_Object* object) {
    const bool isEdje = std::string_view(evas_object_type_get(object)) == "edje";
    if (isEdje && edje_object_part_exists(object, theme::PART_GUIDE))
        return object;
    for (Evas_Object* member : membersOf(object))
        if (Evas_Object* line = lineOf(member))
            return line;
    return nullptr;
}

/** A guide may begin with a symbol of the device's font, which would have it begin at the left. */
void turnGuide(const Evas_Object* line, bool mirrored) {
    const Evas_Object* guide = edje_object_part_object_get(line, theme::PART_GUIDE);
    for (Evas_Object* member : membersOf(line))
        if (member == guide)
            evas_object_paragraph_direction_set(member, mirrored ? EVAS_BIDI_DIRECTION_RTL
                                                                 : EVAS_BIDI_DIRECTION_INHERIT);
}

/** What is typed begins where one reads from, and runs as its own letters do. */
void turnText(Evas_Object* entry, bool mirrored) {
    if (elm_entry_text_style_user_peek(entry))
        elm_entry_text_style_user_pop(entry);
    // The cursor stands in the margin.
    if (mirrored)
        elm_entry_text_style_user_push(entry, "DEFAULT='align=right right_margin=3'");
    bringCursorInLater(entry);
}

void turn(void*, Evas_Object* entry, void*) {
    const bool mirrored = elm_object_mirrored_get(entry) != EINA_FALSE;
    turnText(entry, mirrored);
    if (const Evas_Object* line = lineOf(entry))
        turnGuide(line, mirrored);
}

void followFace(Evas_Object* entry) {
    turn(nullptr, entry, nullptr);
    evas_object_smart_callback_add(entry, "language,changed", turn, nullptr);
    evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, entryDeleted, nullptr);
    if (Evas_Object* line = lineOf(entry))
        evas_object_event_callback_add(line, EVAS_CALLBACK_RESIZE, lineResized, entry);
}

/** Focuses first: who empties a field types on, and screens take the change for a person's. */
void clearClicked(void* field, Evas_Object*, void*) {
    Evas_Object* entry = entryOfField(static_cast<Evas_Object*>(field));
    elm_object_focus_set(entry, EINA_TRUE);
    elm_entry_imf_context_reset(entry);
    elm_entry_entry_set(entry, "");
}

Evas_Object* addClearButton(Evas_Object* field) {
    Evas_Object* button = elm_button_add(field);
    elm_object_style_set(button, theme::STYLE_CLEAR_BUTTON);
    elm_object_focus_allow_set(button, EINA_FALSE);
    setReadTextId(button, "IDS_ACC_BODY_CLEAR");
    evas_object_smart_callback_add(button, "clicked", clearClicked, field);
    return button;
}

void addEntryOf(Evas_Object* field) {
    Evas_Object* entry = addEntry(field, true);
    elm_object_style_set(entry, theme::STYLE_SEARCH);
    // The style has a guide of its own.
    turn(nullptr, entry, nullptr);
    elm_object_part_content_set(field, theme::PART_FIELD_ENTRY, entry);
    evas_object_data_set(field, ENTRY_KEY, entry);
    for (const char* event : {"changed", "preedit,changed"})
        evas_object_smart_callback_add(entry, event, textChanged, field);
    evas_object_smart_callback_add(entry, "focused", entryFocused, field);
    evas_object_smart_callback_add(entry, "unfocused", entryUnfocused, field);
    evas_object_event_callback_add(field, EVAS_CALLBACK_DEL, fieldDeleted, entry);
}

} // namespace

Evas_Object* addEntry(Evas_Object* parent, bool singleLine) {
    Evas_Object* entry = parent ? elm_entry_add(parent) : nullptr;
    if (!entry) {
        LOG_ERROR("An edit field needs a parent");
        return nullptr;
    }
    elm_entry_single_line_set(entry, singleLine);
    elm_entry_scrollable_set(entry, EINA_TRUE);
    elm_scroller_policy_set(entry, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    evas_object_size_hint_weight_set(entry, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(entry, EVAS_HINT_FILL, EVAS_HINT_FILL);
    followFace(entry);
    return entry;
}

Evas_Object* addSearchField(Evas_Object* parent) {
    Evas_Object* field = elm_layout_add(parent);
    if (!field)
        return nullptr;
    if (!elm_layout_theme_set(field, theme::LAYOUT_CLASS, theme::FIELD_GROUP,
                              theme::STYLE_SEARCH)) {
        LOG_ERROR("The theme has no edit field");
        evas_object_del(field);
        return nullptr;
    }
    addEntryOf(field);
    return field;
}

Evas_Object* entryOfField(const Evas_Object* field) {
    return field ? static_cast<Evas_Object*>(evas_object_data_get(field, ENTRY_KEY)) : nullptr;
}

void setClearButton(Evas_Object* field, bool enabled) {
    Evas_Object* button = elm_object_part_content_get(field, theme::PART_FIELD_BUTTON);
    if (enabled == (button != nullptr))
        return;
    if (enabled)
        elm_object_part_content_set(field, theme::PART_FIELD_BUTTON, addClearButton(field));
    else
        evas_object_del(button);
    showClearButton(field);
}

} // namespace host
