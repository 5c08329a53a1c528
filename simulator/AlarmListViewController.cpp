#include "AlarmListViewController.h"

#include <algorithm>
#include <ctime>
#include <iterator>
#include <utility>

#include "AlarmEditViewController.h"
#include "AlarmListText.h"
#include "AlarmOrder.h"
#include "StoredAlarms.h"
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

void AlarmListViewController::onEvent(EventType type) {
    _needsOrder = _needsOrder || type == PAUSED || type == TIME_CHANGED;
    _needsRows = _needsRows || type == SETTINGS_CHANGED || type == LANGUAGE_CHANGED;
    ListPage::onEvent(type);
}

void AlarmListViewController::createAlarm() {
    openEditor(ClockAlarmDbData(), true);
}

void AlarmListViewController::editAlarm(int id) {
    const ClockAlarmDbData* alarm = find(id);
    if (alarm == nullptr) {
        LOG_ERROR("Alarm %d is not stored", id);
        return;
    }
    _shownId = id;
    openEditor(*alarm, false);
}

void AlarmListViewController::openEditor(const ClockAlarmDbData& alarm, bool isCreate) {
    if (isOnTop())
        pushPage(new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, isCreate));
}

void AlarmListViewController::openWorldClock() {
    if (isOnTop())
        pushPage(new WorldClockViewController(theme()));
}

void AlarmListViewController::pushPage(app_assist::WContentViewController* page) {
    _needsOrder = true;
    getNaviframeController()->push(page);
}

void AlarmListViewController::switchAlarm(int id, bool on) {
    switchStoredAlarm(id, on);
    // What could not be stored is announced by nobody, but the switch has moved.
    scheduleRefresh();
}

void AlarmListViewController::askToRemove(int id) {
    const ClockAlarmDbData* alarm = find(id);
    if (alarm == nullptr)
        return;
    ListPage::askToRemove(
        {.title = [alarm = *alarm] { return alarmTimeText(alarm, isTwelveHour()); },
         .name = alarm->name,
         .textId = "IDS_ALM_POP_REMOVE_ALARM"},
        [this, id] { removeAlarm(id); });
}

void AlarmListViewController::removeAlarm(int id) {
    const int neighbour = neighbourOf(ids(), id).value_or(NONE);
    if (removeStoredAlarm(id))
        _shownId = neighbour;
    scheduleRefresh();
}

const ClockAlarmDbData* AlarmListViewController::find(int id) const {
    const auto alarm = std::find_if(_alarms.begin(), _alarms.end(),
                                    [id](const ClockAlarmDbData& a) { return a.id == id; });
    return alarm == _alarms.end() ? nullptr : &*alarm;
}

std::vector<int> AlarmListViewController::ids() const {
    std::vector<int> ids;
    std::transform(_alarms.begin(), _alarms.end(), std::back_inserter(ids),
                   [](const ClockAlarmDbData& alarm) { return alarm.id; });
    return ids;
}

std::vector<ClockAlarmDbData> AlarmListViewController::readAlarms() const {
    std::vector<ClockAlarmDbData> alarms;
    // What cannot be read stays as it was seen last.
    if (!ClockAlarmDbModel().getAllAlarmList(alarms))
        alarms = _alarms;
    if (_needsOrder)
        orderAlarms(alarms, std::time(nullptr));
    else
        keepOrder(alarms, ids());
    return alarms;
}

std::vector<AlarmRowLook> AlarmListViewController::looks() const {
    const std::time_t now = std::time(nullptr);
    const bool twelveHour = isTwelveHour();
    const auto next = nextAlarm(_alarms, now);
    std::vector<AlarmRowLook> looks;
    for (const ClockAlarmDbData& alarm : _alarms) {
        const bool isNext = next && next->id == alarm.id;
        looks.push_back({twelveHour, isNext ? nextRingText(next->ring, now) : ""});
    }
    return looks;
}

void AlarmListViewController::drawRows() {
    const auto looks = this->looks();
    for (std::size_t place = 0; place < _rows.size(); ++place)
        _rows[place]->show(_alarms.at(place), looks.at(place));
}

bool AlarmListViewController::renewRows() {
    if (_needsOrder || _needsRows)
        return false;
    const std::vector<int> before = ids();
    auto alarms = readAlarms();
    std::swap(_alarms, alarms);
    if (ids() == before) {
        drawRows();
        return true;
    }
    std::swap(_alarms, alarms);
    return false;
}

Elm_Object_Item* AlarmListViewController::appendRows() {
    const auto before = ids();
    _alarms = readAlarms();
    _needsOrder = false;
    _needsRows = false;
    _rows.clear();
    const auto looks = this->looks();
    const int shownId = std::exchange(_shownId, NONE);
    Elm_Object_Item* shown = nullptr;
    for (std::size_t place = 0; place < _alarms.size(); ++place) {
        const ClockAlarmDbData& alarm = _alarms[place];
        auto* row = new AlarmListItem(alarm, looks.at(place),
                                      {[this](int id) { editAlarm(id); },
                                       [this](int id) { askToRemove(id); },
                                       [this](int id, bool on) {
                                           switchAlarm(id, on);
                                       }});
        Elm_Object_Item* item = append(row);
        _rows.push_back(row);
        const bool isNew = std::find(before.begin(), before.end(), alarm.id) == before.end();
        if (isNew || alarm.id == shownId)
            shown = item;
    }
    // A new list starts at its top; a person's alarm may lie further down.
    return before.empty() ? nullptr : shown;
}

} // namespace simulator
