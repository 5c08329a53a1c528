#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "screens/PickerFixture.h"

namespace {

/** The editor's first screen, as a person sees it. */
class FirstScreenTest : public EditorFixture {};

TEST_F(FirstScreenTest, EveryTextLiesInsideTheCircle) {
    createAlarm();
    const auto texts = stage().texts();
    EXPECT_GE(texts.size(), 10U);
    for (const FoundText& text : texts) {
        EXPECT_TRUE(text.area.insideCircle())
            << text.text << " at " << text.area.x << ", " << text.area.y << ", " << text.area.width
            << " x " << text.area.height;
    }
}

TEST_F(FirstScreenTest, TheTitleButtonsAreWhereTheyBelong) {
    createAlarm();
    const Area cancel = Stage::area(stage().findText("Cancel")->widget);
    const Area done = Stage::area(stage().findText("Done")->widget);
    EXPECT_EQ(cancel.y, 36);
    EXPECT_EQ(cancel.height, 48);
    EXPECT_EQ(done.y, 36);
    EXPECT_EQ(done.height, 48);
    EXPECT_NEAR(cancel.x, 72, 1);
    EXPECT_NEAR(done.x + done.width, 288, 1);
    EXPECT_LT(cancel.x + cancel.width, done.x);
    const Area title = stage().findText("Create")->area;
    EXPECT_LE(title.y + title.height, 36);
}

TEST_F(FirstScreenTest, TheDateButtonIsLargeEnoughForAFinger) {
    createAlarm();
    const auto date = stage().findText("DATE");
    ASSERT_TRUE(date);
    const Area button = Stage::area(date->widget);
    EXPECT_EQ(button.y, 276);
    EXPECT_EQ(button.height, 48);
    EXPECT_GE(button.width, 96);
    EXPECT_TRUE(button.insideCircle());
}

TEST_F(FirstScreenTest, TheLastRowScrollsToTheMiddleOfTheFace) {
    createAlarm();
    stage().showRow(Stage::rows(genlist()).back().item);
    const auto label = stage().findText("Alarm name");
    ASSERT_TRUE(label);
    EXPECT_NEAR(label->area.y, 150, 40);
    for (Evas_Object* entry : stage().widgets("Elm_Entry")) {
        EXPECT_TRUE(Stage::area(entry).insideCircle());
    }
}

TEST_F(FirstScreenTest, AMirroredFaceSwapsTheTitleButtons) {
    elm_config_mirrored_set(EINA_TRUE);
    createAlarm();
    EXPECT_GT(stage().findText("Cancel")->area.x, stage().findText("Done")->area.x);
    takeStageDown();
    elm_config_mirrored_set(EINA_FALSE);
}

/** The arrow of the way back. */
class BackButtonTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        button = elm_button_add(stage().window());
        elm_object_style_set(button, "naviframe/back_btn/default");
        evas_object_geometry_set(button, 132, 156, 96, 48);
        evas_object_show(button);
        stage().settle();
    }
    /** Where the middle line of the disc meets the tip of the arrow. */
    int tip() {
        for (int x = 160; x < 200; ++x) {
            if ((stage().pixel(x, 180) & 0xff) > 200) {
                return x;
            }
        }
        return 0;
    }

    Evas_Object* button = nullptr;
};

TEST_F(BackButtonTest, TheArrowPointsAgainstTheText) {
    EXPECT_NEAR(tip(), 173, 3);
    elm_object_mirrored_automatic_set(button, EINA_FALSE);
    elm_object_mirrored_set(button, EINA_TRUE);
    stage().settle();
    EXPECT_NEAR(tip(), 184, 3);
    elm_object_mirrored_set(button, EINA_FALSE);
    stage().settle();
    EXPECT_NEAR(tip(), 173, 3);
}

TEST_F(BackButtonTest, AWordTakesTheArrowsPlaceAlsoOnAMirroredFace) {
    elm_object_text_set(button, "Back");
    elm_object_mirrored_automatic_set(button, EINA_FALSE);
    elm_object_mirrored_set(button, EINA_TRUE);
    stage().settle();
    EXPECT_TRUE(stage().shows("Back"));
    const char* state = edje_object_part_state_get(elm_layout_edje_get(button), "arrow", nullptr);
    EXPECT_STREQ(state, "hidden");
    elm_object_text_set(button, "");
    stage().settle();
    EXPECT_NEAR(tip(), 184, 3);
}

class SwitchTest : public ScreenTest {
protected:
    Evas_Object* addSwitch() {
        Evas_Object* check = elm_check_add(stage().window());
        elm_object_style_set(check, "on&off");
        evas_object_geometry_set(check, 150, 156, 60, 48);
        evas_object_show(check);
        evas_object_smart_callback_add(
            check, "changed", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); },
            &changes);
        stage().settle();
        return check;
    }
    static int knob(Evas_Object* check) {
        int x = 0;
        edje_object_part_geometry_get(elm_layout_edje_get(check), "knob", &x, nullptr, nullptr,
                                      nullptr);
        return x;
    }

    int changes = 0;
};

TEST_F(SwitchTest, ATouchMovesTheKnobSmoothly) {
    Evas_Object* check = addSwitch();
    const int off = knob(check);
    stage().tap(180, 180);
    const int between = knob(check);
    EXPECT_TRUE(elm_check_state_get(check));
    EXPECT_GT(between, off);
    stage().settle();
    EXPECT_GT(knob(check), between);
    EXPECT_EQ(changes, 1);
}

TEST_F(SwitchTest, ProgramsMoveItAtOnceAndTellNobody) {
    Evas_Object* check = addSwitch();
    const int off = knob(check);
    elm_check_state_set(check, EINA_TRUE);
    Stage::frames(1);
    const int on = knob(check);
    EXPECT_GT(on, off);
    stage().settle();
    EXPECT_EQ(knob(check), on);
    EXPECT_EQ(changes, 0);
}

TEST_F(SwitchTest, AStateOtherThanTheMovementWins) {
    Evas_Object* check = addSwitch();
    const int off = knob(check);
    elm_check_state_set(check, EINA_TRUE);
    stage().settle();
    elm_object_signal_emit(check, "elm,activate,check,on", "elm");
    elm_check_state_set(check, EINA_FALSE);
    stage().settle();
    EXPECT_EQ(knob(check), off);
}

TEST_F(SwitchTest, ADisabledSwitchStays) {
    Evas_Object* check = addSwitch();
    elm_object_disabled_set(check, EINA_TRUE);
    stage().settle();
    stage().tap(180, 180);
    stage().settle();
    EXPECT_FALSE(elm_check_state_get(check));
    EXPECT_EQ(changes, 0);
}

/** A question with two buttons. */
class PopupLookTest : public ScreenTest {
protected:
    void ask() {
        popup = elm_popup_add(stage().window());
        elm_popup_align_set(popup, ELM_NOTIFY_ALIGN_FILL, 1.0);
        elm_object_part_text_set(popup, "title,text", "Discard changes");
        elm_object_text_set(popup, "All changes will be discarded.");
        for (const char* part : {"button1", "button2"}) {
            Evas_Object* button = elm_button_add(popup);
            elm_object_style_set(button, "popup");
            elm_object_text_set(button, part == std::string("button1") ? "Cancel" : "Discard");
            elm_object_part_content_set(popup, part, button);
            evas_object_show(button);
        }
        evas_object_smart_callback_add(
            popup, "dismissed", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); },
            &dismissed);
        evas_object_show(popup);
        stage().settle();
    }

    Evas_Object* popup = nullptr;
    int dismissed = 0;
};

TEST_F(PopupLookTest, TextsAndButtonsLieInsideTheCircle) {
    ask();
    for (const char* text : {"Discard changes", "All changes will be discarded."}) {
        ASSERT_TRUE(stage().shows(text)) << text;
        EXPECT_TRUE(stage().findText(text)->area.insideCircle()) << text;
    }
    for (const char* text : {"Cancel", "Discard"}) {
        ASSERT_TRUE(stage().shows(text)) << text;
        const Area button = Stage::area(stage().findText(text)->widget);
        EXPECT_TRUE(button.insideCircle()) << text;
        EXPECT_GE(button.height, 48) << text;
    }
}

TEST_F(PopupLookTest, TheSecondButtonWarns) {
    ask();
    const Area cancel = Stage::area(stage().findText("Cancel")->widget);
    const Area discard = Stage::area(stage().findText("Discard")->widget);
    const auto red = [](unsigned color) {
        return static_cast<int>((color >> 16) & 0xff);
    };
    const auto blue = [](unsigned color) {
        return static_cast<int>(color & 0xff);
    };
    const unsigned plain = stage().pixel(cancel.x + 24, cancel.middle().y - 18);
    const unsigned warning = stage().pixel(discard.x + 24, discard.middle().y - 18);
    EXPECT_LT(red(plain), blue(plain));
    EXPECT_GT(red(warning), blue(warning) + 10);
}

TEST_F(PopupLookTest, ADismissedPopupSaysSoOnceItHasFaded) {
    ask();
    elm_popup_dismiss(popup);
    EXPECT_EQ(dismissed, 0);
    Stage::advance(0.3);
    EXPECT_EQ(dismissed, 1);
}

} // namespace
