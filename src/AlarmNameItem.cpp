#define LOG_TAG "alarm-ui-common"
#include "AlarmNameItem.h"

#include <cstdlib>
#include <cstring>
#include <memory>
#include <string_view>

#include <Elementary.h>

#include <base/Text.h>
#include <clock/ClockText.h>
#include <device/ea.h>
#include <device/eext.h>
#include <device/notification.h>

#include "NullData.h"

namespace {

constexpr int MAX_NAME_CHARACTERS = 20;
constexpr std::size_t MAX_TOAST_BYTES = 1023;

// Entries keep a pointer to it. It guards typing only: a longer name that is set is shown whole.
Elm_Entry_Filter_Limit_Size nameLimit = {MAX_NAME_CHARACTERS, 0};

// Marks an entry whose selection the back key is to clear.
constexpr const char* SELECTION_KEY = "eext_entry";

using Text = std::unique_ptr<char, decltype(&std::free)>;

std::string entryText(const Evas_Object* entry) {
    const Text text(elm_entry_markup_to_utf8(elm_entry_entry_get(entry)), &std::free);
    return text ? text.get() : "";
}

void setEntryText(Evas_Object* entry, const std::string& utf8) {
    const Text markup(elm_entry_utf8_to_markup(utf8.c_str()), &std::free);
    elm_entry_entry_set(entry, markup.get());
}

void selectionBackKeyCb(void* data, Evas_Object* entry, void* info);

void stopClearingSelection(Evas_Object* entry) {
    eext_object_event_callback_del(entry, EEXT_EVENT_BACK, selectionBackKeyCb);
    evas_object_data_del(entry, SELECTION_KEY);
}

void selectionBackKeyCb(void*, Evas_Object* entry, void*) {
    if (elm_entry_selection_get(entry))
        elm_entry_select_none(entry);
    stopClearingSelection(entry);
}

void selectionStartCb(void*, Evas_Object* entry, void*) {
    if (evas_object_data_get(entry, SELECTION_KEY))
        return;
    evas_object_data_set(entry, SELECTION_KEY, reinterpret_cast<void*>(1));
    eext_object_event_callback_add(entry, EEXT_EVENT_BACK, selectionBackKeyCb, nullptr);
}

void selectionClearedCb(void*, Evas_Object* entry, void*) {
    if (evas_object_data_get(entry, SELECTION_KEY))
        stopClearingSelection(entry);
}

struct Signal {
    const char* name;
    Evas_Smart_Cb callback;
};

constexpr Signal ROW_SIGNALS[] = {
    {"focused", AlarmNameItem::_alarmNameFocusedCb},
    {"activated", AlarmNameItem::_alarmNameActivatedCb},
    {"changed", AlarmNameItem::_alarmNameChangedCb},
    {"preedit,changed", AlarmNameItem::_alarmNamePreeditChangedCb},
    {"maxlength,reached", AlarmNameItem::_alarmNameMaxLengthCb},
    {"language,changed", AlarmNameItem::_entryLangChangedCb},
};

} // namespace

AlarmNameItem::AlarmNameItem(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmNameItem::~AlarmNameItem() {
    // The list may delete the row before the widgets.
    for (Evas_Object* entry : _entries.all()) {
        for (const Signal& signal : ROW_SIGNALS)
            evas_object_smart_callback_del_full(entry, signal.name, signal.callback, this);
        evas_object_event_callback_del_full(entry, EVAS_CALLBACK_DEL, _entryDeletedCb, this);
    }
}

Elm_Genlist_Item_Class* AlarmNameItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "entry.main";
    itemClass->func.text_get = _getNameItemText;
    itemClass->func.content_get = _getNameItemIcon;
    // A list makes and drops a row several times to measure it; entries are too costly for that.
    itemClass->func.reusable_content_get = _keepNameItemIcon;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmNameItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

void AlarmNameItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

std::string AlarmNameItem::getTypedName() const {
    if (const Evas_Object* entry = _entries.newest())
        return entryText(entry);
    return _typedName.value_or(_alarm.name);
}

char* AlarmNameItem::_getNameItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    if (std::string_view(part ? part : "") != "elm.text.main")
        return nullptr;
    return strdup(clockText("IDS_ALM_BODY_ALARM_NAME"));
}

Evas_Object* AlarmNameItem::_getNameItemIcon(void* data, Evas_Object* genlist, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    if (std::string_view(part ? part : "") != "elm.icon.entry")
        return nullptr;
    return static_cast<AlarmNameItem*>(data)->createEntry(genlist);
}

Evas_Object* AlarmNameItem::_keepNameItemIcon(void* data, Evas_Object*, const char*,
                                              Evas_Object* old) {
    RETURN_IF_NULL(data, nullptr);
    return static_cast<AlarmNameItem*>(data)->_entries.reusable(old);
}

Evas_Object* AlarmNameItem::createEntry(Evas_Object* genlist) {
    Evas_Object* entry = ea_editfield_add(genlist, EA_EDITFIELD_SINGLELINE);
    if (!entry) {
        LOG_ERROR("Entry is NULL !!");
        return nullptr;
    }
    elm_object_domain_translatable_part_text_set(entry, "elm.guide", nullptr, "IDS_COM_BODY_ALARM");
    elm_entry_cnp_mode_set(entry, ELM_CNP_MODE_PLAINTEXT);
    elm_entry_input_panel_return_key_type_set(entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_DONE);
    evas_object_smart_callback_add(entry, "selection,start", selectionStartCb, nullptr);
    evas_object_smart_callback_add(entry, "selection,cleared", selectionClearedCb, nullptr);
    evas_object_propagate_events_set(entry, EINA_FALSE);

    const std::string name = getTypedName();
    _entries.add(entry);
    evas_object_event_callback_add(entry, EVAS_CALLBACK_DEL, _entryDeletedCb, this);
    if (name.empty())
        LOG_ERROR("Alarm Name is NULL !!");
    else
        setEntryText(entry, name);
    elm_entry_markup_filter_append(entry, elm_entry_filter_limit_size, &nameLimit);
    for (const Signal& signal : ROW_SIGNALS)
        evas_object_smart_callback_add(entry, signal.name, signal.callback, this);
    return entry;
}

void AlarmNameItem::_entryDeletedCb(void* data, Evas*, Evas_Object* entry, void*) {
    static_cast<AlarmNameItem*>(data)->_typedName = entryText(entry);
}

void AlarmNameItem::_alarmNameFocusedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
}

void AlarmNameItem::_alarmNameActivatedCb(void* data, Evas_Object* entry, void*) {
    RETURN_IF_NULL(data);
    // Also closes the keyboard.
    elm_object_focus_set(entry, EINA_FALSE);
}

void AlarmNameItem::_alarmNameChangedCb(void* data, Evas_Object* entry, void*) {
    RETURN_IF_NULL(data);
    if (!elm_object_focus_get(entry))
        LOG_ERROR("Focus is not set for entry !!");
}

void AlarmNameItem::_alarmNamePreeditChangedCb(void* data, Evas_Object* entry, void*) {
    RETURN_IF_NULL(data);
    if (!elm_object_focus_get(entry))
        LOG_ERROR("Focus is not set for entry !!");
}

void AlarmNameItem::_alarmNameMaxLengthCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    const char* translation = clockText("IDS_CLOCK_TPOP_CANT_SAVE_MORE_THAN_PD_CHARACTERS");
    const std::string toast = base::formatTranslation(base::cutUtf8(translation, MAX_TOAST_BYTES),
                                                      {MAX_NAME_CHARACTERS}, MAX_TOAST_BYTES);
    notification_status_message_post(toast.c_str());
}

void AlarmNameItem::_entryLangChangedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
}
