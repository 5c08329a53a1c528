// The alarm server of the desktop: schedules in the clock's own file, so that one backup holds
// both.
#define LOG_TAG "device-host"
#include <device/alarm_server.h>

#include <ctime>
#include <optional>
#include <string>
#include <vector>

#include <base/AppStore.h>
#include <base/CivilTime.h>
#include <base/Log.h>
#include <base/SqliteDatabase.h>

namespace {

constexpr int LATEST_YEAR = 9999;

struct StoredSchedule {
    std::int32_t id = 0;
    alarm_schedule_s values{};
};

const std::vector<std::string>& migrations() {
    // AUTOINCREMENT: the id of a removed schedule may still stand in an alarm, and must not come to
    // mean another one.
    static const std::vector<std::string> scripts{
        R"(CREATE TABLE alarm_schedule(
            schedule_id INTEGER PRIMARY KEY AUTOINCREMENT,
            alarm_id INTEGER NOT NULL,
            enabled INTEGER NOT NULL,
            hour INTEGER NOT NULL,
            minute INTEGER NOT NULL,
            weekdays INTEGER NOT NULL,
            year INTEGER NOT NULL,
            month INTEGER NOT NULL,
            day INTEGER NOT NULL) STRICT)"};
    return scripts;
}

std::string storePath() {
    return base::appDataPath("clock.db", LOG_TAG);
}

bool openStore(base::SqliteDatabase& database) {
    const bool opened = base::openAppStore(database, "alarm-server", migrations(), LOG_TAG);
    if (!opened)
        LOG_ERROR("schedules cannot be opened: %s", database.lastError().c_str());
    return opened;
}

int ioError(const base::SqliteDatabase& database) {
    LOG_ERROR("schedules cannot be used: %s", database.lastError().c_str());
    return ALARM_SERVER_ERROR_IO;
}

bool isDate(int year, int month, int day) {
    const base::CivilDate date{year, month, day};
    return year >= 1 && year <= LATEST_YEAR && month >= 1 && month <= 12 &&
           base::addDays(date, 0) == date;
}

bool isValid(const alarm_schedule_s* schedule) {
    return schedule && (schedule->enabled == 0 || schedule->enabled == 1) && schedule->hour >= 0 &&
           schedule->hour <= 23 && schedule->minute >= 0 && schedule->minute <= 59 &&
           schedule->weekdays >= 0 && schedule->weekdays <= 127 &&
           (schedule->year == 0 || isDate(schedule->year, schedule->month, schedule->day));
}

void bindSchedule(base::SqliteStatement& statement, const alarm_schedule_s& schedule) {
    int parameter = 0;
    for (const auto value : {schedule.alarm_id, schedule.enabled, schedule.hour, schedule.minute,
                             schedule.weekdays, schedule.year, schedule.month, schedule.day})
        statement.bind(++parameter, std::int64_t(value));
}

StoredSchedule readSchedule(const base::SqliteStatement& row) {
    StoredSchedule schedule;
    auto& values = schedule.values;
    int column = 0;
    for (auto* value : {&schedule.id, &values.alarm_id, &values.enabled, &values.hour,
                        &values.minute, &values.weekdays, &values.year, &values.month, &values.day})
        *value = static_cast<std::int32_t>(row.integer(column++));
    return schedule;
}

/** Derived anew on every call: the clock or the zone may have been set since the last one. */
std::int64_t nextRingOf(const alarm_schedule_s& schedule) {
    // The file can be edited by hand.
    if (schedule.enabled != 1 || !isValid(&schedule))
        return 0;
    base::RingRule rule{schedule.hour, schedule.minute, schedule.weekdays, std::nullopt};
    if (schedule.year != 0)
        rule.date = base::CivilDate{schedule.year, schedule.month, schedule.day};
    return base::nextRing(rule, std::time(nullptr), base::currentTimeZone()).value_or(0);
}

constexpr const char* SELECT =
    "SELECT schedule_id, alarm_id, enabled, hour, minute, weekdays, year, month, day "
    "FROM alarm_schedule ";

} // namespace

int alarm_server_register(const alarm_schedule_s* schedule, int32_t* schedule_id) {
    if (!isValid(schedule) || !schedule_id)
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    base::SqliteDatabase database(storePath());
    if (!openStore(database))
        return ALARM_SERVER_ERROR_IO;
    auto insert =
        database.prepare("INSERT INTO alarm_schedule(alarm_id, enabled, hour, minute, weekdays, "
                         "year, month, day) VALUES(?1, ?2, ?3, ?4, ?5, ?6, ?7, ?8)");
    bindSchedule(insert, *schedule);
    if (!insert.run())
        return ioError(database);
    *schedule_id = static_cast<std::int32_t>(database.lastInsertId());
    return ALARM_SERVER_ERROR_NONE;
}

int alarm_server_update(int32_t schedule_id, const alarm_schedule_s* schedule) {
    if (!isValid(schedule))
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    base::SqliteDatabase database(storePath());
    if (!openStore(database))
        return ALARM_SERVER_ERROR_IO;
    auto update = database.prepare(
        "UPDATE alarm_schedule SET alarm_id = ?1, enabled = ?2, hour = ?3, minute = ?4, "
        "weekdays = ?5, year = ?6, month = ?7, day = ?8 WHERE schedule_id = ?9");
    bindSchedule(update, *schedule);
    if (!update.bind(9, std::int64_t(schedule_id)).run())
        return ioError(database);
    return database.changes() == 1 ? ALARM_SERVER_ERROR_NONE : ALARM_SERVER_ERROR_NOT_FOUND;
}

int alarm_server_unregister(int32_t schedule_id) {
    base::SqliteDatabase database(storePath());
    if (!openStore(database))
        return ALARM_SERVER_ERROR_IO;
    auto remove = database.prepare("DELETE FROM alarm_schedule WHERE schedule_id = ?1");
    if (!remove.bind(1, std::int64_t(schedule_id)).run())
        return ioError(database);
    return database.changes() == 1 ? ALARM_SERVER_ERROR_NONE : ALARM_SERVER_ERROR_NOT_FOUND;
}

int alarm_server_get(int32_t schedule_id, alarm_schedule_s* schedule, int64_t* next_ring) {
    base::SqliteDatabase database(storePath());
    if (!openStore(database))
        return ALARM_SERVER_ERROR_IO;
    auto query = database.prepare(std::string(SELECT) + "WHERE schedule_id = ?1");
    if (!query.bind(1, std::int64_t(schedule_id)).step())
        return query.failed() ? ioError(database) : ALARM_SERVER_ERROR_NOT_FOUND;
    const auto stored = readSchedule(query);
    if (schedule)
        *schedule = stored.values;
    if (next_ring)
        *next_ring = nextRingOf(stored.values);
    return ALARM_SERVER_ERROR_NONE;
}

int alarm_server_foreach(int (*callback)(int32_t schedule_id, const alarm_schedule_s* schedule,
                                         int64_t next_ring, void* data),
                         void* data) {
    if (!callback)
        return ALARM_SERVER_ERROR_INVALID_PARAMETER;
    std::vector<StoredSchedule> schedules;
    {
        base::SqliteDatabase database(storePath());
        if (!openStore(database))
            return ALARM_SERVER_ERROR_IO;
        auto query = database.prepare(std::string(SELECT) + "ORDER BY schedule_id");
        while (query.step())
            schedules.push_back(readSchedule(query));
        if (query.failed())
            return ioError(database);
    }
    for (const auto& schedule : schedules)
        if (callback(schedule.id, &schedule.values, nextRingOf(schedule.values), data) == 0)
            break;
    return ALARM_SERVER_ERROR_NONE;
}
