#include "app_assist/WViewController.h"

#include <utility>

#include <Ecore_Evas.h>
#include <Elementary.h>

#include "app_assist/WDeferredDeletion.h"
#include "app_assist/WPopupController.h"
#include "app_assist/WWindowController.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

WViewController::WViewController() = default;

WViewController::~WViewController() {
    _dying = true;
    WDeferredDeletion::forget(this);
    finishPopups();
    deleteView();
}

const char* WViewController::getClassName() const {
    return "WViewController";
}

bool WViewController::create(Evas_Object* parent, void* param) {
    if (_created || _dying) {
        LOG_ERROR("%s is created already, or dying", getClassName());
        return false;
    }
    _created = true;
    if (!onCreate(param)) {
        LOG_ERROR("%s gave up in onCreate", getClassName());
        return false;
    }
    if (_dying || !adoptView(onCreateView(parent, param))) {
        LOG_ERROR("%s has no view", getClassName());
        return false;
    }
    _stands = true;
    onCreated();
    return !_dying;
}

bool WViewController::adoptView(Evas_Object* view) {
    if (view == nullptr) {
        return false;
    }
    if (_dying) {
        evas_object_del(view);
        return false;
    }
    _view = view;
    evas_object_event_callback_add(_view, EVAS_CALLBACK_DEL, _viewDeletedCb, this);
    return true;
}

void WViewController::destroy() {
    destroyPopups();
    scheduleEnd();
}

bool WViewController::onCreate(void* /*param*/) {
    return true;
}

Evas_Object* WViewController::onCreateView(Evas_Object* /*parent*/, void* /*param*/) {
    return nullptr;
}

void WViewController::onCreated() {}

void WViewController::onDestroy() {}

WWeakPtr<WViewController> WViewController::getWeakPtr() {
    return {this, _life};
}

void WViewController::attachPopup(WPopupController* popup) {
    if (popup == nullptr) {
        LOG_ERROR("%s was given no popup", getClassName());
        return;
    }
    if (popup == this || popup->_attached) {
        LOG_ERROR("%s is attached already", popup->getClassName());
        return;
    }
    popup->_attached = true;
    std::erase_if(_popups, [](const auto& other) { return other.expired(); });
    _popups.push_back(popup->getWeakPtr());
    if (_view == nullptr || _dying) {
        LOG_ERROR("%s has no view to show %s over", getClassName(), popup->getClassName());
        popup->destroy();
        return;
    }
    // A popup covers the whole face, not just the view that it belongs to.
    WWindowController* const window = getWindowController();
    Evas_Object* const parent = window ? window->getEvasObj() : elm_object_top_widget_get(_view);
    if (popup->getEvasObj() == nullptr && !popup->create(parent, nullptr)) {
        popup->destroy();
    }
}

WWindowController* WViewController::getWindowController() const {
    return _view == nullptr ? nullptr : WWindowController::ofCanvas(evas_object_evas_get(_view));
}

void WViewController::destroyPopups() {
    for (const auto& popup : std::exchange(_popups, {})) {
        if (popup) {
            popup->destroy();
        }
    }
}

void WViewController::finishPopups() {
    for (const auto& popup : std::exchange(_popups, {})) {
        if (popup) {
            WDeferredDeletion::finishNow(popup.get());
        }
    }
}

void WViewController::_viewDeletedCb(void* data, Evas* /*evas*/, Evas_Object* /*view*/,
                                     void* /*info*/) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    auto* const self = static_cast<WViewController*>(data);
    self->_view = nullptr;
    self->scheduleEnd();
}

void WViewController::scheduleEnd() {
    if (!_dying) {
        _dying = true;
        WDeferredDeletion::add(this);
    }
}

void WViewController::finish() {
    finishPopups();
    if (std::exchange(_stands, false)) {
        onDestroy();
    }
    if (_detach) {
        _detach();
    }
    deleteView();
    if (!_ownedByApplication) {
        delete this;
    }
}

void WViewController::deleteView() {
    Evas_Object* const view = std::exchange(_view, nullptr);
    if (view != nullptr) {
        evas_object_event_callback_del_full(view, EVAS_CALLBACK_DEL, _viewDeletedCb, this);
        evas_object_del(view);
    }
}

} // namespace app_assist
