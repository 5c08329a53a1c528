// The field to search with and the index along the rim: pressed, reached by keys, typed into,
// turned. An index has no disabled look: where there is nothing to turn it is not there.

#include <string>

#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "support/Look.h"
#include "support/Ring.h"

namespace {

class SearchStatesTest : public CityPickerFixture {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        openPicker();
    }
    /** What is around the entry. */
    Evas_Object* field() { return elm_object_parent_widget_get(entry()); }
    Evas_Object* clearButton() {
        return elm_object_part_content_get(field(), "elm.swallow.button");
    }
    Look look() { return {stage(), field()}; }
    /** Where a finger on the index is told its hour. */
    Look middle() { return {stage(), {100, 140, 180, 200}}; }
};

TEST_F(SearchStatesTest, APressShowsAndLeavesTheFieldRinged) {
    const Look before = look();
    pressOn(stage(), entry());
    const Look pressed = look();
    EXPECT_GT(pressed.unlike(before), 50 * SEEN);
    EXPECT_EQ(pressed.accent(), 0);
    stage().screenshot("search-pressed");
    stage().release();
    const Look typing = look();
    EXPECT_GT(typing.accent(), 5 * SEEN) << "keys go to it";
    EXPECT_GT(typing.unlike(pressed), 50 * SEEN) << "the finger has gone";
    stage().screenshot("search-typing");
}

TEST_F(SearchStatesTest, TheKeysAreSeen) {
    const Look before = look();
    ASSERT_TRUE(tabTo(stage(), field()));
    EXPECT_GT(look().unlike(before), 5 * SEEN);
}

TEST_F(SearchStatesTest, AFieldWithTextHasAButtonThatShowsAFingerAndTheKeys) {
    search("ka");
    const Look before(stage(), clearButton());
    pressOn(stage(), clearButton());
    EXPECT_GT(Look(stage(), clearButton()).unlike(before), SEEN);
    stage().screenshot("search-clear-pressed");
    stage().moveTo(180, 20);
    stage().release();
    EXPECT_EQ(Look(stage(), clearButton()).unlike(before), 0);
    ASSERT_TRUE(tabTo(stage(), clearButton()));
    EXPECT_GT(Look(stage(), clearButton()).unlike(before), 40);
    stage().screenshot("search-clear-focused");
}

TEST_F(SearchStatesTest, ADisabledFieldIsPaler) {
    for (const char* text : {"", "ka"}) {
        SCOPED_TRACE(text);
        elm_entry_entry_set(entry(), text);
        fill();
        const Look before = look();
        elm_object_disabled_set(field(), EINA_TRUE);
        const Look disabled = look();
        EXPECT_GT(disabled.unlike(before), 50 * SEEN);
        EXPECT_LT(disabled.brightest(), before.brightest());
        stage().screenshot(std::string("search-disabled-") + text);
        pressOn(stage(), entry());
        EXPECT_EQ(look().unlike(disabled), 0) << "it answers a touch";
        stage().release();
        EXPECT_FALSE(tabTo(stage(), field()));
        stage().tap(180, 20);
        elm_object_disabled_set(field(), EINA_FALSE);
        EXPECT_EQ(look().unlike(before), 0);
    }
}

TEST_F(SearchStatesTest, TheButtonOfThePlaceShowsAFingerAndTheKeys) {
    const Look before(stage(), locationButton());
    pressOn(stage(), locationButton());
    EXPECT_GT(Look(stage(), locationButton()).unlike(before), 10 * SEEN);
    stage().moveTo(180, 20);
    stage().release();
    EXPECT_EQ(Look(stage(), locationButton()).unlike(before), 0);
    ASSERT_TRUE(tabTo(stage(), locationButton()));
    EXPECT_GT(Look(stage(), locationButton()).unlike(before), SEEN);
}

TEST_F(SearchStatesTest, AFingerOnTheIndexShows) {
    stage().press(338, 200);
    const Look touched = middle();
    stage().screenshot("index-touched");
    stage().release();
    EXPECT_GT(middle().unlike(touched), 50 * SEEN) << "it is told in the middle, and then no more";
}

TEST_F(SearchStatesTest, KeysOnTheIndexAndTurningItAreSeen) {
    const Look before = middle();
    ASSERT_TRUE(tabTo(stage(), index()));
    const Look focused = middle();
    EXPECT_GT(focused.unlike(before), 50 * SEEN);
    stage().screenshot("index-focused");
    stage().keySettled("Return");
    EXPECT_GT(middle().accent(), focused.accent() + SEEN);
    stage().screenshot("index-turning");
    stage().keySettled("Return");
    EXPECT_EQ(middle().unlike(focused), 0);
    stage().tap(180, 20);
    EXPECT_EQ(middle().unlike(before), 0);
}

} // namespace
