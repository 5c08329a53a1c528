// The tone picker without a finger. Its page is filled as its program does it.

#include <memory>

#include <gtest/gtest.h>

#include "TonePage.h"
#include "support/FocusWalk.h"
#include "support/ScreenTest.h"

namespace {

using Names = std::vector<std::string>;

class FocusToneTest : public ScreenTest, public testing::WithParamInterface<Hand> {
protected:
    void TearDown() override {
        // The window goes before the page.
        takeStageDown();
        _page.reset();
        ScreenTest::TearDown();
    }
    FocusWalk walk() { return {stage(), GetParam()}; }
    void open(int marked) {
        std::vector<tone_picker::Tone> tones;
        for (const char* title : {"Bells", "Crickets", "Morning", "Ocean", "Rain", "Zephyr"})
            tones.push_back({std::string(title) + ".wav", title});
        _page = std::make_unique<tone_picker::TonePage>(
            tones, marked,
            tone_picker::TonePage::Actions{.marked = [this](int position) { heard = position; },
                                           .done = [this](int position) { chosen = position; },
                                           .cancelled =
                                               [this] {
                                                   ++cancels;
                                               }});
        _page->show(stage().window());
        stage().settle();
    }

    int heard = -1;
    int chosen = -1;
    int cancels = 0;

private:
    std::unique_ptr<tone_picker::TonePage> _page;
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
