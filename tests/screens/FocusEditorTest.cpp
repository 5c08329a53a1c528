// The alarm editor without a finger: by keys alone, and by the bezel alone.

#include <cmath>

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/Ring.h"

namespace {

using Names = std::vector<std::string>;

/** Keys or the bezel, whichever a test tries. */
struct Hand {
    const char* name;
    void (*next)(Stage&);
    void (*previous)(Stage&);
    void (*press)(Stage&);
    void (*turnOn)(Stage&);
};

const Hand KEYS{"keys", [](Stage& stage) { stage.keySettled("Tab"); },
                [](Stage& stage) { stage.keySettled("ISO_Left_Tab"); },
                [](Stage& stage) { stage.keySettled("Return"); },
                [](Stage& stage) {
                    stage.keySettled("Down");
                }};
const Hand BEZEL{"bezel", [](Stage& stage) { stage.bezel(1); },
                 [](Stage& stage) { stage.bezel(-1); }, [](Stage& stage) { stage.pressBezel(); },
                 [](Stage& stage) {
                     stage.bezel(1);
                 }};

class FocusEditorTest : public EditorFixture, public testing::WithParamInterface<const Hand*> {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    void next() { GetParam()->next(stage()); }
    void previous() { GetParam()->previous(stage()); }
    void press() { GetParam()->press(stage()); }
    void turnOn() { GetParam()->turnOn(stage()); }
    std::string time() {
        std::tm shown{};
        EXPECT_TRUE(elm_datetime_value_get(picker(), &shown));
        return std::to_string(shown.tm_hour) + ":" + std::to_string(shown.tm_min);
    }
    std::string focused() { return ringedName(stage()); }

    /** Goes on until something of a name has the focus. */
    bool goTo(const std::string& name, int direction = 1) {
        for (int i = 0; i < 25; ++i) {
            if (focused() == name)
                return true;
            direction > 0 ? next() : previous();
        }
        return false;
    }

    /** The names of all that the focus comes by until it stays where it is. */
    Names walk(int direction) {
        Names names;
        Area before;
        for (int i = 0; i < 30; ++i) {
            direction > 0 ? next() : previous();
            const Ringed now = theRinged(stage());
            if (!names.empty() && now.area.x == before.x && now.area.y == before.y &&
                names.back() == now.name)
                break;
            expectVisible(now);
            names.push_back(now.name);
            before = now.area;
        }
        return names;
    }

    /** Its middle is well inside the face and, when it scrolls, near the middle. */
    void expectVisible(const Ringed& thing) {
        const Spot middle = thing.area.middle();
        EXPECT_LE(std::hypot(middle.x - 180, middle.y - 180), 150) << thing.name;
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusEditorTest, testing::Values(&KEYS, &BEZEL),
                         [](const auto& info) { return info.param->name; });

TEST_P(FocusEditorTest, EverythingIsReachedOnceInTheOrderOfReading) {
    createAlarm();
    pick(7, 30);
    ASSERT_TRUE(goTo("Cancel", -1));
    Names names = walk(1);
    names.insert(names.begin(), "Cancel");
    EXPECT_EQ(names, (Names{"Cancel", "Done", "06", "29", "DATE", "Repeat weekly", "Alarm type",
                            "Elm_Slider", "Alarm tone", "Snooze", "Increase volume", "Alarm"}));
    Names back = walk(-1);
    std::reverse(back.begin(), back.end());
    back.push_back("Alarm");
    EXPECT_EQ(back, names);
}

TEST_P(FocusEditorTest, AWholeAlarmIsMade) {
    createAlarm();
    pick(7, 30);
    ASSERT_TRUE(goTo("06")) << "the hours show what comes before 7 at their top";
    press();
    turnOn();
    turnOn();
    EXPECT_EQ(time(), "9:30");
    press();
    next();
    EXPECT_EQ(time(), "9:30") << "after the second press a step leads on";
    ASSERT_TRUE(goTo("Repeat weekly"));
    press();
    ASSERT_TRUE(goTo("Every Tuesday"));
    press();
    stage().backKey();
    stage().settle();
    EXPECT_EQ(focused(), "Repeat weekly") << "a page that comes back shows where its focus was";
    ASSERT_TRUE(goTo("Snooze"));
    press();
    ASSERT_TRUE(goTo("Done", -1));
    press();
    ASSERT_EQ(storedAlarms().size(), 1U);
    const ClockAlarmDbData alarm = storedAlarms().front();
    EXPECT_EQ(alarm.hour, 9);
    EXPECT_EQ(alarm.min, 30);
    EXPECT_NE(alarm.repeatWeekly, 0);
    EXPECT_FALSE(isOpen());
}

TEST_P(FocusEditorTest, TheFocusStaysInAPopupAndReturnsAfterIt) {
    createAlarm();
    ASSERT_TRUE(goTo("Alarm type"));
    press();
    next();
    walk(-1);
    const std::string first = focused();
    Names names = walk(1);
    names.insert(names.begin(), first);
    EXPECT_EQ(names, (Names{"Sound", "Vibration", "Vibration and sound"}));
    press();
    EXPECT_EQ(focused(), "Alarm type");
}

TEST_P(FocusEditorTest, TheBackKeyEndsTurningFirst) {
    createAlarm();
    pick(7, 30);
    ASSERT_TRUE(goTo("06"));
    press();
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(isOpen());
    EXPECT_FALSE(asksToDiscard());
    next();
    EXPECT_EQ(time(), "7:30");
}

TEST_P(FocusEditorTest, ATouchHidesTheRing) {
    createAlarm();
    ASSERT_TRUE(goTo("Done", -1));
    const Area done = theRinged(stage()).area;
    const unsigned ringedEdge = stage().pixel(done.middle().x, done.y + 1);
    stage().tap(180, 20);
    stage().settle();
    EXPECT_TRUE(ringed(stage()).empty());
    EXPECT_NE(stage().pixel(done.middle().x, done.y + 1), ringedEdge) << "a ring is drawn";
}

TEST_P(FocusEditorTest, TheVolumeIsTurned) {
    createAlarm();
    ASSERT_TRUE(goTo("Elm_Slider"));
    stage().screenshot(std::string("focus-slider-") + GetParam()->name);
    press();
    const double before = elm_slider_value_get(stage().widgets("Slider").front());
    stage().bezel(-1);
    EXPECT_EQ(elm_slider_value_get(stage().widgets("Slider").front()), std::round(before) - 1);
    EXPECT_EQ(before, std::round(before)) << "the pointer is over the slider, but is no finger";
    stage().screenshot(std::string("focus-slider-turning-") + GetParam()->name);
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
