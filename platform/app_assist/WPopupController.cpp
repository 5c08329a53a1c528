#include "app_assist/WPopupController.h"

#include <array>
#include <cstdlib>

#include <Elementary.h>

#include <device/eext.h>

#include "app_assist/WAccessible.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

namespace {

constexpr std::array BUTTON_PARTS = {"button1", "button2", "button3"};

/** A popup is called by its title, also in the next language. */
void nameByTitle(void* /*data*/, Evas_Object* popup, void* /*info*/) {
    const char* const title = elm_object_part_text_get(popup, "title,text");
    char* const plain = title == nullptr ? nullptr : elm_entry_markup_to_utf8(title);
    if (plain != nullptr) {
        setAccessibleName(popup, plain);
    }
    std::free(plain);
}

} // namespace

WPopupController::WPopupController() = default;

WPopupController::~WPopupController() = default;

void WPopupController::setContent(const ContentFunction& content) {
    _content = content;
}

void WPopupController::addButton(const std::string& text, const ClickFunction& clicked,
                                 const ButtonFunction& created) {
    if (getEvasObj() != nullptr || _buttons.size() >= BUTTON_PARTS.size()) {
        LOG_ERROR("%s takes no button \"%s\"", getClassName(), text.c_str());
        return;
    }
    _buttons.push_back({text, clicked, created, nullptr});
}

void WPopupController::setOnBack(const BackFunction& back) {
    _back = back;
}

void WPopupController::setOnAddProperties(const PropertiesFunction& properties) {
    _properties = properties;
}

Evas_Object* WPopupController::onCreateView(Evas_Object* parent, void* /*param*/) {
    Evas_Object* const popup = elm_popup_add(parent);
    if (popup == nullptr) {
        return nullptr;
    }
    elm_popup_align_set(popup, 0.5, 0.5);
    evas_object_size_hint_weight_set(popup, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    if (_properties) {
        _properties(popup);
    }
    nameByTitle(nullptr, popup, nullptr);
    evas_object_smart_callback_add(popup, "language,changed", nameByTitle, nullptr);
    if (Evas_Object* const content = _content ? _content(popup) : nullptr) {
        elm_object_content_set(popup, content);
    }
    createButtons(popup);
    eext_object_event_callback_add(popup, EEXT_EVENT_BACK, _backKeyCb, this);
    evas_object_show(popup);
    return popup;
}

void WPopupController::onDestroy() {}

void WPopupController::createButtons(Evas_Object* popup) {
    for (std::size_t i = 0; i < _buttons.size(); ++i) {
        Evas_Object* const button = elm_button_add(popup);
        elm_object_style_set(button, "popup");
        elm_object_text_set(button, _buttons[i].text.c_str());
        evas_object_smart_callback_add(button, "clicked", _buttonClickedCb, this);
        elm_object_part_content_set(popup, BUTTON_PARTS.at(i), button);
        evas_object_show(button);
        _buttons[i].object = button;
        if (const ButtonFunction created = _buttons[i].created) {
            created(button);
        }
    }
}

void WPopupController::_buttonClickedCb(void* data, Evas_Object* button, void* /*info*/) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    auto* const self = static_cast<WPopupController*>(data);
    for (const Button& candidate : self->_buttons) {
        if (candidate.object == button) {
            self->onButtonClicked(candidate.clicked);
            return;
        }
    }
}

void WPopupController::onButtonClicked(const ClickFunction& clicked) {
    if (isDying()) {
        return;
    }
    bool keepOpen = false;
    if (clicked) {
        clicked(&keepOpen);
    }
    if (!keepOpen) {
        destroy();
    }
}

void WPopupController::_backKeyCb(void* data, Evas_Object* /*popup*/, void* /*info*/) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    auto* const self = static_cast<WPopupController*>(data);
    if (self->isDying()) {
        return;
    }
    bool destroyPopup = true;
    if (const BackFunction back = self->_back) {
        back(&destroyPopup);
    }
    if (destroyPopup) {
        self->destroy();
    }
}

} // namespace app_assist
