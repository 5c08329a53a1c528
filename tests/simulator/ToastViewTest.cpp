// Toasts on the face.

#include "ToastView.h"

#include <string>

#include "support/ScreenTest.h"

using simulator::ToastView;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class ToastViewTest : public ScreenTest {
protected:
    bool shows(const std::string& text) { return stage().shows(text); }
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

TEST_F(ToastViewTest, theSameTextAgainDoesNotWait) {
    ToastView toasts(stage().window(), THEME);
    for (int times = 0; times < 5; ++times)
        toasts.post("First");
    toasts.post("Second");
    toasts.post("Second");
    Stage::advance(4);
    EXPECT_TRUE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Second"));
    toasts.post("Second");
    Stage::advance(1);
    EXPECT_TRUE(shows("Second")) << "a toast that has gone may come again";
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
