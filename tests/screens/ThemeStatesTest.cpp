// What can be touched looks otherwise while it is pressed, disabled or reached by keys: each
// control by itself. Rows, wheels, calendars, fields and the index have tests of their own.

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "support/Look.h"
#include "support/ScreenTest.h"

namespace {

/** A kind of widget in the middle of the face. */
struct Kind {
    const char* name;
    std::function<Evas_Object*(Evas_Object* window)> make;
    Spot touch = {180, 180};
};

Kind button(const char* style) {
    return {style, [style](Evas_Object* window) {
                Evas_Object* const made = elm_button_add(window);
                elm_object_style_set(made, style);
                elm_object_text_set(made, "Text");
                return made;
            }};
}

std::vector<Kind> buttons() {
    std::vector<Kind> all;
    for (const char* style :
         {"default", "naviframe/title_left", "naviframe/title_right", "naviframe/back_btn/default",
          "on_gradient_bg", "popup", "calendar/decrease/default", "calendar/increase/default",
          "bg_animated", "editfield/clear"})
        all.push_back(button(style));
    // Without a text it has an arrow.
    all.push_back({"way back", [](Evas_Object* window) {
                       Evas_Object* const made = elm_button_add(window);
                       elm_object_style_set(made, "naviframe/back_btn/default");
                       return made;
                   }});
    return all;
}

std::vector<Kind> kinds() {
    std::vector<Kind> all = buttons();
    all.push_back({"switch", [](Evas_Object* window) {
                       Evas_Object* const made = elm_check_add(window);
                       elm_object_style_set(made, "on&off");
                       return made;
                   }});
    // A mark stands at the end of its group.
    all.push_back({"check", elm_check_add, {226, 180}});
    all.push_back({"radio",
                   [](Evas_Object* window) {
                       Evas_Object* const made = elm_radio_add(window);
                       elm_object_style_set(made, "list");
                       return made;
                   },
                   {226, 180}});
    all.push_back({"slider", elm_slider_add, {140, 180}});
    return all;
}

class ThemeStatesTest : public ScreenTest, public testing::WithParamInterface<Kind> {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        Evas_Object* const pages = stage().naviframe().getEvasObj();
        Evas_Object* const page = elm_grid_add(pages);
        elm_grid_size_set(page, Stage::SIZE, Stage::SIZE - TITLE);
        widget = GetParam().make(page);
        elm_grid_pack(page, widget, 120, 156 - TITLE, 120, 48);
        evas_object_show(widget);
        elm_naviframe_item_push(pages, "States", nullptr, nullptr, page, nullptr);
        stage().settle();
    }
    Look look() { return {stage(), {110, 150, 140, 60}}; }

    static constexpr int TITLE = 84;
    Evas_Object* widget = nullptr;
};

TEST_P(ThemeStatesTest, APressShows) {
    const Look before = look();
    stage().press(GetParam().touch.x, GetParam().touch.y);
    EXPECT_GT(look().unlike(before), SEEN);
    stage().release();
}

TEST_P(ThemeStatesTest, ADisabledOneIsPaler) {
    const Look before = look();
    elm_object_disabled_set(widget, EINA_TRUE);
    const Look disabled = look();
    EXPECT_GT(disabled.unlike(before), 40);
    EXPECT_LT(disabled.brightest(), before.brightest());
    stage().press(GetParam().touch.x, GetParam().touch.y);
    EXPECT_EQ(look().unlike(disabled), 0) << "it answers a touch";
    stage().release();
    stage().keySettled("Tab");
    EXPECT_EQ(look().unlike(disabled), 0) << "keys reach it";
    elm_object_disabled_set(widget, EINA_FALSE);
    EXPECT_EQ(look().unlike(before), 0);
}

std::string nameOf(const testing::TestParamInfo<Kind>& kind) {
    std::string name = kind.param.name;
    for (char& letter : name) {
        if (std::isalnum(static_cast<unsigned char>(letter)) == 0)
            letter = '_';
    }
    return name;
}

INSTANTIATE_TEST_SUITE_P(Kinds, ThemeStatesTest, testing::ValuesIn(kinds()), nameOf);

class ThemeKeysTest : public ThemeStatesTest {};

TEST_P(ThemeKeysTest, TheKeysAreSeen) {
    const Look before = look();
    stage().keySettled("Tab");
    const Look focused = look();
    EXPECT_GT(focused.unlike(before), 40);
    // A touch of something else hides the ring.
    stage().tap(180, 20);
    EXPECT_EQ(look().unlike(before), 0);
    stage().bezel(1);
    EXPECT_EQ(look().unlike(focused), 0) << "the bezel leads the focus as well";
}

/** Keys never reach a radio: the row that it is in has the focus. */
std::vector<Kind> reachedByKeys() {
    std::vector<Kind> all = kinds();
    std::erase_if(all, [](const Kind& kind) { return kind.name == std::string("radio"); });
    return all;
}

INSTANTIATE_TEST_SUITE_P(Kinds, ThemeKeysTest, testing::ValuesIn(reachedByKeys()), nameOf);

class ThemeButtonTest : public ThemeStatesTest {};

TEST_P(ThemeButtonTest, IsAsBeforeOnceItIsReleased) {
    const Look before = look();
    stage().tap(GetParam().touch);
    EXPECT_EQ(look().unlike(before), 0);
}

TEST_P(ThemeButtonTest, ANewTextLeavesItDisabled) {
    elm_object_disabled_set(widget, EINA_TRUE);
    const char* const text = elm_object_text_get(widget);
    const std::string word = text ? text : "";
    const Look disabled = look();
    elm_object_text_set(widget, "Other");
    EXPECT_LT(look().brightest(), 200) << "the colour of a text that can be pressed";
    elm_object_text_set(widget, "");
    stage().settle();
    elm_object_text_set(widget, word.c_str());
    EXPECT_EQ(look().unlike(disabled), 0);
}

INSTANTIATE_TEST_SUITE_P(Buttons, ThemeButtonTest, testing::ValuesIn(buttons()), nameOf);

} // namespace
