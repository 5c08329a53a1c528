#define LOG_TAG "alarm-ui-common"
#include "AlarmRepeatViewItem.h"

#include <cstring>
#include <string_view>

#include <clock/ClockText.h>

#include "CheckLayout.h"
#include "NullData.h"
#include "rules/RepeatRows.h"

AlarmRepeatViewItem::AlarmRepeatViewItem(ClockAlarmDbData& alarm, int index)
    : _alarm(alarm), _index(index) {}

AlarmRepeatViewItem::~AlarmRepeatViewItem() = default;

Elm_Genlist_Item_Class* AlarmRepeatViewItem::getItemClassStatic() {
    static Elm_Genlist_Item_Class* const itemClass = [] {
        Elm_Genlist_Item_Class* made = elm_genlist_item_class_new();
        made->item_style = "1line";
        made->func.text_get = _getRepeatViewItemText;
        made->func.content_get = _getRepeatViewItemIcon;
        made->func.del = deleteCb;
        return made;
    }();
    return itemClass;
}

void AlarmRepeatViewItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

void AlarmRepeatViewItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

char* AlarmRepeatViewItem::_getRepeatViewItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const auto* self = static_cast<AlarmRepeatViewItem*>(data);
    const char* textId = rules::repeatRowTextId(self->_index);
    if (!textId || std::string_view(part ? part : "") != "elm.text.main.left")
        return nullptr;
    return strdup(clockText(textId));
}

Evas_Object* AlarmRepeatViewItem::_getRepeatViewItemIcon(void* data, Evas_Object* genlist,
                                                         const char* part) {
    RETURN_IF_NULL(data, nullptr);
    auto* self = static_cast<AlarmRepeatViewItem*>(data);
    if (std::string_view(part ? part : "") != "elm.icon.2")
        return nullptr;
    Evas_Object* layout = createIconLayout(genlist);
    Evas_Object* check = elm_check_add(layout);
    elm_object_style_set(check, "default");
    setIcon(layout, check);
    if (rules::isRepeatRowOn(self->_index, self->_alarm.repeatWeekly))
        elm_check_state_set(check, EINA_TRUE);
    self->_checks.add(check);
    return layout;
}
