#include <algorithm>
#include <cmath>
#include <set>
#include <string>

#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

const char* const EDITOR_THEME = CLOCK_RESOURCE_DIR "/edje/AlarmEditViewController.edj";

/** A slider as in a row: an icon, and 0 to 15. */
class SliderTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        slider = elm_slider_add(stage().window());
        elm_slider_indicator_show_set(slider, EINA_FALSE);
        elm_slider_min_max_set(slider, 0, 15);
        elm_slider_value_set(slider, 7);
        for (const char* event : {"changed", "slider,drag,start", "slider,drag,stop"}) {
            evas_object_smart_callback_add(slider, event, count, this);
        }
        evas_object_geometry_set(slider, 45, 144, 270, 72);
        evas_object_show(slider);
        setIcon("volume.normal.bg");
        stage().settle();
    }
    void setIcon(const char* group) {
        Evas_Object* image = elm_image_add(slider);
        ASSERT_TRUE(elm_image_file_set(image, EDITOR_THEME, group)) << group;
        evas_object_size_hint_aspect_set(image, EVAS_ASPECT_CONTROL_VERTICAL, 1, 1);
        elm_object_part_content_set(slider, "elm.swallow.icon", image);
    }
    double value() const { return elm_slider_value_get(slider); }
    Area part(const char* name) const {
        const Area widget = Stage::area(slider);
        Area area;
        EXPECT_TRUE(edje_object_part_geometry_get(elm_layout_edje_get(slider), name, &area.x,
                                                  &area.y, &area.width, &area.height))
            << name;
        return {widget.x + area.x, widget.y + area.y, area.width, area.height};
    }
    unsigned colourOf(const char* name) {
        const Spot middle = part(name).middle();
        return stage().pixel(middle.x, middle.y);
    }

    Evas_Object* slider = nullptr;
    int events = 0;

private:
    static void count(void* data, Evas_Object*, void*) { ++static_cast<SliderTest*>(data)->events; }
};

class MirroredSliderTest : public SliderTest {
protected:
    void SetUp() override {
        elm_config_mirrored_set(EINA_TRUE);
        SliderTest::SetUp();
    }
    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        SliderTest::TearDown();
    }
};

TEST_F(SliderTest, ATapOnTheTrackBringsTheKnobBelowTheFinger) {
    const Area track = part("track");
    for (int x = track.x; x < track.x + track.width; x += 9) {
        elm_slider_value_set(slider, x < 200 ? 15 : 0);
        stage().settle();
        events = 0;
        stage().tap(x, 180);
        stage().settle();
        const Area knob = part("knob");
        EXPECT_LE(std::abs(knob.middle().x - x), knob.width / 2) << "at " << x;
        EXPECT_GE(events, 3) << "changed, start and stop at " << x;
    }
}

TEST_F(SliderTest, TheEndsOfTheTrackAreTheFirstAndTheLastLevel) {
    const Area bar = part("elm.swallow.bar");
    stage().tap(bar.x, 180);
    EXPECT_NEAR(value(), 0, 0.1);
    stage().tap(bar.x + bar.width - 1, 180);
    EXPECT_NEAR(value(), 15, 0.1);
}

TEST_F(SliderTest, IsHighEnoughForAFinger) {
    EXPECT_GE(part("elm.swallow.bar").height, 48);
    EXPECT_GE(part("elm.dragable.slider").height, 48);
    stage().tap(280, 180 - 23);
    EXPECT_GT(value(), 11);
    stage().tap(130, 180 + 23);
    EXPECT_LT(value(), 5);
}

TEST_F(SliderTest, TakingHoldOfTheKnobDoesNotMoveIt) {
    const Spot knob = part("knob").middle();
    stage().tap(knob.x - 9, knob.y);
    stage().tap(knob.x + 9, knob.y);
    stage().settle();
    EXPECT_DOUBLE_EQ(value(), 7);
}

TEST_F(SliderTest, TheKnobFollowsTheFinger) {
    const Spot knob = part("knob").middle();
    stage().drag(knob.x, knob.y, 60, 0);
    stage().settle();
    EXPECT_NEAR(part("knob").middle().x, knob.x + 60, 2);
    EXPECT_GE(events, 4);
}

TEST_F(SliderTest, AFingerThatCameDownOnTheTrackLeadsOn) {
    stage().drag(280, 180, -150, 20);
    stage().settle();
    EXPECT_NEAR(part("knob").middle().x, 130, 14);
}

TEST_F(SliderTest, TheLevelReachesFromTheIconToTheKnob) {
    EXPECT_LE(part("elm.swallow.icon").x + 32, part("track").x);
    EXPECT_EQ(part("level").x, part("track").x);
    EXPECT_NEAR(part("level").x + part("level").width, part("knob").middle().x, 1);
    EXPECT_LE(part("track").height, 8);
}

TEST_F(MirroredSliderTest, TheLevelGrowsFromTheRight) {
    const Area icon = part("elm.swallow.icon");
    const Area track = part("track");
    EXPECT_GE(icon.x, track.x + track.width);
    EXPECT_NEAR(part("level").x + part("level").width, track.x + track.width, 1);
    stage().tap(track.x + 2, 180);
    stage().settle();
    EXPECT_GT(value(), 13.5);
    EXPECT_NEAR(part("level").width, track.width, 16);
    stage().tap(track.x + track.width - 3, 180);
    EXPECT_LT(value(), 1.5);
}

TEST_F(MirroredSliderTest, TheKnobFollowsTheFinger) {
    const Spot knob = part("knob").middle();
    stage().drag(knob.x, knob.y, -60, 0);
    stage().settle();
    EXPECT_NEAR(part("knob").middle().x, knob.x - 60, 2);
    EXPECT_GT(value(), 9);
}

TEST_F(SliderTest, ShowsThatItIsPressed) {
    const unsigned before = colourOf("knob");
    const Spot knob = part("knob").middle();
    stage().press(knob.x, knob.y);
    stage().settle();
    EXPECT_NE(colourOf("knob"), before);
    stage().release();
    stage().settle();
    EXPECT_EQ(colourOf("knob"), before);
    stage().press(280, 180);
    stage().settle();
    EXPECT_NE(colourOf("knob"), before);
    stage().release();
    stage().settle();
    EXPECT_EQ(colourOf("knob"), before);
}

TEST_F(SliderTest, ADisabledSliderStaysAndLooksPale) {
    const unsigned before = colourOf("knob");
    elm_object_disabled_set(slider, EINA_TRUE);
    stage().settle();
    EXPECT_NE(colourOf("knob"), before);
    stage().tap(280, 180);
    const Spot knob = part("knob").middle();
    stage().drag(knob.x, knob.y, 60, 0);
    EXPECT_DOUBLE_EQ(value(), 7);
    elm_object_disabled_set(slider, EINA_FALSE);
    stage().settle();
    EXPECT_EQ(colourOf("knob"), before);
    stage().tap(280, 180);
    EXPECT_GT(value(), 11);
}

TEST_F(SliderTest, ATouchGivesItTheFocusThatAnotherWidgetTakes) {
    stage().tap(280, 180);
    EXPECT_TRUE(elm_object_focus_get(slider));
    Evas_Object* other = elm_button_add(stage().window());
    evas_object_geometry_set(other, 130, 20, 100, 60);
    evas_object_show(other);
    stage().settle();
    stage().tap(other);
    EXPECT_FALSE(elm_object_focus_get(slider));
}

TEST_F(SliderTest, EachIconIsASquareOfItsOwn) {
    std::set<std::string> pictures;
    for (const char* group : {"volume.normal.bg", "volume.vibrate.bg", "volume.mute.bg"}) {
        setIcon(group);
        stage().settle();
        const Area icon = part("elm.swallow.icon");
        EXPECT_EQ(icon.width, 32);
        EXPECT_EQ(icon.height, 32);
        std::string picture;
        for (int y = 0; y < icon.height; y += 2) {
            for (int x = 0; x < icon.width; x += 2) {
                picture += (stage().pixel(icon.x + x, icon.y + y) & 0x80U) != 0 ? '#' : ' ';
            }
        }
        EXPECT_GT(std::count(picture.begin(), picture.end(), '#'), 25) << group;
        pictures.insert(picture);
    }
    EXPECT_EQ(pictures.size(), 3U);
}

TEST_F(SliderTest, WithoutAnIconTheTrackStartsFurtherLeft) {
    const int before = part("track").x;
    elm_object_part_content_unset(slider, "elm.swallow.icon");
    stage().settle();
    EXPECT_LT(part("track").x, before - 30);
}

} // namespace
