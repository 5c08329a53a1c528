#include "app_assist/WGenlistItem.h"

#define LOG_TAG "app-assist"
#include "base/Log.h"

namespace app_assist {

namespace {

void selectCb(void* data, Evas_Object* /*genlist*/, void* info) {
    if (data == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    auto* const item = static_cast<Elm_Object_Item*>(info);
    // A row is pressed like a button: it does not stay highlighted, and the next tap counts again.
    if (item != nullptr) {
        elm_genlist_item_selected_set(item, EINA_FALSE);
    }
    static_cast<WGenlistItem*>(data)->onSelect(item);
}

} // namespace

WGenlistItem::~WGenlistItem() = default;

Elm_Genlist_Item_Class* WGenlistItem::getItemClassStatic() {
    return nullptr;
}

Elm_Genlist_Item_Class* WGenlistItem::getItemClassNew() {
    return nullptr;
}

void WGenlistItem::onSelect(Elm_Object_Item* /*item*/) {}

void WGenlistItem::onSetElmObjectItem(Elm_Object_Item* /*item*/) {}

Evas_Smart_Cb WGenlistItem::getSelectCb() {
    return selectCb;
}

void WGenlistItem::setElmObjectItem(Elm_Object_Item* item) {
    _item = item;
    onSetElmObjectItem(item);
}

void WGenlistItem::deleteCb(void* data, Evas_Object* /*genlist*/) {
    delete static_cast<WGenlistItem*>(data);
}

} // namespace app_assist
