// What the display shows while nobody looks at any application.

#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "EventRecorder.h"
#include "Foreground.h"
#include "Keys.h"
#include "control/DeviceActions.h"
#include "device/eext.h"
#include "device_remote.h"
#include "device_settings.h"
#include "support/ScreenTest.h"

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
    simulator::goToBackground();
    Stage::frames(2);
    simulator::comeToForeground();
    Stage::frames(2);
    EXPECT_FALSE(stage().shows("09:41"));
    use();
    EXPECT_EQ(clicks, 1);
    EXPECT_EQ(turns, 1);
    EXPECT_EQ(backs, 1);
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
    takeStageDown();
    Stage::advance(1);
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
