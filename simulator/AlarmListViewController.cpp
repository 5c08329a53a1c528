#include "AlarmListViewController.h"

#include <algorithm>
#include <utility>

#include "AlarmEditViewController.h"
#include "AlarmListItem.h"
#include "TimeText.h"
#include "WorldClockViewController.h"
#include "app_assist/WNaviframeController.h"
#include "clock/ClockAlarmDbModel.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr ListPageTexts TEXTS{.title = "IDS_ALM_HEADER_ALARM",
                              .other = "IDS_WCL_HEADER_WORLD_CLOCK",
                              .add = "IDS_COM_BODY_CREATE",
                              .empty = "IDS_ALM_BODY_NO_ALARMS"};

bool isNew(const ClockAlarmDbData& alarm, const std::vector<ClockAlarmDbData>& before) {
    return std::none_of(before.begin(), before.end(),
                        [&alarm](const ClockAlarmDbData& old) { return old.id == alarm.id; });
}

} // namespace

AlarmListViewController::AlarmListViewController(std::string theme)
    : ListPage(std::move(theme), TEXTS) {
    ClockAlarmDbModel::setChangedCb([this] { scheduleRefresh(); });
}

AlarmListViewController::~AlarmListViewController() {
    ClockAlarmDbModel::setChangedCb({});
}

const char* AlarmListViewController::getClassName() const {
    return "AlarmListViewController";
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
    if (isOnTop()) {
        getNaviframeController()->push(
            new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, isCreate));
    }
}

void AlarmListViewController::openWorldClock() {
    if (isOnTop())
        getNaviframeController()->push(new WorldClockViewController(theme()));
}

Elm_Object_Item* AlarmListViewController::appendRows() {
    const auto before = std::exchange(_alarms, {});
    ClockAlarmDbModel().getAllAlarmList(_alarms);
    const bool twelveHour = isTwelveHour();
    Elm_Object_Item* latest = nullptr;
    for (const ClockAlarmDbData& alarm : _alarms) {
        Elm_Object_Item* item =
            append(new AlarmListItem(alarm, twelveHour, [this](int id) { editAlarm(id); }));
        if (isNew(alarm, before) || alarm.id == _editedId)
            latest = item;
    }
    // A new list starts at its top; a person's alarm may lie further down.
    return before.empty() ? nullptr : latest;
}

} // namespace simulator
