// What can be touched on the simulator's own pages looks otherwise while it is pressed or reached
// by keys. A toast and the level after a volume key take no touches; the quick panel has nothing
// for keys to reach; and a row of an alarm that is off is paler, but opens as any other.

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "AlarmListViewController.h"
#include "QuickPanel.h"
#include "ToastView.h"
#include "VolumeView.h"
#include "support/Look.h"
#include "support/Ring.h"
#include "support/ScreenTest.h"
#include "support/StoredData.h"

using simulator::AlarmListViewController;
using simulator::QuickPanel;
using simulator::ToastView;
using simulator::VolumeView;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";
/** The lower end of the face, with the button there. */
constexpr Area LOWER_END{100, 302, 160, 58};

class PageStatesTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
        store(7, 30, 1);
        store(22, 45, 0);
        stage().push(new AlarmListViewController(THEME));
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        ScreenTest::TearDown();
    }
    static void store(int hour, int minute, int enable) {
        ClockAlarmDbData alarm = alarmAt(hour, minute, 62);
        alarm.enable = enable;
        storeAlarm(alarm);
    }
    Evas_Object* list() { return stage().widgets("Elm_Genlist").front(); }
    Elm_Object_Item* alarmRow(unsigned position) {
        // Below the padding.
        return elm_genlist_nth_item_get(list(), position + 1);
    }
    Area area(const Elm_Object_Item* item) {
        for (const Row& row : Stage::rows(list()))
            if (row.item == item)
                return row.area;
        return {};
    }
    Look look(Elm_Object_Item* item) { return {stage(), area(item)}; }
    Evas_Object* button(const char* style) {
        for (Evas_Object* found : stage().widgets("Elm_Button"))
            if (elm_object_style_get(found) == std::string(style))
                return found;
        ADD_FAILURE() << "no button " << style;
        return nullptr;
    }
};

TEST_F(PageStatesTest, ARowShowsAFingerUntilItScrolls) {
    stage().showRow(alarmRow(0));
    const Look before = look(alarmRow(0));
    const Spot middle = area(alarmRow(0)).middle();
    stage().press(middle.x, middle.y);
    EXPECT_GT(look(alarmRow(0)).unlike(before), 100 * SEEN);
    stage().screenshot("alarm-pressed");
    for (int y = middle.y; y > middle.y - 80; y -= 4)
        stage().moveTo(middle.x, y);
    stage().settle();
    stage().release();
    stage().settle();
    stage().showRow(alarmRow(0));
    EXPECT_EQ(look(alarmRow(0)).unlike(before), 0);
}

TEST_F(PageStatesTest, ARowShowsTheKeys) {
    stage().showRow(alarmRow(0));
    const Look before = look(alarmRow(0));
    for (int i = 0; i < 8 && ringed(stage()).size() != 1; ++i)
        stage().keySettled("Tab");
    while (theRinged(stage()).type != "Elm_Genlist")
        stage().keySettled("Tab");
    EXPECT_GT(look(alarmRow(0)).accent(), before.accent() + 5 * SEEN);
    stage().screenshot("alarm-focused");
    stage().tap(180, 20);
    EXPECT_EQ(look(alarmRow(0)).unlike(before), 0);
}

TEST_F(PageStatesTest, AnAlarmThatIsOffIsPaler) {
    stage().showRow(alarmRow(1));
    const auto off = stage().findText("22:45");
    ASSERT_TRUE(off);
    const int shown = Look(stage(), off->area).brightest();
    stage().showRow(alarmRow(0));
    const auto on = stage().findText("07:30");
    ASSERT_TRUE(on);
    EXPECT_LT(shown, Look(stage(), on->area).brightest() - 80);
}

TEST_F(PageStatesTest, TheButtonAtTheLowerEndShowsAFingerTheKeysAndThatItCannotBeUsed) {
    Evas_Object* const create = button("simulator/create");
    const Look before(stage(), LOWER_END);
    pressOn(stage(), create);
    EXPECT_GT(Look(stage(), LOWER_END).unlike(before), 50 * SEEN);
    stage().screenshot("create-pressed");
    stage().moveTo(180, 20);
    stage().release();
    EXPECT_EQ(Look(stage(), LOWER_END).unlike(before), 0);
    ASSERT_TRUE(tabTo(stage(), create));
    EXPECT_GT(Look(stage(), LOWER_END).unlike(before), 40);
    stage().screenshot("create-focused");
    stage().tap(180, 20);
    elm_object_disabled_set(create, EINA_TRUE);
    const Look disabled(stage(), LOWER_END);
    EXPECT_GT(disabled.unlike(before), 50 * SEEN);
    EXPECT_LT(disabled.brightest(), before.brightest() / 2);
    stage().screenshot("create-disabled");
    pressOn(stage(), create);
    EXPECT_EQ(Look(stage(), LOWER_END).unlike(disabled), 0) << "it answers a touch";
    stage().release();
    EXPECT_FALSE(tabTo(stage(), create));
}

TEST_F(PageStatesTest, TheWayToTheOtherListShowsAFingerAndTheKeys) {
    Evas_Object* const other = button("naviframe/back_btn/default");
    const Look before(stage(), other);
    pressOn(stage(), other);
    EXPECT_GT(Look(stage(), other).unlike(before), 10 * SEEN);
    stage().moveTo(180, 20);
    stage().release();
    EXPECT_EQ(Look(stage(), other).unlike(before), 0);
    ASSERT_TRUE(tabTo(stage(), other));
    EXPECT_GT(Look(stage(), other).unlike(before), SEEN);
}

TEST_F(PageStatesTest, AFingerOnTheQuickPanelShows) {
    QuickPanel panel(stage().window(), THEME, [](bool) {});
    panel.toggle();
    Stage::advance(0.6);
    const Area middle{40, 80, 280, 270};
    const Look before(stage(), middle);
    stage().press(180, 260);
    EXPECT_GT(Look(stage(), middle).unlike(before), 500 * SEEN);
    stage().screenshot("quick-panel-pressed");
    stage().release();
    Stage::advance(0.6);
    ASSERT_FALSE(panel.isShown());
    panel.toggle();
    Stage::advance(0.6);
    EXPECT_EQ(Look(stage(), middle).unlike(before), 0);
}

TEST_F(PageStatesTest, WhatOnlyTellsSomethingLetsTouchesThrough) {
    Evas_Object* const below = evas_object_rectangle_add(stage().canvas());
    evas_object_color_set(below, 0, 0, 0, 0);
    evas_object_geometry_set(below, 0, 0, Stage::SIZE, Stage::SIZE);
    evas_object_show(below);
    int touches = 0;
    evas_object_event_callback_add(
        below, EVAS_CALLBACK_MOUSE_DOWN,
        [](void* data, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &touches);
    const std::string text = "Alarm set for 6 hours from now";
    ToastView toasts(stage().window(), THEME);
    toasts.post(text);
    VolumeView volume(stage().window(), THEME);
    volume.show(7);
    Stage::advance(0.5);
    ASSERT_TRUE(stage().shows(text));
    ASSERT_TRUE(stage().shows("7"));
    stage().tapText(text);
    stage().tapText("7");
    EXPECT_EQ(touches, 2);
    evas_object_del(below);
}

} // namespace
