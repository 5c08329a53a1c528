#include "clock/ClockWorldClockDbModel.h"

#include <cerrno>
#include <filesystem>
#include <limits>
#include <string>
#include <tuple>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "host/ClockStore.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace fs = std::filesystem;

namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

constexpr int BERLIN = 10;
constexpr int DELHI = 20;
constexpr int SINGAPORE = 30;

/** What a row may be changed to in a test. */
struct Row {
    std::string key = "10";
    std::string city = "'IDS_CITY_DE_BERLIN'";
    std::string country = "'IDS_COUNTRY_DE'";
    std::string zone = "'Europe/Berlin'";
    std::string mcc = "'262'";
    std::string cityOnly = "0";

    std::string insert() const {
        return "INSERT INTO city VALUES(" + key + ", " + city + ", " + country + ", " + zone +
               ", " + mcc + ", " + cityOnly + ");";
    }
};

class ClockWorldClockDbModelTest : public testing::Test {
protected:
    ClockWorldClockDbModelTest() {
        writeCities(
            Row().insert() +
            Row{"20", "'IDS_CITY_IN_DELHI'", "'IDS_COUNTRY_IN'", "'Asia/Kolkata'", "'404 405'"}
                .insert() +
            Row{"30", "'IDS_CITY_SG_SINGAPORE'", "'IDS_COUNTRY_SG'", "'Asia/Singapore'", "''", "1"}
                .insert());
    }

    std::string dataFile() const { return host.resourceDir() + "/data/world-clock.db"; }
    std::string userFile() const { return host.dataDir() + "/world-clock-selection.db"; }

    /** A city database with other rows, without the checks of the real one's columns. */
    void writeCities(const std::string& rows, const std::string& version = "1",
                     const std::string& table = "CREATE TABLE city(key, city, country, tz_path, "
                                                "mcc, city_only);") {
        writeFile(dataFile(), "");
        OutsideView view(dataFile());
        const auto result =
            view.rows("PRAGMA application_id = 1668050795; PRAGMA user_version = " + version +
                      "; BEGIN; " + table + rows + "COMMIT");
        ASSERT_THAT(result, IsEmpty());
    }

    static std::vector<ClockWorldClockDbData> allCities() {
        std::vector<ClockWorldClockDbData> cities;
        EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockAllCityList(cities));
        return cities;
    }
    static std::vector<int> selectedKeys() {
        std::vector<ClockWorldClockDbData> cities;
        EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockSelectedCityList(cities));
        std::vector<int> keys;
        keys.reserve(cities.size());
        for (const auto& city : cities)
            keys.push_back(city.index);
        return keys;
    }
    static bool select(int key, int position) {
        ClockWorldClockDbData city;
        city.index = key;
        city.selected = 1;
        city.position = position;
        return ClockWorldClockDbModel().updateWorldClockDbRecord(city);
    }
    static bool remove(int key) {
        ClockWorldClockDbData city;
        city.index = key;
        return ClockWorldClockDbModel().removeWorldClockDbRecord(city);
    }

    /** There are no cities, and one log line at error priority tells why. */
    static void expectNoCities(const std::string& reason) {
        std::vector<ClockWorldClockDbData> all(1);
        std::vector<ClockWorldClockDbData> selected(1);
        const auto log = standardErrorOf(
            [&] { EXPECT_FALSE(ClockWorldClockDbModel().getWorldClockAllCityList(all)); });
        EXPECT_THAT(log, AllOf(HasSubstr("* Critical *"), HasSubstr("there are no cities"),
                               HasSubstr(reason)));
        EXPECT_THAT(all, IsEmpty());
        standardErrorOf([&] {
            EXPECT_FALSE(ClockWorldClockDbModel().getWorldClockSelectedCityList(selected));
            EXPECT_FALSE(select(BERLIN, 0));
        });
        EXPECT_THAT(selected, IsEmpty());
    }

    DeviceHost host;
};

// --- The cities ----------------------------------------------------------------------------

TEST_F(ClockWorldClockDbModelTest, ARecordHasWhatTheDatabaseKnowsOfTheCity) {
    const auto cities = allCities();
    ASSERT_THAT(cities, SizeIs(3));
    EXPECT_EQ(cities[1].index, DELHI);
    EXPECT_EQ(cities[1].city, "IDS_CITY_IN_DELHI");
    EXPECT_EQ(cities[1].country, "IDS_COUNTRY_IN");
    EXPECT_EQ(cities[1].timezone, "GMT+05:30");
    EXPECT_EQ(cities[1].tzPath, "Asia/Kolkata");
    EXPECT_EQ(cities[1].mcc, "404 405");
    EXPECT_FALSE(cities[1].cityOnly);
    EXPECT_EQ(cities[1].selected, 0);
    EXPECT_EQ(cities[1].position, 0);
    EXPECT_EQ(cities[1].searchKeyword, "");
    EXPECT_EQ(cities[1].extraInfo, "");
    EXPECT_TRUE(cities[2].cityOnly);
    EXPECT_EQ(cities[2].mcc, "");
}

TEST_F(ClockWorldClockDbModelTest, AListIsFilledAndNotAppendedTo) {
    std::vector<ClockWorldClockDbData> cities(5);
    EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockAllCityList(cities));
    EXPECT_THAT(cities, SizeIs(3));
    select(BERLIN, 0);
    EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockSelectedCityList(cities));
    EXPECT_THAT(cities, SizeIs(1));
}

struct OffsetCase {
    const char* zone;
    const char* when;
    const char* text;
};

class ClockWorldClockOffsetTest : public ClockWorldClockDbModelTest,
                                  public testing::WithParamInterface<OffsetCase> {};

TEST_P(ClockWorldClockOffsetTest, IsThatOfTheMomentTheListIsLoaded) {
    const OffsetCase& c = GetParam();
    const TimeZoneForTest zone("UTC");
    Row row;
    row.zone = "'" + std::string(c.zone) + "'";
    writeCities(row.insert());
    const FrozenTime now(at(c.when));
    EXPECT_EQ(allCities().at(0).timezone, c.text);
}

INSTANTIATE_TEST_SUITE_P(
    Zones, ClockWorldClockOffsetTest,
    testing::Values(OffsetCase{"Europe/Berlin", "2026-01-15 12:00:00", "GMT+01:00"},
                    OffsetCase{"Europe/Berlin", "2026-07-15 12:00:00", "GMT+02:00"},
                    OffsetCase{"Europe/Berlin", "2026-03-29 00:59:59", "GMT+01:00"},
                    OffsetCase{"Europe/Berlin", "2026-03-29 01:00:00", "GMT+02:00"},
                    OffsetCase{"America/St_Johns", "2026-01-15 12:00:00", "GMT-03:30"},
                    OffsetCase{"America/St_Johns", "2026-07-15 12:00:00", "GMT-02:30"},
                    OffsetCase{"Australia/Lord_Howe", "2026-01-15 12:00:00", "GMT+11:00"},
                    OffsetCase{"Australia/Lord_Howe", "2026-07-15 12:00:00", "GMT+10:30"},
                    OffsetCase{"Asia/Kathmandu", "2026-07-15 12:00:00", "GMT+05:45"},
                    OffsetCase{"Pacific/Kiritimati", "2026-07-15 12:00:00", "GMT+14:00"},
                    OffsetCase{"Etc/GMT+12", "2026-07-15 12:00:00", "GMT-12:00"},
                    OffsetCase{"UTC", "2026-07-15 12:00:00", "GMT+00:00"},
                    // Monrovia kept its own mean time then: 44 and a half minutes behind.
                    OffsetCase{"Africa/Monrovia", "1970-06-01 12:00:00", "GMT-00:44"}));

TEST_F(ClockWorldClockDbModelTest, TheOffsetIsTheCitysWhateverTheClockOfTheWatchShows) {
    const TimeZoneForTest zone("America/New_York");
    EXPECT_EQ(allCities().at(1).timezone, "GMT+05:30");
}

TEST_F(ClockWorldClockDbModelTest, ACityWhoseTimeZoneIsUnknownIsLeftOut) {
    writeCities(
        Row().insert() +
        Row{"20", "'IDS_CITY_XX_ATLANTIS'", "'IDS_COUNTRY_XX'", "'Atlantis/Town'"}.insert());
    std::vector<ClockWorldClockDbData> cities;
    const auto log = standardErrorOf(
        [&] { EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockAllCityList(cities)); });
    ASSERT_THAT(cities, SizeIs(1));
    EXPECT_EQ(cities[0].index, BERLIN);
    EXPECT_THAT(log, HasSubstr("IDS_CITY_XX_ATLANTIS is left out: its time zone Atlantis/Town is "
                               "unknown"));
}

// --- City data that cannot be used ---------------------------------------------------------

TEST_F(ClockWorldClockDbModelTest, AMissingCityDatabaseIsReported) {
    fs::remove(dataFile());
    expectNoCities("the city database data/world-clock.db is missing");
    EXPECT_FALSE(fs::exists(dataFile())) << "a look made a file";
}

TEST_F(ClockWorldClockDbModelTest, AnUnreadableCityDatabaseIsReported) {
    for (fs::path folder = dataFile(); folder.string().size() > 4; folder = folder.parent_path())
        fs::permissions(folder, fs::perms(0755));
    fs::permissions(dataFile(), fs::perms(0));
    EXPECT_EQ(inAnotherProcess([&] {
                  if (geteuid() == 0 && (setgid(65534) != 0 || setuid(65534) != 0))
                      return 99;
                  std::vector<ClockWorldClockDbData> cities;
                  const auto log = standardErrorOf(
                      [&] { ClockWorldClockDbModel().getWorldClockAllCityList(cities); });
                  const bool told = log.find("unable to open database file") != std::string::npos;
                  return cities.empty() && told ? 0 : 1;
              }),
              0);
}

TEST_F(ClockWorldClockDbModelTest, AFileThatIsNoDatabaseIsReportedAndLeft) {
    for (const auto& contents :
         {std::string("no database, but a text that is long enough to look like one ............"),
          std::string(100000, '\xa5'), std::string(4096, '\0')}) {
        writeFile(dataFile(), contents);
        expectNoCities("file is not a database");
        EXPECT_EQ(readFile(dataFile()), contents);
    }
}

TEST_F(ClockWorldClockDbModelTest, AnEmptyFileOrAnotherDatabaseIsReported) {
    writeFile(dataFile(), "");
    expectNoCities("it is no city database");
    OutsideView(dataFile()).rows("CREATE TABLE city(key); PRAGMA user_version = 1");
    expectNoCities("it is no city database");
}

TEST_F(ClockWorldClockDbModelTest, AnOlderOrNewerDatabaseIsReported) {
    writeCities(Row().insert(), "0");
    expectNoCities("it has version 0, this program reads 1");
    writeCities(Row().insert(), "2");
    expectNoCities("it has version 2, this program reads 1");
}

TEST_F(ClockWorldClockDbModelTest, AFileThatIsCutOffIsReported) {
    std::string rows;
    for (int key = 1; key < 3000; ++key) {
        Row row;
        row.key = std::to_string(key);
        rows += row.insert();
    }
    writeCities(rows);
    EXPECT_THAT(allCities(), SizeIs(2999));
    const auto whole = readFile(dataFile());
    for (const std::size_t size : {whole.size() / 2, whole.size() - 4096, whole.size() - 1,
                                   std::size_t{512}, std::size_t{100}}) {
        writeFile(dataFile(), whole.substr(0, size));
        expectNoCities("");
    }
}

TEST_F(ClockWorldClockDbModelTest, DamageAnywhereNeverGivesHalfAList) {
    std::string rows;
    for (int key = 1; key < 500; ++key) {
        Row row;
        row.key = std::to_string(key);
        rows += row.insert();
    }
    writeCities(rows);
    const auto whole = readFile(dataFile());
    // A blow to every page, to its head, its middle and its end.
    for (std::size_t place = 0; place + 200 < whole.size(); place += 1024) {
        auto damaged = whole;
        damaged.replace(place, 200, std::string(200, '\xff'));
        writeFile(dataFile(), damaged);
        std::vector<ClockWorldClockDbData> cities;
        bool read = false;
        standardErrorOf([&] { read = ClockWorldClockDbModel().getWorldClockAllCityList(cities); });
        EXPECT_EQ(cities.size(), read ? 499U : 0U) << "damaged at " << place;
    }
}

TEST_F(ClockWorldClockDbModelTest, OtherTablesAndColumnsAreReported) {
    writeCities("", "1", "CREATE TABLE town(key);");
    expectNoCities("it has no table of cities");
    writeCities("", "1", "CREATE TABLE city(key, city, country, tz_path, city_only);");
    expectNoCities("no such column: mcc");
    writeCities("");
    expectNoCities("it has no cities");
}

TEST_F(ClockWorldClockDbModelTest, AViewThatNeverEndsIsNotAsked) {
    writeCities("", "1",
                "CREATE VIEW city(key, city, country, tz_path, mcc, city_only) AS WITH RECURSIVE "
                "n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n) SELECT i, 'IDS_CITY_A', "
                "'IDS_COUNTRY_A', 'UTC', '', 0 FROM n;");
    expectNoCities("it has no table of cities");
}

TEST_F(ClockWorldClockDbModelTest, MoreCitiesThanTheWorldHasAreReported) {
    writeCities("INSERT INTO city WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n "
                "WHERE i < 100001) SELECT i, 'IDS_CITY_A', 'IDS_COUNTRY_A', 'UTC', '', 0 FROM n;");
    expectNoCities("it has too many cities");
}

struct DamagedRow {
    const char* what;
    std::string Row::*column;
    const char* value;
};

class ClockWorldClockDamageTest : public ClockWorldClockDbModelTest,
                                  public testing::WithParamInterface<DamagedRow> {};

TEST_P(ClockWorldClockDamageTest, MakesTheWholeFileUnusable) {
    Row second{"20"};
    second.*GetParam().column = GetParam().value;
    writeCities(Row().insert() + second.insert());
    expectNoCities(GetParam().column == &Row::key ? "is damaged" : "row 2 is damaged");
}

INSTANTIATE_TEST_SUITE_P(
    Rows, ClockWorldClockDamageTest,
    testing::Values(DamagedRow{"key of a wrong type", &Row::key, "'twenty'"},
                    DamagedRow{"no key", &Row::key, "NULL"}, DamagedRow{"key 0", &Row::key, "0"},
                    DamagedRow{"negative key", &Row::key, "-5"},
                    DamagedRow{"key too large", &Row::key, "2147483648"},
                    DamagedRow{"key twice", &Row::key, "10"},
                    DamagedRow{"no city", &Row::city, "NULL"},
                    DamagedRow{"empty city", &Row::city, "''"},
                    DamagedRow{"city of a wrong type", &Row::city, "7"},
                    DamagedRow{"city as bytes", &Row::city, "x'4944535f41'"},
                    DamagedRow{"no message identifier", &Row::city, "'Berlin'"},
                    DamagedRow{"with a NUL", &Row::city, "'IDS_CITY' || char(0) || 'X'"},
                    DamagedRow{"no UTF-8", &Row::city, "'IDS_' || CAST(x'fffe' AS TEXT)"},
                    DamagedRow{"a format", &Row::country, "'IDS_%s%n'"},
                    DamagedRow{"64 bytes", &Row::country, "'IDS_' || printf('%.*c', 60, 'A')"},
                    DamagedRow{"empty zone", &Row::zone, "''"},
                    DamagedRow{"zone with a NUL", &Row::zone, "'Europe/Berlin' || char(0)"},
                    DamagedRow{"zone outside", &Row::zone, "'../../etc/passwd'"},
                    DamagedRow{"zone of 64 bytes", &Row::zone, "printf('%.*c', 64, 'A')"},
                    DamagedRow{"two digits", &Row::mcc, "'26'"},
                    DamagedRow{"two spaces", &Row::mcc, "'262  263'"},
                    DamagedRow{"a space at the end", &Row::mcc, "'262 '"},
                    DamagedRow{"a space for a digit", &Row::mcc, "'2 2'"},
                    DamagedRow{"a digit for a space", &Row::mcc, "'2620263'"},
                    DamagedRow{"letters", &Row::mcc, "'26a'"},
                    DamagedRow{"a number", &Row::mcc, "262"},
                    DamagedRow{"no number", &Row::cityOnly, "'yes'"},
                    DamagedRow{"no truth value", &Row::cityOnly, "2"}),
    [](const auto& test) {
        std::string name = test.param.what;
        for (auto& c : name)
            c = std::isalnum(static_cast<unsigned char>(c)) ? c : '_';
        return name + "_" + std::to_string(test.index);
    });

TEST_F(ClockWorldClockDbModelTest, NamesOf63BytesAreStillNames) {
    Row row;
    row.city = "'IDS_' || printf('%.*c', 59, 'A')";
    writeCities(row.insert());
    EXPECT_EQ(allCities().at(0).city.size(), 63U);
}

TEST_F(ClockWorldClockDbModelTest, ATextOfMegabytesIsNotEvenRead) {
    Row row;
    row.city = "'IDS_' || printf('%.*c', 50000000, 'A')";
    writeCities(row.insert());
    expectNoCities("string or blob too big");
}

TEST_F(ClockWorldClockDbModelTest, ALockByAnotherProcessDoesNotHoldUpTheCities) {
    const LockedStore lock(dataFile());
    EXPECT_THAT(allCities(), SizeIs(3));
}

TEST_F(ClockWorldClockDbModelTest, CitiesAreReadWhereNothingCanBeWritten) {
    const std::string strange = host.resourceDir() + "/data";
    fs::permissions(strange, fs::perms(0555));
    fs::permissions(dataFile(), fs::perms(0444));
    EXPECT_THAT(allCities(), SizeIs(3));
    fs::permissions(strange, fs::perms(0755));
    EXPECT_THAT(std::vector<fs::path>(fs::directory_iterator(strange), {}), SizeIs(1))
        << "reading leaves nothing beside the file";
}

// --- The user's list -----------------------------------------------------------------------

TEST_F(ClockWorldClockDbModelTest, ASelectedCityIsMarkedInBothLists) {
    EXPECT_THAT(selectedKeys(), IsEmpty());
    auto city = allCities().at(1);
    city.selected = 1;
    city.position = 7;
    ASSERT_TRUE(ClockWorldClockDbModel().updateWorldClockDbRecord(city));
    const auto all = allCities();
    EXPECT_EQ(std::tuple(all[1].selected, all[1].position), std::tuple(1, 7));
    EXPECT_EQ(std::tuple(all[0].selected, all[0].position), std::tuple(0, 0));
    std::vector<ClockWorldClockDbData> selected;
    ASSERT_TRUE(ClockWorldClockDbModel().getWorldClockSelectedCityList(selected));
    ASSERT_THAT(selected, SizeIs(1));
    EXPECT_EQ(selected[0].city, "IDS_CITY_IN_DELHI");
    EXPECT_EQ(selected[0].timezone, "GMT+05:30");
    EXPECT_EQ(std::tuple(selected[0].selected, selected[0].position), std::tuple(1, 7));
}

TEST_F(ClockWorldClockDbModelTest, TheUsersListIsOrderedByPositionAndThenByTheOrderOfChoosing) {
    select(SINGAPORE, 5);
    select(DELHI, 2);
    select(BERLIN, 5);
    EXPECT_THAT(selectedKeys(), ElementsAre(DELHI, SINGAPORE, BERLIN));
    select(DELHI, 9);
    EXPECT_THAT(selectedKeys(), ElementsAre(SINGAPORE, BERLIN, DELHI)) << "moved, not doubled";
}

TEST_F(ClockWorldClockDbModelTest, ACityThatIsNoLongerSelectedLeavesTheList) {
    select(BERLIN, 0);
    select(DELHI, 1);
    auto city = allCities().at(0);
    city.selected = 0;
    ASSERT_TRUE(ClockWorldClockDbModel().updateWorldClockDbRecord(city));
    EXPECT_THAT(selectedKeys(), ElementsAre(DELHI));
    EXPECT_TRUE(ClockWorldClockDbModel().updateWorldClockDbRecord(city)) << "nothing to change";
}

TEST_F(ClockWorldClockDbModelTest, RemovingTakesOneCityOut) {
    select(BERLIN, 0);
    select(DELHI, 1);
    select(SINGAPORE, 2);
    ASSERT_TRUE(remove(DELHI));
    EXPECT_THAT(selectedKeys(), ElementsAre(BERLIN, SINGAPORE));
    EXPECT_EQ(allCities().at(2).position, 2);
    const auto log = standardErrorOf([] { EXPECT_FALSE(remove(DELHI)); });
    EXPECT_THAT(log, HasSubstr("(20) is not selected"));
}

TEST_F(ClockWorldClockDbModelTest, TheNextPositionIsBehindTheLastCity) {
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 0);
    select(BERLIN, 0);
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 1);
    select(DELHI, 41);
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 42);
    remove(BERLIN);
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 42);
    select(DELHI, -3);
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 0);
    select(DELHI, std::numeric_limits<int>::max());
    EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(),
              std::numeric_limits<int>::max());
}

TEST_F(ClockWorldClockDbModelTest, ACityThatDoesNotExistCannotBeSelected) {
    const auto log = standardErrorOf([] { EXPECT_FALSE(select(99, 0)); });
    EXPECT_THAT(log, HasSubstr("there is no city (99)"));
    EXPECT_THAT(selectedKeys(), IsEmpty());
}

TEST_F(ClockWorldClockDbModelTest, TheChoiceSurvivesNewCityData) {
    select(SINGAPORE, 1);
    select(BERLIN, 2);
    writeCities(
        Row{"5", "'IDS_CITY_AT_GRAZ'", "'IDS_COUNTRY_AT'", "'Europe/Vienna'"}.insert() +
        Row{"30", "'IDS_CITY_SG_SINGAPORE'", "'IDS_COUNTRY_SG'", "'Asia/Singapore'", "'525'"}
            .insert());
    std::vector<ClockWorldClockDbData> selected;
    const auto log = standardErrorOf(
        [&] { EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockSelectedCityList(selected)); });
    ASSERT_THAT(selected, SizeIs(1));
    EXPECT_EQ(selected[0].mcc, "525") << "the new data count";
    EXPECT_THAT(log, HasSubstr("the city data no longer know IDS_CITY_DE_BERLIN(10)"));
    writeCities(Row().insert());
    standardErrorOf([] { EXPECT_THAT(selectedKeys(), ElementsAre(BERLIN)); });
}

TEST_F(ClockWorldClockDbModelTest, TheChoiceIsAPlainTableOfItsOwn) {
    select(DELHI, 3);
    OutsideView view(userFile());
    EXPECT_EQ(view.value("SELECT key, city, position FROM selected_city"),
              "20|IDS_CITY_IN_DELHI|3");
    EXPECT_EQ(view.value("SELECT owner, version FROM schema_version"), "world-clock-selection|1");
    EXPECT_FALSE(fs::exists(host.dataDir() + "/clock.db")) << "alarms are elsewhere";
}

// --- A choice that cannot be read or written -----------------------------------------------

TEST_F(ClockWorldClockDbModelTest, ADamagedChoiceIsKeptAsideAndAllCitiesAreThere) {
    writeFile(userFile(), "no database");
    std::vector<ClockWorldClockDbData> cities;
    const auto log = standardErrorOf(
        [&] { EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockAllCityList(cities)); });
    EXPECT_THAT(log, HasSubstr("was damaged, it is kept as " + userFile() + ".corrupt-"));
    EXPECT_THAT(cities, SizeIs(3));
    std::string kept;
    for (const auto& entry : fs::directory_iterator(host.dataDir()))
        if (entry.path().string().find(".corrupt-") != std::string::npos)
            kept = readFile(entry.path());
    EXPECT_EQ(kept, "no database");
    EXPECT_TRUE(select(BERLIN, 0));
}

TEST_F(ClockWorldClockDbModelTest, AChoiceOfANewerVersionIsLeftAndCitiesAreShownUnselected) {
    select(BERLIN, 4);
    OutsideView(userFile()).rows("UPDATE schema_version SET version = 2");
    std::vector<ClockWorldClockDbData> cities;
    const auto log = standardErrorOf([&] {
        EXPECT_FALSE(ClockWorldClockDbModel().getWorldClockAllCityList(cities));
        EXPECT_FALSE(select(DELHI, 1));
        EXPECT_FALSE(remove(BERLIN));
        EXPECT_EQ(ClockWorldClockDbModel().getWorldClockNextPosition(), 0);
    });
    EXPECT_THAT(log, AllOf(HasSubstr("the selected cities cannot be read: written by a newer"),
                           HasSubstr("the choice of IDS_CITY_IN_DELHI(20) cannot be stored"),
                           HasSubstr("(10) cannot be removed")));
    ASSERT_THAT(cities, SizeIs(3));
    EXPECT_EQ(cities[0].selected, 0);
    OutsideView view(userFile());
    EXPECT_EQ(view.value("SELECT key, position FROM selected_city"), "10|4");
}

TEST_F(ClockWorldClockDbModelTest, ALockedChoiceCanBeReadAndRefusesChanges) {
    select(BERLIN, 4);
    {
        const LockedStore lock(userFile());
        EXPECT_THAT(selectedKeys(), ElementsAre(BERLIN));
        const auto log = standardErrorOf([] { EXPECT_FALSE(select(DELHI, 1)); });
        EXPECT_THAT(log, HasSubstr("cannot be stored: database is locked"));
    }
    EXPECT_TRUE(select(DELHI, 1));
    EXPECT_THAT(selectedKeys(), ElementsAre(DELHI, BERLIN));
}

TEST_F(ClockWorldClockDbModelTest, AMissingDataFolderLeavesTheCities) {
    fs::remove_all(host.dataDir());
    std::vector<ClockWorldClockDbData> cities;
    const auto log = standardErrorOf(
        [&] { EXPECT_FALSE(ClockWorldClockDbModel().getWorldClockAllCityList(cities)); });
    EXPECT_THAT(log, HasSubstr("the selected cities cannot be read"));
    EXPECT_THAT(cities, SizeIs(3));
}

TEST_F(ClockWorldClockDbModelTest, AKilledProcessLosesNoCityThatItWasToldIsStored) {
    const int died = inAnotherProcess([] {
        if (select(BERLIN, 1) && select(DELHI, 2))
            raise(SIGKILL);
        return 0;
    });
    EXPECT_EQ(died, -1);
    EXPECT_THAT(selectedKeys(), ElementsAre(BERLIN, DELHI));
}

} // namespace
