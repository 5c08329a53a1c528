#define LOG_TAG "alarm-ui-common"
#include "AlarmTypePopupViewController.h"

#include <Elementary.h>

#include "AlarmTypePopupViewItem.h"
#include "NullData.h"
#include "rules/AlertType.h"

AlarmTypePopupViewController::AlarmTypePopupViewController(ClockAlarmDbData& alarm)
    : _alarm(alarm) {}

AlarmTypePopupViewController::~AlarmTypePopupViewController() {
    if (Evas_Object* popup = getEvasObj())
        evas_object_smart_callback_del(popup, "dismissed", _dismissedCb);
}

void AlarmTypePopupViewController::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

Evas_Object* AlarmTypePopupViewController::onCreateView(Evas_Object* parent, void* param) {
    setContent([this](Evas_Object* popup) { return _createContent(popup); });
    setOnAddProperties([this](Evas_Object* popup) {
        elm_object_style_set(popup, "theme_bg");
        evas_object_smart_callback_add(popup, "dismissed", _dismissedCb, this);
        elm_object_domain_translatable_part_text_set(popup, "title,text", nullptr,
                                                     "IDS_ALM_BODY_TYPE");
    });
    setOnBack([this](bool* destroyPopup) {
        *destroyPopup = false;
        _dismiss();
    });
    return WPopupController::onCreateView(parent, param);
}

Evas_Object* AlarmTypePopupViewController::_createContent(Evas_Object* parent) {
    // The first list is never shown; it stays with its parent.
    elm_genlist_add(parent);
    Evas_Object* genlist = elm_genlist_add(parent);
    elm_genlist_mode_set(genlist, ELM_LIST_COMPRESS);
    evas_object_size_hint_weight_set(genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_show(genlist);
    _createTypePopupViewItems(genlist);
    return genlist;
}

void AlarmTypePopupViewController::_createTypePopupViewItems(Evas_Object* genlist) {
    for (int index = 0; index < rules::ALERT_TYPE_COUNT; ++index) {
        auto* row = new AlarmTypePopupViewItem(_alarm, index);
        Elm_Object_Item* item =
            elm_genlist_item_append(genlist, row->getItemClassStatic(), row, nullptr,
                                    ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row);
        row->setSelectedCb([this] {
            if (_selected)
                _selected();
            _dismiss();
        });
        row->setElmObjectItem(item);
    }
}

void AlarmTypePopupViewController::_dismiss() {
    if (Evas_Object* popup = getEvasObj())
        elm_popup_dismiss(popup);
}

void AlarmTypePopupViewController::_dismissedCb(void* data, Evas_Object*, void*) {
    RETURN_IF_NULL(data);
    if (Evas_Object* popup = static_cast<AlarmTypePopupViewController*>(data)->getEvasObj())
        evas_object_del(popup);
}
