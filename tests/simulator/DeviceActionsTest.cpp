// What panels and scripts do to the device besides its settings.

#include "control/DeviceActions.h"

#include <string>
#include <vector>

#include <Ecore_Input.h>
#include <Elementary.h>
#include <gmock/gmock.h>

#include "QuickPanel.h"
#include "support/ScreenTest.h"

using simulator::QuickPanel;
using testing::ElementsAre;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class DeviceActionsTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        _shape = evas_object_rectangle_add(stage().canvas());
        evas_object_resize(_shape, Stage::SIZE, Stage::SIZE);
        evas_object_show(_shape);
        _filter = ecore_event_filter_add(
            nullptr,
            [](void* self, void*, int type, void* info) -> Eina_Bool {
                if (type == ECORE_EVENT_MOUSE_BUTTON_DOWN)
                    static_cast<DeviceActionsTest*>(self)->buttons.push_back(
                        static_cast<Ecore_Event_Mouse_Button*>(info)->buttons);
                return EINA_TRUE;
            },
            nullptr, this);
        evas_object_event_callback_add(
            _shape, EVAS_CALLBACK_MOUSE_WHEEL,
            [](void* self, Evas*, Evas_Object*, void* info) {
                static_cast<DeviceActionsTest*>(self)->turns.push_back(
                    static_cast<Evas_Event_Mouse_Wheel*>(info)->z);
            },
            this);
        Stage::advance(0.2);
    }
    void TearDown() override {
        ecore_event_filter_del(_filter);
        evas_object_del(_shape);
        ScreenTest::TearDown();
    }

    std::vector<unsigned> buttons;
    std::vector<int> turns;

private:
    Evas_Object* _shape = nullptr;
    Ecore_Event_Filter* _filter = nullptr;
};

} // namespace

TEST_F(DeviceActionsTest, theBezelIsPressedAndTurned) {
    simulator::pressBezel();
    simulator::turnBezel(1);
    simulator::turnBezel(-1);
    Stage::frames(3);
    EXPECT_THAT(buttons, ElementsAre(2U)) << "a finger is button 1";
    EXPECT_THAT(turns, ElementsAre(1, -1));
}

TEST_F(DeviceActionsTest, theQuickPanelIsOpenedOnceAndClosedOnce) {
    std::vector<bool> told;
    QuickPanel panel(stage().window(), THEME, [&told](bool shown) { told.push_back(shown); });
    simulator::openQuickPanel();
    simulator::setQuickPanel(&panel);
    simulator::closeQuickPanel();
    EXPECT_TRUE(told.empty()) << "there was none, or it was closed";
    simulator::openQuickPanel();
    simulator::openQuickPanel();
    simulator::closeQuickPanel();
    simulator::closeQuickPanel();
    simulator::setQuickPanel(nullptr);
    EXPECT_THAT(told, ElementsAre(true, false));
}
