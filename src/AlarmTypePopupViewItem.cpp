#define LOG_TAG "alarm-ui-common"
#include "AlarmTypePopupViewItem.h"

#include <cstring>
#include <string_view>

#include <clock/ClockText.h>

#include "CheckLayout.h"
#include "NullData.h"
#include "rules/AlertType.h"

AlarmTypePopupViewItem::AlarmTypePopupViewItem(ClockAlarmDbData& alarm, int index)
    : _alarm(alarm), _index(index) {}

AlarmTypePopupViewItem::~AlarmTypePopupViewItem() = default;

Elm_Genlist_Item_Class* AlarmTypePopupViewItem::getItemClassStatic() {
    static Elm_Genlist_Item_Class* const itemClass = [] {
        Elm_Genlist_Item_Class* made = elm_genlist_item_class_new();
        made->item_style = "1line";
        made->func.text_get = _getTypePopupViewItemText;
        made->func.content_get = _getTypePopupViewItemIcon;
        made->func.del = deleteCb;
        return made;
    }();
    return itemClass;
}

void AlarmTypePopupViewItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

void AlarmTypePopupViewItem::onSelect(Elm_Object_Item* item) {
    if (!item)
        return;
    elm_genlist_item_selected_set(item, EINA_FALSE);
    if (Evas_Object* radio = _radios.newest()) {
        elm_object_signal_emit(radio, "elm,activate,check,on", "elm");
        elm_radio_state_value_set(radio, _index);
    }
    if (rules::alertTypeTextId(_index))
        _alarm.type = _index;
    if (_selected)
        _selected();
}

char* AlarmTypePopupViewItem::_getTypePopupViewItemText(void* data, Evas_Object*,
                                                        const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const auto* self = static_cast<AlarmTypePopupViewItem*>(data);
    const char* textId = rules::alertTypeTextId(self->_index);
    if (!textId || std::string_view(part ? part : "") != "elm.text.main.left")
        return nullptr;
    return strdup(clockText(textId));
}

Evas_Object* AlarmTypePopupViewItem::_getTypePopupViewItemIcon(void* data, Evas_Object* genlist,
                                                               const char* part) {
    RETURN_IF_NULL(data, nullptr);
    auto* self = static_cast<AlarmTypePopupViewItem*>(data);
    // Nobody stores a group: each radio stands alone. It is on once its own value is that of its
    // group of one.
    auto* group = static_cast<Evas_Object*>(evas_object_data_get(genlist, "radioGroup"));
    if (std::string_view(part ? part : "") != "elm.icon.2")
        return nullptr;
    Evas_Object* layout = createIconLayout(genlist);
    Evas_Object* radio = elm_radio_add(layout);
    elm_object_style_set(radio, "list");
    elm_radio_value_set(radio, self->_index);
    elm_radio_group_add(radio, group);
    evas_object_size_hint_weight_set(radio, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(radio, EVAS_HINT_FILL, EVAS_HINT_FILL);
    setIcon(layout, radio);
    if (self->_alarm.type == self->_index)
        elm_radio_state_value_set(radio, self->_alarm.type);
    self->_radios.add(radio);
    return layout;
}
