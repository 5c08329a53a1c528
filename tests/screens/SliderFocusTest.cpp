// What the device adds to the toolkit's sliders.

#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "support/ScreenTest.h"

using testing::ElementsAre;

namespace {

class SliderFocusTest : public ScreenTest {
protected:
    Evas_Object* place(Evas_Object* widget, int y) {
        evas_object_geometry_set(widget, 60, y, 240, 50);
        evas_object_show(widget);
        stage().settle();
        return widget;
    }
    Evas_Object* addSlider() {
        Evas_Object* slider = elm_slider_add(stage().window());
        for (const char* name : {"focused", "unfocused"})
            evas_object_smart_callback_add(
                slider, name,
                [](void* data, Evas_Object* object, void* info) {
                    EXPECT_EQ(info, nullptr);
                    static_cast<SliderFocusTest*>(data)->_heard.emplace_back(
                        elm_object_focus_get(object) ? "focused" : "unfocused");
                },
                this);
        return place(slider, 100);
    }
    void focus(Evas_Object* widget) {
        elm_object_focus_set(widget, EINA_TRUE);
        stage().settle();
    }
    std::vector<std::string> heard() { return std::exchange(_heard, {}); }

private:
    std::vector<std::string> _heard;
};

TEST_F(SliderFocusTest, ASliderTellsThatItGotAndLostTheFocus) {
    Evas_Object* slider = addSlider();
    Evas_Object* other = place(elm_button_add(stage().window()), 200);
    heard();
    for (int i = 0; i < 2; ++i) {
        focus(slider);
        EXPECT_THAT(heard(), ElementsAre("focused"));
        focus(other);
        EXPECT_THAT(heard(), ElementsAre("unfocused"));
    }
}

TEST_F(SliderFocusTest, ASliderThatDiesLosesTheFocusOnce) {
    Evas_Object* slider = addSlider();
    place(elm_button_add(stage().window()), 200);
    focus(slider);
    heard();
    evas_object_del(slider);
    stage().settle();
    EXPECT_THAT(heard(), ElementsAre("unfocused"));
}

TEST_F(SliderFocusTest, WithoutAParentThereIsNoSlider) {
    EXPECT_EQ(elm_slider_add(nullptr), nullptr);
    expectLog("elm_slider_add: no parent");
}

} // namespace
