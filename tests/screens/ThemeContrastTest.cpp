// Every text stands out from its ground.

#include <algorithm>
#include <cmath>

#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

struct Contrast {
    const char* text;
    const char* ground;
    double least;
};

/** Texts need more than large digits, icons and knobs. */
constexpr double BODY = 4.5;
constexpr double LARGE = 3;
/** What cannot be used now can still be read. */
constexpr double DISABLED = 3.5;

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
        {"text.second", "surface", BODY},
        {"text.second", "surface.pressed", BODY},
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

TEST_F(ThemeContrastTest, ADisabledTextCanBeReadAndIsClearlyPaler) {
    for (const char* ground : {"ground", "surface.disabled"}) {
        const double disabled = contrast("text.disabled", ground);
        EXPECT_GE(disabled, DISABLED) << ground;
        for (const char* text : {"text", "text.second"})
            EXPECT_GE(contrast(text, ground), 2 * disabled) << text << " on " << ground;
    }
}

TEST_F(ThemeContrastTest, AnEqualColourHasNone) {
    EXPECT_DOUBLE_EQ(contrast("accent", "accent"), 1);
    EXPECT_NEAR(contrast("text", "ground"), 21, 0.01);
}

} // namespace
