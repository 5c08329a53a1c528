// The tone picker without a finger.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "screens/ToneFixture.h"
#include "support/FocusWalk.h"

namespace {

using Names = std::vector<std::string>;

class FocusToneTest : public ToneFixture, public testing::WithParamInterface<Hand> {
protected:
    FocusWalk walk() { return {stage(), GetParam()}; }
    void open(int marked) {
        openTones({"Bells", "Crickets", "Morning", "Ocean", "Rain", "Zephyr"}, marked);
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusToneTest, testing::Values(Hand::Keys, Hand::Bezel),
                         [](const auto& info) { return nameOf(info.param); });

TEST_P(FocusToneTest, EveryToneAndBothButtonsAreReached) {
    open(0);
    EXPECT_EQ(walk().everything(),
              (Names{"Cancel", "Done", "Bells", "Crickets", "Morning", "Ocean", "Rain", "Zephyr"}));
}

TEST_P(FocusToneTest, AnotherToneIsHeardAndChosen) {
    open(0);
    ASSERT_TRUE(walk().goTo("Rain"));
    walk().press();
    EXPECT_EQ(heard, 4);
    stage().screenshot("focus-tone-" + nameOf(GetParam()));
    ASSERT_TRUE(walk().goTo("Done", -1));
    walk().press();
    EXPECT_EQ(chosen, 4);
    EXPECT_EQ(cancels, 0);
}

TEST_P(FocusToneTest, WithoutAMarkDoneIsPassedByUntilThereIsOne) {
    open(-1);
    EXPECT_EQ(walk().everything().at(1), "Bells");
    ASSERT_TRUE(walk().goTo("Ocean"));
    walk().press();
    ASSERT_TRUE(walk().goTo("Done", -1));
    walk().press();
    EXPECT_EQ(chosen, 3);
}

TEST_P(FocusToneTest, CancelIsPressed) {
    open(2);
    ASSERT_TRUE(walk().goTo("Cancel", -1));
    walk().press();
    EXPECT_EQ(cancels, 1);
    EXPECT_EQ(chosen, -1);
}

} // namespace
