#include "AlarmListViewController.h"

#include <algorithm>
#include <utility>

#include "AlarmEditViewController.h"
#include "AlarmListItem.h"
#include "app_assist/WNaviframeController.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockText.h"
#include "device/vconf.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr const char* TITLE = "IDS_ALM_HEADER_ALARM";
constexpr const char* CREATE = "IDS_COM_BODY_CREATE";
constexpr const char* NO_ALARMS = "IDS_ALM_BODY_NO_ALARMS";

bool isTwelveHour() {
    int form = 0;
    return vconf_get_int("db/menu_widget/regionformat_time1224", &form) == VCONF_OK && form == 1;
}

bool isNew(const ClockAlarmDbData& alarm, const std::vector<ClockAlarmDbData>& before) {
    return std::none_of(before.begin(), before.end(),
                        [&alarm](const ClockAlarmDbData& old) { return old.id == alarm.id; });
}

} // namespace

AlarmListViewController::AlarmListViewController(std::string theme) : _theme(std::move(theme)) {
    ClockAlarmDbModel::setChangedCb([this] { scheduleRefresh(); });
}

AlarmListViewController::~AlarmListViewController() {
    ClockAlarmDbModel::setChangedCb({});
}

const char* AlarmListViewController::getClassName() const {
    return "AlarmListViewController";
}

Evas_Object* AlarmListViewController::onCreateView(Evas_Object* parent, void*) {
    Evas_Object* layout = elm_layout_add(parent);
    if (!elm_layout_file_set(layout, _theme.c_str(), "simulator/alarm_list"))
        LOG_ERROR("'%s' has no alarm list", _theme.c_str());
    _button = createButton(layout);
    elm_object_part_content_set(layout, "alarm_list.create", _button);
    fill(layout);
    return layout;
}

Evas_Object* AlarmListViewController::createList(Evas_Object* parent) {
    Evas_Object* list = elm_genlist_add(parent);
    elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
    elm_scroller_policy_set(list, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
    return list;
}

Evas_Object* AlarmListViewController::createButton(Evas_Object* parent) {
    Evas_Object* button = elm_button_add(parent);
    elm_object_style_set(button, "simulator/create");
    evas_object_smart_callback_add(button, "clicked", _createClickedCb, this);
    return button;
}

void AlarmListViewController::onDestroy() {
    // A refresh that comes now would draw on widgets that go.
    _refreshJob.reset();
    _list = nullptr;
    _button = nullptr;
    WContentViewController::onDestroy();
}

void AlarmListViewController::onPushed(Elm_Object_Item* naviItem) {
    WContentViewController::onPushed(naviItem);
    setTexts();
}

void AlarmListViewController::onBecomeTop() {
    WContentViewController::onBecomeTop();
    // At first it is fresh already.
    if (std::exchange(_wasTop, true))
        scheduleRefresh();
}

void AlarmListViewController::onEvent(EventType type) {
    if (type == LANGUAGE_CHANGED)
        setTexts();
    if (type != PAUSED)
        scheduleRefresh();
}

void AlarmListViewController::setTexts() {
    if (getNaviItem() != nullptr) {
        elm_object_item_domain_translatable_part_text_set(getNaviItem(), "elm.text.title", nullptr,
                                                          TITLE);
    }
    elm_object_domain_translatable_text_set(_button, nullptr, CREATE);
}

void AlarmListViewController::_createClickedCb(void* data, Evas_Object*, void*) {
    auto* self = static_cast<AlarmListViewController*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    self->createAlarm();
}

void AlarmListViewController::createAlarm() {
    openEditor(ClockAlarmDbData(), true);
}

void AlarmListViewController::editAlarm(int id) {
    const auto alarm = std::find_if(_alarms.begin(), _alarms.end(),
                                    [id](const ClockAlarmDbData& a) { return a.id == id; });
    if (alarm == _alarms.end()) {
        LOG_ERROR("Alarm %d is not stored", id);
        return;
    }
    _editedId = id;
    openEditor(*alarm, false);
}

void AlarmListViewController::openEditor(const ClockAlarmDbData& alarm, bool isCreate) {
    app_assist::WNaviframeController* pages = getNaviframeController();
    // A second tap while the editor slides in must not open another one.
    if (pages == nullptr || pages->getTop() != this)
        return;
    pages->push(new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, isCreate));
}

void AlarmListViewController::_refreshCb(void* data) {
    auto* self = static_cast<AlarmListViewController*>(data);
    if (self == nullptr) {
        LOG_ERROR("Data is NULL !!");
        return;
    }
    // The main loop deletes a job that has run.
    static_cast<void>(self->_refreshJob.release());
    self->fill(self->getEvasObj());
}

void AlarmListViewController::scheduleRefresh() {
    if (!_refreshJob && _list != nullptr)
        _refreshJob.reset(ecore_job_add(_refreshCb, this));
}

void AlarmListViewController::fill(Evas_Object* layout) {
    const auto before = std::exchange(_alarms, {});
    ClockAlarmDbModel().getAllAlarmList(_alarms);
    // A list that is cleared and filled before it was laid out draws its rows in wrong places.
    _list = createList(layout);
    elm_object_part_content_set(layout, "alarm_list.list", _list);
    const bool twelveHour = isTwelveHour();
    Elm_Object_Item* latest = nullptr;
    appendPadding("simulator.padding.top");
    for (const ClockAlarmDbData& alarm : _alarms) {
        Elm_Object_Item* item = appendAlarm(alarm, twelveHour);
        if (isNew(alarm, before) || alarm.id == _editedId)
            latest = item;
    }
    appendPadding("simulator.padding.bottom");
    // A new list starts at its top; a person's alarm may lie further down.
    if (latest != nullptr && !before.empty())
        elm_genlist_item_show(latest, ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
    elm_layout_text_set(layout, "alarm_list.empty", _alarms.empty() ? clockText(NO_ALARMS) : "");
}

void AlarmListViewController::appendPadding(const char* style) {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = style;
    Elm_Object_Item* item = elm_genlist_item_append(_list, itemClass, nullptr, nullptr,
                                                    ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_class_free(itemClass);
    elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
}

Elm_Object_Item* AlarmListViewController::appendAlarm(const ClockAlarmDbData& alarm,
                                                      bool twelveHour) {
    auto* row = new AlarmListItem(alarm, twelveHour, [this](int id) { editAlarm(id); });
    Elm_Genlist_Item_Class* itemClass = row->getItemClassNew();
    Elm_Object_Item* item = elm_genlist_item_append(
        _list, itemClass, row, nullptr, ELM_GENLIST_ITEM_NONE, AlarmListItem::getSelectCb(), row);
    elm_genlist_item_class_free(itemClass);
    row->setElmObjectItem(item);
    return item;
}

} // namespace simulator
