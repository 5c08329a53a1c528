#include "PickerWorld.h"

#include <cstdio>
#include <filesystem>
#include <libintl.h>
#include <map>

#include <sqlite3.h>

#include "rules/CatalogueForTest.h"
#include "rules/WorldCities.h"

namespace fs = std::filesystem;

namespace {

constexpr const char* LANGUAGE = "en";
constexpr const char* BUILT = CLOCK_RESOURCE_DIR;
constexpr const char* DATABASE = "data/world-clock.db";

bool execute(sqlite3* database, const std::string& sql) {
    return sqlite3_exec(database, sql.c_str(), nullptr, nullptr, nullptr) == SQLITE_OK;
}

/** Fills the copy of a database with other cities, and a catalogue with their names. */
class CityWriter {
public:
    explicit CityWriter(const std::string& file) { sqlite3_open(file.c_str(), &_database); }
    ~CityWriter() { sqlite3_close(_database); }
    CityWriter(const CityWriter&) = delete;
    CityWriter& operator=(const CityWriter&) = delete;

    bool write() {
        if (!execute(_database, "PRAGMA synchronous = OFF; BEGIN; DELETE FROM city"))
            return false;
        for (const ClockWorldClockDbData& city : worldCities(LANGUAGE)) {
            if (!add(city))
                return false;
        }
        return execute(_database, "COMMIT");
    }

    CatalogueForTest::Texts names;

private:
    bool add(const ClockWorldClockDbData& city) {
        std::string& country = _countries[city.country];
        if (country.empty())
            country = "IDS_COUNTRY_BENCH_" + std::to_string(_countries.size());
        const std::string name = "IDS_CITY_BENCH_" + std::to_string(city.index);
        names[country] = city.country;
        names[name] = city.city;
        return execute(_database, "INSERT INTO city VALUES(" + std::to_string(city.index + 1) +
                                      ",'" + name + "','" + country + "','" + city.tzPath +
                                      "','',0)");
    }

    sqlite3* _database = nullptr;
    std::map<std::string, std::string> _countries;
};

} // namespace

PickerWorld::PickerWorld(const std::string& folder)
    : _folder(folder), _resources(folder + "/resources") {
    fs::create_directories(_resources + "/data");
    for (const auto& entry : fs::directory_iterator(BUILT)) {
        if (entry.path().filename() != "data")
            fs::create_symlink(entry.path(), fs::path(_resources) / entry.path().filename());
    }
    useOwnCities();
}

PickerWorld::~PickerWorld() = default;

void PickerWorld::use(const std::string& database) const {
    const fs::path used = fs::path(_resources) / DATABASE;
    fs::remove(used);
    fs::create_symlink(database, used);
}

void PickerWorld::useOwnCities() {
    _names.reset();
    bindtextdomain("clock", (_resources + "/locale").c_str());
    use(std::string(BUILT) + "/" + DATABASE);
}

bool PickerWorld::useManyCities() {
    if (!fs::exists(WORLD_CITIES_FILE)) {
        std::printf("No measurement with many cities: %s is missing; install libtimezonemap-data\n",
                    WORLD_CITIES_FILE);
        return false;
    }
    return makeManyCities();
}

bool PickerWorld::makeManyCities() {
    const std::string file = _folder + "/many-cities.db";
    std::error_code failed;
    fs::copy_file(std::string(BUILT) + "/" + DATABASE, file, fs::copy_options::overwrite_existing,
                  failed);
    if (failed)
        return false;
    fs::permissions(file, fs::perms::owner_write, fs::perm_options::add);
    CityWriter cities(file);
    if (!cities.write())
        return false;
    _names = std::make_unique<CatalogueForTest>(LANGUAGE, cities.names);
    use(file);
    return true;
}
