// What the display shows while nobody looks at any application.

#include <cstdlib>
#include <string>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <Elementary.h>
#include <gmock/gmock.h>

#include "EventRecorder.h"
#include "Foreground.h"
#include "Keys.h"
#include "WatchFace.h"
#include "control/DeviceActions.h"
#include "device/eext.h"
#include "device_remote.h"
#include "device_settings.h"
#include "support/ScreenTest.h"
#include "support/ToolkitErrors.h"

using testing::ElementsAre;

namespace {

class HomeScreenTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        _button = elm_button_add(stage().window());
        elm_object_text_set(_button, "Application");
        evas_object_resize(_button, Stage::SIZE, Stage::SIZE);
        evas_object_show(_button);
        evas_object_smart_callback_add(
            _button, "clicked",
            [](void* count, Evas_Object*, void*) { ++*static_cast<int*>(count); }, &clicks);
        evas_object_event_callback_add(
            _button, EVAS_CALLBACK_MOUSE_WHEEL,
            [](void* count, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(count); }, &turns);
        eext_object_event_callback_add(
            _button, EEXT_EVENT_BACK,
            [](void* count, Evas_Object*, void*) { ++*static_cast<int*>(count); }, &backs);
        Stage::advance(0.3);
    }
    void TearDown() override {
        simulator::comeToForeground();
        ScreenTest::TearDown();
    }
    void use() {
        stage().tap(180, 180);
        stage().backKey();
        stage().bezel(1);
    }
    unsigned brightest() {
        unsigned most = 0;
        for (const unsigned pixel : stage().pixels(60, 120, 240, 120))
            most = std::max(most, pixel & 0xFFU);
        return most;
    }

    int clicks = 0;
    int turns = 0;
    int backs = 0;

private:
    Evas_Object* _button = nullptr;
};

} // namespace

TEST_F(HomeScreenTest, itShowsTheTimeAndTheApplicationGetsNothing) {
    simulator::goToBackground();
    Stage::frames(2);
    EXPECT_TRUE(stage().shows("09:41"));
    EXPECT_EQ(stage().pixel(20, 180) & 0xFFFFFFU, 0U) << "the application shines through";
    EXPECT_GT(brightest(), 200U) << "the time is not drawn";
    use();
    EXPECT_EQ(clicks, 0);
    EXPECT_EQ(turns, 0);
    EXPECT_EQ(backs, 0);
}

TEST_F(HomeScreenTest, theApplicationComesBackAsItWas) {
    const ToolkitErrors errors;
    simulator::goToBackground();
    Stage::frames(2);
    simulator::comeToForeground();
    Stage::advance(1);
    EXPECT_EQ(errors.count(), 0) << "the time goes on";
    EXPECT_FALSE(stage().shows("09:41"));
    use();
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(turns, 1);
    EXPECT_EQ(backs, 1);
}

TEST_F(HomeScreenTest, theTimeStandsInTheMiddleBelowToasts) {
    simulator::goToBackground();
    Stage::frames(2);
    const auto time = stage().findText("09:41");
    ASSERT_TRUE(time);
    EXPECT_NEAR(time->area.middle().x, Stage::SIZE / 2.0, 1);
    EXPECT_NEAR(time->area.middle().y, Stage::SIZE / 2.0, 1);
    Evas_Object* toast = evas_object_rectangle_add(stage().canvas());
    evas_object_color_set(toast, 255, 0, 0, 255);
    evas_object_resize(toast, Stage::SIZE, Stage::SIZE);
    evas_object_layer_set(toast, simulator::LAYER_TOAST);
    evas_object_show(toast);
    Stage::frames(2);
    EXPECT_EQ(stage().pixel(180, 100) & 0xFFFFFFU, 0xFF0000U);
    evas_object_del(toast);
}

TEST_F(HomeScreenTest, keysAndTurnsOfOtherWindowsAndFunctionKeysPass) {
    simulator::goToBackground();
    Stage::frames(2);
    std::vector<std::string> passed;
    Ecore_Event_Handler* keys = ecore_event_handler_add(
        ECORE_EVENT_KEY_DOWN,
        [](void* all, int, void* info) -> Eina_Bool {
            static_cast<std::vector<std::string>*>(all)->emplace_back(
                static_cast<Ecore_Event_Key*>(info)->keyname);
            return ECORE_CALLBACK_PASS_ON;
        },
        &passed);
    Ecore_Event_Handler* wheel = ecore_event_handler_add(
        ECORE_EVENT_MOUSE_WHEEL,
        [](void* all, int, void*) -> Eina_Bool {
            static_cast<std::vector<std::string>*>(all)->emplace_back("wheel");
            return ECORE_CALLBACK_PASS_ON;
        },
        &passed);
    const Ecore_Window own = ecore_evas_window_get(ecore_evas_ecore_evas_get(stage().canvas()));
    const auto press = [](const char* name, Ecore_Window window) {
        auto* event = static_cast<Ecore_Event_Key*>(calloc(1, sizeof(Ecore_Event_Key)));
        event->keyname = event->key = name;
        event->window = event->event_window = window;
        ecore_event_add(ECORE_EVENT_KEY_DOWN, event, nullptr, nullptr);
    };
    press("F", own);
    press("F9", own);
    press("Return", own);
    press("F", own + 77);
    for (const Ecore_Window window : {own, own + 77}) {
        auto* event =
            static_cast<Ecore_Event_Mouse_Wheel*>(calloc(1, sizeof(Ecore_Event_Mouse_Wheel)));
        event->window = event->event_window = window;
        ecore_event_add(ECORE_EVENT_MOUSE_WHEEL, event, nullptr, nullptr);
    }
    Stage::frames(2);
    ecore_event_handler_del(keys);
    ecore_event_handler_del(wheel);
    EXPECT_THAT(passed, ElementsAre("F9", "F", "wheel"));
}

TEST_F(HomeScreenTest, theTimeGoesOnInTheDevicesForm) {
    simulator::goToBackground();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 21:59:00");
    Stage::advance(0.6);
    EXPECT_TRUE(stage().shows("21:59"));
    device().setSetting(DEVICE_SETTING_TIME_FORM, 1);
    Stage::advance(0.6);
    EXPECT_TRUE(stage().shows("9:59"));
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 00:05:00");
    Stage::advance(0.6);
    EXPECT_TRUE(stage().shows("12:05"));
}

TEST_F(HomeScreenTest, aDesktopsKeyBringsTheApplicationBack) {
    const simulator::Keys keys([] {});
    EventRecorder recorder;
    stage().key("F5");
    Stage::frames(2);
    EXPECT_TRUE(stage().shows("09:41"));
    stage().key("F6");
    Stage::frames(2);
    EXPECT_FALSE(stage().shows("09:41"));
    EXPECT_THAT(recorder.events,
                ElementsAre(ClockEventListener::PAUSED, ClockEventListener::RESUMED));
}

TEST_F(HomeScreenTest, aKeyThatWasHeldBeforeIsReleased) {
    stage().keyDown("XF86Back");
    simulator::goToBackground();
    stage().keyUp("XF86Back");
    EXPECT_EQ(backs, 1);
}

TEST_F(HomeScreenTest, goingTwiceIsGoingOnce) {
    simulator::Foreground foreground(stage().window());
    simulator::setForeground(&foreground);
    EventRecorder recorder;
    simulator::goToBackground();
    simulator::goToBackground();
    EXPECT_FALSE(simulator::isInForeground());
    simulator::comeToForeground();
    simulator::comeToForeground();
    EXPECT_TRUE(simulator::isInForeground());
    EXPECT_THAT(recorder.events,
                ElementsAre(ClockEventListener::PAUSED, ClockEventListener::RESUMED));
    simulator::setForeground(nullptr);
}

TEST_F(HomeScreenTest, whoCallsTheApplicationBackLooksAtIt) {
    simulator::Foreground foreground(stage().window());
    simulator::setForeground(&foreground);
    EventRecorder recorder;
    ecore_evas_focus_set(ecore_evas_ecore_evas_get(stage().canvas()), EINA_FALSE);
    Stage::frames(2);
    EXPECT_THAT(recorder.events, ElementsAre(ClockEventListener::PAUSED));
    simulator::comeToForeground();
    EXPECT_TRUE(simulator::isInForeground());
    simulator::setForeground(nullptr);
}

TEST_F(HomeScreenTest, itGoesWithItsWindow) {
    simulator::goToBackground();
    const ToolkitErrors errors;
    takeStageDown();
    Stage::advance(1);
    EXPECT_EQ(errors.count(), 0);
    EXPECT_TRUE(stage().texts().empty());
    simulator::goToBackground();
    Stage::frames(2);
    EXPECT_TRUE(stage().shows("09:41")) << "a new window can be covered";
}

TEST_F(HomeScreenTest, nonsenseIsRefused) {
    const char* words[] = {"home", "perhaps"};
    EXPECT_EQ(device_remote_send_to_all(words, 2), 0);
    Stage::frames(2);
    EXPECT_FALSE(stage().shows("09:41"));
}
