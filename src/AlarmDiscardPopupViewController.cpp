#define LOG_TAG "alarm-ui-common"
#include "AlarmDiscardPopupViewController.h"

#include <Elementary.h>

#include <app_assist/WAccessible.h>
#include <device/eext.h>

#include "NullData.h"

namespace {

void addTextButton(Evas_Object* popup, const char* part, const char* textId, Evas_Smart_Cb clicked,
                   void* data) {
    Evas_Object* button = elm_button_add(popup);
    elm_object_style_set(button, "popup");
    elm_object_domain_translatable_text_set(button, nullptr, textId);
    elm_object_part_content_set(popup, part, button);
    evas_object_smart_callback_add(button, "clicked", clicked, data);
    evas_object_show(button);
}

} // namespace

AlarmDiscardPopupViewController::AlarmDiscardPopupViewController() = default;
AlarmDiscardPopupViewController::~AlarmDiscardPopupViewController() = default;

const char* AlarmDiscardPopupViewController::getClassName() const {
    return "AlarmDiscardPopupViewController";
}

void AlarmDiscardPopupViewController::setDiscardBtnSelectedCb(
    const std::function<void()>& discard) {
    _discard = discard;
}

Evas_Object* AlarmDiscardPopupViewController::onCreateView(Evas_Object* parent, void*) {
    Evas_Object* popup = elm_popup_add(parent);
    if (!popup)
        return nullptr;
    elm_popup_align_set(popup, ELM_NOTIFY_ALIGN_FILL, 1.0);
    elm_object_domain_translatable_part_text_set(popup, "title,text", nullptr,
                                                 "IDS_CLD_HEADER_DISCARD_CHANGES_ABB");
    app_assist::setAccessibleTextId(popup, "IDS_CLD_HEADER_DISCARD_CHANGES_ABB");
    elm_object_domain_translatable_part_text_set(popup, nullptr, nullptr,
                                                 "IDS_CLD_POP_ALL_CHANGES_WILL_BE_DISCARDED");
    evas_object_size_hint_weight_set(popup, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    eext_object_event_callback_add(popup, EEXT_EVENT_BACK, _backKeyCb, this);
    addTextButton(popup, "button1", "IDS_COM_SK_CANCEL", _discardPopupCancelBtnClickedCb, this);
    addTextButton(popup, "button2", "IDS_CLD_BUTTON_DISCARD_ABB", _discardPopupDiscardBtnClickedCb,
                  this);
    evas_object_show(popup);
    return popup;
}

void AlarmDiscardPopupViewController::_backKeyCb(void*, Evas_Object* popup, void*) {
    evas_object_del(popup);
}

void AlarmDiscardPopupViewController::_discardPopupCancelBtnClickedCb(void* data, Evas_Object*,
                                                                      void*) {
    RETURN_IF_NULL(data);
    auto* self = static_cast<AlarmDiscardPopupViewController*>(data);
    if (Evas_Object* popup = self->getEvasObj())
        evas_object_del(popup);
}

void AlarmDiscardPopupViewController::_discardPopupDiscardBtnClickedCb(void* data, Evas_Object*,
                                                                       void*) {
    RETURN_IF_NULL(data);
    static_cast<AlarmDiscardPopupViewController*>(data)->_discard();
}
