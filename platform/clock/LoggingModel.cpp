#define LOG_TAG "clock-common"
#include "clock/LoggingModel.h"

#include <ctime>
#include <string>
#include <vector>

#include <base/AppStore.h>
#include <base/Log.h>
#include <base/SqliteDatabase.h>

namespace {

// A file of its own: damage to the usage log must not touch the alarms.
constexpr const char* FILE_NAME = "usage.db";

const std::vector<std::string>& migrations() {
    static const std::vector<std::string> scripts{
        R"(CREATE TABLE usage(
            number INTEGER PRIMARY KEY AUTOINCREMENT,
            time INTEGER NOT NULL,
            application_id TEXT NOT NULL,
            feature TEXT NOT NULL,
            detail TEXT NOT NULL,
            extra TEXT NOT NULL) STRICT)"};
    return scripts;
}

bool openStore(base::SqliteDatabase& database) {
    if (!base::openAppStore(database, "usage", migrations(), LOG_TAG)) {
        LOG_ERROR("usage log cannot be opened: %s", database.lastError().c_str());
        return false;
    }
    // The editor logs several events at once while a person waits for it to close.
    return database.relax();
}

bool writeEvent(base::SqliteDatabase& database, const char* applicationId, const char* feature,
                const char* detail, const char* extra) {
    auto insert = database.prepare("INSERT INTO usage(time, application_id, feature, detail, "
                                   "extra) VALUES(?1, ?2, ?3, ?4, ?5)");
    insert.bind(1, static_cast<std::int64_t>(std::time(nullptr)))
        .bind(2, std::string_view(applicationId))
        .bind(3, std::string_view(feature))
        .bind(4, std::string_view(detail))
        .bind(5, std::string_view(extra ? extra : ""));
    return insert.run() && database.execute("DELETE FROM usage WHERE number <= "
                                            "(SELECT MAX(number) FROM usage) - 10000");
}

} // namespace

LoggingModel& LoggingModel::getInstance() {
    static LoggingModel instance;
    static const bool initialised = (init(), true);
    static_cast<void>(initialised);
    return instance;
}

void LoggingModel::init() {
    // Opening makes the file and its table.
    base::SqliteDatabase database(base::appDataPath(FILE_NAME, LOG_TAG));
    openStore(database);
}

void LoggingModel::insertLog(const char* applicationId, const char* feature, const char* detail,
                             const char* extra) {
    if (!applicationId || !feature || !detail) {
        LOG_ERROR("%s is NULL !!", !applicationId ? "applicationId"
                                   : !feature     ? "feature"
                                                  : "detail");
        return;
    }
    base::SqliteDatabase database(base::appDataPath(FILE_NAME, LOG_TAG));
    if (openStore(database) && !database.transaction([&] {
            return writeEvent(database, applicationId, feature, detail, extra);
        }))
        LOG_ERROR("usage event cannot be stored: %s", database.lastError().c_str());
}
