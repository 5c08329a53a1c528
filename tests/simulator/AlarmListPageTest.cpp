// The clock application's first page.

#include <string>

#include "AlarmListFixture.h"

namespace {

constexpr const char* TIME_FORM = "db/menu_widget/regionformat_time1224";

class AlarmListPageTest : public AlarmListFixture {
protected:
    void TearDown() override {
        takeStageDown();
        // What the editor says about a new alarm's empty name is its own affair.
        takeErrors();
        AlarmListFixture::TearDown();
    }
    static ClockAlarmDbData store(int hour, int minute, const std::string& name = "") {
        constexpr int MONDAY = 2;
        return add(hour, minute, true, MONDAY, name);
    }
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

TEST_F(AlarmListPageTest, theAlarmThatTheEditorWasOpenedOnStandsInTheMiddleThen) {
    for (int hour = 10; hour < 20; ++hour)
        store(hour, 0, hour % 2 == 0 ? "Several words that take two lines" : "");
    openPage();
    page->editAlarm(alarms().at(5).id);
    stage().settle();
    stage().tapText("Cancel");
    stage().settle();
    EXPECT_NEAR(Stage::area(switchOf("15:00")).middle().y, 180, 10) << readFace();
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
