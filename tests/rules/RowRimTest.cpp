#include <algorithm>
#include <cmath>
#include <vector>

#include <gtest/gtest.h>

#include "../host/widgets/RowRim.h"

using host::rimAnchor;
using host::RimBox;
using host::RimEdges;
using host::rimLook;
using host::rimScale;

namespace {

constexpr double RADIUS = 178;
/** A list below a title of 84 pixels on a face of 360. */
constexpr RimEdges BELOW_TITLE{-96, 180, RADIUS};

/** How far the farthest corner of a box lies from the middle once it is drawn. */
double reachOf(const RimBox& box, const host::RimLook& look) {
    const auto drawn = [&](double y) {
        return look.anchor + look.scale * (y - look.anchor);
    };
    const double height = std::max(std::abs(drawn(box.top)), std::abs(drawn(box.bottom)));
    return std::hypot(look.scale * box.reach, height);
}

} // namespace

TEST(RowRim, ARowShrinksTowardItsInnerEdge) {
    EXPECT_EQ(rimAnchor(40, 128), 40);
    EXPECT_EQ(rimAnchor(-128, -40), -40);
    EXPECT_EQ(rimAnchor(-44, 44), 0);
    EXPECT_EQ(rimAnchor(0, 88), 0);
}

TEST(RowRim, ScalesOfOneBox) {
    struct Case {
        const char* what;
        RimBox box;
        double anchor;
        double scale;
    };
    const std::vector<Case> cases = {
        {"in the middle", {135, -32, 32}, 0, 1},
        {"just inside", {135, 40, 116}, 40, 1},
        {"through the middle line of the rim", {356, 0, 0}, 0, 0.5},
        {"a point on the way down", {0, 89, 267}, 89, 0.5},
        {"beyond the rim", {10, 190, 200}, 180, 0},
        {"an empty box at its anchor", {0, 50, 50}, 50, 1},
    };
    for (const Case& c : cases)
        EXPECT_NEAR(rimScale(c.box, c.anchor, {-180, 180, RADIUS}), c.scale, 0.001) << c.what;
}

TEST(RowRim, EveryRowEndsUpInsideTheCircle) {
    for (int top = -300; top <= 300; ++top) {
        const RimBox text{135, top + 13.0, top + 77.0};
        const auto look = rimLook(top, top + 88, {text}, {-180, 180, RADIUS});
        if (look.opacity > 0) {
            EXPECT_LE(reachOf(text, look), RADIUS + 1e-6) << top;
        }
    }
}

TEST(RowRim, ARowGetsSmallerAndFainterOnItsWayOut) {
    host::RimLook before{0, 1, 1};
    for (int top = 0; top <= 200; ++top) {
        const auto look = rimLook(top, top + 88, {{135, top + 13.0, top + 77.0}}, BELOW_TITLE);
        EXPECT_LE(look.scale, before.scale + 1e-9) << top;
        EXPECT_LE(look.opacity, before.opacity + 1e-9) << top;
        EXPECT_LT(before.scale - look.scale, 0.03) << "jumps at " << top;
        before = look;
    }
    EXPECT_EQ(before.opacity, 0);
}

TEST(RowRim, WhatATitleCoversAsksForNoRoom) {
    // A row that is half below the title is as large as in the middle: the circle is wide there.
    EXPECT_EQ(rimLook(-150, -62, {{135, -137, -73}}, BELOW_TITLE).scale, 1);
    // Without a title it would be cut.
    EXPECT_LT(rimLook(-150, -62, {{135, -137, -73}}, {-180, 180, RADIUS}).scale, 1);
    // The lower edge of the list is the rim itself.
    EXPECT_LT(rimLook(120, 208, {{135, 133, 197}}, BELOW_TITLE).scale, 0.8);
}

TEST(RowRim, ARowWithNothingInItStaysAsItIs) {
    EXPECT_EQ(rimLook(100, 188, {}, BELOW_TITLE), (host::RimLook{100, 1, 1}));
}
