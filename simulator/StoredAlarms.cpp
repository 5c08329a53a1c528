#include "StoredAlarms.h"

#include <algorithm>
#include <ctime>
#include <optional>
#include <string>
#include <vector>

#include "AlarmOnOff.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockAlarmManagerModel.h"
#include "clock/ClockAlarmToast.h"
#include "clock/ClockNotificationModel.h"
#include "device/vconf.h"

#define LOG_TAG "clock-sim"
#include "base/Log.h"

namespace simulator {
namespace {

constexpr const char* ENABLED_ALARMS_KEY = "memory/private/com.vendra.indicator/alarm";

std::optional<ClockAlarmDbData> storedAlarm(int id) {
    std::vector<ClockAlarmDbData> alarms;
    if (!ClockAlarmDbModel().getAllAlarmList(alarms))
        return std::nullopt;
    const auto found = std::find_if(alarms.begin(), alarms.end(),
                                    [id](const ClockAlarmDbData& a) { return a.id == id; });
    if (found == alarms.end()) {
        LOG_ERROR("Alarm %d is not stored", id);
        return std::nullopt;
    }
    return *found;
}

/** Ring and record, or neither. */
bool save(ClockAlarmDbData alarm, ClockAlarmDbData before) {
    if (!ClockAlarmManagerModel::updateAlarmOnServer(alarm))
        return false;
    if (ClockAlarmDbModel().updateAlarmData(alarm, true, true))
        return true;
    before.alarmMgrId = alarm.alarmMgrId;
    ClockAlarmManagerModel::updateAlarmOnServer(before);
    return false;
}

void clearTraces(int id) {
    ClockNotificationModel::removeAlarmNotificationByTag(std::to_string(id));
    vconf_set_int(ENABLED_ALARMS_KEY, ClockAlarmDbModel().getNumberOfEnabledAlarmList());
}

} // namespace

bool switchStoredAlarm(int id, bool on) {
    const auto before = storedAlarm(id);
    if (!before)
        return false;
    ClockAlarmDbData alarm = *before;
    const std::time_t now = std::time(nullptr);
    on ? switchOn(alarm, now) : switchOff(alarm, now);
    if (!save(alarm, *before)) {
        LOG_ERROR("Alarm %d stays switched %s", id, before->enable == 1 ? "on" : "off");
        return false;
    }
    clearTraces(id);
    if (on)
        postTimeToRing(alarm);
    return true;
}

bool removeStoredAlarm(int id) {
    const auto alarm = storedAlarm(id);
    // The record goes first: an alarm that is still in the list must ring.
    if (!alarm || !ClockAlarmDbModel().removeAlarmData(*alarm))
        return false;
    ClockAlarmManagerModel::unregisterAlarmFromServer(*alarm);
    clearTraces(id);
    return true;
}

} // namespace simulator
