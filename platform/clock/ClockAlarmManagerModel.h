/**
 * @file
 * @brief Registration of alarms with the system alarm server.
 */
#pragma once

#include <clock/ClockAlarmDbData.h>
#include <clock/Export.h>

/** The alarm server as the clock sees it. Failures are logged at error priority. */
class CLOCK_COMMON_EXPORT ClockAlarmManagerModel {
public:
    /**
     * @brief Schedules a new alarm.
     * @param[in,out] alarm Gets an id when it has none yet, and the id of its schedule
     *        (alarmMgrId), which stays -1 when the server refuses.
     */
    static bool registerAlarmToServer(ClockAlarmDbData& alarm);

    /**
     * @brief Re-schedules an alarm from its fields.
     *
     * An alarm whose schedule the server does not know (any more) is registered anew and its
     * alarmMgrId replaced.
     */
    static bool updateAlarmOnServer(ClockAlarmDbData& alarm);

    /** @brief Cancels the schedule held under the record's alarmMgrId. */
    static bool unregisterAlarmFromServer(const ClockAlarmDbData& alarm);

    /**
     * @brief Makes the server agree with the stored alarms, once when an application starts.
     *
     * Alarms without a schedule are registered, and schedules of alarms that are not stored are
     * cancelled: both can be left behind by a process that was killed between the two stores.
     */
    static bool synchronize();
};
