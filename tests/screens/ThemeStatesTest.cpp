// What can be touched looks otherwise while it is pressed, disabled or reached by keys, and every
// text stands out from its ground.

#include <cmath>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

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
        widget = GetParam().make(stage().window());
        evas_object_geometry_set(widget, 120, 156, 120, 48);
        evas_object_show(widget);
        stage().settle();
    }
    /** Number of pixels around the widget that differ clearly. */
    int unlike(const std::vector<unsigned>& before) {
        const auto now = look();
        int count = 0;
        for (std::size_t i = 0; i < now.size(); ++i) {
            for (const unsigned shift : {0U, 8U, 16U}) {
                if (std::abs(static_cast<int>(now[i] >> shift & 0xFF) -
                             static_cast<int>(before[i] >> shift & 0xFF)) >= 12) {
                    ++count;
                    break;
                }
            }
        }
        return count;
    }
    std::vector<unsigned> look() {
        stage().settle();
        return stage().pixels(110, 150, 140, 60);
    }

    Evas_Object* widget = nullptr;
};

TEST_P(ThemeStatesTest, APressShows) {
    const auto before = look();
    stage().press(GetParam().touch.x, GetParam().touch.y);
    EXPECT_GT(unlike(before), 60);
    stage().release();
}

TEST_P(ThemeStatesTest, ADisabledOneIsPaler) {
    const auto before = look();
    elm_object_disabled_set(widget, EINA_TRUE);
    EXPECT_GT(unlike(before), 40);
    const auto disabled = look();
    stage().press(GetParam().touch.x, GetParam().touch.y);
    EXPECT_EQ(unlike(disabled), 0) << "it answers a touch";
    stage().release();
    elm_object_disabled_set(widget, EINA_FALSE);
    EXPECT_EQ(unlike(before), 0);
}

TEST_P(ThemeStatesTest, TheKeysAreSeen) {
    const auto before = look();
    elm_object_signal_emit(widget, "elm,action,focus_highlight,show", "elm");
    EXPECT_GT(unlike(before), 40);
    elm_object_signal_emit(widget, "elm,action,focus_highlight,hide", "elm");
    EXPECT_EQ(unlike(before), 0);
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

class ThemeButtonTest : public ThemeStatesTest {};

TEST_P(ThemeButtonTest, IsAsBeforeOnceItIsReleased) {
    const auto before = look();
    stage().tap(GetParam().touch);
    EXPECT_EQ(unlike(before), 0);
}

INSTANTIATE_TEST_SUITE_P(Buttons, ThemeButtonTest, testing::ValuesIn(buttons()), nameOf);

struct Contrast {
    const char* text;
    const char* ground;
    double least;
};

/** Texts need more than large digits, icons and knobs. */
constexpr double BODY = 4.5;
constexpr double LARGE = 3;

class ThemeContrastTest : public ScreenTest {
protected:
    double luminance(const char* colour) {
        int channels[3] = {};
        Evas_Object* const edje = edje_object_add(stage().canvas());
        edje_object_file_set(edje, CLOCK_RESOURCE_DIR "/edje/device.edj",
                             "elm/button/base/default");
        EXPECT_TRUE(edje_object_color_class_get(edje, colour, &channels[0], &channels[1],
                                                &channels[2], nullptr, nullptr, nullptr, nullptr,
                                                nullptr, nullptr, nullptr, nullptr, nullptr))
            << colour;
        evas_object_del(edje);
        const auto linear = [](int channel) {
            const double value = channel / 255.0;
            return value <= 0.03928 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * linear(channels[0]) + 0.7152 * linear(channels[1]) +
               0.0722 * linear(channels[2]);
    }
    double contrast(const char* one, const char* other) {
        const double a = luminance(one) + 0.05;
        const double b = luminance(other) + 0.05;
        return std::max(a, b) / std::min(a, b);
    }
};

TEST_F(ThemeContrastTest, EveryTextStandsOut) {
    const Contrast pairs[] = {
        {"text", "ground", BODY},
        {"text.second", "ground", BODY},
        {"text.faint", "ground", BODY},
        {"text", "surface", BODY},
        {"text", "surface.pressed", BODY},
        {"text.faint", "surface", LARGE},
        {"accent", "ground", BODY},
        {"accent", "surface", BODY},
        {"accent", "surface.pressed", BODY},
        {"on.accent", "accent", BODY},
        {"on.accent", "accent.pressed", BODY},
        {"warning", "ground", BODY},
        {"warning", "surface", BODY},
        {"T1067", "ground", BODY},
        {"text", "B0211", BODY},
        {"text.faint", "B0211", LARGE},
        {"text.second", "line", LARGE},
        {"accent", "line", LARGE},
    };
    for (const Contrast& pair : pairs)
        EXPECT_GE(contrast(pair.text, pair.ground), pair.least)
            << pair.text << " on " << pair.ground;
}

TEST_F(ThemeContrastTest, AnEqualColourHasNone) {
    EXPECT_DOUBLE_EQ(contrast("accent", "accent"), 1);
    EXPECT_NEAR(contrast("text", "ground"), 21, 0.01);
}

} // namespace
