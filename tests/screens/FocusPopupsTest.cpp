// The pages and popups of the alarm editor without a finger: by keys alone, and by the bezel alone.

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/FocusWalk.h"

namespace {

using Names = std::vector<std::string>;

class FocusPopupsTest : public EditorFixture, public testing::WithParamInterface<Hand> {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    FocusWalk walk() { return {stage(), GetParam()}; }
    void open(const std::string& row) {
        createAlarm();
        ASSERT_TRUE(walk().goTo(row));
        walk().press();
    }
    /** Leaves the editor by Cancel after a change. */
    void askToDiscard() {
        open("Snooze");
        ASSERT_TRUE(walk().goTo("Cancel", -1));
        walk().press();
        ASSERT_TRUE(asksToDiscard());
    }
    void picture(const std::string& name) {
        stage().screenshot("focus-" + name + "-" + nameOf(GetParam()));
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusPopupsTest, testing::Values(Hand::Keys, Hand::Bezel),
                         [](const auto& info) { return nameOf(info.param); });

TEST_P(FocusPopupsTest, EveryDayAndTheArrowOfTheRepeatScreenAreReached) {
    open("Repeat weekly");
    EXPECT_EQ(walk().everything(),
              (Names{"Back", "Every day", "Every Sunday", "Every Monday", "Every Tuesday",
                     "Every Wednesday", "Every Thursday", "Every Friday", "Every Saturday"}));
    picture("repeat");
}

TEST_P(FocusPopupsTest, ADayIsChosenAndTheArrowLeadsBack) {
    open("Repeat weekly");
    ASSERT_TRUE(walk().goTo("Every Saturday"));
    walk().press();
    ASSERT_TRUE(walk().goTo("Every Friday", -1));
    walk().press();
    picture("repeat-days");
    walk().press();
    ASSERT_TRUE(walk().goTo("Back", -1));
    picture("repeat-back");
    walk().press();
    EXPECT_EQ(walk().focused(), "Repeat weekly");
    EXPECT_TRUE(stage().shows("Sat ")) << "Friday was chosen and given up again";
}

TEST_P(FocusPopupsTest, ATypeIsChosen) {
    open("Alarm type");
    EXPECT_EQ(walk().everything(), (Names{"Sound", "Vibration", "Vibration and sound"}));
    ASSERT_TRUE(walk().goTo("Vibration"));
    picture("type");
    walk().press();
    EXPECT_EQ(walk().focused(), "Alarm type");
    EXPECT_TRUE(stage().shows("Vibration"));
}

TEST_P(FocusPopupsTest, TheBackKeyLeavesTheTypeAsItWas) {
    open("Alarm type");
    ASSERT_TRUE(walk().goTo("Vibration"));
    stage().backKey();
    stage().settle();
    EXPECT_EQ(walk().focused(), "Alarm type");
    EXPECT_TRUE(stage().shows("Sound"));
}

TEST_P(FocusPopupsTest, ChangesAreKept) {
    askToDiscard();
    EXPECT_EQ(walk().everything(), (Names{"Cancel", "Discard"}));
    picture("discard");
    ASSERT_TRUE(walk().goTo("Cancel", -1));
    walk().press();
    EXPECT_TRUE(isOpen());
    EXPECT_FALSE(asksToDiscard());
    EXPECT_EQ(walk().focused(), "Cancel") << "the one of the editor, which had asked";
}

TEST_P(FocusPopupsTest, ChangesAreDiscarded) {
    askToDiscard();
    ASSERT_TRUE(walk().goTo("Discard"));
    walk().press();
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(storedAlarms().empty());
}

TEST_P(FocusPopupsTest, EverythingOfTheDatePopupIsReached) {
    open("DATE");
    const Names names = walk().everything();
    ASSERT_EQ(names.size(), 5U);
    EXPECT_EQ(names.at(0), "Previous month");
    EXPECT_EQ(names.at(1), "Next month");
    EXPECT_EQ((Names{names.at(3), names.at(4)}), (Names{"Cancel", "Set"}));
}

} // namespace
