#include "app_assist/WContentViewController.h"

#include <utility>

#include "app_assist/WNaviframeController.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

WContentViewController::WContentViewController() {
    _detach = [this] {
        leave();
    };
}

WContentViewController::~WContentViewController() {
    leave();
    if (auto* const naviframeController = getNaviframeController()) {
        naviframeController->pageGone(this);
    }
}

void WContentViewController::destroy() {
    _leaving = true;
    WViewController::destroy();
}

void WContentViewController::onSetContainerProperties(WNaviframeController* /*naviframeController*/,
                                                      Elm_Object_Item* /*naviItem*/) {}

Elm_Object_Item* WContentViewController::onPushToNaviframe(Evas_Object* naviframe) {
    return elm_naviframe_item_push(naviframe, nullptr, nullptr, nullptr, getEvasObj(), nullptr);
}

void WContentViewController::onPushed(Elm_Object_Item* /*naviItem*/) {}

bool WContentViewController::onPop() {
    return true;
}

void WContentViewController::onBecomeTop() {}

void WContentViewController::onSetAsPageContent(Evas_Object* /*object*/) {}

void WContentViewController::onSetMoreButton(Evas_Object* object, Evas_Smart_Cb callback,
                                             void* data) {
    if (object == nullptr || _naviItem == nullptr) {
        LOG_ERROR("%s has no button or is not on a naviframe", getClassName());
        return;
    }
    if (callback != nullptr) {
        evas_object_smart_callback_add(object, "clicked", callback, data);
    }
    elm_object_item_part_content_set(_naviItem, "more_btn", object);
}

WNaviframeController* WContentViewController::getNaviframeController() const {
    return static_cast<WNaviframeController*>(_naviframeController.get());
}

void WContentViewController::popOut() {
    if (_naviItem == nullptr || _asking) {
        return;
    }
    Evas_Object* const naviframe = elm_object_item_widget_get(_naviItem);
    _heardFromToolkit = false;
    if (elm_naviframe_top_item_get(naviframe) == _naviItem) {
        elm_naviframe_item_pop(naviframe);
    }
    // The toolkit pops the item on top only, and not while that is still coming in.
    if (!_heardFromToolkit && askToLeave()) {
        destroy();
    }
}

void WContentViewController::adoptItem(WNaviframeController* naviframeController,
                                       Elm_Object_Item* item) {
    _naviframeController = naviframeController->getWeakPtr();
    _naviItem = item;
    elm_object_item_data_set(item, this);
    elm_object_item_del_cb_set(item, _itemDeletedCb);
    elm_naviframe_item_pop_cb_set(item, _itemPopCb, this);
}

Eina_Bool WContentViewController::_itemPopCb(void* data, Elm_Object_Item* item) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return EINA_TRUE;
    }
    auto* const self = static_cast<WContentViewController*>(data);
    self->_heardFromToolkit = true;
    if (!self->askToLeave()) {
        return EINA_FALSE;
    }
    // The toolkit deletes the last page on the spot, perhaps with the button that was just clicked.
    if (elm_naviframe_bottom_item_get(elm_object_item_widget_get(item)) == item) {
        self->destroy();
        return EINA_FALSE;
    }
    self->_popping = true;
    return EINA_TRUE;
}

void WContentViewController::_itemDeletedCb(void* data, Evas_Object* /*naviframe*/,
                                            void* /*info*/) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    auto* const self = static_cast<WContentViewController*>(data);
    self->_naviItem = nullptr;
    self->destroy();
}

bool WContentViewController::askToLeave() {
    if (_leaving || isDying()) {
        return false;
    }
    _asking = true;
    const bool agreed = onPop();
    _asking = false;
    if (!agreed) {
        return false;
    }
    _leaving = true;
    destroyPopups();
    return true;
}

void WContentViewController::leave() {
    _leaving = true;
    Elm_Object_Item* const item = std::exchange(_naviItem, nullptr);
    if (item == nullptr) {
        return;
    }
    elm_naviframe_item_pop_cb_set(item, nullptr, nullptr);
    elm_object_item_del_cb_set(item, nullptr);
    if (_popping) {
        // The toolkit deletes an item that is sliding out itself; just the page's things go now.
        deleteItemContents();
    } else {
        elm_object_item_del(item);
    }
}

void WContentViewController::deleteItemContents() {
    Evas_Object* const layout = getEvasObj() ? elm_object_parent_widget_get(getEvasObj()) : nullptr;
    Eina_List* contents = layout ? elm_layout_content_swallow_list_get(layout) : nullptr;
    while (contents != nullptr) {
        auto* const content = static_cast<Evas_Object*>(eina_list_data_get(contents));
        contents = eina_list_remove_list(contents, contents);
        if (content != getEvasObj()) {
            evas_object_del(content);
        }
    }
}

} // namespace app_assist
