#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/PickerFixture.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

/** Frames after which a resting finger has no speed left. */
constexpr int REST = 15;

class WheelTest : public PickerFixture {};

TEST_F(WheelTest, ADragByThreeValuesPassesEachOfThemOnce) {
    addPicker("time_layout_24hr", 6, 30);
    stage().drag(HOUR_24, MIDDLE, 0, -3 * STEP);
    EXPECT_TRUE(stage().settle());
    EXPECT_EQ(time(), "09:30");
    EXPECT_THAT(takeChanges(), ElementsAre("07:30", "08:30", "09:30"));
}

TEST_F(WheelTest, TheDigitsFollowTheFingerPixelByPixel) {
    addPicker("time_layout_24hr", 6, 30);
    const int before = stage().findText("06")->area.middle().y;
    stage().press(HOUR_24, MIDDLE);
    stage().moveTo(HOUR_24, MIDDLE - 7);
    Stage::frames(1);
    EXPECT_NEAR(stage().findText("06")->area.middle().y, before - 7, 1);
    stage().moveTo(HOUR_24, MIDDLE - 20);
    Stage::frames(1);
    EXPECT_NEAR(stage().findText("06")->area.middle().y, before - 20, 1);
    Stage::frames(REST);
    stage().release();
    stage().settle();
    EXPECT_NEAR(stage().findText("06")->area.middle().y, before, 1);
    EXPECT_THAT(takeChanges(), IsEmpty());
}

TEST_F(WheelTest, ADragThatEndsBetweenTwoValuesSnapsToTheNearer) {
    addPicker("time_layout_24hr", 6, 30);
    stage().drag(HOUR_24, MIDDLE, 0, -(STEP + STEP / 2 + 4));
    stage().settle();
    EXPECT_EQ(time(), "08:30");
    stage().drag(HOUR_24, MIDDLE, 0, -(STEP + STEP / 2 - 4));
    stage().settle();
    EXPECT_EQ(time(), "09:30");
}

TEST_F(WheelTest, AFlickRunsOnSlowsDownAndLandsOnAValue) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(MINUTE_24, MIDDLE, 0, -60);
    const std::string atRelease = time();
    EXPECT_TRUE(stage().settle());
    EXPECT_GT(time(), atRelease);
    EXPECT_GE(takeChanges().size(), 3U);
    // On a value: the digits stand exactly in the middle.
    const auto digits = stage().findText(time().substr(3));
    ASSERT_TRUE(digits);
    EXPECT_NEAR(digits->area.middle().y, MIDDLE, 2);
}

TEST_F(WheelTest, AFlickUpGoesThroughTwentyThreeToZero) {
    addPicker("time_layout_24hr", 22, 30);
    stage().flick(HOUR_24, MIDDLE, 0, -60);
    stage().settle();
    const auto changes = takeChanges();
    ASSERT_GE(changes.size(), 3U);
    EXPECT_EQ(changes[0], "23:30");
    EXPECT_EQ(changes[1], "00:30");
    EXPECT_EQ(changes[2], "01:30");
}

TEST_F(WheelTest, AFlickDownGoesThroughZeroToTwentyThree) {
    addPicker("time_layout_24hr", 1, 30);
    stage().flick(HOUR_24, MIDDLE, 0, 60);
    stage().settle();
    const auto changes = takeChanges();
    ASSERT_GE(changes.size(), 3U);
    EXPECT_EQ(changes[0], "00:30");
    EXPECT_EQ(changes[1], "23:30");
    EXPECT_EQ(changes[2], "22:30");
}

TEST_F(WheelTest, MinutesWrapWithoutTurningTheHour) {
    addPicker("time_layout_24hr", 6, 59);
    stage().wheel(MINUTE_24, MIDDLE, 1);
    EXPECT_EQ(time(), "06:00");
    stage().wheel(MINUTE_24, MIDDLE, -1);
    EXPECT_EQ(time(), "06:59");
}

TEST_F(WheelTest, OneNotchOfAMouseWheelIsOneValue) {
    addPicker("time_layout_24hr", 6, 30);
    stage().wheel(HOUR_24, MIDDLE, 1);
    EXPECT_EQ(time(), "07:30");
    stage().wheel(HOUR_24, MIDDLE, -1);
    stage().wheel(HOUR_24, MIDDLE, -1);
    EXPECT_EQ(time(), "05:30");
    EXPECT_THAT(takeChanges(), ElementsAre("07:30", "06:30", "05:30"));
}

TEST_F(WheelTest, ATapOnANeighbourGoesToIt) {
    addPicker("time_layout_24hr", 6, 30);
    stage().tap(HOUR_24, MIDDLE + STEP);
    EXPECT_EQ(time(), "07:30");
    stage().settle();
    stage().tap(MINUTE_24, MIDDLE - STEP);
    EXPECT_EQ(time(), "07:29");
    EXPECT_THAT(takeChanges(), ElementsAre("07:30", "07:29"));
}

TEST_F(WheelTest, ATapOnTheCurrentValueOnlyGivesItTheKeys) {
    addPicker("time_layout_24hr", 6, 30);
    stage().tap(MINUTE_24, MIDDLE);
    stage().settle();
    EXPECT_THAT(takeChanges(), IsEmpty());
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
}

TEST_F(WheelTest, UpAndDownStepToTheValueDrawnThere) {
    addPicker("time_layout_24hr", 6, 30);
    elm_object_focus_set(wheel("wheel.hour"), EINA_TRUE);
    stage().key("Down");
    EXPECT_EQ(time(), "07:30");
    stage().key("Up");
    stage().key("Up");
    EXPECT_EQ(time(), "05:30");
    EXPECT_THAT(takeChanges(), SizeIs(3));
}

TEST_F(WheelTest, LeftRightAndTabGoToTheNextWheel) {
    addPicker("time_layout", 6, 30);
    elm_object_focus_set(wheel("wheel.hour"), EINA_TRUE);
    stage().key("Right");
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
    stage().key("Tab");
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.half")));
    stage().key("Left");
    EXPECT_TRUE(elm_object_focus_get(wheel("wheel.minute")));
    EXPECT_THAT(takeChanges(), IsEmpty());
}

TEST_F(WheelTest, AFingerStopsARunningWheelWithoutSteppingIt) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(MINUTE_24, MIDDLE, 0, -100);
    Stage::frames(6);
    stage().press(MINUTE_24, MIDDLE + STEP);
    const std::string caught = time();
    Stage::frames(10);
    stage().release();
    stage().settle();
    EXPECT_EQ(time(), caught);
}

TEST_F(WheelTest, AKeyDuringAFlickStepsFromTheValueInTheMiddle) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(MINUTE_24, MIDDLE, 0, -100);
    Stage::frames(6);
    const int before = std::stoi(time().substr(3));
    stage().wheel(MINUTE_24, MIDDLE, 1);
    stage().settle();
    EXPECT_EQ(std::stoi(time().substr(3)), before + 1);
}

TEST_F(WheelTest, SettingATimeStopsTheMotionAndTellsNobody) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(MINUTE_24, MIDDLE, 0, -100);
    Stage::frames(3);
    takeChanges();
    show(12, 15);
    stage().settle();
    EXPECT_EQ(time(), "12:15");
    EXPECT_THAT(takeChanges(), IsEmpty());
}

TEST_F(WheelTest, SettingATimeUnderAFingerEndsTheDrag) {
    addPicker("time_layout_24hr", 6, 30);
    stage().press(HOUR_24, MIDDLE);
    stage().moveTo(HOUR_24, MIDDLE - STEP);
    takeChanges();
    show(12, 15);
    stage().moveTo(HOUR_24, MIDDLE - 2 * STEP);
    stage().release();
    stage().settle();
    EXPECT_EQ(time(), "12:15");
    EXPECT_THAT(takeChanges(), IsEmpty());
}

TEST_F(WheelTest, NoFrameIsDrawnWhileNothingTurns) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(HOUR_24, MIDDLE, 0, -60);
    ASSERT_TRUE(stage().settle());
    const int before = stage().renderedFrames();
    Stage::advance(3);
    EXPECT_EQ(stage().renderedFrames(), before);
}

TEST_F(WheelTest, NoAnimatorRunsOnceAWheelHasComeToRest) {
    addPicker("time_layout_24hr", 6, 30);
    // With a source of its own the toolkit asks for ticks as long as there is an animator.
    int ticksWanted = 0;
    ecore_animator_custom_source_tick_begin_callback_set(
        [](void* data) { ++*static_cast<int*>(data); }, &ticksWanted);
    stage().flick(HOUR_24, MIDDLE, 0, -60);
    ASSERT_TRUE(stage().settle());
    EXPECT_GT(ticksWanted, 0);
    ticksWanted = 0;
    Stage::advance(1);
    EXPECT_EQ(ticksWanted, 0);
    ecore_animator_custom_source_tick_begin_callback_set(nullptr, nullptr);
}

TEST_F(WheelTest, TheHalfDayHasTwoValuesAndDoesNotWrap) {
    addPicker("time_layout", 6, 30);
    stage().wheel(HALF_12, MIDDLE, 1);
    EXPECT_EQ(time(), "18:30");
    stage().wheel(HALF_12, MIDDLE, 1);
    EXPECT_EQ(time(), "18:30");
    stage().flick(HALF_12, MIDDLE, 0, 60);
    stage().settle();
    EXPECT_EQ(time(), "06:30");
    stage().drag(HALF_12, MIDDLE, 0, 70);
    EXPECT_TRUE(stage().settle());
    EXPECT_EQ(time(), "06:30");
    EXPECT_THAT(takeChanges(), ElementsAre("18:30", "06:30"));
}

TEST_F(WheelTest, TurningFromElevenToTwelveKeepsTheHalfDay) {
    addPicker("time_layout", 11, 30);
    stage().wheel(HOUR_12, MIDDLE, 1);
    EXPECT_EQ(time(), "00:30");
    stage().wheel(HOUR_12, MIDDLE, 1);
    EXPECT_EQ(time(), "01:30");
    show(23, 0);
    stage().wheel(HOUR_12, MIDDLE, 1);
    EXPECT_EQ(time(), "12:00");
}

// Every hour and its text.
TEST_F(WheelTest, TwelveHoursReadFromOneToTwelve) {
    addPicker("time_layout", 0, 5);
    EXPECT_TRUE(stage().shows("12"));
    EXPECT_TRUE(stage().shows("05"));
    EXPECT_TRUE(stage().shows("AM"));
    for (int hour = 1; hour < 24; ++hour) {
        show(hour, 0);
        Stage::frames(1);
        const auto text = stage().findText(std::to_string(hour % 12 == 0 ? 12 : hour % 12));
        ASSERT_TRUE(text) << hour;
        EXPECT_NEAR(text->area.middle().y, MIDDLE, 2) << hour;
        EXPECT_NEAR(stage().findText(hour < 12 ? "AM" : "PM")->area.middle().y, MIDDLE, 2) << hour;
        EXPECT_EQ(time().substr(0, 2),
                  hour < 10 ? "0" + std::to_string(hour) : std::to_string(hour));
    }
}

class WheelInAListTest : public PickerFixture {
protected:
    void SetUp() override {
        PickerFixture::SetUp();
        elm_theme_extension_add(nullptr, THEME);
        list = elm_genlist_add(stage().window());
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        evas_object_geometry_set(list, 0, 84, 360, 276);
        evas_object_smart_callback_add(
            list, "selected", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); },
            &selections);
        first = append("edit.theme.time");
        for (int i = 0; i < 5; ++i) {
            append("2line.top");
        }
        evas_object_show(list);
        stage().settle();
    }

    void TearDown() override {
        PickerFixture::TearDown();
        elm_theme_extension_del(nullptr, THEME);
    }

    int listTop() const {
        int y = 0;
        evas_object_geometry_get(picker, nullptr, &y, nullptr, nullptr);
        return y;
    }

    static constexpr const char* THEME = CLOCK_RESOURCE_DIR "/edje/AlarmCustomTheme.edj";
    Evas_Object* list = nullptr;
    Elm_Object_Item* first = nullptr;
    int selections = 0;

private:
    Elm_Object_Item* append(const char* style) {
        Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
        itemClass->item_style = style;
        itemClass->func.content_get = [](void* data, Evas_Object* genlist,
                                         const char* part) -> Evas_Object* {
            if (std::string(part) != "timepicker.area") {
                return nullptr;
            }
            return static_cast<WheelInAListTest*>(data)->addPicker("time_layout_24hr", 6, 30,
                                                                   genlist);
        };
        Elm_Object_Item* item = elm_genlist_item_append(list, itemClass, this, nullptr,
                                                        ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
        elm_genlist_item_class_free(itemClass);
        return item;
    }
};

TEST_F(WheelInAListTest, ADragOnAWheelDoesNotScrollTheList) {
    ASSERT_EQ(listTop(), 84);
    stage().press(HOUR_24, MIDDLE);
    for (int y = MIDDLE; y > MIDDLE - 120; y -= 6) {
        stage().moveTo(HOUR_24, y);
        Stage::frames(1);
        ASSERT_EQ(listTop(), 84);
    }
    Stage::frames(REST);
    stage().release();
    stage().settle();
    EXPECT_EQ(listTop(), 84);
    EXPECT_EQ(time(), "08:30");
}

TEST_F(WheelInAListTest, ANotchOverAWheelDoesNotScrollTheList) {
    stage().wheel(HOUR_24, MIDDLE, 1);
    stage().settle();
    EXPECT_EQ(listTop(), 84);
    EXPECT_EQ(time(), "07:30");
}

TEST_F(WheelInAListTest, ADragBesideTheWheelsScrollsTheList) {
    stage().drag(180, 290, 0, -120);
    stage().settle();
    EXPECT_LT(listTop(), 20);
    EXPECT_EQ(time(), "06:30");
}

TEST_F(WheelInAListTest, ADragThatStartsSidewaysIsLeftToTheList) {
    stage().press(HOUR_24, MIDDLE);
    stage().moveTo(HOUR_24 + 30, MIDDLE + 2);
    Stage::frames(2);
    for (int dy = 0; dy <= 120; dy += 8) {
        stage().moveTo(HOUR_24 + 30, MIDDLE + 2 - dy);
        Stage::frames(1);
    }
    stage().release();
    stage().settle();
    EXPECT_EQ(time(), "06:30");
    EXPECT_THAT(takeChanges(), IsEmpty());
    EXPECT_LT(listTop(), 84);
}

TEST_F(WheelInAListTest, TurningAWheelDoesNotSelectItsRow) {
    stage().tap(HOUR_24, MIDDLE + STEP);
    stage().drag(HOUR_24, MIDDLE, 0, -STEP);
    stage().settle();
    EXPECT_EQ(selections, 0);
    EXPECT_EQ(time(), "08:30");
}

TEST_F(WheelInAListTest, TheArrowKeysTurnATouchedWheelInsteadOfWalkingTheList) {
    stage().tap(MINUTE_24, MIDDLE);
    stage().settle();
    stage().key("Down");
    stage().settle();
    EXPECT_EQ(time(), "06:31");
    EXPECT_EQ(listTop(), 84);
}

TEST_F(WheelInAListTest, TheListScrollsAgainAfterAPickerWasDeletedUnderAFinger) {
    stage().press(HOUR_24, MIDDLE);
    stage().moveTo(HOUR_24, MIDDLE - 40);
    Stage::frames(2);
    elm_genlist_item_update(first);
    Stage::frames(5);
    stage().release();
    stage().settle();
    stage().drag(180, 290, 0, -120);
    stage().settle();
    EXPECT_LT(listTop(), 20);
}

class PickerDeletionTest : public PickerFixture {
protected:
    void deleteOnChange() {
        evas_object_smart_callback_add(
            picker, "changed", [](void*, Evas_Object* object, void*) { evas_object_del(object); },
            nullptr);
    }
};

TEST_F(PickerDeletionTest, APickerMayBeDeletedInTheMiddleOfADrag) {
    addPicker("time_layout_24hr", 6, 30);
    stage().press(HOUR_24, MIDDLE);
    stage().moveTo(HOUR_24, MIDDLE - 80);
    evas_object_del(picker);
    stage().moveTo(HOUR_24, MIDDLE - 160);
    stage().release();
    EXPECT_TRUE(stage().settle());
}

TEST_F(PickerDeletionTest, APickerMayBeDeletedWhileItRuns) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(HOUR_24, MIDDLE, 0, -80);
    Stage::frames(2);
    evas_object_del(picker);
    EXPECT_TRUE(stage().settle());
}

TEST_F(PickerDeletionTest, APickerMayBeDeletedWhenItsDragIsHeard) {
    addPicker("time_layout_24hr", 6, 30);
    deleteOnChange();
    stage().drag(HOUR_24, MIDDLE, 0, -3 * STEP);
    EXPECT_TRUE(stage().settle());
    EXPECT_THAT(takeChanges(), SizeIs(1));
}

TEST_F(PickerDeletionTest, APickerMayBeDeletedWhenItsFlickIsHeard) {
    addPicker("time_layout_24hr", 6, 30);
    stage().flick(HOUR_24, MIDDLE, 0, -80);
    deleteOnChange();
    takeChanges();
    EXPECT_TRUE(stage().settle());
    EXPECT_THAT(takeChanges(), SizeIs(1));
}

TEST_F(PickerDeletionTest, APickerMayBeDeletedWhenAStepIsHeard) {
    addPicker("time_layout_24hr", 6, 30);
    deleteOnChange();
    stage().wheel(HOUR_24, MIDDLE, 1);
    EXPECT_TRUE(stage().settle());
    EXPECT_THAT(takeChanges(), SizeIs(1));
}

} // namespace
