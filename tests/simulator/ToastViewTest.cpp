// Toasts on the face, and the keys that stand for a device's events.

#include "ToastView.h"

#include <string>
#include <vector>

#include "Keys.h"
#include "clock/ClockEventListener.h"
#include "support/ScreenTest.h"

using simulator::ToastView;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class ToastViewTest : public ScreenTest {
protected:
    bool shows(const std::string& text) { return stage().shows(text); }
};

class EventRecorder : public ClockEventListener {
public:
    void onEvent(EventType type) override { events.push_back(type); }
    std::vector<EventType> events;
};

} // namespace

TEST_F(ToastViewTest, aToastShowsAndGoesAgain) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("Tea & <b>biscuits</b>");
    Stage::advance(1);
    EXPECT_TRUE(shows("Tea & <b>biscuits</b>"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Tea & <b>biscuits</b>"));
}

TEST_F(ToastViewTest, aSecondToastWaitsForTheFirst) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("First");
    toasts.post("Second");
    Stage::advance(1);
    EXPECT_TRUE(shows("First"));
    EXPECT_FALSE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("First"));
    EXPECT_TRUE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Second"));
}

TEST_F(ToastViewTest, aLongToastStaysInsideTheCircle) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("An alarm is already set for 10:45 PM. Existing alarm updated.");
    Stage::advance(1);
    bool found = false;
    for (const FoundText& text : stage().texts()) {
        found = true;
        EXPECT_TRUE(text.area.insideCircle()) << text.area.x << " " << text.area.y << " "
                                              << text.area.width << " " << text.area.height;
    }
    EXPECT_TRUE(found);
}

TEST_F(ToastViewTest, aToastLetsInputThrough) {
    ToastView toasts(stage().window(), THEME);
    Evas_Object* button = elm_button_add(stage().window());
    evas_object_resize(button, Stage::SIZE, Stage::SIZE);
    evas_object_show(button);
    int clicks = 0;
    evas_object_smart_callback_add(
        button, "clicked", [](void* count, Evas_Object*, void*) { ++*static_cast<int*>(count); },
        &clicks);
    toasts.post("Above the button");
    Stage::advance(1);
    stage().tap(180, 280);
    EXPECT_EQ(clicks, 1);
    evas_object_del(button);
}

TEST_F(ToastViewTest, aViewThatGoesWithAToastLeavesNothingBehind) {
    {
        ToastView toasts(stage().window(), THEME);
        toasts.post("First");
        toasts.post("Second");
    }
    Stage::advance(5);
    EXPECT_FALSE(shows("Second"));
}

TEST_F(ToastViewTest, aThemeWithoutAToastIsLogged) {
    const ToastView toasts(stage().window(), "/nowhere.edj");
    expectLog("'/nowhere.edj' has no toast");
}

TEST_F(ToastViewTest, functionKeysRaiseTheApplicationsEvents) {
    stage();
    EventRecorder recorder;
    {
        const simulator::Keys keys;
        for (const char* key : {"F5", "F6", "F7", "F8", "F9", "F10", "a"})
            stage().key(key);
    }
    stage().key("F5");
    EXPECT_EQ(recorder.events,
              (std::vector{ClockEventListener::PAUSED, ClockEventListener::RESUMED,
                           ClockEventListener::LANGUAGE_CHANGED, ClockEventListener::TIME_CHANGED,
                           ClockEventListener::SETTINGS_CHANGED}));
}
