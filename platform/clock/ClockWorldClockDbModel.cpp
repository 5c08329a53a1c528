#define LOG_TAG "clock-common"
#include "clock/ClockWorldClockDbModel.h"

#include <algorithm>
#include <limits>
#include <optional>
#include <string>
#include <unordered_map>

#include <base/AppStore.h>
#include <base/Log.h>
#include <base/SqliteDatabase.h>

#include "clock/CityDatabase.h"

namespace {

constexpr const char* OWNER = "world-clock-selection";

// One row for each city of the user's list. The name tells a person which city a key means.
const std::vector<std::string>& migrations() {
    static const std::vector<std::string> scripts{
        R"(CREATE TABLE selected_city(
            sequence INTEGER PRIMARY KEY,
            key INTEGER NOT NULL UNIQUE,
            city TEXT NOT NULL,
            position INTEGER NOT NULL) STRICT)"};
    return scripts;
}

struct Choice {
    std::int32_t key = 0;
    std::int32_t position = 0;
    std::string city;
};

/** The user's choice in its order; nothing when it cannot be read. */
std::optional<std::vector<Choice>> readChoice(base::SqliteDatabase& selection) {
    auto query = selection.prepare(
        "SELECT key, position, city FROM selected_city ORDER BY position, sequence");
    std::vector<Choice> choice;
    while (query.step())
        choice.push_back({static_cast<std::int32_t>(query.integer(0)),
                          static_cast<std::int32_t>(query.integer(1)), query.text(2)});
    if (!query.failed())
        return choice;
    LOG_ERROR("the selected cities cannot be read: %s", selection.lastError().c_str());
    return std::nullopt;
}

using Places = std::unordered_map<std::int32_t, ClockWorldClockDbData*>;

Places byKey(std::vector<ClockWorldClockDbData>& cities) {
    Places places;
    for (auto& city : cities)
        places.emplace(city.index, &city);
    return places;
}

const ClockWorldClockDbData* findCity(const std::vector<ClockWorldClockDbData>& cities,
                                      std::int32_t key) {
    const auto place = std::find_if(cities.begin(), cities.end(),
                                    [&](const auto& city) { return city.index == key; });
    return place == cities.end() ? nullptr : &*place;
}

bool writeChoice(base::SqliteDatabase& selection, const ClockWorldClockDbData& city,
                 std::int32_t position) {
    auto write = selection.prepare(
        "INSERT INTO selected_city(key, city, position) VALUES(?1, ?2, ?3) "
        "ON CONFLICT(key) DO UPDATE SET city = excluded.city, position = excluded.position");
    return write.bind(1, std::int64_t(city.index))
        .bind(2, std::string_view(city.city))
        .bind(3, std::int64_t(position))
        .run();
}

bool deleteChoice(base::SqliteDatabase& selection, std::int32_t key) {
    auto remove = selection.prepare("DELETE FROM selected_city WHERE key = ?1");
    return remove.bind(1, std::int64_t(key)).run();
}

} // namespace

ClockWorldClockDbModel::ClockWorldClockDbModel()
    : _selection(std::make_unique<base::SqliteDatabase>(
          base::appDataPath("world-clock-selection.db", LOG_TAG))) {
    base::openAppStore(*_selection, OWNER, migrations(), LOG_TAG);
}

ClockWorldClockDbModel::~ClockWorldClockDbModel() = default;

bool ClockWorldClockDbModel::getWorldClockAllCityList(std::vector<ClockWorldClockDbData>& cities) {
    cities = clock_common::readCities();
    const auto choice = readChoice(*_selection);
    if (cities.empty() || !choice)
        return false;
    const auto places = byKey(cities);
    for (const auto& chosen : *choice) {
        if (const auto place = places.find(chosen.key); place != places.end()) {
            place->second->selected = 1;
            place->second->position = chosen.position;
        }
    }
    return true;
}

bool ClockWorldClockDbModel::getWorldClockSelectedCityList(
    std::vector<ClockWorldClockDbData>& cities) {
    cities.clear();
    auto all = clock_common::readCities();
    const auto choice = readChoice(*_selection);
    if (all.empty() || !choice)
        return false;
    const auto places = byKey(all);
    for (const auto& chosen : *choice) {
        const auto place = places.find(chosen.key);
        if (place == places.end()) {
            LOG_WARNING("the city data no longer know %s(%d), it stays selected but is not shown",
                        chosen.city.c_str(), chosen.key);
            continue;
        }
        cities.push_back(*place->second);
        cities.back().selected = 1;
        cities.back().position = chosen.position;
    }
    return true;
}

bool ClockWorldClockDbModel::updateWorldClockDbRecord(const ClockWorldClockDbData& city) {
    const auto cities = clock_common::readCities();
    const auto* known = findCity(cities, city.index);
    if (!known) {
        LOG_ERROR("there is no city %s(%d)", city.city.c_str(), city.index);
        return false;
    }
    const bool stored = city.selected != 0 ? writeChoice(*_selection, *known, city.position)
                                           : deleteChoice(*_selection, city.index);
    if (!stored)
        LOG_ERROR("the choice of %s(%d) cannot be stored: %s", known->city.c_str(), city.index,
                  _selection->lastError().c_str());
    return stored;
}

bool ClockWorldClockDbModel::removeWorldClockDbRecord(const ClockWorldClockDbData& city) {
    if (!deleteChoice(*_selection, city.index)) {
        LOG_ERROR("%s(%d) cannot be removed: %s", city.city.c_str(), city.index,
                  _selection->lastError().c_str());
        return false;
    }
    if (_selection->changes() == 0) {
        LOG_ERROR("%s(%d) is not selected", city.city.c_str(), city.index);
        return false;
    }
    return true;
}

std::int32_t ClockWorldClockDbModel::getWorldClockNextPosition() {
    const auto choice = readChoice(*_selection);
    if (!choice || choice->empty())
        return 0;
    const auto last = choice->back().position;
    return last == std::numeric_limits<std::int32_t>::max() ? last : std::max(last + 1, 0);
}
