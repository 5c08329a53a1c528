#include "EditField.h"

#include <string_view>

#include "Accessible.h"
#include "EvasLists.h"
#include "ThemeNames.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

constexpr const char* ENTRY_KEY = "device-host.edit-field.entry";

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

void turnGuideIn(Evas_Object* object, Evas_BiDi_Direction direction) {
    const bool isEdje = std::string_view(evas_object_type_get(object)) == "edje";
    const Evas_Object* guide =
        isEdje ? edje_object_part_object_get(object, theme::PART_GUIDE) : nullptr;
    for (Evas_Object* member : membersOf(object)) {
        if (member == guide)
            evas_object_paragraph_direction_set(member, direction);
        turnGuideIn(member, direction);
    }
}

/** A guide may begin with a symbol of the device's font, which would have it begin at the left. */
void turnGuide(void*, Evas_Object* entry, void*) {
    turnGuideIn(entry, elm_object_mirrored_get(entry) ? EVAS_BIDI_DIRECTION_RTL
                                                      : EVAS_BIDI_DIRECTION_INHERIT);
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
    elm_object_part_content_set(field, theme::PART_FIELD_ENTRY, entry);
    evas_object_data_set(field, ENTRY_KEY, entry);
    for (const char* event : {"changed", "preedit,changed"})
        evas_object_smart_callback_add(entry, event, textChanged, field);
    evas_object_smart_callback_add(entry, "focused", entryFocused, field);
    evas_object_smart_callback_add(entry, "unfocused", entryUnfocused, field);
    turnGuide(nullptr, entry, nullptr);
    evas_object_smart_callback_add(entry, "language,changed", turnGuide, nullptr);
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
