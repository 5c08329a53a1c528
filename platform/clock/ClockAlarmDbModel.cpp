#define LOG_TAG "clock-common"
#include "clock/ClockAlarmDbModel.h"

#include <array>
#include <ctime>
#include <limits>
#include <optional>
#include <string>

#include <base/AppStore.h>
#include <base/Log.h>
#include <base/SqliteDatabase.h>

#include "clock/AlarmRing.h"

namespace {

constexpr const char* OWNER = "clock";

// The table "alarm" has one row for each alarm; its columns are the members of ClockAlarmDbData in
// their order. "alarm_id" has one row: the next id that was never handed out.
const std::vector<std::string>& migrations() {
    static const std::vector<std::string> scripts{
        R"(CREATE TABLE alarm(
            leading INTEGER NOT NULL,
            id INTEGER PRIMARY KEY,
            alarm_mgr_id INTEGER NOT NULL,
            enable INTEGER NOT NULL,
            alarm_time INTEGER NOT NULL,
            alarm_time_base INTEGER NOT NULL,
            create_time INTEGER NOT NULL,
            update_time INTEGER NOT NULL,
            auto_date INTEGER NOT NULL,
            manual_date INTEGER NOT NULL,
            hour INTEGER NOT NULL,
            min INTEGER NOT NULL,
            name TEXT NOT NULL,
            time_zone TEXT NOT NULL,
            repeat_once INTEGER NOT NULL,
            repeat_weekly INTEGER NOT NULL,
            snooze INTEGER NOT NULL,
            snooze_duration INTEGER NOT NULL,
            snooze_repeat INTEGER NOT NULL,
            snooze_count INTEGER NOT NULL,
            type INTEGER NOT NULL,
            sound_path TEXT NOT NULL,
            volume INTEGER NOT NULL,
            trailing INTEGER NOT NULL,
            increase_volume INTEGER NOT NULL,
            tone_position INTEGER NOT NULL) STRICT;
        CREATE TABLE alarm_id(next INTEGER NOT NULL) STRICT;
        INSERT INTO alarm_id(next) VALUES(1))"};
    return scripts;
}

constexpr const char* COLUMNS =
    "leading, id, alarm_mgr_id, enable, alarm_time, alarm_time_base, create_time, update_time, "
    "auto_date, manual_date, hour, min, name, time_zone, repeat_once, repeat_weekly, snooze, "
    "snooze_duration, snooze_repeat, snooze_count, type, sound_path, volume, trailing, "
    "increase_volume, tone_position";

constexpr const char* PARAMETERS = "?1, ?2, ?3, ?4, ?5, ?6, ?7, ?8, ?9, ?10, ?11, ?12, ?13, ?14, "
                                   "?15, ?16, ?17, ?18, ?19, ?20, ?21, ?22, ?23, ?24, ?25, ?26";

/** Calls a function with each member of a record, in the order of the columns. */
template <typename Record, typename Visitor>
void visitMembers(Record& alarm, Visitor visit) {
    const auto visitAll = [&](auto&... members) {
        (visit(members), ...);
    };
    visitAll(alarm.leading, alarm.id, alarm.alarmMgrId, alarm.enable, alarm.alarmTime,
             alarm.alarmTimeBase, alarm.createTime, alarm.updateTime, alarm.autoDate,
             alarm.manualDate, alarm.hour, alarm.min, alarm.name, alarm.timeZone, alarm.repeatOnce,
             alarm.repeatWeekly, alarm.snooze, alarm.snoozeDuration, alarm.snoozeRepeat,
             alarm.snoozeCount, alarm.type, alarm.soundPath, alarm.volume, alarm.trailing,
             alarm.increaseVolume, alarm.tonePosition);
}

struct Binder {
    base::SqliteStatement& statement;
    int parameter = 0;
    void operator()(std::int32_t value) { statement.bind(++parameter, std::int64_t(value)); }
    void operator()(const std::string& value) {
        statement.bind(++parameter, std::string_view(value));
    }
};

struct Reader {
    const base::SqliteStatement& row;
    int column = 0;
    void operator()(std::int32_t& value) {
        value = static_cast<std::int32_t>(row.integer(column++));
    }
    void operator()(std::string& value) { value = row.text(column++); }
};

void bindAlarm(base::SqliteStatement& statement, const ClockAlarmDbData& alarm) {
    visitMembers(alarm,
                 [binder = Binder{statement}](const auto& member) mutable { binder(member); });
}

ClockAlarmDbData readAlarm(const base::SqliteStatement& row) {
    ClockAlarmDbData alarm;
    visitMembers(alarm, [reader = Reader{row}](auto& member) mutable { reader(member); });
    return alarm;
}

std::function<void()>& changedCb() {
    static std::function<void()> changed;
    return changed;
}

void announceChange() {
    // The callback may replace itself while it runs.
    if (const auto changed = changedCb())
        changed();
}

/** The smallest id that is not taken and was never handed out; nothing when there is none. */
std::optional<std::int32_t> takeNextId(base::SqliteDatabase& database) {
    auto query = database.prepare("SELECT MAX(next, IFNULL((SELECT MAX(id) + 1 FROM alarm), 1)) "
                                  "FROM alarm_id");
    if (!query.step())
        return std::nullopt;
    const auto id = query.integer(0);
    if (id < 1 || id >= std::numeric_limits<std::int32_t>::max()) {
        LOG_ERROR("every alarm id has been handed out");
        return std::nullopt;
    }
    auto update = database.prepare("UPDATE alarm_id SET next = ?1");
    if (!update.bind(1, id + 1).run())
        return std::nullopt;
    return static_cast<std::int32_t>(id);
}

bool writeNewAlarm(base::SqliteDatabase& database, ClockAlarmDbData alarm) {
    if (alarm.id < 0) {
        const auto id = takeNextId(database);
        if (!id)
            return false;
        alarm.id = *id;
    }
    // An id that the caller brought along must not be handed out later either.
    auto pass = database.prepare("UPDATE alarm_id SET next = MAX(next, ?1 + 1)");
    if (!pass.bind(1, std::int64_t(alarm.id)).run())
        return false;
    auto insert = database.prepare(std::string("INSERT INTO alarm(") + COLUMNS + ") VALUES(" +
                                   PARAMETERS + ")");
    bindAlarm(insert, alarm);
    return insert.run();
}

} // namespace

ClockAlarmDbModel::ClockAlarmDbModel()
    : _database(std::make_unique<base::SqliteDatabase>(base::appDataPath("clock.db", LOG_TAG))) {
    base::openAppStore(*_database, OWNER, migrations(), LOG_TAG);
}

ClockAlarmDbModel::~ClockAlarmDbModel() = default;

int ClockAlarmDbModel::isDuplicatedAlarmData(const ClockAlarmDbData& alarm) {
    auto query = _database->prepare(std::string("SELECT ") + COLUMNS +
                                    " FROM alarm WHERE hour = ?1 AND min = ?2 AND "
                                    "(repeat_weekly & 127) = ?3 ORDER BY id");
    const auto wanted = clock_common::ringRule(alarm);
    query.bind(1, std::int64_t(wanted.hour))
        .bind(2, std::int64_t(wanted.minute))
        .bind(3, std::int64_t(wanted.weekdays));
    const auto now = std::time(nullptr);
    const auto zone = base::currentTimeZone();
    const auto dayOf = [&](const base::RingRule& rule) {
        const auto next = rule.date ? std::nullopt : base::nextRing(rule, now, zone);
        return next ? base::toCivil(*next, zone).date : rule.date.value_or(base::CivilDate());
    };
    while (query.step()) {
        const auto stored = readAlarm(query);
        if (wanted.weekdays != 0 || dayOf(clock_common::ringRule(stored)) == dayOf(wanted))
            return stored.id;
    }
    if (query.failed())
        LOG_ERROR("alarms cannot be read: %s", _database->lastError().c_str());
    return -1;
}

bool ClockAlarmDbModel::insertAlarmData(const ClockAlarmDbData& alarm) {
    if (!_database->transaction([&] { return writeNewAlarm(*_database, alarm); })) {
        LOG_ERROR("alarm %d cannot be stored: %s", alarm.id, _database->lastError().c_str());
        return false;
    }
    announceChange();
    return true;
}

bool ClockAlarmDbModel::updateAlarmData(const ClockAlarmDbData& alarm, bool writeSchedule,
                                        bool announce) {
    std::string values = PARAMETERS;
    if (!writeSchedule)
        values.replace(values.find("?3"), 2, "alarm_mgr_id");
    const auto sql =
        std::string("UPDATE alarm SET (") + COLUMNS + ") = (" + values + ") WHERE id = ?2";
    auto update = _database->prepare(sql);
    bindAlarm(update, alarm);
    if (!update.run()) {
        LOG_ERROR("alarm %d cannot be stored: %s", alarm.id, _database->lastError().c_str());
        return false;
    }
    if (_database->changes() == 0) {
        LOG_ERROR("alarm %d is not stored", alarm.id);
        return false;
    }
    if (announce)
        announceChange();
    return true;
}

bool ClockAlarmDbModel::removeAlarmData(const ClockAlarmDbData& alarm) {
    auto remove = _database->prepare("DELETE FROM alarm WHERE id = ?1");
    if (!remove.bind(1, std::int64_t(alarm.id)).run()) {
        LOG_ERROR("alarm %d cannot be removed: %s", alarm.id, _database->lastError().c_str());
        return false;
    }
    if (_database->changes() == 0) {
        LOG_ERROR("alarm %d is not stored", alarm.id);
        return false;
    }
    announceChange();
    return true;
}

bool ClockAlarmDbModel::getAllAlarmList(std::vector<ClockAlarmDbData>& alarms) {
    auto query =
        _database->prepare(std::string("SELECT ") + COLUMNS + " FROM alarm ORDER BY hour, min, id");
    std::vector<ClockAlarmDbData> stored;
    while (query.step())
        stored.push_back(readAlarm(query));
    if (query.failed()) {
        LOG_ERROR("alarms cannot be read: %s", _database->lastError().c_str());
        return false;
    }
    alarms.insert(alarms.end(), stored.begin(), stored.end());
    return true;
}

int ClockAlarmDbModel::getNumberOfEnabledAlarmList() {
    auto query = _database->prepare("SELECT COUNT(*) FROM alarm WHERE enable = 1");
    if (query.step())
        return static_cast<int>(query.integer(0));
    LOG_ERROR("alarms cannot be read: %s", _database->lastError().c_str());
    return 0;
}

std::int32_t ClockAlarmDbModel::reserveAlarmId() {
    std::optional<std::int32_t> id;
    const bool reserved = _database->transaction([&] {
        id = takeNextId(*_database);
        return id.has_value();
    });
    if (reserved)
        return *id;
    LOG_ERROR("no id for a new alarm: %s", _database->lastError().c_str());
    return -1;
}

void ClockAlarmDbModel::setChangedCb(const std::function<void()>& changed) {
    changedCb() = changed;
}
