// What was built from the packages of places, countries and networks.
#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <iterator>
#include <libintl.h>
#include <map>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "clock/ClockText.h"
#include "clock/ClockWorldClockDbModel.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"

namespace fs = std::filesystem;

// The C library's count of changes of language.
extern "C" int _nl_msg_cat_cntr;

namespace {

using testing::Contains;

const fs::path locales = CLOCK_RESOURCE_DIR "/locale";

class ClockWorldClockDataTest : public testing::Test {
public:
    ~ClockWorldClockDataTest() override { setLanguage("en"); }

protected:
    ClockWorldClockDataTest() {
        fs::create_directories(host.resourceDir() + "/data");
        fs::copy_file(CLOCK_RESOURCE_DIR "/data/world-clock.db",
                      host.resourceDir() + "/data/world-clock.db");
        setLanguage("en");
    }

    static void setLanguage(const std::string& language) {
        setenv("LANGUAGE", language.c_str(), 1);
        setlocale(LC_ALL, "C.UTF-8");
        bindtextdomain("clock", locales.c_str());
        bind_textdomain_codeset("clock", "UTF-8");
        // The library keeps what it has found until it is told that the language has changed.
        ++_nl_msg_cat_cntr;
    }

    static std::vector<ClockWorldClockDbData> cities() {
        std::vector<ClockWorldClockDbData> list;
        EXPECT_TRUE(ClockWorldClockDbModel().getWorldClockAllCityList(list));
        return list;
    }

    /** A city as a row shows it. */
    static std::string row(const ClockWorldClockDbData& city) {
        const std::string name = clockText(city.city.c_str());
        return city.cityOnly ? name : name + ", " + clockText(city.country.c_str());
    }

    /** The city that a row shows in the current language. */
    static ClockWorldClockDbData find(const std::string& wanted) {
        for (const auto& city : cities()) {
            if (row(city) == wanted)
                return city;
        }
        ADD_FAILURE() << "no row " << wanted;
        return {};
    }

    static std::vector<std::string> languages() {
        std::vector<std::string> names;
        for (const auto& entry : fs::directory_iterator(locales))
            names.push_back(entry.path().filename());
        std::sort(names.begin(), names.end());
        return names;
    }

    DeviceHost host;
};

struct KnownCity {
    const char* row;
    const char* offset; // In summer.
    const char* zone;
    const char* code;
};

} // namespace

TEST_F(ClockWorldClockDataTest, KnowsTheCitiesOfTheWorld) {
    const auto list = cities();
    EXPECT_GE(list.size(), 4000U);
    std::set<std::string> countries;
    std::set<std::string> zones;
    for (const auto& city : list) {
        countries.insert(city.country);
        zones.insert(city.tzPath);
    }
    EXPECT_GE(countries.size(), 240U);
    EXPECT_GE(zones.size(), 280U);
}

TEST_F(ClockWorldClockDataTest, KnowsWhatPeopleKnowOfSomeCities) {
    const FrozenTime now(1784116800); // 15 July 2026
    for (const auto& known :
         std::vector<KnownCity>{{"Berlin, Germany", "GMT+02:00", "Europe/Berlin", "262"},
                                {"Tokyo, Japan", "GMT+09:00", "Asia/Tokyo", "440"},
                                {"Kathmandu, Nepal", "GMT+05:45", "Asia/Kathmandu", "429"},
                                {"Saint John's, Canada", "GMT-02:30", "America/St_Johns", "302"},
                                {"Singapore", "GMT+08:00", "Asia/Singapore", "525"},
                                {"New York, United States", "GMT-04:00", "America/New_York", "310"},
                                {"Seoul, South Korea", "GMT+09:00", "Asia/Seoul", "450"},
                                {"São Paulo, Brazil", "GMT-03:00", "America/Sao_Paulo", "724"},
                                {"Honolulu, United States", "GMT-10:00", "Pacific/Honolulu", "310"},
                                {"Phoenix, United States", "GMT-07:00", "America/Phoenix", "310"},
                                // Known by their time zones alone.
                                {"Baghdad, Iraq", "GMT+03:00", "Asia/Baghdad", "418"},
                                {"Addis Ababa, Ethiopia", "GMT+03:00", "Africa/Addis_Ababa", "636"},
                                {"Dili, Timor-Leste", "GMT+09:00", "Asia/Dili", ""}}) {
        const auto city = find(known.row);
        EXPECT_EQ(city.timezone, known.offset) << known.row;
        EXPECT_EQ(city.tzPath, known.zone) << known.row;
        if (*known.code == '\0')
            continue;
        std::istringstream codes(city.mcc);
        EXPECT_THAT(std::vector<std::string>(std::istream_iterator<std::string>(codes), {}),
                    Contains(known.code))
            << known.row;
    }
}

TEST_F(ClockWorldClockDataTest, OffsetsFollowSummerTime) {
    const FrozenTime winter(1768478400); // 15 January 2026
    EXPECT_EQ(find("Berlin, Germany").timezone, "GMT+01:00");
    EXPECT_EQ(find("Sydney, Australia").timezone, "GMT+11:00");
    const FrozenTime summer(1784116800); // 15 July 2026
    EXPECT_EQ(find("Berlin, Germany").timezone, "GMT+02:00");
    EXPECT_EQ(find("Sydney, Australia").timezone, "GMT+10:00");
}

TEST_F(ClockWorldClockDataTest, CountriesOfOneCityAreShownByTheCityAlone) {
    EXPECT_TRUE(find("Singapore").cityOnly);
    EXPECT_TRUE(find("Monaco").cityOnly);
    EXPECT_TRUE(find("Hong Kong").cityOnly);
    EXPECT_FALSE(find("Berlin, Germany").cityOnly);
    EXPECT_FALSE(find("Rome, Italy").cityOnly);
}

TEST_F(ClockWorldClockDataTest, CitiesOfOneNameShowTheirState) {
    EXPECT_EQ(find("Portland (Oregon), United States").timezone.substr(0, 4), "GMT-");
    EXPECT_NE(find("Portland (Oregon), United States").tzPath,
              find("Portland (Maine), United States").tzPath);
    EXPECT_EQ(find("Chicago, United States").tzPath, "America/Chicago") << "only one";
}

TEST_F(ClockWorldClockDataTest, EveryRecordIsInTheFormThatScreensAndOtherApplicationsExpect) {
    const auto id = testing::MatchesRegex("IDS_[A-Z0-9_]+");
    const auto codes = testing::MatchesRegex("([0-9]{3}( [0-9]{3})*)?");
    const auto offset = testing::MatchesRegex("GMT[+-][0-9]{2}:[0-9]{2}");
    std::set<int> keys;
    std::set<std::string> ids;
    for (const auto& city : cities()) {
        EXPECT_THAT(city.city, id) << city.city;
        EXPECT_THAT(city.country, id) << city.country;
        EXPECT_LE(std::max({city.city.size(), city.country.size(), city.tzPath.size()}), 63U);
        EXPECT_THAT(city.mcc, codes) << city.mcc;
        EXPECT_THAT(city.timezone, offset) << city.timezone;
        EXPECT_TRUE(fs::is_regular_file("/usr/share/zoneinfo/" + city.tzPath)) << city.tzPath;
        EXPECT_TRUE(keys.insert(city.index).second) << city.index;
        EXPECT_TRUE(ids.insert(city.city).second) << city.city;
        EXPECT_GT(city.index, 0);
    }
}

TEST_F(ClockWorldClockDataTest, MobileCodesAreKnownForMostCities) {
    const auto list = cities();
    const auto known =
        std::count_if(list.begin(), list.end(), [](const auto& city) { return !city.mcc.empty(); });
    EXPECT_GE(known * 100, static_cast<std::ptrdiff_t>(list.size()) * 90);
}

TEST_F(ClockWorldClockDataTest, EveryCityAndCountryHasAnEnglishName) {
    for (const auto& city : cities()) {
        EXPECT_NE(clockText(city.city.c_str()), city.city);
        EXPECT_NE(clockText(city.country.c_str()), city.country);
    }
}

TEST_F(ClockWorldClockDataTest, NoTwoRowsLookTheSameInAnyLanguage) {
    const auto list = cities();
    for (const auto& language : languages()) {
        setLanguage(language + ":en");
        std::map<std::string, std::string> rows;
        for (const auto& city : list) {
            const auto [other, isNew] = rows.emplace(row(city), city.city);
            EXPECT_TRUE(isNew) << language << ": " << row(city) << " is both " << city.city
                               << " and " << other->second;
        }
    }
}

TEST_F(ClockWorldClockDataTest, NamesAreSafeInMarkedUpRowsAndFitInThem) {
    const auto list = cities();
    for (const auto& language : languages()) {
        setLanguage(language + ":en");
        for (const auto& city : list) {
            const auto text = row(city);
            EXPECT_EQ(text.find_first_of("<>&\n\t"), std::string::npos) << language << text;
            EXPECT_LE(text.size(), 255U) << language << text;
        }
    }
}

TEST_F(ClockWorldClockDataTest, NamesAreTranslated) {
    EXPECT_GE(languages().size(), 140U);
    setLanguage("de:en");
    EXPECT_EQ(find("München, Deutschland").city, "IDS_CITY_DE_BAVARIA_MUNICH");
    EXPECT_EQ(find("Bagdad, Irak").city, "IDS_CITY_IQ_BAGHDAD");
    EXPECT_EQ(find("Singapur").tzPath, "Asia/Singapore");
    setLanguage("ja:en");
    EXPECT_EQ(find("東京, 日本").tzPath, "Asia/Tokyo");
    EXPECT_EQ(find("バグダッド, イラク").tzPath, "Asia/Baghdad");
    setLanguage("pt_BR:en");
    EXPECT_EQ(find("Moscou, Federação Russa").tzPath, "Europe/Moscow");
    setLanguage("ar:en");
    EXPECT_EQ(find("القاهرة, مصر").tzPath, "Africa/Cairo");
}

TEST_F(ClockWorldClockDataTest, ALanguageWithoutNamesOfCitiesShowsEnglishOnes) {
    setLanguage("wo:en");
    EXPECT_EQ(row(find("Berlin, Almaañ")), "Berlin, Almaañ");
}

TEST_F(ClockWorldClockDataTest, TheTextsOfTheScreensAreStillThere) {
    EXPECT_STREQ(clockText("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"), "Cancel");
    setLanguage("de:en");
    EXPECT_STREQ(clockText("IDS_TPLATFORM_ACBUTTON_DONE_ABB"), "Fertig");
    // Cities have Norwegian names, the screens have no Norwegian texts.
    setLanguage("nb:en");
    EXPECT_STREQ(clockText("IDS_TPLATFORM_ACBUTTON_DONE_ABB"), "Done");
}

TEST_F(ClockWorldClockDataTest, KeysOfCitiesNeverChange) {
    // Stored in the user's list: other numbers would be other cities.
    EXPECT_EQ(find("Berlin, Germany").index, 242043557);
    EXPECT_EQ(find("Tokyo, Japan").index, 1967837859);
}
