// The alarm editor without a finger: by keys alone, and by the bezel alone.

#include <cmath>

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/FocusWalk.h"

namespace {

using Names = std::vector<std::string>;

class FocusEditorTest : public EditorFixture, public testing::WithParamInterface<Hand> {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    FocusWalk walk() { return {stage(), GetParam()}; }
    std::string time() {
        std::tm shown{};
        EXPECT_TRUE(elm_datetime_value_get(picker(), &shown));
        return std::to_string(shown.tm_hour) + ":" + std::to_string(shown.tm_min);
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusEditorTest, testing::Values(Hand::Keys, Hand::Bezel),
                         [](const auto& info) { return nameOf(info.param); });

TEST_P(FocusEditorTest, EverythingIsReachedOnceInTheOrderOfReading) {
    createAlarm();
    pick(7, 30);
    EXPECT_EQ(walk().everything(),
              (Names{"Cancel", "Done", "06", "29", "DATE", "Repeat weekly", "Alarm type",
                     "Elm_Slider", "Alarm tone", "Snooze", "Increase volume", "Alarm"}));
}

TEST_P(FocusEditorTest, AWholeAlarmIsMade) {
    createAlarm();
    pick(7, 30);
    ASSERT_TRUE(walk().goTo("06")) << "the hours show what comes before 7 at their top";
    walk().press();
    walk().turn();
    walk().turn();
    EXPECT_EQ(time(), "9:30");
    walk().press();
    walk().next();
    EXPECT_EQ(time(), "9:30") << "after the second press a step leads on";
    ASSERT_TRUE(walk().goTo("Repeat weekly"));
    walk().press();
    ASSERT_TRUE(walk().goTo("Every Tuesday"));
    walk().press();
    stage().backKey();
    stage().settle();
    EXPECT_EQ(walk().focused(), "Repeat weekly")
        << "a page that comes back shows where its focus was";
    ASSERT_TRUE(walk().goTo("Snooze"));
    walk().press();
    ASSERT_TRUE(walk().goTo("Done", -1));
    walk().press();
    ASSERT_EQ(storedAlarms().size(), 1U);
    const ClockAlarmDbData alarm = storedAlarms().front();
    EXPECT_EQ(alarm.hour, 9);
    EXPECT_EQ(alarm.min, 30);
    EXPECT_NE(alarm.repeatWeekly, 0);
    EXPECT_FALSE(isOpen());
}

TEST_P(FocusEditorTest, TheFocusStaysInAPopupAndReturnsAfterIt) {
    createAlarm();
    ASSERT_TRUE(walk().goTo("Alarm type"));
    walk().press();
    walk().next();
    EXPECT_EQ(walk().everything(), (Names{"Sound", "Vibration", "Vibration and sound"}));
    ASSERT_TRUE(walk().goTo("Vibration"));
    walk().press();
    EXPECT_EQ(walk().focused(), "Alarm type");
}

TEST_P(FocusEditorTest, TheBackKeyEndsTurningFirst) {
    createAlarm();
    pick(7, 30);
    ASSERT_TRUE(walk().goTo("06"));
    walk().press();
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(isOpen());
    EXPECT_FALSE(asksToDiscard());
    walk().next();
    EXPECT_EQ(time(), "7:30");
}

TEST_P(FocusEditorTest, ATouchHidesTheRing) {
    createAlarm();
    ASSERT_TRUE(walk().goTo("Done", -1));
    const Area done = theRinged(stage()).area;
    const unsigned ringedEdge = stage().pixel(done.middle().x, done.y + 1);
    stage().tap(180, 20);
    stage().settle();
    EXPECT_TRUE(ringed(stage()).empty());
    EXPECT_NE(stage().pixel(done.middle().x, done.y + 1), ringedEdge) << "a ring is drawn";
}

TEST_P(FocusEditorTest, TheVolumeIsTurned) {
    createAlarm();
    ASSERT_TRUE(walk().goTo("Elm_Slider"));
    stage().screenshot("focus-slider-" + nameOf(GetParam()));
    walk().press();
    const double before = elm_slider_value_get(stage().widgets("Slider").front());
    stage().bezel(-1);
    EXPECT_EQ(elm_slider_value_get(stage().widgets("Slider").front()), std::round(before) - 1);
    EXPECT_EQ(before, std::round(before)) << "the pointer is over the slider, but is no finger";
    stage().screenshot("focus-slider-turning-" + nameOf(GetParam()));
}

TEST_F(EditorFixture, TheNameIsReachedAndTypedWithTheKeyboard) {
    createAlarm();
    for (int i = 0; i < 20 && ringedName(stage()) != "Alarm"; ++i)
        stage().keySettled("Tab");
    stage().type("Gym");
    stage().settle();
    EXPECT_TRUE(stage().shows("Gym"));
    const Area field = Stage::area(nameRow().getNameEntryObj());
    EXPECT_LE(std::abs(field.middle().y - 200), 60) << "scrolled to the middle";
    stage().keySettled("Return");
    EXPECT_FALSE(elm_object_focus_get(nameRow().getNameEntryObj())) << "Done ends typing";
    takeErrors();
}

TEST_F(EditorFixture, ATurnedWheelGoesOnWithTheBezel) {
    createAlarm();
    pick(7, 30);
    stage().tap(elm_object_part_content_get(picker(), "wheel.minute"));
    stage().settle();
    stage().bezel(2);
    std::tm shown{};
    elm_datetime_value_get(picker(), &shown);
    EXPECT_EQ(shown.tm_min, 32);
    takeErrors();
}

} // namespace
