#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/ea.h>
#include <device/uxt.h>

#include "support/FaceInk.h"
#include "support/ScreenTest.h"

using testing::Contains;
using testing::ElementsAre;

namespace {

constexpr const char* GUIDE = "\uF897 Search";
constexpr const char* LONG_ROW = "Llanfairpwllgwyngyllgogerych, Wales";

/** A page to search on, as far as the theme and the device's widgets make it. */
class SearchPageTest : public ScreenTest {
protected:
    Evas_Object* addLayout(Evas_Object* parent, const char* group, const char* style) {
        Evas_Object* layout = elm_layout_add(parent);
        EXPECT_TRUE(elm_layout_theme_set(layout, "layout", group, style)) << group << "/" << style;
        evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
        return layout;
    }
    void showPage(int rows = 60) {
        Evas_Object* naviframe = stage().naviframe().getEvasObj();
        Evas_Object* outer = addLayout(naviframe, "application", "default");
        base = addLayout(outer, "application", "searchbar_base");
        elm_layout_signal_emit(base, "elm,state,show,searchbar", "elm");
        elm_object_part_content_set(outer, "elm.swallow.content", base);
        fastscroll = addLayout(base, "application", "fastscroll");
        elm_object_part_content_set(base, "elm.swallow.content", fastscroll);
        addBar();
        addIndex();
        addList(rows);
        Elm_Object_Item* item =
            elm_naviframe_item_push(naviframe, "Add city", nullptr, nullptr, outer, nullptr);
        back = elm_button_add(naviframe);
        elm_object_style_set(back, "naviframe/back_btn/default");
        elm_object_text_set(back, "Cancel");
        elm_object_item_part_content_set(item, "prev_btn", back);
        stage().settle();
    }
    void showIndex(bool shown) {
        elm_layout_signal_emit(
            fastscroll, shown ? "elm,state,fastscroll,show" : "elm,state,fastscroll,hide", "");
        elm_index_level_go(index, 0);
        stage().settle();
    }
    void showNothingFound() {
        evas_object_del(elm_object_part_content_unset(fastscroll, "elm.swallow.content"));
        list = nullptr;
        Evas_Object* nothing = addLayout(fastscroll, "nocontents", "search");
        elm_object_part_text_set(nothing, "elm.text", "No search results");
        elm_object_part_content_set(fastscroll, "elm.swallow.content", nothing);
        showIndex(false);
    }

    /** The labels of the index that are drawn, and what they say. */
    std::vector<FoundText> labels() const {
        std::vector<FoundText> found;
        Evas_Object* box =
            edje_object_part_swallow_get(elm_layout_edje_get(index), "elm.swallow.index.0");
        Eina_List* members = evas_object_smart_members_get(box);
        void* member = nullptr;
        EINA_LIST_FREE(members, member) {
            auto* label = static_cast<Evas_Object*>(member);
            const char* text = std::strcmp(evas_object_type_get(label), "edje") == 0
                                   ? edje_object_part_text_get(label, "elm.text")
                                   : nullptr;
            if (text)
                found.push_back({text, label, index, placeOf(label)});
        }
        return found;
    }
    /** What the index says in the middle of the face. */
    std::string saidByIndex() const {
        const char* text = edje_object_part_text_get(elm_layout_edje_get(index), "elm.text");
        return text ? text : "";
    }
    /** Where its text is; its label keeps the place of the longest text. */
    static Area placeOf(Evas_Object* label) {
        const auto* text = edje_object_part_object_get(label, "elm.text");
        return Stage::area(const_cast<Evas_Object*>(text));
    }
    bool clearButtonIsShown() {
        return stage().canBeSeen(elm_object_part_content_get(field, "elm.swallow.button"));
    }
    std::string typed() const { return elm_entry_entry_get(entry); }
    int changesWhileFocused = 0;

    Evas_Object* base = nullptr;
    Evas_Object* fastscroll = nullptr;
    Evas_Object* field = nullptr;
    Evas_Object* entry = nullptr;
    Evas_Object* location = nullptr;
    Evas_Object* index = nullptr;
    Evas_Object* list = nullptr;
    Evas_Object* back = nullptr;
    std::vector<std::string> indexed;

private:
    void addBar() {
        Evas_Object* bar = elm_layout_add(base);
        EXPECT_TRUE(
            elm_layout_file_set(bar, CLOCK_RESOURCE_DIR "/edje/WorldClockAddCityViewController.edj",
                                "searchbar.layout"));
        elm_object_part_content_set(base, "searchbar", bar);
        field = uxt_edit_field_layout_add(bar, UXT_EDIT_FIELD_SEARCH);
        uxt_edit_field_set_clear_button_enabled(field, EINA_TRUE);
        elm_object_part_content_set(bar, "entry.part", field);
        entry = uxt_edit_field_layout_get_entry(field);
        elm_object_part_text_set(entry, "elm.guide", GUIDE);
        evas_object_smart_callback_add(entry, "changed", _changedCb, this);
        location = elm_button_add(bar);
        elm_object_part_content_set(bar, "location.btn", location);
        EXPECT_TRUE(elm_object_style_set(location, "bg_animated"));
    }
    void addIndex() {
        index = elm_index_add(fastscroll);
        elm_object_part_content_set(fastscroll, "elm.swallow.fastscroll", index);
        elm_index_autohide_disabled_set(index, EINA_TRUE);
        for (int hour = -11; hour <= 14; ++hour)
            elm_index_item_append(index, std::to_string(hour).c_str(), nullptr, nullptr);
        evas_object_smart_callback_add(index, "changed", _indexedCb, this);
    }
    void addList(int rows) {
        list = elm_genlist_add(fastscroll);
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        elm_genlist_homogeneous_set(list, EINA_TRUE);
        elm_scroller_policy_set(list, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
        Elm_Genlist_Item_Class* rowClass = elm_genlist_item_class_new();
        rowClass->item_style = "2line.top";
        rowClass->func.text_get = _textCb;
        for (int i = 0; i < rows; ++i)
            elm_genlist_item_append(list, rowClass, nullptr, nullptr, ELM_GENLIST_ITEM_NONE,
                                    nullptr, nullptr);
        elm_genlist_item_class_free(rowClass);
        elm_object_part_content_set(fastscroll, "elm.swallow.content", list);
    }
    static void _changedCb(void* data, Evas_Object* entry, void*) {
        if (elm_object_focus_get(entry))
            ++static_cast<SearchPageTest*>(data)->changesWhileFocused;
    }
    static void _indexedCb(void* data, Evas_Object*, void* item) {
        static_cast<SearchPageTest*>(data)->indexed.emplace_back(
            elm_index_item_letter_get(static_cast<Elm_Object_Item*>(item)));
    }
    static char* _textCb(void*, Evas_Object*, const char* part) {
        return strdup(std::strstr(part, "main") ? LONG_ROW : "GMT+0:00");
    }
};

/** How far the corner of an area that is farthest from the middle of the face is from it. */
double reachOf(const Area& area) {
    const double x = std::max(std::abs(area.x - 180), std::abs(area.x + area.width - 180));
    const double y = std::max(std::abs(area.y - 180), std::abs(area.y + area.height - 180));
    return std::hypot(x, y);
}

TEST_F(SearchPageTest, TheBarAndItsButtonsLieInsideTheCircleBelowTheTitle) {
    showPage();
    const Area bar = Stage::area(field);
    const Area button = Stage::area(location);
    EXPECT_TRUE(bar.insideCircle());
    EXPECT_TRUE(button.insideCircle());
    EXPECT_GE(bar.y, 84);
    EXPECT_GE(bar.height, 48);
    EXPECT_GE(button.width, 48);
    EXPECT_EQ(button.y, bar.y);
    EXPECT_GE(button.x, bar.x + bar.width);
    EXPECT_TRUE(Stage::area(back).insideCircle());
    EXPECT_GE(Stage::area(entry).y, bar.y);
    EXPECT_LE(Stage::area(entry).height, bar.height);
    EXPECT_LE(bar.y + bar.height, Stage::area(list).y);
}

TEST_F(SearchPageTest, WithoutItsSignalTheBarTakesNoRoom) {
    showPage();
    const int with = Stage::area(list).y;
    elm_layout_signal_emit(base, "elm,state,hide,searchbar", "elm");
    stage().settle();
    EXPECT_EQ(Stage::area(list).y, with - 56);
    EXPECT_FALSE(stage().canBeSeen(field));
}

TEST_F(SearchPageTest, LabelsFollowTheRim) {
    showPage();
    showIndex(true);
    const auto found = labels();
    ASSERT_GE(found.size(), 8U);
    EXPECT_EQ(found.front().text, "-11");
    EXPECT_EQ(found.back().text, "14");
    for (const FoundText& label : found) {
        const Spot middle = label.area.middle();
        EXPECT_NEAR(std::hypot(middle.x - 180, middle.y - 180), 164, 3) << label.text;
        EXPECT_GT(middle.x, 180);
        EXPECT_NE(label.text, "*");
    }
}

TEST_F(SearchPageTest, LabelsFollowTheOtherRimOnAMirroredFace) {
    elm_config_mirrored_set(EINA_TRUE);
    showPage();
    showIndex(true);
    const auto found = labels();
    EXPECT_GE(found.size(), 8U);
    for (const FoundText& label : found) {
        const Spot middle = label.area.middle();
        EXPECT_NEAR(std::hypot(middle.x - 180, middle.y - 180), 164, 3) << label.text;
        EXPECT_LT(middle.x, 180);
    }
    EXPECT_LT(Stage::area(location).x, Stage::area(field).x);
    takeStageDown();
    elm_config_mirrored_set(EINA_FALSE);
}

TEST_F(SearchPageTest, TheGuideBeginsWhereOneReadsFrom) {
    for (const bool mirrored : {true, false}) {
        elm_config_mirrored_set(mirrored ? EINA_TRUE : EINA_FALSE);
        showPage();
        elm_object_part_text_set(entry, "elm.guide", "\uF897 بحث");
        stage().settle();
        const Area around = Stage::area(field);
        int found = 0;
        for (const Ink& ink : inkOf(stage().canvas())) {
            if (!ink.isText || ink.what.find("بحث") == std::string::npos)
                continue;
            const double middle = ink.area.x + ink.area.width / 2;
            EXPECT_EQ(middle > around.middle().x, mirrored) << middle;
            ++found;
        }
        EXPECT_EQ(found, 1);
        takeStageDown();
    }
    elm_config_mirrored_set(EINA_FALSE);
}

TEST_F(SearchPageTest, TextsOfRowsEndBeforeTheIndex) {
    showPage();
    showIndex(true);
    int widest = 0;
    for (const FoundText& text : stage().texts()) {
        if (text.area.y > 140 && text.area.y < 250)
            widest = std::max(widest, text.widget == list ? text.area.x + text.area.width : 0);
    }
    const auto found = labels();
    ASSERT_FALSE(found.empty());
    const int narrow = Stage::area(list).width;
    // A row's text ends at seven eighths of the list.
    const double end = narrow * 0.875;
    for (const FoundText& label : found)
        EXPECT_LE(end, label.area.x) << label.text;
    EXPECT_LE(widest, end + 1);
    showIndex(false);
    EXPECT_GT(Stage::area(list).width, narrow);
}

TEST_F(SearchPageTest, AFingerOnTheIndexIsToldTheHourInTheMiddle) {
    showPage();
    showIndex(true);
    const unsigned before = stage().pixel(150, 240);
    stage().press(350, 180);
    stage().settle();
    ASSERT_FALSE(indexed.empty());
    const auto said = stage().findText(indexed.back());
    ASSERT_TRUE(said);
    EXPECT_EQ(saidByIndex(), indexed.back());
    EXPECT_NE(stage().pixel(150, 240), before);
    stage().screenshot("search-index-pressed");
    stage().release();
    stage().settle();
    EXPECT_EQ(stage().pixel(150, 240), before);
}

TEST_F(SearchPageTest, AMovingFingerReachesHoursThatHaveNoLabel) {
    showPage();
    showIndex(true);
    stage().press(350, 148);
    for (int y = 148; y < 284; ++y) {
        stage().moveTo(330, y);
        Stage::frames(1);
    }
    stage().release();
    stage().settle();
    for (int hour = -11; hour <= 14; ++hour)
        EXPECT_THAT(indexed, Contains(std::to_string(hour)));
}

TEST_F(SearchPageTest, AFingerAnywhereInTheStripIsOnTheLabelBesideIt) {
    showPage();
    showIndex(true);
    for (const FoundText& label : labels()) {
        for (const int x : {304, 330, 356}) {
            if (label.text == "\u2022")
                continue;
            stage().press(x, label.area.middle().y);
            stage().settle();
            EXPECT_EQ(saidByIndex(), label.text) << "at " << x;
            stage().release();
            stage().settle();
        }
    }
}

TEST_F(SearchPageTest, TheIndexComesBackWithAllItsLabels) {
    showPage();
    showIndex(true);
    const auto first = labels().size();
    showIndex(false);
    elm_index_item_clear(index);
    for (int hour = 1; hour <= 3; ++hour)
        elm_index_item_append(index, std::to_string(hour).c_str(), nullptr, nullptr);
    showIndex(true);
    EXPECT_EQ(labels().size(), 3U);
    showIndex(false);
    elm_index_item_clear(index);
    for (int hour = -11; hour <= 14; ++hour)
        elm_index_item_append(index, std::to_string(hour).c_str(), nullptr, nullptr);
    showIndex(true);
    EXPECT_EQ(labels().size(), first);
}

TEST_F(SearchPageTest, AHiddenIndexTakesNoTouches) {
    showPage();
    showIndex(false);
    stage().tap(345, 200);
    stage().settle();
    EXPECT_TRUE(indexed.empty());
}

TEST_F(SearchPageTest, ASearchThatFindsNothingSaysSoInsideTheCircle) {
    showPage();
    showNothingFound();
    const auto text = stage().findText("No search results");
    ASSERT_TRUE(text);
    EXPECT_LT(reachOf(text->area), 180);
    EXPECT_GT(text->area.y, Stage::area(field).y + 48);
    stage().screenshot("search-nothing");
}

TEST_F(SearchPageTest, TheClearButtonIsThereWhileThereIsText) {
    showPage();
    EXPECT_FALSE(clearButtonIsShown());
    stage().tap(entry);
    stage().type("rio");
    stage().settle();
    EXPECT_EQ(typed(), "rio");
    EXPECT_TRUE(clearButtonIsShown());
    for (int i = 0; i < 3; ++i)
        stage().key("BackSpace");
    stage().settle();
    EXPECT_EQ(typed(), "");
    EXPECT_FALSE(clearButtonIsShown());
}

TEST_F(SearchPageTest, TheClearButtonEmptiesTheFieldAndLeavesItFocused) {
    showPage();
    stage().tap(entry);
    stage().type("rio");
    stage().settle();
    changesWhileFocused = 0;
    stage().tap(elm_object_part_content_get(field, "elm.swallow.button"));
    stage().settle();
    EXPECT_EQ(typed(), "");
    EXPECT_TRUE(elm_object_focus_get(entry));
    EXPECT_GT(changesWhileFocused, 0);
    stage().type("x");
    EXPECT_EQ(typed(), "x");
}

TEST_F(SearchPageTest, TheClearButtonFocusesAFieldThatWasLeft) {
    showPage();
    stage().tap(entry);
    stage().type("rio");
    elm_object_focus_set(entry, EINA_FALSE);
    stage().settle();
    changesWhileFocused = 0;
    stage().tap(elm_object_part_content_get(field, "elm.swallow.button"));
    stage().settle();
    EXPECT_EQ(typed(), "");
    EXPECT_TRUE(elm_object_focus_get(entry));
    EXPECT_GT(changesWhileFocused, 0);
}

TEST_F(SearchPageTest, AFieldCanBeWithoutItsClearButton) {
    showPage();
    uxt_edit_field_set_clear_button_enabled(field, EINA_FALSE);
    elm_entry_entry_set(entry, "rio");
    stage().settle();
    EXPECT_EQ(elm_object_part_content_get(field, "elm.swallow.button"), nullptr);
    uxt_edit_field_set_clear_button_enabled(field, EINA_TRUE);
    stage().settle();
    EXPECT_TRUE(clearButtonIsShown());
}

TEST_F(SearchPageTest, WhatIsTypedTogetherWithTheClearButtonKeepsItsOrder) {
    showPage();
    stage().tap(entry);
    stage().type("buenos");
    stage().settle();
    EXPECT_EQ(typed(), "buenos");
    EXPECT_EQ(elm_entry_cursor_pos_get(entry), 6);
    stage().screenshot("search-typed");
}

TEST_F(SearchPageTest, AnEditFieldIsMadeOnlyOfAParentAndAKnownType) {
    Evas_Object* window = stage().window();
    EXPECT_EQ(uxt_edit_field_layout_add(nullptr, UXT_EDIT_FIELD_SEARCH), nullptr);
    expectLog("An edit field needs a parent");
    EXPECT_EQ(uxt_edit_field_layout_add(window, 6), nullptr);
    expectLog("There is no edit field of type 6");
    EXPECT_EQ(uxt_edit_field_layout_get_entry(window), nullptr);
    uxt_edit_field_set_clear_button_enabled(nullptr, EINA_TRUE);
    EXPECT_EQ(takeErrors().size(), 2U);
}

/** The pixels of an area that something is drawn on. */
std::vector<Spot> inkIn(Stage& stage, const Area& area) {
    std::vector<Spot> ink;
    for (int y = area.y; y < area.y + area.height; ++y) {
        for (int x = area.x; x < area.x + area.width; ++x) {
            if ((stage.pixel(x, y) & 0xFF) > 0x50)
                ink.push_back({x - area.x, y - area.y});
        }
    }
    return ink;
}

Area boundsOf(const std::vector<Spot>& ink) {
    Area bounds{999, 999, 0, 0};
    for (const Spot& spot : ink) {
        bounds.x = std::min(bounds.x, spot.x);
        bounds.y = std::min(bounds.y, spot.y);
    }
    for (const Spot& spot : ink) {
        bounds.width = std::max(bounds.width, spot.x - bounds.x + 1);
        bounds.height = std::max(bounds.height, spot.y - bounds.y + 1);
    }
    return bounds;
}

TEST_F(SearchPageTest, TheGuideBeginsWithAMagnifierAndNotWithTheBoxOfAMissingCharacter) {
    showPage();
    const Area text = Stage::area(entry);
    const Area place{text.x + 4, text.y + 8, 24, 32};
    const auto magnifier = inkIn(stage(), place);
    // No font has this character.
    elm_object_part_text_set(entry, "elm.guide", "\uF6D3 Search");
    stage().settle();
    const auto missing = inkIn(stage(), place);
    ASSERT_FALSE(magnifier.empty());
    const Area bounds = boundsOf(magnifier);
    EXPECT_GE(bounds.width, 14);
    EXPECT_LE(bounds.width, 22);
    EXPECT_NEAR(bounds.width, bounds.height, 3);
    const auto has = [&magnifier](int x, int y) {
        return std::any_of(magnifier.begin(), magnifier.end(), [x, y](const Spot& spot) {
            return std::abs(spot.x - x) <= 1 && std::abs(spot.y - y) <= 1;
        });
    };
    // A handle to the lower right, and nothing in the other corners or inside the ring.
    EXPECT_TRUE(has(bounds.x + bounds.width - 2, bounds.y + bounds.height - 2));
    EXPECT_FALSE(has(bounds.x + 1, bounds.y + bounds.height - 2));
    EXPECT_FALSE(has(bounds.x + bounds.width - 2, bounds.y + 1));
    EXPECT_FALSE(has(bounds.x + bounds.width * 4 / 10, bounds.y + bounds.height * 4 / 10));
    const auto same = [](const Spot& a, const Spot& b) {
        return a.x == b.x && a.y == b.y;
    };
    EXPECT_FALSE(
        std::equal(magnifier.begin(), magnifier.end(), missing.begin(), missing.end(), same));
}

TEST_F(SearchPageTest, AColourInTheFirstTextOfARowIsDrawn) {
    showPage(0);
    Elm_Genlist_Item_Class* rowClass = elm_genlist_item_class_new();
    rowClass->item_style = "2line.top";
    rowClass->func.text_get = [](void*, Evas_Object*, const char* part) -> char* {
        if (!std::strstr(part, "main"))
            return strdup("GMT+0:00");
        int r = 0;
        int g = 0;
        int b = 0;
        int a = 0;
        ea_theme_color_get("T1067", &r, &g, &b, &a, nullptr, nullptr, nullptr, nullptr, nullptr,
                           nullptr, nullptr, nullptr);
        char text[128];
        std::snprintf(text, sizeof text, "<color=#%02x%02x%02x%02x>Lon</color>don", r, g, b, a);
        return strdup(text);
    };
    elm_genlist_item_append(list, rowClass, nullptr, nullptr, ELM_GENLIST_ITEM_NONE, nullptr,
                            nullptr);
    elm_genlist_item_class_free(rowClass);
    stage().settle();
    int accent = 0;
    int white = 0;
    for (int y = 144; y < 192; ++y) {
        for (int x = 40; x < 160; ++x) {
            const unsigned pixel = stage().pixel(x, y) & 0xFFFFFF;
            accent += pixel == 0x4DB6FF ? 1 : 0;
            white += pixel == 0xFFFFFF ? 1 : 0;
        }
    }
    EXPECT_GT(accent, 20);
    EXPECT_GT(white, 20);
}

TEST_F(SearchPageTest, ThePageLooksAsItShould) {
    showPage();
    showIndex(true);
    stage().screenshot("search-page");
}

TEST_F(ScreenTest, AColourOfTheThemeIsToldWithItsOutlineAndShadow) {
    int r = -1;
    int g = -1;
    int b = -1;
    int a = -1;
    EXPECT_TRUE(ea_theme_color_get("T1067", &r, &g, &b, &a, nullptr, nullptr, nullptr, nullptr,
                                   nullptr, nullptr, nullptr, nullptr));
    EXPECT_THAT((std::vector<int>{r, g, b, a}), ElementsAre(77, 182, 255, 255));
    EXPECT_TRUE(ea_theme_color_get("press", nullptr, nullptr, nullptr, &a, nullptr, nullptr,
                                   nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    EXPECT_EQ(a, 36);
}

TEST_F(ScreenTest, AColourThatTheThemeLacksLeavesEverythingUntouched) {
    int r = 5;
    EXPECT_FALSE(ea_theme_color_get("T9999", &r, nullptr, nullptr, nullptr, nullptr, nullptr,
                                    nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    expectLog("The theme has no colour T9999");
    EXPECT_FALSE(ea_theme_color_get(nullptr, &r, nullptr, nullptr, nullptr, nullptr, nullptr,
                                    nullptr, nullptr, nullptr, nullptr, nullptr, nullptr));
    expectLog("The theme has no colour without a name");
    EXPECT_EQ(r, 5);
}

} // namespace
