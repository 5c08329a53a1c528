// The simulator's pages without a finger, and as a screen reader reads them.

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "AlarmListViewController.h"
#include "PageFixture.h"
#include "QuickPanel.h"
#include "WorldClockViewController.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockWorldClockDbModel.h"
#include "support/FocusWalk.h"
#include "support/ReadingSwitch.h"
#include "support/ScreenReader.h"
#include "support/StoredData.h"

using simulator::AlarmListViewController;
using simulator::QuickPanel;
using simulator::WorldClockViewController;
using testing::Contains;
using testing::ElementsAre;
using testing::IsSupersetOf;

namespace {

using Names = std::vector<std::string>;

constexpr const char* KATHMANDU = "IDS_CITY_NP_KATHMANDU";
constexpr const char* SINGAPORE = "IDS_CITY_SG_SINGAPORE";

class PagesTest : public PageFixture {
protected:
    void TearDown() override {
        takeStageDown();
        // What the editor and the city picker tell of themselves is their own affair.
        takeErrors();
        PageFixture::TearDown();
    }
    static void storeNamed(int hour, int minute, const std::string& name, bool on) {
        constexpr int MONDAY = 2;
        ClockAlarmDbData alarm = alarmAt(hour, minute, MONDAY);
        alarm.name = name;
        alarm.enable = on ? 1 : 0;
        storeAlarm(alarm);
    }
    void openAlarms() {
        // An alarm that rings next would begin with the time until then.
        storeNamed(7, 30, "Gym", false);
        stage().push(new AlarmListViewController(theme()));
    }
    void openCities() {
        storeCity(KATHMANDU, 0);
        storeCity(SINGAPORE, 1);
        stage().push(new WorldClockViewController(theme()));
    }
    static Names selected() {
        std::vector<ClockWorldClockDbData> cities;
        ClockWorldClockDbModel().getWorldClockSelectedCityList(cities);
        Names ids;
        for (const auto& city : cities)
            ids.push_back(city.city);
        return ids;
    }
    Evas_Object* page() {
        return elm_object_parent_widget_get(elm_object_item_content_get(
            elm_naviframe_top_item_get(stage().naviframe().getEvasObj())));
    }
    Evas_Object* popup() {
        const auto popups = stage().widgets("Popup");
        return popups.empty() ? nullptr : popups.back();
    }
};

class FocusListsTest : public PagesTest, public testing::WithParamInterface<Hand> {
protected:
    FocusWalk walk() { return {stage(), GetParam()}; }
    void picture(const std::string& name) {
        stage().screenshot("focus-" + name + "-" + nameOf(GetParam()));
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusListsTest, testing::Values(Hand::Keys, Hand::Bezel),
                         [](const auto& info) { return nameOf(info.param); });

TEST_P(FocusListsTest, TheAlarmListLeadsToTheWorldClock) {
    openAlarms();
    const Names all = walk().everything();
    EXPECT_EQ(all.front(), "World clock");
    EXPECT_EQ(all.back(), "Create");
    EXPECT_THAT(all, Contains("07:30"));
    ASSERT_TRUE(walk().goTo("World clock", -1));
    picture("alarms");
    walk().press();
    EXPECT_TRUE(stage().shows("Add city"));
    ASSERT_TRUE(walk().goTo("Alarm", -1));
    walk().press();
    EXPECT_EQ(walk().focused(), "World clock")
        << "a page that comes back shows where its focus was";
}

TEST_P(FocusListsTest, AnAlarmIsOpened) {
    openAlarms();
    ASSERT_TRUE(walk().goTo("07:30"));
    walk().expectVisible(theRinged(stage()));
    walk().press();
    EXPECT_TRUE(stage().shows("Edit"));
}

TEST_P(FocusListsTest, AnAlarmIsCreated) {
    openAlarms();
    ASSERT_TRUE(walk().goTo("Create"));
    walk().press();
    ASSERT_TRUE(walk().goTo("Done", -1));
    walk().press();
    EXPECT_TRUE(stage().shows("Create"));
    std::vector<ClockAlarmDbData> alarms;
    ClockAlarmDbModel().getAllAlarmList(alarms);
    EXPECT_EQ(alarms.size(), 2U);
}

TEST_P(FocusListsTest, EverythingOfTheWorldClockIsReached) {
    openCities();
    const Names all = walk().everything();
    ASSERT_EQ(all.size(), 4U);
    EXPECT_EQ(all.front(), "Alarm");
    EXPECT_EQ(all.back(), "Add city");
}

TEST_P(FocusListsTest, ACityIsRemovedOrKept) {
    openCities();
    walk().everything();
    walk().next();
    walk().press();
    ASSERT_NE(popup(), nullptr);
    EXPECT_EQ(walk().everything(), (Names{"Cancel", "Remove"}));
    picture("remove");
    ASSERT_TRUE(walk().goTo("Cancel", -1));
    walk().press();
    EXPECT_THAT(selected(), ElementsAre(KATHMANDU, SINGAPORE));
    walk().press();
    ASSERT_TRUE(walk().goTo("Remove"));
    walk().press();
    EXPECT_THAT(selected(), ElementsAre(SINGAPORE));
}

TEST_P(FocusListsTest, ACityIsAdded) {
    openCities();
    ASSERT_TRUE(walk().goTo("Add city"));
    walk().press();
    stage().settle();
    while (ringed(stage()).empty() || theRinged(stage()).type != "Elm_Genlist")
        walk().next();
    walk().press();
    EXPECT_EQ(selected().size(), 3U);
}

class ReadPagesTest : public PagesTest {
protected:
    bool press(Evas_Object* root, const std::string& role, const std::string& name) {
        const bool pressed = ScreenReader::press(root, role, name);
        stage().settle();
        return pressed;
    }

    ScreenReader reader;
};

TEST_F(ReadPagesTest, TheAlarmListIsRead) {
    openAlarms();
    EXPECT_THAT(ScreenReader::lines(page()),
                IsSupersetOf({"push button | Create", "push button | World clock"}));
    for (const ReadThing& thing : ScreenReader::things(page()))
        EXPECT_NE(thing.name, "") << thing.role;
    const auto things = ScreenReader::things(page());
    const auto row = std::find_if(things.begin(), things.end(),
                                  [](const auto& thing) { return thing.role == "list item"; });
    ASSERT_NE(row, things.end());
    EXPECT_THAT(row->name, testing::AllOf(testing::HasSubstr("07:30"), testing::HasSubstr("Gym"),
                                          testing::HasSubstr("Mon")));
    EXPECT_TRUE(press(page(), "list item", row->name));
    EXPECT_TRUE(stage().shows("Edit"));
}

TEST_F(ReadPagesTest, TheWorldClockIsReadAndItsPopupByItsTitle) {
    openCities();
    EXPECT_THAT(ScreenReader::lines(page()),
                ElementsAre("push button | Add city", "list item | 14:26, Kathmandu, GMT+05:45",
                            "list item | 16:41, Singapore, GMT+08:00", "push button | Alarm"));
    EXPECT_TRUE(press(page(), "list item", "16:41, Singapore, GMT+08:00"));
    EXPECT_THAT(ScreenReader::lines(popup()),
                ElementsAre("dialog | Singapore",
                            "label | This city will be removed from the list.",
                            "push button | Cancel", "push button | Remove"));
    EXPECT_TRUE(press(popup(), "push button", "Remove"));
    EXPECT_THAT(selected(), ElementsAre(KATHMANDU));
}

TEST_F(ReadPagesTest, TheQuickPanelSaysTheVolumeWhileItIsDown) {
    device().setVolume(SOUND_TYPE_ALARM, 7);
    auto panel = std::make_unique<QuickPanel>(stage().window(), theme(), [](bool) {});
    const auto said = [this] {
        return ScreenReader::announced(stage().window());
    };
    EXPECT_THAT(said(), testing::IsEmpty());
    panel->toggle();
    Stage::advance(0.5);
    EXPECT_THAT(said(), ElementsAre("Alarm volume, 7 / 15"));
    stage().bezel(1);
    EXPECT_THAT(said(), ElementsAre("Alarm volume, 8 / 15"));
    panel->toggle();
    Stage::advance(0.5);
    EXPECT_THAT(said(), testing::IsEmpty());
}

/** Another language is chosen while a page is open. */
class ReadPagesSwitchTest : public ReadingSwitch<PagesTest> {
protected:
    void tapRow(const std::string& text) {
        stage().tapText(text);
        stage().settle();
    }
};

INSTANTIATE_TEST_SUITE_P(Languages, ReadPagesSwitchTest, languageChanges(),
                         [](const auto& info) { return info.param.name; });

TEST_P(ReadPagesSwitchTest, TheAlarmListsRowsSwitchesAndButtons) {
    storeNamed(7, 30, "Gym", false);
    storeNamed(22, 45, "", true);
    expectTheSame([this] { stage().push(new AlarmListViewController(theme())); });
}

TEST_P(ReadPagesSwitchTest, TheWordsThatThereAreNoAlarms) {
    expectTheSame([this] { stage().push(new AlarmListViewController(theme())); });
}

TEST_P(ReadPagesSwitchTest, TheQuestionBeforeAnAlarmGoes) {
    storeNamed(7, 30, "Gym", false);
    expectTheSame([this] {
        stage().push(new AlarmListViewController(theme()));
        const auto time = stage().findText("07:30");
        ASSERT_TRUE(time);
        stage().press(time->area.middle().x, time->area.middle().y);
        Stage::advance(0.8);
        stage().release();
    });
}

TEST_P(ReadPagesSwitchTest, TheWorldClocksRowsAndButtons) {
    expectTheSame([this] { openCities(); });
}

TEST_P(ReadPagesSwitchTest, TheWordsThatThereAreNoCities) {
    expectTheSame([this] { stage().push(new WorldClockViewController(theme())); });
}

TEST_P(ReadPagesSwitchTest, TheQuestionBeforeACityGoes) {
    expectTheSame([this] {
        openCities();
        tapRow("14:26");
    });
}

TEST_P(ReadPagesSwitchTest, TheQuickPanelsVolume) {
    device().setVolume(SOUND_TYPE_ALARM, 7);
    language().choose("en");
    QuickPanel panel(stage().window(), theme(), [](bool) {});
    panel.toggle();
    Stage::advance(0.5);
    language().choose("de");
    stage().settle();
    EXPECT_THAT(ScreenReader::announced(stage().window()), ElementsAre("Weckerlautstärke, 7 / 15"));
    panel.toggle();
    stage().settle();
}

} // namespace
