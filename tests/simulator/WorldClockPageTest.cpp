// The clock application's second page.

#include "WorldClockViewController.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "AlarmListViewController.h"
#include "PageFixture.h"
#include "clock/ClockWorldClockDbModel.h"
#include "screens/TestCatalogue.h"
#include "support/StoredData.h"

using simulator::AlarmListViewController;
using simulator::WorldClockViewController;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

constexpr const char* TIME_FORM = "db/menu_widget/regionformat_time1224";
constexpr const char* KATHMANDU = "IDS_CITY_NP_KATHMANDU";
constexpr const char* HONOLULU = "IDS_CITY_US_HAWAII_HONOLULU";
constexpr const char* SINGAPORE = "IDS_CITY_SG_SINGAPORE";

// The city picker tells at error priority what it does.
const std::vector<std::string> TOLD = {"create genlist",
                                       "_callerType = ", "City selected :: ", "Hide keyboard"};

class WorldClockPageTest : public PageFixture {
protected:
    void TearDown() override {
        takeStageDown();
        for (const std::string& line : takeErrors()) {
            EXPECT_TRUE(std::any_of(TOLD.begin(), TOLD.end(), [&](const auto& told) {
                return line.starts_with(told);
            })) << line;
        }
        PageFixture::TearDown();
    }

    void openPage() { stage().push(new WorldClockViewController(theme())); }
    static std::vector<std::string> selected() {
        std::vector<ClockWorldClockDbData> cities;
        ClockWorldClockDbModel().getWorldClockSelectedCityList(cities);
        std::vector<std::string> ids(cities.size());
        std::transform(cities.begin(), cities.end(), ids.begin(),
                       [](const auto& city) { return city.city; });
        return ids;
    }
    /** Of some texts those that can be seen, from the top. */
    std::vector<std::string> shown(const std::vector<std::string>& texts) {
        std::vector<std::string> found;
        for (const FoundText& text : stage().texts()) {
            for (const std::string& wanted : texts) {
                if (text.text.find(wanted) != std::string::npos)
                    found.push_back(wanted);
            }
        }
        return found;
    }
    /** All that can be read on the face, one line each. */
    std::string readFace() {
        std::string all;
        for (const FoundText& found : stage().texts())
            all += found.text + "\n";
        return all;
    }
    void tapCity(const std::string& name) {
        for (const FoundText& found : stage().texts()) {
            if (found.text.find(name) != std::string::npos) {
                stage().tap(found.area.middle());
                stage().settle();
                return;
            }
        }
        ADD_FAILURE() << "no " << name << " in " << readFace();
    }
    void tapText(const std::string& text) {
        stage().tapText(text);
        stage().settle();
    }
};

} // namespace

TEST_F(WorldClockPageTest, withoutCitiesItSaysSo) {
    openPage();
    EXPECT_TRUE(stage().shows("World clock"));
    EXPECT_TRUE(stage().shows("No cities"));
    EXPECT_TRUE(stage().shows("Add city"));
}

TEST_F(WorldClockPageTest, citiesAreInTheUsersOrderWithTheirTimes) {
    storeCity(KATHMANDU, 1);
    storeCity(SINGAPORE, 0);
    openPage();
    // It is 08:41 in Greenwich.
    EXPECT_THAT(shown({"Singapore", "Kathmandu"}), ElementsAre("Singapore", "Kathmandu"));
    EXPECT_THAT(shown({"16:41", "14:26"}), ElementsAre("16:41", "14:26"));
    EXPECT_THAT(readFace(), HasSubstr("GMT+08:00"));
    EXPECT_FALSE(stage().shows("No cities"));
}

TEST_F(WorldClockPageTest, everyTextOfACityLiesInsideTheCircle) {
    storeCity(SINGAPORE, 0);
    openPage();
    for (const FoundText& found : stage().texts())
        EXPECT_TRUE(found.area.insideCircle()) << found.text;
}

TEST_F(WorldClockPageTest, theTimeFollowsTheSetting) {
    storeCity(SINGAPORE, 0);
    openPage();
    device().setSetting(TIME_FORM, 1);
    ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
    stage().settle();
    EXPECT_TRUE(stage().shows("4:41\u202fPM")) << readFace();
}

TEST_F(WorldClockPageTest, theTimeMovesOnWithEveryMinute) {
    storeCity(SINGAPORE, 0);
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:41:30");
    openPage();
    EXPECT_TRUE(stage().shows("16:41")) << readFace();
    Stage::advance(31);
    EXPECT_TRUE(stage().shows("16:42")) << readFace();
    Stage::advance(60);
    EXPECT_TRUE(stage().shows("16:43")) << readFace();
}

TEST_F(WorldClockPageTest, aClockThatWasSetShowsAtOnce) {
    storeCity(SINGAPORE, 0);
    openPage();
    VirtualClock::jump(3 * 3600);
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle(2);
    EXPECT_TRUE(stage().shows("19:41")) << readFace();
}

TEST_F(WorldClockPageTest, aWatchThatComesBackShowsTheTimeOfNow) {
    storeCity(SINGAPORE, 0);
    openPage();
    VirtualClock::jump(2 * 3600);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    stage().settle(2);
    EXPECT_TRUE(stage().shows("18:41")) << readFace();
}

TEST_F(WorldClockPageTest, aCityOnAnotherDaySaysSo) {
    storeCity(HONOLULU, 0);
    openPage();
    EXPECT_THAT(readFace(), HasSubstr("Yesterday, GMT-10:00"));
    EXPECT_TRUE(stage().shows("22:41"));
}

TEST_F(WorldClockPageTest, aCityIsAddedThroughThePicker) {
    storeCity(SINGAPORE, 4);
    openPage();
    tapText("Add city");
    ASSERT_TRUE(stage().shows("Cancel")) << readFace();
    stage().tap(140, 112);
    stage().type("kathm");
    stage().settle();
    stage().tap(150, 185);
    stage().settle();
    EXPECT_THAT(selected(), ElementsAre(SINGAPORE, KATHMANDU));
    EXPECT_THAT(readFace(), HasSubstr("Kathmandu"));
    EXPECT_TRUE(stage().shows("World clock"));
    EXPECT_EQ(cityOf(KATHMANDU).position, 5);
}

TEST_F(WorldClockPageTest, aCityThatIsAddedFarDownComesIntoView) {
    std::vector<ClockWorldClockDbData> all;
    ClockWorldClockDbModel().getWorldClockAllCityList(all);
    for (std::size_t i = 0; i < 6; ++i) {
        if (all.at(i).city != KATHMANDU)
            storeCity(all.at(i).city, static_cast<int>(i));
    }
    openPage();
    EXPECT_THAT(shown({"Kathmandu"}), ElementsAre());
    tapText("Add city");
    stage().tap(140, 112);
    stage().type("kathm");
    stage().settle();
    stage().tap(150, 185);
    stage().settle();
    EXPECT_THAT(shown({"Kathmandu"}), ElementsAre("Kathmandu")) << readFace();
}

TEST_F(WorldClockPageTest, aPickerThatIsLeftAddsNothing) {
    openPage();
    tapText("Add city");
    tapText("Cancel");
    EXPECT_THAT(selected(), ElementsAre());
    EXPECT_TRUE(stage().shows("No cities")) << readFace();
}

TEST_F(WorldClockPageTest, aCityIsRemovedOnceAPersonSaysSo) {
    storeCity(SINGAPORE, 0);
    storeCity(KATHMANDU, 1);
    openPage();
    tapCity("Singapore");
    EXPECT_TRUE(stage().shows("Remove")) << readFace();
    EXPECT_THAT(selected(), ElementsAre(SINGAPORE, KATHMANDU));
    tapText("Remove");
    EXPECT_THAT(selected(), ElementsAre(KATHMANDU));
    EXPECT_FALSE(stage().shows("Remove"));
    EXPECT_THAT(shown({"Singapore", "Kathmandu"}), ElementsAre("Kathmandu"));
}

TEST_F(WorldClockPageTest, aCityThatIsHeldIsAskedForToo) {
    storeCity(SINGAPORE, 0);
    openPage();
    const auto time = stage().findText("16:41");
    ASSERT_TRUE(time);
    stage().press(time->area.middle().x, time->area.middle().y);
    Stage::advance(0.8);
    EXPECT_TRUE(stage().shows("Remove")) << readFace();
    stage().release();
    stage().settle();
    EXPECT_TRUE(stage().shows("Remove")) << "the finger that goes up answers nothing";
    tapText("Remove");
    EXPECT_THAT(selected(), ElementsAre());
}

TEST_F(WorldClockPageTest, theLastCityThatGoesLeavesAnEmptyList) {
    storeCity(SINGAPORE, 0);
    openPage();
    tapCity("Singapore");
    tapText("Remove");
    EXPECT_TRUE(stage().shows("No cities")) << readFace();
}

TEST_F(WorldClockPageTest, cancelAndTheBackKeyKeepTheCity) {
    storeCity(SINGAPORE, 0);
    openPage();
    tapCity("Singapore");
    tapText("Cancel");
    EXPECT_FALSE(stage().shows("Remove"));
    tapCity("Singapore");
    EXPECT_TRUE(stage().shows("Remove"));
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(stage().shows("Remove"));
    EXPECT_THAT(selected(), ElementsAre(SINGAPORE));
    EXPECT_TRUE(stage().shows("World clock")) << "the back key closes the question alone";
}

TEST_F(WorldClockPageTest, aDamagedListIsLoggedAndLooksEmpty) {
    storeCity(SINGAPORE, 0);
    for (const char* suffix : {"-wal", "-shm"})
        std::filesystem::remove(device().dataPath() + "world-clock-selection.db" + suffix);
    std::ofstream(device().dataPath() + "world-clock-selection.db") << std::string(4096, 'x');
    openPage();
    EXPECT_TRUE(stage().shows("No cities")) << readFace();
    EXPECT_THAT(takeErrors(), testing::Contains(HasSubstr("world-clock-selection.db")));
}

TEST_F(WorldClockPageTest, theTitlesButtonLeadsThereAndBack) {
    stage().push(new AlarmListViewController(theme()));
    tapText("World clock");
    EXPECT_TRUE(stage().shows("No cities")) << readFace();
    tapText("Alarm");
    EXPECT_TRUE(stage().shows("No alarms")) << readFace();
}

TEST_F(WorldClockPageTest, aLanguageChangeReachesEveryText) {
    storeCity(HONOLULU, 0);
    openPage();
    const TestCatalogue other({{HONOLULU, "Onolulu"},
                               {"IDS_WCL_HEADER_WORLD_CLOCK", "Ora mondiale"},
                               {"IDS_ALM_HEADER_ALARM", "Sveglia"},
                               {"IDS_WCL_OPT_ADDCITY", "Aggiungi"},
                               {"IDS_CLOCK_BODY_YESTERDAY", "Ieri"}});
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    for (const char* text : {"Onolulu", "Ora mondiale", "Sveglia", "Aggiungi", "Ieri"})
        EXPECT_THAT(readFace(), HasSubstr(text));
}
