// The clock application's first page.

#include "AlarmListViewController.h"

#include <string>

#include <Elementary.h>

#include "clock/ClockAlarmDbModel.h"
#include "support/ScreenTest.h"

using simulator::AlarmListViewController;

namespace {

constexpr const char* TIME_FORM = "db/menu_widget/regionformat_time1224";
const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class AlarmListPageTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        // What the editor says about a new alarm's empty name is its own affair.
        takeErrors();
        ScreenTest::TearDown();
    }

    void openPage() {
        page = new AlarmListViewController(THEME);
        stage().push(page);
    }
    static ClockAlarmDbData store(int hour, int minute, const std::string& name = "") {
        ClockAlarmDbData alarm;
        alarm.leading = 0;
        alarm.hour = hour;
        alarm.min = minute;
        alarm.name = name;
        alarm.enable = 1;
        alarm.repeatWeekly = 2;
        alarm.repeatOnce = 0;
        ClockAlarmDbModel model;
        alarm.id = model.reserveAlarmId();
        EXPECT_TRUE(model.insertAlarmData(alarm));
        return alarm;
    }
    unsigned pages() {
        Eina_List* const list = elm_naviframe_items_get(stage().naviframe().getEvasObj());
        const unsigned count = eina_list_count(list);
        eina_list_free(list);
        return count;
    }
    /** All that can be read on the face, one line each. */
    std::string readFace() {
        std::string all;
        for (const FoundText& found : stage().texts())
            all += found.text + "\n";
        return all;
    }

    AlarmListViewController* page = nullptr;
};

} // namespace

TEST_F(AlarmListPageTest, withoutAlarmsItSaysSo) {
    openPage();
    EXPECT_TRUE(stage().shows("Alarm"));
    EXPECT_TRUE(stage().shows("No alarms"));
    EXPECT_TRUE(stage().shows("Create"));
}

TEST_F(AlarmListPageTest, anAlarmShowsItsTimeNameAndDays) {
    store(7, 30, "Gym & <b>tea</b>");
    openPage();
    EXPECT_TRUE(stage().shows("07:30")) << readFace();
    EXPECT_NE(readFace().find("Gym & <b>tea</b>"), std::string::npos) << readFace();
    EXPECT_NE(readFace().find("Mon"), std::string::npos) << readFace();
    EXPECT_FALSE(stage().shows("No alarms"));
}

TEST_F(AlarmListPageTest, theTimeFollowsTheSetting) {
    store(19, 30);
    openPage();
    device().setSetting(TIME_FORM, 1);
    ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
    stage().settle();
    EXPECT_TRUE(stage().shows("7:30\u202fPM")) << readFace();
}

TEST_F(AlarmListPageTest, aNewAlarmAppearsAndADeletedOneGoes) {
    openPage();
    const ClockAlarmDbData alarm = store(8, 15);
    stage().settle();
    EXPECT_TRUE(stage().shows("08:15")) << readFace();
    EXPECT_FALSE(stage().shows("No alarms"));
    ClockAlarmDbModel().removeAlarmData(alarm);
    stage().settle();
    EXPECT_FALSE(stage().shows("08:15"));
    EXPECT_TRUE(stage().shows("No alarms"));
}

TEST_F(AlarmListPageTest, aNewAlarmFarDownTheListComesIntoView) {
    for (int hour = 0; hour < 12; ++hour)
        store(hour, 0);
    openPage();
    EXPECT_FALSE(stage().shows("11:45"));
    store(11, 45);
    stage().settle();
    EXPECT_TRUE(stage().shows("11:45")) << readFace();
}

TEST_F(AlarmListPageTest, theFirstAndTheLastAlarmCanBeScrolledToTheMiddle) {
    for (int hour = 0; hour < 6; ++hour)
        store(hour, 0);
    openPage();
    stage().settle();
    const auto first = stage().findText("00:00");
    ASSERT_TRUE(first);
    EXPECT_TRUE(first->area.insideCircle());
    EXPECT_LE(first->area.y, 180);
    for (int drag = 0; drag < 6; ++drag)
        stage().drag(180, 250, 0, -150);
    stage().settle();
    const auto last = stage().findText("05:00");
    ASSERT_TRUE(last) << readFace();
    EXPECT_LE(last->area.y, 190);
}

TEST_F(AlarmListPageTest, createOpensTheEditorForANewAlarm) {
    openPage();
    stage().tapText("Create");
    stage().settle();
    EXPECT_EQ(pages(), 2U);
    EXPECT_TRUE(stage().shows("Done")) << readFace();
}

TEST_F(AlarmListPageTest, aTapOnAnAlarmOpensTheEditorOnIt) {
    store(7, 30);
    openPage();
    stage().tapText("07:30");
    stage().settle();
    EXPECT_EQ(pages(), 2U);
    EXPECT_TRUE(stage().shows("Edit")) << readFace();
}

TEST_F(AlarmListPageTest, aSecondRequestWhileTheEditorIsOpenDoesNothing) {
    openPage();
    page->createAlarm();
    page->createAlarm();
    stage().settle();
    EXPECT_EQ(pages(), 2U);
}

TEST_F(AlarmListPageTest, anAlarmThatIsNotStoredIsNotOpened) {
    openPage();
    page->editAlarm(4711);
    expectLog("Alarm 4711 is not stored");
    EXPECT_EQ(pages(), 1U);
}

TEST_F(AlarmListPageTest, aChangeAfterThePageHasGoneIsIgnored) {
    openPage();
    takeStageDown();
    store(9, 0);
    Stage::advance(1);
}
