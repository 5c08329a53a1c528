// The panel that is pulled down over the face.

#include "QuickPanel.h"

#include <memory>
#include <string>
#include <vector>

#include "ButtonBelow.h"
#include "device/eext.h"
#include "support/ScreenTest.h"

using simulator::QuickPanel;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class QuickPanelTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        stage();
        device().setVolume(SOUND_TYPE_ALARM, 7);
        panel = std::make_unique<QuickPanel>(stage().window(), THEME,
                                             [this](bool shown) { told.push_back(shown); });
    }
    void TearDown() override {
        panel.reset();
        ScreenTest::TearDown();
    }
    void pullDown() {
        panel->toggle();
        Stage::advance(0.5);
    }

    std::vector<bool> told;
    std::unique_ptr<QuickPanel> panel;
};

} // namespace

TEST_F(QuickPanelTest, itIsNotThereAtFirst) {
    EXPECT_FALSE(panel->isShown());
    EXPECT_FALSE(stage().shows("Alarm volume"));
    EXPECT_TRUE(told.empty());
}

TEST_F(QuickPanelTest, itComesDownWithTheAlarmsLevelAndTells) {
    pullDown();
    EXPECT_TRUE(panel->isShown());
    EXPECT_TRUE(stage().shows("Alarm volume"));
    EXPECT_TRUE(stage().shows("7"));
    for (const FoundText& text : stage().texts())
        EXPECT_TRUE(text.area.insideCircle()) << text.text;
    EXPECT_EQ(told, std::vector{true});
}

TEST_F(QuickPanelTest, itGoesUpAgainAndTells) {
    pullDown();
    panel->toggle();
    EXPECT_FALSE(panel->isShown());
    Stage::advance(0.5);
    EXPECT_FALSE(stage().shows("Alarm volume"));
    EXPECT_EQ(told, (std::vector{true, false}));
}

TEST_F(QuickPanelTest, theBezelTurnsTheVolume) {
    pullDown();
    stage().bezel(2);
    EXPECT_TRUE(stage().shows("9"));
    stage().bezel(-3);
    EXPECT_TRUE(stage().shows("6"));
    EXPECT_TRUE(panel->isShown());
}

TEST_F(QuickPanelTest, aTouchSendsItUp) {
    pullDown();
    stage().tap(180, 260);
    EXPECT_FALSE(panel->isShown());
    Stage::advance(0.5);
    EXPECT_EQ(told, (std::vector{true, false}));
}

TEST_F(QuickPanelTest, itKeepsTouchesFromWhatItCovers) {
    const ButtonBelow button(stage().window());
    pullDown();
    stage().tap(180, 180);
    EXPECT_EQ(button.clicks(), 0);
    Stage::advance(0.5);
    stage().tap(180, 180);
    EXPECT_EQ(button.clicks(), 1) << "below it once it is up";
}

TEST_F(QuickPanelTest, theBackKeySendsItUpAndNothingElse) {
    int backs = 0;
    eext_object_event_callback_add(
        stage().window(), EEXT_EVENT_BACK,
        [](void* count, Evas_Object*, void*) { ++*static_cast<int*>(count); }, &backs);
    pullDown();
    stage().backKey();
    EXPECT_FALSE(panel->isShown());
    EXPECT_EQ(backs, 0);
    Stage::advance(0.5);
    stage().backKey();
    EXPECT_EQ(backs, 1);
    EXPECT_EQ(told, (std::vector{true, false}));
}

TEST_F(QuickPanelTest, itFollowsALevelThatChangesMeanwhile) {
    pullDown();
    device().setVolume(SOUND_TYPE_ALARM, 3);
    panel->refresh();
    Stage::frames(2);
    EXPECT_TRUE(stage().shows("3"));
    device().setVolume(SOUND_TYPE_ALARM, 12);
    Stage::advance(0.7);
    EXPECT_TRUE(stage().shows("12")) << "another process set it";
}

TEST_F(QuickPanelTest, itReadsTheLevelAnewEachTime) {
    pullDown();
    panel->toggle();
    device().setVolume(SOUND_TYPE_ALARM, 2);
    pullDown();
    EXPECT_TRUE(stage().shows("2"));
}

TEST_F(QuickPanelTest, aPanelThatGoesWhileItIsDownLeavesNothingBehind) {
    pullDown();
    panel.reset();
    Stage::advance(1);
    stage().backKey();
    EXPECT_FALSE(stage().shows("Alarm volume"));
}

TEST_F(QuickPanelTest, aThemeWithoutAPanelIsLogged) {
    const QuickPanel other(stage().window(), "/nowhere.edj", [](bool) {});
    expectLog("'/nowhere.edj' has no quick panel");
}
