// Rows look otherwise while a finger is on them, while keys lead to them, and while they cannot be
// used. A row that is one control ("1icon"), a field ("entry.main") or the wheels
// ("edit.theme.time") has the states of what is in it; nothing selects a row for longer than a
// touch.

#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "support/Look.h"
#include "support/Ring.h"
#include "support/ScreenTest.h"

namespace {

class RowStatesTest : public ScreenTest, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        Evas_Object* const pages = stage().naviframe().getEvasObj();
        list = elm_genlist_add(pages);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        Elm_Genlist_Item_Class* const rowClass = elm_genlist_item_class_new();
        rowClass->item_style = GetParam();
        rowClass->func.text_get = [](void*, Evas_Object*, const char*) {
            return strdup("Text");
        };
        rowClass->func.content_get = addControl;
        for (int i = 0; i < 5; ++i)
            elm_genlist_item_append(list, rowClass, this, nullptr, ELM_GENLIST_ITEM_NONE, unselect,
                                    nullptr);
        elm_genlist_item_class_free(rowClass);
        elm_naviframe_item_push(pages, "Rows", nullptr, nullptr, list, nullptr);
        stage().settle();
        item = elm_genlist_nth_item_get(list, 1);
    }
    Area area() { return Stage::rows(list).at(1).area; }
    Look look() { return {stage(), area()}; }
    /** Keys bring what they reach to the middle. */
    void scrollBack() {
        elm_scroller_region_show(list, 0, 0, 1, 1);
        stage().settle();
    }
    void press() { stage().press(area().x + 100, area().middle().y); }

    Evas_Object* list = nullptr;
    Elm_Object_Item* item = nullptr;

private:
    static void unselect(void*, Evas_Object*, void* info) {
        elm_genlist_item_selected_set(static_cast<Elm_Object_Item*>(info), EINA_FALSE);
    }
    static Evas_Object* addControl(void*, Evas_Object* parent, const char*) {
        if (std::strcmp(GetParam(), "2line.top") == 0)
            return nullptr;
        Evas_Object* const check = elm_check_add(parent);
        if (std::strcmp(GetParam(), "1line") != 0)
            elm_object_style_set(check, "on&off");
        elm_check_state_set(check, EINA_TRUE);
        return check;
    }
};

TEST_P(RowStatesTest, APressShowsUntilItEnds) {
    const Look before = look();
    press();
    EXPECT_GT(look().unlike(before), 100 * SEEN);
    stage().screenshot(std::string("row-pressed-") + GetParam());
    stage().release();
    EXPECT_EQ(look().unlike(before), 0);
}

TEST_P(RowStatesTest, AFingerThatScrollsDoesNotPress) {
    const Look before = look();
    const int top = area().y;
    press();
    for (int moved = 0; moved < 60; moved += 4)
        stage().moveTo(100, area().middle().y - 4);
    stage().settle();
    stage().release();
    scrollBack();
    ASSERT_EQ(area().y, top);
    EXPECT_EQ(look().unlike(before), 0);
}

TEST_P(RowStatesTest, TheKeysAreSeen) {
    const Look before = look();
    stage().keySettled("Tab");
    stage().keySettled("Tab");
    ASSERT_EQ(theRinged(stage()).area.y, area().y);
    stage().screenshot(std::string("row-focused-") + GetParam());
    scrollBack();
    EXPECT_GT(look().unlike(before), SEEN);
    EXPECT_GT(look().accent(), before.accent() + SEEN);
    stage().tap(180, 20);
    EXPECT_EQ(look().unlike(before), 0);
}

TEST_P(RowStatesTest, ADisabledOneIsPaler) {
    const Look before = look();
    elm_object_item_disabled_set(item, EINA_TRUE);
    const Look disabled = look();
    EXPECT_GT(disabled.unlike(before), SEEN);
    EXPECT_LT(disabled.brightest(), before.brightest() * 2 / 3);
    stage().screenshot(std::string("row-disabled-") + GetParam());
    press();
    EXPECT_EQ(look().unlike(disabled), 0) << "it answers a touch";
    stage().release();
    stage().keySettled("Tab");
    stage().keySettled("Tab");
    scrollBack();
    EXPECT_EQ(look().unlike(disabled), 0) << "keys reach it";
    stage().tap(180, 20);
    elm_object_item_disabled_set(item, EINA_FALSE);
    EXPECT_EQ(look().unlike(before), 0);
}

INSTANTIATE_TEST_SUITE_P(Styles, RowStatesTest,
                         testing::Values("2line.top", "1line", "multiline_sub.main.1icon"),
                         [](const auto& style) {
                             std::string name = style.param;
                             std::erase_if(name, [](char c) { return std::isalnum(c) == 0; });
                             return name;
                         });

} // namespace
