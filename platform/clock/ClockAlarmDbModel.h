/**
 * @file
 * @brief The alarm database.
 */
#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <vector>

#include <clock/ClockAlarmDbData.h>
#include <clock/Export.h>

namespace base {
class SqliteDatabase;
}

/**
 * @brief The stored alarms. Made on the stack for one operation.
 *
 * The store is the SQLite file "clock.db" in the application's data folder. An operation that fails
 * logs the reason at error priority and changes nothing: a store that is locked, read-only, full or
 * written by a newer version is left as it is, and a damaged file is moved aside, never deleted.
 */
class CLOCK_COMMON_EXPORT ClockAlarmDbModel {
public:
    ClockAlarmDbModel();
    ~ClockAlarmDbModel();
    ClockAlarmDbModel(const ClockAlarmDbModel&) = delete;
    ClockAlarmDbModel& operator=(const ClockAlarmDbModel&) = delete;

    /**
     * @brief Finds the stored alarm that a record would duplicate.
     *
     * Duplicates have the same hour, minute and weekday set; two one-time alarms also the same day
     * of ringing. The record's own id is not excluded.
     * @return The id of the stored alarm (the smallest when there are several), or -1.
     */
    int isDuplicatedAlarmData(const ClockAlarmDbData& alarm);

    /**
     * @brief Stores a new alarm under its id, or under a new id when it has none (a negative one).
     * @return True when the alarm is on the disk.
     */
    bool insertAlarmData(const ClockAlarmDbData& alarm);

    /**
     * @brief Rewrites the stored alarm with the record's id.
     * @param writeSchedule Also rewrite the id of the schedule (alarmMgrId); otherwise the stored
     *        one stays.
     * @param announce Tell the listeners of setChangedCb().
     * @return False when no such alarm is stored or the store cannot be written.
     */
    bool updateAlarmData(const ClockAlarmDbData& alarm, bool writeSchedule, bool announce);

    /** @brief Deletes the stored alarm with the record's id. @return False when there is none. */
    bool removeAlarmData(const ClockAlarmDbData& alarm);

    /** @brief Appends every stored alarm, by time of day and id, to a list. */
    bool getAllAlarmList(std::vector<ClockAlarmDbData>& alarms);

    /** @brief The number of stored alarms that are switched on; 0 when the store is unreadable. */
    int getNumberOfEnabledAlarmList();

    /** @brief Reserves an id for a new alarm; never handed out twice. @return -1 on failure. */
    std::int32_t reserveAlarmId();

    /**
     * @brief Sets the function that runs after this process has changed the stored alarms.
     * @param changed Replaces the earlier one; empty = none.
     */
    static void setChangedCb(const std::function<void()>& changed);

private:
    std::unique_ptr<base::SqliteDatabase> _database;
};
