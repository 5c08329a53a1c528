#include <algorithm>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/ea.h>
#include <device/eext.h>

#include "screens/PickerFixture.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

// The picker behind the toolkit's date-time functions.

class PickerTest : public PickerFixture {
protected:
    void setStyle(const char* style) {
        EXPECT_TRUE(elm_object_style_set(picker, style));
        stage().settle();
    }
};

TEST_F(PickerTest, TheWholeTimeComesBackAsItWasSet) {
    addPicker("time_layout_24hr", 6, 30);
    std::tm set{};
    set.tm_year = 99;
    set.tm_mon = 1;
    set.tm_mday = 28;
    set.tm_hour = 23;
    set.tm_min = 59;
    set.tm_sec = 58;
    set.tm_wday = 3;
    set.tm_yday = 58;
    set.tm_isdst = 1;
    ASSERT_TRUE(elm_datetime_value_set(picker, &set));
    stage().wheel(MINUTE_24, MIDDLE, 1);
    std::tm got{};
    ASSERT_TRUE(elm_datetime_value_get(picker, &got));
    EXPECT_EQ(got.tm_year, 99);
    EXPECT_EQ(got.tm_mon, 1);
    EXPECT_EQ(got.tm_mday, 28);
    EXPECT_EQ(got.tm_hour, 23);
    EXPECT_EQ(got.tm_min, 0);
    EXPECT_EQ(got.tm_sec, 58);
    EXPECT_EQ(got.tm_wday, 3);
    EXPECT_EQ(got.tm_yday, 58);
    EXPECT_EQ(got.tm_isdst, 1);
}

TEST_F(PickerTest, SettingATimeTellsNobody) {
    addPicker("time_layout_24hr", 6, 30);
    show(9, 45);
    stage().settle();
    EXPECT_THAT(takeChanges(), IsEmpty());
    EXPECT_TRUE(stage().shows("09"));
    EXPECT_TRUE(stage().shows("45"));
}

TEST_F(PickerTest, AnHourThatNoClockShowsIsRefused) {
    addPicker("time_layout_24hr", 6, 30);
    std::tm bad{};
    bad.tm_hour = 24;
    EXPECT_FALSE(elm_datetime_value_set(picker, &bad));
    expectLog("No clock shows 24:0");
    bad.tm_hour = 5;
    bad.tm_min = -1;
    EXPECT_FALSE(elm_datetime_value_set(picker, &bad));
    expectLog("No clock shows 5:-1");
    EXPECT_EQ(time(), "06:30");
}

TEST_F(PickerTest, ChangingTheStyleBothWaysKeepsTheTime) {
    addPicker("time_layout_24hr", 18, 5);
    EXPECT_TRUE(stage().shows("18"));
    EXPECT_FALSE(stage().shows("PM"));
    setStyle("time_layout");
    EXPECT_EQ(time(), "18:05");
    EXPECT_TRUE(stage().shows("6"));
    EXPECT_TRUE(stage().shows("PM"));
    stage().wheel(HALF_12, MIDDLE, -1);
    EXPECT_EQ(time(), "06:05");
    setStyle("time_layout_24hr");
    EXPECT_EQ(time(), "06:05");
    EXPECT_TRUE(stage().shows("06"));
    EXPECT_FALSE(stage().shows("AM"));
    EXPECT_THAT(takeChanges(), ElementsAre("06:05"));
}

TEST_F(PickerTest, AFormatDecidesBetweenTwelveAndTwentyFourHours) {
    addPicker("time_layout_24hr", 18, 5);
    elm_datetime_format_set(picker, "%d/%b/%Y %I:%M %p");
    stage().settle();
    EXPECT_TRUE(stage().shows("PM"));
    EXPECT_STREQ(elm_object_style_get(picker), "time_layout");
    EXPECT_STREQ(elm_datetime_format_get(picker), "%d/%b/%Y %I:%M %p");
    elm_datetime_format_set(picker, "%H:%M");
    stage().settle();
    EXPECT_FALSE(stage().shows("PM"));
    EXPECT_STREQ(elm_object_style_get(picker), "time_layout_24hr");
    EXPECT_EQ(time(), "18:05");
    elm_datetime_format_set(picker, nullptr);
    expectLog("An empty time format is ignored");
}

TEST_F(PickerTest, ALocaleGivesDigitsHalvesAndTheirOrder) {
    addPicker("time_layout_24hr", 18, 5);
    const auto x = [this](const char* text) {
        return stage().findText(text)->area.middle().x;
    };
    uxt_date_time_set_format_by_locale(picker, "en_US", 0);
    stage().settle();
    EXPECT_GT(x("PM"), x("05"));
    uxt_date_time_set_format_by_locale(picker, "ko_KR.UTF-8", 0);
    stage().settle();
    ASSERT_TRUE(stage().shows("오후"));
    EXPECT_LT(x("오후"), x("6"));
    uxt_date_time_set_format_by_locale(picker, "fa_IR", 1);
    stage().settle();
    EXPECT_TRUE(stage().shows("۱۸"));
    EXPECT_TRUE(stage().shows("۰۵"));
    EXPECT_EQ(time(), "18:05");
}

TEST_F(PickerTest, ATimeReadsFromLeftToRightInEveryLanguage) {
    elm_config_mirrored_set(EINA_TRUE);
    addPicker("time_layout_24hr", 18, 5);
    EXPECT_LT(stage().findText("18")->area.middle().x, stage().findText("05")->area.middle().x);
    elm_config_mirrored_set(EINA_FALSE);
}

TEST_F(PickerTest, TheFieldsAreThoseOfTheStyle) {
    addPicker("time_layout", 18, 5);
    EXPECT_TRUE(elm_datetime_field_visible_get(picker, ELM_DATETIME_HOUR));
    EXPECT_TRUE(elm_datetime_field_visible_get(picker, ELM_DATETIME_AMPM));
    EXPECT_FALSE(elm_datetime_field_visible_get(picker, ELM_DATETIME_YEAR));
    elm_datetime_field_visible_set(picker, ELM_DATETIME_YEAR, EINA_TRUE);
    EXPECT_FALSE(elm_datetime_field_visible_get(picker, ELM_DATETIME_YEAR));
    int least = -1;
    int greatest = -1;
    elm_datetime_field_limit_get(picker, ELM_DATETIME_MINUTE, &least, &greatest);
    EXPECT_EQ(least, 0);
    EXPECT_EQ(greatest, 59);
    std::tm limit{};
    EXPECT_FALSE(elm_datetime_value_min_set(picker, &limit));
    EXPECT_FALSE(elm_datetime_value_max_get(picker, &limit));
}

TEST_F(PickerTest, TheToolkitsOwnDateTimeWidgetStillReachesTheToolkit) {
    Evas_Object* stock = elm_datetime_add(stage().window());
    elm_datetime_format_set(stock, "%H:%M");
    EXPECT_STREQ(elm_datetime_format_get(stock), "%H:%M");
    elm_datetime_field_visible_set(stock, ELM_DATETIME_YEAR, EINA_FALSE);
    EXPECT_FALSE(elm_datetime_field_visible_get(stock, ELM_DATETIME_YEAR));
    std::tm value{};
    EXPECT_TRUE(elm_datetime_value_get(stock, &value));
    evas_object_del(stock);
}

TEST_F(PickerTest, NoObjectIsAnErrorLineAndNothingElse) {
    std::tm value{};
    EXPECT_FALSE(elm_datetime_value_set(nullptr, &value));
    expectLog("elm_datetime_value_set: no object");
    EXPECT_FALSE(elm_datetime_value_get(nullptr, &value));
    expectLog("elm_datetime_value_get: no object");
    elm_datetime_format_set(nullptr, "%H");
    expectLog("elm_datetime_format_set: no object");
    EXPECT_EQ(elm_datetime_format_get(nullptr), nullptr);
    expectLog("elm_datetime_format_get: no object");
    EXPECT_EQ(uxt_date_time_add(nullptr, "time_layout"), nullptr);
    expectLog("A time picker needs a parent");
    EXPECT_EQ(uxt_button_add(nullptr, "default"), nullptr);
    expectLog("A button needs a parent");
    addPicker("time_layout", 1, 2);
    EXPECT_FALSE(elm_datetime_value_set(picker, nullptr));
    expectLog("no time to set");
    EXPECT_FALSE(elm_datetime_value_get(picker, nullptr));
    expectLog("no place for the time");
}

TEST_F(PickerTest, ADisabledPickerLooksSoAndDoesNotTurn) {
    addPicker("time_layout_24hr", 6, 30);
    const auto brightest = [this] {
        unsigned result = 0;
        for (int x = 90; x < 155; ++x) {
            result = std::max(result, stage().pixel(x, MIDDLE) & 0xFFU);
        }
        return result;
    };
    const unsigned enabled = brightest();
    elm_object_disabled_set(picker, EINA_TRUE);
    stage().settle();
    EXPECT_LT(brightest(), enabled / 2);
    stage().wheel(HOUR_24, MIDDLE, 1);
    stage().flick(MINUTE_24, MIDDLE, 0, -60);
    stage().tap(HOUR_24, MIDDLE + STEP);
    stage().settle();
    EXPECT_EQ(time(), "06:30");
    elm_object_disabled_set(picker, EINA_FALSE);
    stage().settle();
    stage().wheel(HOUR_24, MIDDLE, 1);
    EXPECT_EQ(time(), "07:30");
}

TEST_F(PickerTest, ItsGroundCanBeMadeTransparent) {
    addPicker("time_layout_24hr", 6, 30);
    // Between the two wheels' digits and the rim, on the ground of the current row.
    EXPECT_NE(stage().pixel(60, 160) & 0xFFFFFFU, 0U);
    ea_theme_object_color_replace(picker, "B0211", "transparent");
    stage().settle();
    EXPECT_EQ(stage().pixel(60, 160) & 0xFFFFFFU, 0U);
    ea_theme_object_color_replace(picker, "B0211", "no such colour");
    expectLog("Colour B0211 cannot become no such colour here");
    ea_theme_object_color_replace(nullptr, "B0211", "transparent");
    expectLog("An object and two colours are needed");
}

// The back key.

class BackKeyTest : public ScreenTest {
protected:
    struct Listener {
        BackKeyTest* test;
        std::string name;
    };

    Evas_Object* addObject() {
        Evas_Object* object = evas_object_rectangle_add(stage().canvas());
        evas_object_show(object);
        return object;
    }
    void listen(Evas_Object* object, Listener& listener) {
        eext_object_event_callback_add(object, EEXT_EVENT_BACK, heard, &listener);
    }
    static void heard(void* data, Evas_Object*, void* info) {
        auto* listener = static_cast<Listener*>(data);
        EXPECT_EQ(info, nullptr);
        listener->test->calls.push_back(listener->name);
    }

    std::vector<std::string> calls;
    Listener first{this, "first"};
    Listener second{this, "second"};
};

TEST_F(BackKeyTest, OnlyTheOneAddedLastHearsTheKey) {
    listen(addObject(), first);
    listen(addObject(), second);
    stage().backKey();
    EXPECT_THAT(calls, ElementsAre("second"));
}

TEST_F(BackKeyTest, TheReleaseOfTheKeyCounts) {
    listen(addObject(), first);
    stage().keyDown("XF86Back");
    stage().keyDown("XF86Back");
    EXPECT_THAT(calls, IsEmpty());
    stage().keyUp("XF86Back");
    EXPECT_THAT(calls, ElementsAre("first"));
}

TEST_F(BackKeyTest, EscapeIsTheBackKeyOfADesktop) {
    listen(addObject(), first);
    stage().key("Escape");
    stage().key("a");
    EXPECT_THAT(calls, ElementsAre("first"));
}

TEST_F(BackKeyTest, AHiddenOrDeletedObjectHearsNothing) {
    listen(addObject(), first);
    Evas_Object* object = addObject();
    listen(object, second);
    evas_object_hide(object);
    stage().backKey();
    evas_object_show(object);
    stage().backKey();
    evas_object_del(object);
    stage().backKey();
    EXPECT_THAT(calls, ElementsAre("first", "second", "first"));
}

TEST_F(BackKeyTest, AnObjectBehindAHiddenClipperHearsNothing) {
    Evas_Object* object = addObject();
    Evas_Object* clipper = evas_object_rectangle_add(stage().canvas());
    evas_object_clip_set(object, clipper);
    listen(object, first);
    stage().backKey();
    EXPECT_THAT(calls, IsEmpty());
    evas_object_show(clipper);
    stage().backKey();
    EXPECT_THAT(calls, ElementsAre("first"));
}

TEST_F(BackKeyTest, ACallbackTakenBackGivesItsDataAndHearsNothing) {
    Evas_Object* object = addObject();
    listen(object, first);
    EXPECT_EQ(eext_object_event_callback_del(object, EEXT_EVENT_BACK, heard), &first);
    EXPECT_EQ(eext_object_event_callback_del(object, EEXT_EVENT_BACK, heard), nullptr);
    stage().backKey();
    EXPECT_THAT(calls, IsEmpty());
}

TEST_F(BackKeyTest, ACallbackMayDeleteItsObject) {
    listen(addObject(), first);
    eext_object_event_callback_add(
        addObject(), EEXT_EVENT_BACK,
        [](void*, Evas_Object* object, void*) { evas_object_del(object); }, nullptr);
    stage().backKey();
    EXPECT_THAT(calls, IsEmpty());
    stage().backKey();
    EXPECT_THAT(calls, ElementsAre("first"));
}

TEST_F(BackKeyTest, ACallbackMayTakeItselfBack) {
    listen(addObject(), first);
    static int heardOnce;
    heardOnce = 0;
    static const eext_event_cb once = [](void*, Evas_Object* object, void*) {
        ++heardOnce;
        eext_object_event_callback_del(object, EEXT_EVENT_BACK, once);
    };
    eext_object_event_callback_add(addObject(), EEXT_EVENT_BACK, once, nullptr);
    stage().backKey();
    stage().backKey();
    EXPECT_EQ(heardOnce, 1);
    EXPECT_THAT(calls, ElementsAre("first"));
}

TEST_F(BackKeyTest, NoObjectAndNoCallbackAreErrorLines) {
    eext_object_event_callback_add(nullptr, EEXT_EVENT_BACK, heard, nullptr);
    expectLog("An object, the back key and a callback are needed");
    eext_object_event_callback_add(addObject(), EEXT_EVENT_BACK, nullptr, nullptr);
    expectLog("An object, the back key and a callback are needed");
}

// Edit fields and buttons.

class EditFieldTest : public ScreenTest {
protected:
    Evas_Object* addField() {
        Evas_Object* field = ea_editfield_add(stage().window(), EA_EDITFIELD_SINGLELINE);
        elm_object_part_text_set(field, "elm.guide", "Alarm");
        evas_object_geometry_set(field, 45, 140, 270, 48);
        evas_object_show(field);
        stage().settle();
        return field;
    }
    /** Brightest pixel of the line below the field, as 0xRRGGBB. */
    unsigned line() {
        unsigned brightest = 0;
        for (int y = 180; y < 190; ++y) {
            brightest = std::max(brightest, stage().pixel(300, y) & 0xFFFFFFU);
        }
        return brightest;
    }
};

TEST_F(EditFieldTest, TheGuideShowsUntilThereIsText) {
    Evas_Object* field = addField();
    EXPECT_TRUE(stage().shows("Alarm"));
    elm_object_focus_set(field, EINA_TRUE);
    stage().type("Hi");
    stage().settle();
    EXPECT_FALSE(stage().shows("Alarm"));
    EXPECT_STREQ(elm_entry_entry_get(field), "Hi");
    elm_entry_entry_set(field, "");
    stage().settle();
    EXPECT_TRUE(stage().shows("Alarm"));
}

TEST_F(EditFieldTest, TheLineBelowLightsUpWhileKeysGoToTheField) {
    Evas_Object* field = addField();
    EXPECT_EQ(line(), 0x3A4046U);
    elm_object_focus_set(field, EINA_TRUE);
    stage().settle();
    EXPECT_EQ(line(), 0x4DB6FFU);
    elm_object_focus_set(field, EINA_FALSE);
    stage().settle();
    EXPECT_EQ(line(), 0x3A4046U);
}

TEST_F(EditFieldTest, ASingleLineTakesNoLineBreak) {
    Evas_Object* field = addField();
    EXPECT_TRUE(elm_entry_single_line_get(field));
    EXPECT_TRUE(elm_entry_scrollable_get(field));
    EXPECT_EQ(ea_editfield_add(nullptr, EA_EDITFIELD_SINGLELINE), nullptr);
    expectLog("An edit field needs a parent");
}

class ButtonTest : public ScreenTest {
protected:
    Evas_Object* addButton(const char* style) {
        Evas_Object* button = uxt_button_add(stage().window(), style);
        elm_object_text_set(button, "Done");
        evas_object_geometry_set(button, 120, 150, 120, 48);
        evas_object_show(button);
        evas_object_smart_callback_add(
            button, "clicked", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); },
            &clicks);
        stage().settle();
        return button;
    }
    /** The ground of the button, left of its text. */
    unsigned ground() { return stage().pixel(132, 174) & 0xFFFFFFU; }

    int clicks = 0;
};

TEST_F(ButtonTest, APressShowsAndAClickCounts) {
    addButton("on_gradient_bg");
    const unsigned resting = ground();
    stage().press(180, 174);
    Stage::frames(2);
    EXPECT_NE(ground(), resting);
    stage().release();
    stage().settle();
    EXPECT_EQ(ground(), resting);
    EXPECT_EQ(clicks, 1);
}

TEST_F(ButtonTest, ADisabledButtonLooksSoAndDoesNothing) {
    Evas_Object* button = addButton("naviframe/title_right");
    const unsigned resting = ground();
    elm_object_disabled_set(button, EINA_TRUE);
    stage().settle();
    const unsigned disabled = ground();
    EXPECT_NE(disabled, resting);
    stage().tap(180, 174);
    stage().settle();
    EXPECT_EQ(ground(), disabled);
    EXPECT_EQ(clicks, 0);
    elm_object_disabled_set(button, EINA_FALSE);
    stage().settle();
    EXPECT_EQ(ground(), resting);
    stage().tap(180, 174);
    EXPECT_EQ(clicks, 1);
}

} // namespace
