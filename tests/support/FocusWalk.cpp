#include "support/FocusWalk.h"

#include <algorithm>

#include <gtest/gtest.h>

namespace {

constexpr int MOST_STEPS = 40;
/** A thin ring round a small button has more. */
constexpr int FEWEST_PIXELS = 30;

bool isIn(const Area& area, const Spot& spot) {
    return spot.x >= area.x && spot.x < area.x + area.width && spot.y >= area.y &&
           spot.y < area.y + area.height;
}

/** How many pixels the ring changes. */
int pixelsOf(Stage& stage, Evas_Object* ring) {
    const auto with = stage.pixels(0, 0, Stage::SIZE, Stage::SIZE);
    evas_object_hide(ring);
    const auto without = stage.pixels(0, 0, Stage::SIZE, Stage::SIZE);
    evas_object_show(ring);
    int changed = 0;
    for (std::size_t i = 0; i < with.size(); ++i)
        changed += with.at(i) != without.at(i) ? 1 : 0;
    return changed;
}

} // namespace

std::string nameOf(Hand hand) {
    return hand == Hand::Keys ? "Keys" : "Bezel";
}

void FocusWalk::next() {
    _hand == Hand::Keys ? _stage.keySettled("Tab") : _stage.bezel(1);
}

void FocusWalk::previous() {
    _hand == Hand::Keys ? _stage.keySettled("ISO_Left_Tab") : _stage.bezel(-1);
}

void FocusWalk::press() {
    _hand == Hand::Keys ? _stage.keySettled("Return") : _stage.pressBezel();
}

void FocusWalk::turn() {
    _hand == Hand::Keys ? _stage.keySettled("Down") : _stage.bezel(1);
}

bool FocusWalk::goTo(const std::string& name, int direction) {
    for (int step = 0; step < MOST_STEPS; ++step) {
        if (focused() == name)
            return true;
        go(direction);
    }
    ADD_FAILURE() << "the focus does not come to " << name << ", but to " << focused();
    return false;
}

std::vector<std::string> FocusWalk::walk(int direction) {
    std::vector<std::string> names;
    Area before;
    for (int step = 0; step < MOST_STEPS; ++step) {
        go(direction);
        const Ringed now = theRinged(_stage);
        if (!names.empty() && now.area.x == before.x && now.area.y == before.y &&
            names.back() == now.name)
            return names;
        expectVisible(now);
        names.push_back(now.name);
        before = now.area;
    }
    ADD_FAILURE() << "the focus comes to no end";
    return names;
}

std::vector<std::string> FocusWalk::everything() {
    walk(-1);
    const std::string first = focused();
    std::vector<std::string> forth = walk(1);
    // At an end it stays where it is, which is a step of its own there.
    if (forth.empty() || forth.front() != first)
        forth.insert(forth.begin(), first);
    std::vector<std::string> back = walk(-1);
    std::reverse(back.begin(), back.end());
    if (back.empty() || back.back() != forth.back())
        back.push_back(forth.back());
    EXPECT_EQ(back, forth) << "the way back is another one";
    return forth;
}

void FocusWalk::expectVisible(const Ringed& thing) {
    SCOPED_TRACE("focus on " + thing.name);
    ASSERT_NE(thing.ring, nullptr);
    EXPECT_GE(pixelsOf(_stage, thing.ring), FEWEST_PIXELS) << "no ring can be seen";
    const Spot middle = thing.area.middle();
    EXPECT_TRUE((Area{middle.x, middle.y, 1, 1}.insideCircle())) << "it is outside of the face";
    for (const FoundText& text : _stage.texts()) {
        if (text.object == nullptr || !isIn(thing.area, text.area.middle()))
            continue;
        EXPECT_TRUE(text.area.insideCircle()) << "the rim cuts \"" << text.text << "\"";
    }
}
