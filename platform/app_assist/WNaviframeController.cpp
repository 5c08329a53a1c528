#include "app_assist/WNaviframeController.h"

#include <algorithm>

#include <Elementary.h>

#include <device/eext.h>

#include "app_assist/WContentViewController.h"
#include "app_assist/WDeferredDeletion.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

WNaviframeController::WNaviframeController() = default;

WNaviframeController::~WNaviframeController() = default;

void WNaviframeController::push(WContentViewController* page) {
    if (page == nullptr) {
        LOG_ERROR("Page is NULL");
        return;
    }
    if (page->_attached) {
        LOG_ERROR("%s is on a naviframe already", page->getClassName());
        return;
    }
    page->_attached = true;
    if (!show(page)) {
        LOG_ERROR("%s cannot be pushed", page->getClassName());
        page->destroy();
    }
}

bool WNaviframeController::show(WContentViewController* page) {
    Evas_Object* const naviframe = getEvasObj();
    if (naviframe == nullptr || isDying() || page->isDying()) {
        return false;
    }
    if (page->getEvasObj() == nullptr && !page->create(naviframe, nullptr)) {
        return false;
    }
    page->onSetContainerProperties(this, nullptr);
    Elm_Object_Item* const item = page->isDying() ? nullptr : page->onPushToNaviframe(naviframe);
    if (item == nullptr) {
        return false;
    }
    page->adoptItem(this, item);
    _pages.push_back(page->getWeakPtr());
    page->onSetAsPageContent(page->getEvasObj());
    page->onPushed(item);
    announceTop();
    return true;
}

WContentViewController* WNaviframeController::getTop() const {
    const auto stays = [](const auto& weak) {
        const auto* const page = static_cast<WContentViewController*>(weak.get());
        return page != nullptr && !page->_leaving && !page->isDying();
    };
    const auto top = std::find_if(_pages.rbegin(), _pages.rend(), stays);
    return top == _pages.rend() ? nullptr : static_cast<WContentViewController*>(top->get());
}

void WNaviframeController::setOnEmpty(const std::function<void()>& onEmpty) {
    _onEmpty = onEmpty;
}

Evas_Object* WNaviframeController::onCreateView(Evas_Object* parent, void* /*param*/) {
    Evas_Object* const naviframe = elm_naviframe_add(parent);
    if (naviframe == nullptr) {
        return nullptr;
    }
    elm_naviframe_prev_btn_auto_pushed_set(naviframe, EINA_FALSE);
    // A page's view outlives its item, so that onDestroy() still finds it.
    elm_naviframe_content_preserve_on_pop_set(naviframe, EINA_TRUE);
    eext_object_event_callback_add(naviframe, EEXT_EVENT_BACK, _backKeyCb, this);
    evas_object_show(naviframe);
    return naviframe;
}

void WNaviframeController::onDestroy() {
    while (!_pages.empty()) {
        const auto page = _pages.back();
        _pages.pop_back();
        if (page) {
            WDeferredDeletion::finishNow(page.get());
        }
    }
}

void WNaviframeController::_backKeyCb(void* data, Evas_Object* /*naviframe*/, void* /*info*/) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    if (auto* const top = static_cast<WNaviframeController*>(data)->getTop()) {
        top->popOut();
    }
}

void WNaviframeController::pageGone(const WContentViewController* page) {
    std::erase_if(_pages, [page](const auto& other) { return other.get() == page; });
    if (isDying()) {
        return;
    }
    announceTop();
    if (_onEmpty && _pages.empty()) {
        const auto onEmpty = _onEmpty;
        onEmpty();
    }
}

void WNaviframeController::announceTop() {
    WContentViewController* const top = getTop();
    if (top != nullptr && top != _announced.get()) {
        _announced = top->getWeakPtr();
        top->onBecomeTop();
    }
}

} // namespace app_assist
