#define LOG_TAG "clock-common"
#include "clock/ClockAlarmManagerModel.h"

#include <algorithm>
#include <vector>

#include <base/Log.h>
#include <device/alarm_server.h>

#include "clock/AlarmRing.h"
#include "clock/ClockAlarmDbModel.h"

namespace {

alarm_schedule_s scheduleOf(const ClockAlarmDbData& alarm) {
    const auto rule = clock_common::ringRule(alarm);
    alarm_schedule_s schedule{};
    schedule.alarm_id = alarm.id;
    schedule.enabled = alarm.enable == 1 ? 1 : 0;
    schedule.hour = rule.hour;
    schedule.minute = rule.minute;
    schedule.weekdays = rule.weekdays;
    if (rule.date) {
        schedule.year = rule.date->year;
        schedule.month = rule.date->month;
        schedule.day = rule.date->day;
    }
    return schedule;
}

bool isSame(const alarm_schedule_s& a, const alarm_schedule_s& b) {
    return a.alarm_id == b.alarm_id && a.enabled == b.enabled && a.hour == b.hour &&
           a.minute == b.minute && a.weekdays == b.weekdays && a.year == b.year &&
           a.month == b.month && a.day == b.day;
}

bool registerSchedule(ClockAlarmDbData& alarm) {
    const auto schedule = scheduleOf(alarm);
    std::int32_t scheduleId = -1;
    const int result = alarm_server_register(&schedule, &scheduleId);
    if (result != ALARM_SERVER_ERROR_NONE) {
        LOG_ERROR("alarm_server_register failed(id = %d, ret = %d)", alarm.id, result);
        return false;
    }
    alarm.alarmMgrId = scheduleId;
    return true;
}

struct Schedule {
    std::int32_t id = 0;
    alarm_schedule_s values{};
};

int collectSchedule(std::int32_t id, const alarm_schedule_s* values, std::int64_t, void* data) {
    static_cast<std::vector<Schedule>*>(data)->push_back({id, *values});
    return 1;
}

/** Makes one stored alarm's schedule agree with it. */
bool synchronizeAlarm(ClockAlarmDbData& alarm, const std::vector<Schedule>& schedules) {
    const auto own = std::find_if(schedules.begin(), schedules.end(), [&](const Schedule& s) {
        return s.id == alarm.alarmMgrId && s.values.alarm_id == alarm.id;
    });
    if (own != schedules.end())
        return isSame(own->values, scheduleOf(alarm)) ||
               ClockAlarmManagerModel::updateAlarmOnServer(alarm);
    LOG_WARNING("alarm %d had no schedule", alarm.id);
    return registerSchedule(alarm) && ClockAlarmDbModel().updateAlarmData(alarm, true, false);
}

bool cancel(std::int32_t scheduleId) {
    const int result = alarm_server_unregister(scheduleId);
    if (result != ALARM_SERVER_ERROR_NONE)
        LOG_ERROR("alarm_server_unregister failed(schedule = %d, ret = %d)", scheduleId, result);
    return result == ALARM_SERVER_ERROR_NONE;
}

} // namespace

bool ClockAlarmManagerModel::registerAlarmToServer(ClockAlarmDbData& alarm) {
    if (alarm.id < 0)
        alarm.id = ClockAlarmDbModel().reserveAlarmId();
    return alarm.id >= 0 && registerSchedule(alarm);
}

bool ClockAlarmManagerModel::updateAlarmOnServer(ClockAlarmDbData& alarm) {
    const auto schedule = scheduleOf(alarm);
    const int result = alarm_server_update(alarm.alarmMgrId, &schedule);
    if (result == ALARM_SERVER_ERROR_NOT_FOUND)
        return registerSchedule(alarm);
    if (result != ALARM_SERVER_ERROR_NONE)
        LOG_ERROR("alarm_server_update failed(id = %d, ret = %d)", alarm.id, result);
    return result == ALARM_SERVER_ERROR_NONE;
}

bool ClockAlarmManagerModel::unregisterAlarmFromServer(const ClockAlarmDbData& alarm) {
    return cancel(alarm.alarmMgrId);
}

bool ClockAlarmManagerModel::synchronize() {
    std::vector<ClockAlarmDbData> alarms;
    // An unreadable store must not look like one without alarms.
    if (!ClockAlarmDbModel().getAllAlarmList(alarms))
        return false;
    std::vector<Schedule> schedules;
    const int result = alarm_server_foreach(collectSchedule, &schedules);
    if (result != ALARM_SERVER_ERROR_NONE) {
        LOG_ERROR("alarm_server_foreach failed(ret = %d)", result);
        return false;
    }
    bool agreed = true;
    for (auto& alarm : alarms)
        agreed = synchronizeAlarm(alarm, schedules) && agreed;
    for (const auto& schedule : schedules) {
        const bool wanted = std::any_of(alarms.begin(), alarms.end(), [&](const auto& alarm) {
            return alarm.alarmMgrId == schedule.id;
        });
        if (!wanted) {
            LOG_WARNING("schedule %d had no alarm", schedule.id);
            agreed = cancel(schedule.id) && agreed;
        }
    }
    return agreed;
}
