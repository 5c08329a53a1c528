#define LOG_TAG "clock-common"
#include "clock/CityDatabase.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <limits>
#include <memory>
#include <optional>
#include <sqlite3.h>
#include <string_view>
#include <unordered_map>

#include <base/CivilTime.h>
#include <base/Log.h>
#include <device/app_resource_manager.h>

namespace clock_common {

namespace {

constexpr const char* FILE_NAME = "data/world-clock.db";
// Both are written by the program that builds the file.
constexpr std::int64_t APPLICATION_ID = 0x636c6f6b;
constexpr std::int64_t VERSION = 1;

// Nothing that is true of this world comes near these.
constexpr std::size_t MOST_CITIES = 100000;
constexpr std::size_t LONGEST_NAME = 63;
constexpr int LONGEST_VALUE = 4096;

enum Column { KEY, CITY, COUNTRY, TZ_PATH, MCC, CITY_ONLY };

struct Finalizer {
    void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
};
using Statement = std::unique_ptr<sqlite3_stmt, Finalizer>;

/** The file's path; empty when it is missing. */
std::string findFile() {
    if (app_resource_manager_init() != APP_RESOURCE_ERROR_NONE)
        return {};
    char* found = nullptr;
    const int result = app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, FILE_NAME, &found);
    std::string path = result == APP_RESOURCE_ERROR_NONE && found ? found : "";
    std::free(found);
    app_resource_manager_release();
    return path;
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

/** Letters, digits and some more, as long as the buffers that other applications get it in. */
bool isName(std::string_view text, std::string_view more) {
    const auto fits = [&](char c) {
        return isDigit(c) || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') ||
               more.find(c) != std::string_view::npos;
    };
    return !text.empty() && text.size() <= LONGEST_NAME &&
           std::all_of(text.begin(), text.end(), fits);
}

bool isMessageId(std::string_view text) {
    return text.starts_with("IDS_") && isName(text, "_");
}

/** Three digits each, separated by single spaces; or nothing. */
bool isCodeList(std::string_view text) {
    if (!text.empty() && text.size() % 4 != 3)
        return false;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (i % 4 == 3 ? text[i] != ' ' : !isDigit(text[i]))
            return false;
    }
    return true;
}

/** Reads the file; everything it says is checked, as it may be damaged. */
class CityReader {
public:
    /** @return False when the file is of no use; problem() tells why. */
    bool read(const std::string& path, std::vector<ClockWorldClockDbData>& cities);
    const std::string& problem() const { return _problem; }

private:
    struct Closer {
        void operator()(sqlite3* database) const { sqlite3_close(database); }
    };
    bool open(const std::string& path);
    bool checkKind();
    bool readRows(std::vector<ClockWorldClockDbData>& cities);
    bool readRow(sqlite3_stmt* row, ClockWorldClockDbData& city);
    bool addOffset(ClockWorldClockDbData& city);
    Statement prepare(const char* sql);
    std::optional<std::int64_t> number(const char* sql);
    bool fail(std::string problem);
    bool failWithSqliteError();

    std::unique_ptr<sqlite3, Closer> _database;
    std::string _problem;
    std::time_t _now = std::time(nullptr);
    // By time zone; empty for an unknown one.
    std::unordered_map<std::string, std::string> _offsets;
};

bool CityReader::fail(std::string problem) {
    _problem = std::move(problem);
    return false;
}

bool CityReader::failWithSqliteError() {
    return fail(_database ? sqlite3_errmsg(_database.get()) : "out of memory");
}

bool CityReader::read(const std::string& path, std::vector<ClockWorldClockDbData>& cities) {
    return open(path) && checkKind() && readRows(cities);
}

bool CityReader::open(const std::string& path) {
    std::string name = "file:";
    for (const char c : path) {
        if (c == '%' || c == '?' || c == '#') {
            char code[4];
            std::snprintf(code, sizeof code, "%%%02X", static_cast<unsigned>(c));
            name += code;
        } else {
            name += c;
        }
    }
    // Nobody writes the file while it is in use, so that it needs no locks and no folder to write
    // to.
    name += "?immutable=1";
    sqlite3* database = nullptr;
    const int result =
        sqlite3_open_v2(name.c_str(), &database, SQLITE_OPEN_READONLY | SQLITE_OPEN_URI, nullptr);
    _database.reset(database);
    if (result != SQLITE_OK)
        return failWithSqliteError();
    sqlite3_db_config(database, SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0, nullptr);
    sqlite3_limit(database, SQLITE_LIMIT_LENGTH, LONGEST_VALUE);
    return true;
}

Statement CityReader::prepare(const char* sql) {
    sqlite3_stmt* statement = nullptr;
    sqlite3_prepare_v2(_database.get(), sql, -1, &statement, nullptr);
    return Statement(statement);
}

std::optional<std::int64_t> CityReader::number(const char* sql) {
    const auto statement = prepare(sql);
    if (!statement || sqlite3_step(statement.get()) != SQLITE_ROW)
        return std::nullopt;
    return sqlite3_column_int64(statement.get(), 0);
}

bool CityReader::checkKind() {
    const auto application = number("PRAGMA application_id");
    const auto version = number("PRAGMA user_version");
    // Only a real table: a view or a virtual one of that name could go on for ever.
    const auto tables = number("SELECT COUNT(*) FROM sqlite_schema WHERE type = 'table' AND "
                               "name = 'city' AND rootpage > 0");
    if (!application || !version || !tables)
        return failWithSqliteError();
    if (*application != APPLICATION_ID)
        return fail("it is no city database");
    if (*version != VERSION)
        return fail("it has version " + std::to_string(*version) + ", this program reads " +
                    std::to_string(VERSION));
    return *tables == 1 || fail("it has no table of cities");
}

bool CityReader::readRows(std::vector<ClockWorldClockDbData>& cities) {
    const auto query =
        prepare("SELECT key, city, country, tz_path, mcc, city_only FROM city ORDER BY key");
    if (!query)
        return failWithSqliteError();
    int result = sqlite3_step(query.get());
    std::int64_t last = 0;
    for (std::size_t row = 0; result == SQLITE_ROW; ++row) {
        ClockWorldClockDbData city;
        if (row == MOST_CITIES)
            return fail("it has too many cities");
        if (!readRow(query.get(), city) || city.index <= last)
            return fail("row " + std::to_string(row + 1) + " is damaged");
        last = city.index;
        if (addOffset(city))
            cities.push_back(std::move(city));
        result = sqlite3_step(query.get());
    }
    if (result != SQLITE_DONE)
        return failWithSqliteError();
    return !cities.empty() || fail("it has no cities");
}

bool CityReader::readRow(sqlite3_stmt* row, ClockWorldClockDbData& city) {
    const auto integer = [&](Column column, std::int64_t most, std::int64_t& value) {
        value = sqlite3_column_int64(row, column);
        return sqlite3_column_type(row, column) == SQLITE_INTEGER && value >= 0 && value <= most;
    };
    const auto text = [&](Column column, std::string& value) {
        if (sqlite3_column_type(row, column) != SQLITE_TEXT)
            return false;
        const auto* data = reinterpret_cast<const char*>(sqlite3_column_text(row, column));
        value.assign(data ? data : "", static_cast<std::size_t>(sqlite3_column_bytes(row, column)));
        return data != nullptr;
    };
    std::int64_t key = 0;
    std::int64_t cityOnly = 0;
    if (!integer(KEY, std::numeric_limits<std::int32_t>::max(), key) || !text(CITY, city.city) ||
        !text(COUNTRY, city.country) || !text(TZ_PATH, city.tzPath) || !text(MCC, city.mcc) ||
        !integer(CITY_ONLY, 1, cityOnly))
        return false;
    city.index = static_cast<std::int32_t>(key);
    city.cityOnly = cityOnly != 0;
    return isMessageId(city.city) && isMessageId(city.country) && isName(city.tzPath, "/_+-") &&
           isCodeList(city.mcc);
}

/** False when the system does not know the city's time zone. */
bool CityReader::addOffset(ClockWorldClockDbData& city) {
    const auto [place, isNew] = _offsets.try_emplace(city.tzPath);
    if (isNew && base::isTimeZone(city.tzPath))
        place->second = gmtOffsetText(base::utcOffset(_now, city.tzPath));
    city.timezone = place->second;
    if (city.timezone.empty())
        LOG_ERROR("%s is left out: its time zone %s is unknown", city.city.c_str(),
                  city.tzPath.c_str());
    return !city.timezone.empty();
}

} // namespace

std::vector<ClockWorldClockDbData> readCities() {
    const auto path = findFile();
    if (path.empty()) {
        LOG_ERROR("the city database %s is missing, there are no cities", FILE_NAME);
        return {};
    }
    std::vector<ClockWorldClockDbData> cities;
    CityReader reader;
    if (reader.read(path, cities))
        return cities;
    LOG_ERROR("the city database %s cannot be used, there are no cities: %s", path.c_str(),
              reader.problem().c_str());
    return {};
}

std::string gmtOffsetText(int seconds) {
    const int minutes = std::abs(seconds / 60);
    char text[32];
    std::snprintf(text, sizeof text, "GMT%c%02d:%02d", seconds / 60 < 0 ? '-' : '+', minutes / 60,
                  minutes % 60);
    return text;
}

} // namespace clock_common
