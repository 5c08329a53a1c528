#include "ListPage.h"

#include <utility>

#include "app_assist/WNaviframeController.h"
#include "clock/ClockText.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {

ListPage::ListPage(std::string theme, const ListPageTexts& texts)
    : _theme(std::move(theme)), _texts(texts) {}

ListPage::~ListPage() = default;

Evas_Object* ListPage::onCreateView(Evas_Object* parent, void*) {
    Evas_Object* layout = elm_layout_add(parent);
    if (!elm_layout_file_set(layout, _theme.c_str(), "simulator/list_page"))
        LOG_ERROR("'%s' has no list page", _theme.c_str());
    _add = elm_button_add(layout);
    elm_object_style_set(_add, "simulator/create");
    evas_object_smart_callback_add(_add, "clicked", _addClickedCb, this);
    elm_object_part_content_set(layout, "page.create", _add);
    fill(layout);
    return layout;
}

Evas_Object* ListPage::createList(Evas_Object* parent) {
    Evas_Object* list = elm_genlist_add(parent);
    elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
    elm_scroller_policy_set(list, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    return list;
}

void ListPage::onDestroy() {
    // A refresh that comes now would draw on widgets that go.
    _refreshJob.reset();
    _list = nullptr;
    _add = nullptr;
    _other = nullptr;
    WContentViewController::onDestroy();
}

void ListPage::onPushed(Elm_Object_Item* naviItem) {
    WContentViewController::onPushed(naviItem);
    _other = elm_button_add(getNaviframeController()->getEvasObj());
    elm_object_style_set(_other, "naviframe/back_btn/default");
    evas_object_smart_callback_add(_other, "clicked", _otherClickedCb, this);
    elm_object_item_part_content_set(naviItem, "prev_btn", _other);
    setTexts();
}

void ListPage::onBecomeTop() {
    WContentViewController::onBecomeTop();
    // At first it is fresh already.
    if (std::exchange(_wasTop, true))
        scheduleRefresh();
}

void ListPage::onEvent(EventType type) {
    if (type == LANGUAGE_CHANGED)
        setTexts();
    if (type != PAUSED)
        scheduleRefresh();
}

void ListPage::setTexts() {
    if (getNaviItem() == nullptr)
        return;
    elm_object_item_domain_translatable_part_text_set(getNaviItem(), "elm.text.title", nullptr,
                                                      _texts.title);
    elm_object_domain_translatable_text_set(_other, nullptr, _texts.other);
    elm_object_domain_translatable_text_set(_add, nullptr, _texts.add);
}

bool ListPage::isOnTop() const {
    const app_assist::WNaviframeController* pages = getNaviframeController();
    return pages != nullptr && pages->getTop() == this;
}

void ListPage::_addClickedCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<ListPage*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    self->onAddTapped();
}

void ListPage::_otherClickedCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<ListPage*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    self->onOtherTapped();
}

void ListPage::_refreshCb(void* data) {
    auto* self = static_cast<ListPage*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    // The main loop deletes a job that has run.
    static_cast<void>(self->_refreshJob.release());
    self->fill(self->getEvasObj());
}

void ListPage::scheduleRefresh() {
    if (!_refreshJob && _list != nullptr)
        _refreshJob.reset(ecore_job_add(_refreshCb, this));
}

void ListPage::updateRows() {
    if (_list != nullptr)
        elm_genlist_realized_items_update(_list);
}

void ListPage::fill(Evas_Object* layout) {
    // A list that is cleared and filled before it was laid out draws its rows in wrong places.
    _list = createList(layout);
    elm_object_part_content_set(layout, "page.list", _list);
    _rows = 0;
    appendPadding("simulator.padding.top");
    Elm_Object_Item* shown = appendRows();
    appendPadding("simulator.padding.bottom");
    if (shown != nullptr)
        elm_genlist_item_show(shown, ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
    elm_layout_text_set(layout, "page.empty", _rows == 0 ? clockText(_texts.empty) : "");
}

void ListPage::appendPadding(const char* style) {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = style;
    Elm_Object_Item* item = elm_genlist_item_append(_list, itemClass, nullptr, nullptr,
                                                    ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_class_free(itemClass);
    elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
}

Elm_Object_Item* ListPage::append(app_assist::WGenlistItem* row) {
    Elm_Genlist_Item_Class* itemClass = row->getItemClassNew();
    Elm_Object_Item* item =
        elm_genlist_item_append(_list, itemClass, row, nullptr, ELM_GENLIST_ITEM_NONE,
                                app_assist::WGenlistItem::getSelectCb(), row);
    elm_genlist_item_class_free(itemClass);
    row->setElmObjectItem(item);
    ++_rows;
    return item;
}

} // namespace simulator
