// Rows of the device's lists near the rim of the face: drawn smaller, and touched where they are
// drawn.

#include <algorithm>
#include <cmath>
#include <string_view>

#include <gtest/gtest.h>

#include "AlarmSnoozeItem.h"
#include "AlarmVolumeItem.h"
#include "screens/EditorFixture.h"
#include "support/FaceInk.h"

namespace {

class RimTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        createAlarm();
    }
    template <class RowClass>
    RowClass* row() {
        for (Elm_Object_Item* item = elm_genlist_first_item_get(genlist()); item;
             item = elm_genlist_item_next_get(item)) {
            auto* data = static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item));
            if (auto* found = dynamic_cast<RowClass*>(data))
                return found;
        }
        return nullptr;
    }
    int scrolled() {
        int y = 0;
        elm_scroller_region_get(genlist(), nullptr, &y, nullptr, nullptr);
        return y;
    }
    void scrollTo(int y) {
        elm_scroller_region_show(genlist(), 0, y, Stage::SIZE, 204);
        stage().settle();
    }
    /** Scrolls so that the upper edge of a row is at a height of the face. */
    void bringTo(Elm_Object_Item* item, int top) {
        const auto* tracker = static_cast<Evas_Object*>(elm_object_item_track(item));
        if (!tracker) {
            elm_object_item_untrack(item);
            elm_genlist_item_show(item, ELM_GENLIST_ITEM_SCROLLTO_IN);
            stage().settle();
            tracker = static_cast<Evas_Object*>(elm_object_item_track(item));
        }
        int y = 0;
        evas_object_geometry_get(tracker, nullptr, &y, nullptr, nullptr);
        elm_object_item_untrack(item);
        scrollTo(scrolled() + y - top);
    }
    /** Places below the title where the face looks otherwise than before. */
    std::string differences(const std::vector<unsigned>& before) {
        const auto now = stage().pixels(0, 88, Stage::SIZE, 272);
        std::string places;
        for (std::size_t i = 0; i < now.size() && places.size() < 200; ++i) {
            if (now[i] != before[i])
                places += std::to_string(i % Stage::SIZE) + "," +
                          std::to_string(88 + i / Stage::SIZE) + " ";
        }
        return places;
    }
    Evas_Object* visible(const char* type) {
        const auto all = stage().widgets(type);
        return all.empty() ? nullptr : all.front();
    }
    /** Of the drawn texts the one that reads so. */
    void tapInk(const std::string& text) {
        const auto area = ink(text).area;
        stage().tap(static_cast<int>(area.x) + 5, static_cast<int>(area.y) + 5);
    }
    Ink ink(const std::string& text) {
        for (const Ink& drawn : inkOf(stage().canvas())) {
            if (drawn.what == text)
                return drawn;
        }
        ADD_FAILURE() << text << " is not drawn";
        return {};
    }
};

TEST_F(RimTest, ARowInTheMiddleIsAsItIs) {
    bringTo(elm_genlist_nth_item_get(genlist(), 1), 136);
    const Ink text = ink("Repeat weekly");
    EXPECT_EQ(text.opacity, 1);
    EXPECT_EQ(text.area.x, 45);
    EXPECT_GE(text.area.height, 26);
}

TEST_F(RimTest, ARowAtTheRimIsSmallerFainterAndInside) {
    bringTo(elm_genlist_nth_item_get(genlist(), 1), 280);
    const Ink text = ink("Repeat weekly");
    EXPECT_LT(text.opacity, 0.8);
    EXPECT_GT(text.opacity, 0.05);
    EXPECT_GT(text.area.x, 60);
    EXPECT_LE(text.area.reach(), 180);
    int height = 0;
    evas_object_geometry_get(text.object, nullptr, nullptr, nullptr, &height);
    EXPECT_LT(text.area.height, height - 2);
}

TEST_F(RimTest, ASwitchIsTouchedWhereItIsDrawn) {
    auto* snooze = row<AlarmSnoozeItem>();
    bringTo(snooze->getElmObjectItem(), 244);
    Evas_Object* check = visible("Elm_Check");
    ASSERT_NE(check, nullptr);
    const Area drawn = Stage::area(check);
    int x = 0;
    int width = 0;
    evas_object_geometry_get(check, &x, nullptr, &width, nullptr);
    ASSERT_LT(drawn.x + drawn.width, x + width - 8) << "the row is not near the rim";
    const bool was = elm_check_state_get(check) != EINA_FALSE;
    // Near its inner edge: on a row of full size this would miss it.
    stage().tap(drawn.x + 6, drawn.middle().y);
    stage().settle();
    EXPECT_NE(elm_check_state_get(check) != EINA_FALSE, was);
    // Where it would be on a row of full size.
    stage().tap(x + width - 2, drawn.middle().y);
    stage().settle();
    EXPECT_NE(elm_check_state_get(check) != EINA_FALSE, was);
}

TEST_F(RimTest, ASliderFollowsTheFingerAlsoWhenItIsSmall) {
    bringTo(row<AlarmVolumeItem>()->getElmObjectItem(), 252);
    Evas_Object* slider = visible("Elm_Slider");
    ASSERT_NE(slider, nullptr);
    const Area drawn = Stage::area(slider);
    ASSERT_LT(drawn.width, 250) << "the row is not near the rim";
    // From the knob, which stands at 7 of 15, to the end of the track.
    const double before = elm_slider_value_get(slider);
    const int knobX = drawn.x + static_cast<int>(drawn.width * (0.163 + 0.052 + 0.733 * 7 / 15));
    stage().drag(knobX, drawn.middle().y, drawn.width / 4, 0);
    EXPECT_NEAR(elm_slider_value_get(slider), before + 15 / (4 * 0.733), 1.5);
}

TEST_F(RimTest, AListFollowsTheFingerAlsoOnASmallRow) {
    bringTo(elm_genlist_nth_item_get(genlist(), 1), 270);
    const int before = scrolled();
    stage().drag(120, 290, 0, -120);
    const int there = scrolled();
    scrollTo(before);
    stage().drag(120, 180, 0, -120);
    EXPECT_NEAR(there, scrolled(), 2);
    EXPECT_GT(there, before + 80);
}

TEST_F(RimTest, ASmallRowIsChosenWhereItIsDrawn) {
    bringTo(elm_genlist_nth_item_get(genlist(), 2), 262);
    tapInk("Alarm type");
    stage().settle();
    EXPECT_TRUE(stage().shows("Vibration"));
}

TEST_F(RimTest, WhatChangesInASmallRowIsSeen) {
    bringTo(elm_genlist_nth_item_get(genlist(), 2), 262);
    const auto before = stage().pixels(60, 262, 240, 90);
    tapInk("Alarm type");
    stage().settle();
    stage().tapText("Vibration and sound");
    stage().settle();
    const auto after = stage().pixels(60, 262, 240, 90);
    EXPECT_NE(after, before);
    evas_damage_rectangle_add(stage().canvas(), 0, 0, Stage::SIZE, Stage::SIZE);
    stage().settle();
    EXPECT_EQ(stage().pixels(60, 262, 240, 90), after) << "it is drawn late";
}

/** Rows at the list's upper edge were cut twice: at their full size, and once more as drawn. */
TEST_F(RimTest, HowAListCameToAPlaceIsNotSeenThere) {
    for (const int from : {0, 60, 130, 220, 400}) {
        scrollTo(from);
        stage().drag(60, 285, 0, -195);
        stage().settle();
        const int there = scrolled();
        const auto dragged = stage().pixels(0, 88, Stage::SIZE, 272);
        scrollTo(from);
        scrollTo(there);
        EXPECT_EQ(differences(dragged), "") << from;
        elm_genlist_realized_items_update(genlist());
        stage().settle();
        EXPECT_EQ(differences(dragged), "") << from;
    }
}

TEST_F(RimTest, RowsVanishSoftlyBelowTheTitle) {
    const auto brightness = [this](int y) {
        unsigned most = 0;
        for (int x = 40; x < 320; ++x)
            most = std::max(most, stage().pixel(x, y) & 0xff);
        return most;
    };
    bringTo(elm_genlist_nth_item_get(genlist(), 1), 60);
    EXPECT_LT(brightness(87), 60U);
    EXPECT_GT(std::max(brightness(120), brightness(124)), 120U);
}

TEST_F(RimTest, AListAtItsUpperEndIsNotSoftened) {
    const Ink hour = ink("05");
    const unsigned there = stage().pixel(static_cast<int>(hour.area.x) + 14, 98);
    scrollTo(4);
    scrollTo(0);
    EXPECT_EQ(stage().pixel(static_cast<int>(hour.area.x) + 14, 98), there);
    EXPECT_EQ(scrolled(), 0);
}

TEST_F(RimTest, NothingIsDrawnWhileNobodyTouchesTheFace) {
    for (const int y : {0, 40, 130, 240, 420}) {
        scrollTo(y);
        const int frames = stage().renderedFrames();
        Stage::advance(3);
        EXPECT_EQ(stage().renderedFrames(), frames) << y;
    }
}

TEST_F(RimTest, ARowThatGrowsIsMeasuredAgain) {
    auto* snooze = row<AlarmSnoozeItem>();
    bringTo(snooze->getElmObjectItem(), 240);
    elm_genlist_realized_items_update(genlist());
    stage().settle();
    for (const Ink& drawn : inkOf(stage().canvas())) {
        if (drawn.opacity > 0.08) {
            EXPECT_LE(drawn.area.reach(), 180) << drawn.what;
        }
    }
}

} // namespace
