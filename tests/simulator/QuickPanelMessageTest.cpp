// How screens hear of the quick panel where there is no X server.

#include "QuickPanelMessage.h"

#include <memory>
#include <set>
#include <string>
#include <vector>

#include <Ecore_X.h>
#include <gmock/gmock.h>

#include "AlarmEditViewController.h"
#include "QuickPanel.h"
#include "support/ScreenTest.h"
#include "support/SoundFake.h"

using testing::IsEmpty;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class QuickPanelMessageTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        simulator::prepareQuickPanelMessage();
        stage();
        _panel =
            std::make_unique<simulator::QuickPanel>(stage().window(), THEME, [this](bool shown) {
                simulator::sendQuickPanelMessage(stage().window(), shown);
            });
    }
    void TearDown() override {
        _panel.reset();
        takeStageDown();
        for (const std::string& line : takeErrors())
            EXPECT_THAT(line,
                        testing::AnyOf("Alarm Name is NULL !!", "Focus is not set for entry !!"));
        ScreenTest::TearDown();
    }
    void toggle() {
        _panel->toggle();
        Stage::advance(0.5);
    }

private:
    std::unique_ptr<simulator::QuickPanel> _panel;
};

} // namespace

TEST_F(QuickPanelMessageTest, itsNumbersDifferAndStay) {
    const std::set<Ecore_X_Atom> atoms{ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE,
                                       ECORE_X_ATOM_E_ILLUME_QUICKPANEL_ON,
                                       ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF};
    EXPECT_EQ(atoms.size(), 3U);
    EXPECT_FALSE(atoms.contains(0));
    const int type = ECORE_X_EVENT_CLIENT_MESSAGE;
    EXPECT_NE(type, 0);
    simulator::prepareQuickPanelMessage();
    EXPECT_EQ(ECORE_X_EVENT_CLIENT_MESSAGE, type);
}

TEST_F(QuickPanelMessageTest, theEditorLeavesTheVolumeKeysToThePanelAndTakesThemBack) {
    ClockAlarmDbData alarm{};
    alarm.hour = 6;
    alarm.volume = 5;
    stage().push(new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, false));
    ASSERT_THAT(soundDevice().grabbedKeys(), testing::SizeIs(2));
    toggle();
    EXPECT_THAT(soundDevice().grabbedKeys(), IsEmpty());
    toggle();
    EXPECT_THAT(soundDevice().grabbedKeys(), testing::SizeIs(2));
}
