#include "ListPage.h"

#include <algorithm>
#include <ctime>
#include <utility>

#include "TimeText.h"
#include "app_assist/WAccessible.h"
#include "app_assist/WNaviframeController.h"
#include "app_assist/WPopupController.h"
#include "clock/ClockText.h"
#include "rules/RingDay.h"

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
    evas_object_smart_callback_add(list, "longpressed", _rowHeldCb, this);
    evas_object_smart_callback_add(list, "scroll,drag,start", _dragCb<true>, this);
    evas_object_smart_callback_add(list, "scroll,drag,stop", _dragCb<false>, this);
    _dragged = false;
    return list;
}

void ListPage::onDestroy() {
    // A refresh that comes now would draw on widgets that go.
    _refreshJob.reset();
    _minuteTimer.reset();
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
    waitForNextMinute();
    // At first it is fresh already.
    if (std::exchange(_wasTop, true))
        scheduleRefresh();
}

void ListPage::onEvent(EventType type) {
    if (type == LANGUAGE_CHANGED) {
        setTexts();
        if (_questionPopup)
            writeQuestion(_questionPopup->getEvasObj());
    }
    if (type == PAUSED) {
        _minuteTimer.reset();
        return;
    }
    if (_list != nullptr && (_minuteTimer || type == RESUMED))
        waitForNextMinute();
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
    if (!self->renewRows())
        self->fill(self->getEvasObj());
}

void ListPage::_rowHeldCb(void* data, Evas_Object*, void* info) {
    const auto* self = static_cast<ListPage*>(data);
    auto* item = static_cast<Elm_Object_Item*>(info);
    if (self == nullptr || item == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    // Padding has no row.
    auto* row = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
    // A row that follows a slow finger rests below it, as the toolkit sees it.
    if (row != nullptr && self->isOnTop() && !self->_dragged)
        static_cast<ListRow*>(row)->onHold();
}

template <bool dragged>
void ListPage::_dragCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<ListPage*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    self->_dragged = dragged;
}

void ListPage::waitForNextMinute() {
    _minuteTimer.reset(
        ecore_timer_add(rules::secondsToNextMinute(std::time(nullptr)), _minuteCb, this));
}

Eina_Bool ListPage::_minuteCb(void* data) {
    auto* self = static_cast<ListPage*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return ECORE_CALLBACK_CANCEL;
    }
    // The main loop deletes the timer of a callback that cancels.
    static_cast<void>(self->_minuteTimer.release());
    // Below another page it waits until it comes back.
    if (self->isOnTop()) {
        self->onMinute();
        self->waitForNextMinute();
    }
    return ECORE_CALLBACK_CANCEL;
}

void ListPage::scheduleRefresh() {
    if (!_refreshJob && _list != nullptr)
        _refreshJob.reset(ecore_job_add(_refreshCb, this));
}

void ListPage::askToRemove(RemovalQuestion question, std::function<void()> remove) {
    if (!isOnTop())
        return;
    _question = std::move(question);
    auto* popup = new app_assist::WPopupController();
    popup->setOnAddProperties([this](Evas_Object* o) {
        elm_popup_align_set(o, ELM_NOTIFY_ALIGN_FILL, 1.0);
        writeQuestion(o);
    });
    const auto labelled = [](const char* id) {
        return [id](Evas_Object* button) {
            elm_object_domain_translatable_text_set(button, nullptr, id);
        };
    };
    popup->addButton("", {}, labelled("IDS_COM_SK_CANCEL"));
    popup->addButton(
        "", [remove = std::move(remove)](bool*) { remove(); }, labelled("IDS_COM_SK_REMOVE"));
    attachPopup(popup);
    _questionPopup = popup->getWeakPtr();
}

void ListPage::writeQuestion(Evas_Object* popup) const {
    const std::string title = _question.title();
    elm_object_part_text_set(popup, "title,text", markupOf(title).c_str());
    // A popup looks for its title's new words before they are written here.
    app_assist::setAccessibleName(popup, title);
    const std::string name =
        _question.name.empty() ? "" : "<b>" + markupOf(_question.name) + "</b><br>";
    elm_object_text_set(popup, (name + clockText(_question.textId)).c_str());
}

std::optional<int> ListPage::neighbourOf(const std::vector<int>& keys, int key) {
    const auto place = std::find(keys.begin(), keys.end(), key);
    if (place == keys.end() || keys.size() == 1)
        return std::nullopt;
    return place + 1 == keys.end() ? *(place - 1) : *(place + 1);
}

void ListPage::updateRows() {
    if (_list != nullptr)
        elm_genlist_realized_items_update(_list);
}

void ListPage::fill(Evas_Object* layout) {
    // A list that is cleared and filled before it was laid out draws its rows in wrong places.
    _list = createList(layout);
    elm_object_part_content_set(layout, "page.list", _list);
    // The height of a row follows from the width of the list.
    evas_smart_objects_calculate(evas_object_evas_get(_list));
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

Elm_Object_Item* ListPage::append(ListRow* row) {
    Elm_Genlist_Item_Class* itemClass = row->getItemClassNew();
    app_assist::WGenlistItem* const data = row;
    Elm_Object_Item* item =
        elm_genlist_item_append(_list, itemClass, data, nullptr, ELM_GENLIST_ITEM_NONE,
                                app_assist::WGenlistItem::getSelectCb(), data);
    elm_genlist_item_class_free(itemClass);
    row->setElmObjectItem(item);
    ++_rows;
    return item;
}

} // namespace simulator
