// What the editor's rows have in them looks otherwise while it is pressed, reached by keys, turned
// or disabled.

#include <string>

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/Look.h"
#include "support/Ring.h"

namespace {

constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

class EditorStatesTest : public EditorFixture {
protected:
    static constexpr unsigned VOLUME_ROW = 3;

    void SetUp() override {
        EditorFixture::SetUp();
        device().setSetting(HOURS_KEY, 1);
        editAlarm(storedAlarm(7, 30));
    }
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    Elm_Object_Item* row(unsigned position) {
        return elm_genlist_nth_item_get(genlist(), position);
    }
    Look look(Evas_Object* object) { return {stage(), object}; }
};

class WheelStatesTest : public EditorStatesTest, public testing::WithParamInterface<const char*> {
protected:
    Evas_Object* wheel() { return elm_object_part_content_get(picker(), GetParam()); }
};

TEST_P(WheelStatesTest, APressShowsUntilItEnds) {
    const Look before = look(wheel());
    pressOn(stage(), wheel());
    EXPECT_GT(look(wheel()).unlike(before), 10 * SEEN);
    stage().screenshot(std::string("wheel-pressed-") + GetParam());
    stage().release();
    EXPECT_EQ(look(wheel()).unlike(before), 0);
}

TEST_P(WheelStatesTest, KeysAndTurningAreSeen) {
    const Look before = look(wheel());
    ASSERT_TRUE(tabTo(stage(), wheel()));
    const Look focused = look(wheel());
    EXPECT_GT(focused.unlike(before), 40);
    stage().keySettled("Return");
    const Look turning = look(wheel());
    EXPECT_GT(turning.unlike(focused), SEEN);
    EXPECT_GT(turning.accent(), focused.accent() + SEEN);
    stage().keySettled("Return");
    EXPECT_EQ(look(wheel()).unlike(focused), 0);
    stage().tap(180, 20);
    EXPECT_EQ(look(wheel()).unlike(before), 0);
}

TEST_P(WheelStatesTest, ADisabledOneIsPaler) {
    const Look before = look(wheel());
    elm_object_disabled_set(wheel(), EINA_TRUE);
    const Look disabled = look(wheel());
    EXPECT_GT(disabled.unlike(before), SEEN);
    EXPECT_LT(disabled.brightest(), before.brightest() / 2);
    stage().screenshot(std::string("wheel-disabled-") + GetParam());
    pressOn(stage(), wheel());
    EXPECT_EQ(look(wheel()).unlike(disabled), 0) << "it answers a touch";
    stage().release();
    EXPECT_FALSE(tabTo(stage(), wheel()));
    stage().tap(180, 20);
    elm_object_disabled_set(wheel(), EINA_FALSE);
    EXPECT_EQ(look(wheel()).unlike(before), 0);
}

INSTANTIATE_TEST_SUITE_P(Wheels, WheelStatesTest,
                         testing::Values("wheel.hour", "wheel.minute", "wheel.half"),
                         [](const auto& wheel) { return std::string(wheel.param).substr(6); });

TEST_F(EditorStatesTest, TitleButtonsShowAFingerAndTheKeys) {
    for (const char* text : {"Cancel", "Done"}) {
        SCOPED_TRACE(text);
        Evas_Object* const button = stage().findText(text)->widget;
        const Look before = look(button);
        pressOn(stage(), button);
        EXPECT_GT(look(button).unlike(before), 10 * SEEN);
        stage().moveTo(180, 20);
        stage().release();
        EXPECT_EQ(look(button).unlike(before), 0);
        ASSERT_TRUE(tabTo(stage(), button));
        EXPECT_GT(look(button).unlike(before), SEEN);
        stage().tap(180, 20);
    }
}

TEST_F(EditorStatesTest, TheSliderOfTheVolumeRowShowsAFingerTheKeysAndTurning) {
    stage().showRow(row(VOLUME_ROW));
    Evas_Object* const slider = stage().widgets("Elm_Slider").front();
    ASSERT_TRUE(tabTo(stage(), slider));
    const Look focused = look(slider);
    stage().keySettled("Return");
    EXPECT_GT(look(slider).unlike(focused), SEEN) << "turning";
    stage().keySettled("Return");
    stage().tap(180, 20);
    const Look before = look(slider);
    EXPECT_GT(focused.unlike(before), SEEN);
    pressOn(stage(), slider);
    EXPECT_GT(look(slider).unlike(before), SEEN);
    stage().release();
}

TEST_F(EditorStatesTest, TheSliderOfADisabledRowIsPaler) {
    stage().showRow(row(VOLUME_ROW));
    Evas_Object* const slider = stage().widgets("Elm_Slider").front();
    const Look before = look(slider);
    elm_object_item_disabled_set(row(VOLUME_ROW), EINA_TRUE);
    const Look disabled = look(slider);
    EXPECT_GT(disabled.unlike(before), SEEN);
    pressOn(stage(), slider);
    EXPECT_EQ(look(slider).unlike(disabled), 0) << "it answers a touch";
    stage().release();
}

/** The line that the name is typed into. */
class NameStatesTest : public EditorStatesTest {
protected:
    void SetUp() override {
        EditorStatesTest::SetUp();
        stage().showRow(nameRow().getElmObjectItem());
    }
    Evas_Object* field() { return nameRow().getNameEntryObj(); }
};

TEST_F(NameStatesTest, ItsGroundIsAsHighAsAFingerNeedsAndNoHigher) {
    EXPECT_GE(Stage::area(field()).height, 48);
    EXPECT_LE(Stage::area(field()).height, 52);
}

TEST_F(NameStatesTest, APressShowsAndLeavesTheFieldLit) {
    const Look before = look(field());
    pressOn(stage(), field());
    const Look pressed = look(field());
    EXPECT_GT(pressed.unlike(before), 10 * SEEN);
    stage().screenshot("name-pressed");
    stage().release();
    const Look typing = look(field());
    EXPECT_GT(typing.unlike(pressed), 10 * SEEN);
    EXPECT_GT(typing.unlike(before), SEEN) << "keys go to it";
    stage().screenshot("name-typing");
}

TEST_F(NameStatesTest, TheKeysAreSeen) {
    const Look before = look(field());
    for (int i = 0; i < 20 && ringedName(stage()) != "Old"; ++i)
        stage().keySettled("Tab");
    ASSERT_EQ(ringedName(stage()), "Old");
    EXPECT_GT(look(field()).unlike(before), SEEN);
    EXPECT_GT(look(field()).accent(), before.accent() + SEEN);
}

TEST_F(NameStatesTest, ADisabledRowIsPaler) {
    for (const char* name : {"Old", ""}) {
        SCOPED_TRACE(name);
        elm_entry_entry_set(field(), name);
        const Area area = Stage::area(field());
        const Area around{area.x, area.y - 24, area.width, area.height + 24};
        const Look before(stage(), around);
        elm_object_item_disabled_set(nameRow().getElmObjectItem(), EINA_TRUE);
        const Look disabled(stage(), around);
        EXPECT_GT(disabled.unlike(before), SEEN);
        EXPECT_LT(disabled.brightest(), before.brightest());
        stage().screenshot(std::string("name-disabled-") + name);
        pressOn(stage(), field());
        EXPECT_EQ(Look(stage(), around).unlike(disabled), 0) << "it answers a touch";
        stage().release();
        // The pointer of a mouse looks otherwise over an entry that can be used.
        stage().moveTo(180, 20);
        elm_object_item_disabled_set(nameRow().getElmObjectItem(), EINA_FALSE);
        EXPECT_EQ(Look(stage(), around).unlike(before), 0);
    }
}

} // namespace
