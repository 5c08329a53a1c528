#define LOG_TAG "alarm-ui-common"
#include "AlarmRepeatViewController.h"

#include <app_assist/WAccessible.h>
#include <app_assist/WNaviframeController.h>

#include "AlarmRepeatViewItem.h"
#include "CheckLayout.h"
#include "NullData.h"
#include "rules/RepeatRows.h"

namespace {

// A row without a check, not realised, counts as the record has it.
bool isOn(const AlarmRepeatViewItem* row, int index, int weekdays) {
    Evas_Object* check = row->getCheckBoxObj();
    return check ? elm_check_state_get(check) : rules::isRepeatRowOn(index, weekdays);
}

void turnRow(const AlarmRepeatViewItem* row, bool on) {
    if (Evas_Object* check = row->getCheckBoxObj())
        turnCheck(check, on);
}

void backClickedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmRepeatViewController*>(data)->popOut();
}

} // namespace

AlarmRepeatViewController::AlarmRepeatViewController(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmRepeatViewController::~AlarmRepeatViewController() = default;

void AlarmRepeatViewController::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

Evas_Object* AlarmRepeatViewController::onCreateView(Evas_Object* parent, void*) {
    _genlist = elm_genlist_add(parent);
    elm_genlist_mode_set(_genlist, ELM_LIST_COMPRESS);
    evas_object_size_hint_weight_set(_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_show(_genlist);
    _createRepeatViewItems(_genlist);
    return _genlist;
}

void AlarmRepeatViewController::_createRepeatViewItems(Evas_Object* genlist) {
    for (int index = 0; index < rules::REPEAT_ROW_COUNT; ++index) {
        auto* row = new AlarmRepeatViewItem(_alarm, index);
        _rows.at(static_cast<std::size_t>(index)) = row;
        Elm_Object_Item* item =
            elm_genlist_item_append(genlist, row->getItemClassStatic(), row, nullptr,
                                    ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row);
        row->setSelectedCb([this, index] {
            _onRepeatViewItemSelectedCb(index);
            if (_selected)
                _selected();
        });
        row->setElmObjectItem(item);
    }
}

void AlarmRepeatViewController::_onRepeatViewItemSelectedCb(int index) {
    rules::RepeatChecks checks{};
    for (std::size_t row = 0; row < checks.size(); ++row)
        checks.at(row) = isOn(_rows.at(row), static_cast<int>(row), _alarm.repeatWeekly);
    const rules::RepeatToggle toggle = rules::toggleRepeatRow(index, _alarm.repeatWeekly, checks);
    _alarm.repeatWeekly = toggle.weekdays;
    for (int i = 0; i < toggle.rowCount; ++i)
        turnRow(_rows.at(static_cast<std::size_t>(toggle.rows.at(static_cast<std::size_t>(i)))),
                toggle.on);
}

void AlarmRepeatViewController::onPushed(Elm_Object_Item* naviItem) {
    Evas_Object* back = elm_button_add(getNaviframeController()->getEvasObj());
    elm_object_style_set(back, "naviframe/back_btn/default");
    evas_object_smart_callback_add(back, "clicked", backClickedCb, this);
    app_assist::setAccessibleTextId(back, "IDS_ACC_BODY_BACK");
    elm_object_item_part_content_set(naviItem, "prev_btn", back);
    elm_object_item_domain_translatable_part_text_set(naviItem, "elm.text.title", nullptr,
                                                      "IDS_CLOCK_BODY_REPEAT_WEEKLY");
}

void AlarmRepeatViewController::onEvent(EventType type) {
    if ((type == SETTINGS_CHANGED || type == LANGUAGE_CHANGED) && _genlist && getEvasObj())
        elm_genlist_realized_items_update(_genlist);
}
