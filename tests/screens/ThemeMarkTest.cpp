#include <array>
#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

/** The kinds of round marks. */
struct Mark {
    const char* name;
    Evas_Object* (*add)(Evas_Object* parent);
    const char* style;
    Eina_Bool (*isOn)(const Evas_Object* mark);
    void (*set)(Evas_Object* mark, bool on);
};

Eina_Bool radioIsOn(const Evas_Object* radio) {
    return elm_radio_value_get(radio) == 1 ? EINA_TRUE : EINA_FALSE;
}

const Mark CHECK = {"Check", elm_check_add, "default", elm_check_state_get,
                    [](Evas_Object* mark, bool on) {
                        elm_check_state_set(mark, on ? EINA_TRUE : EINA_FALSE);
                    }};
const Mark RADIO = {"Radio", elm_radio_add, "list", radioIsOn, [](Evas_Object* mark, bool on) {
                        elm_radio_value_set(mark, on ? 1 : 0);
                    }};

class MarkTest : public ScreenTest, public testing::WithParamInterface<Mark> {
protected:
    Evas_Object* addMark(Evas_Object* parent) {
        Evas_Object* mark = GetParam().add(parent);
        if (GetParam().style == std::string("list")) {
            elm_radio_state_value_set(mark, 1);
            elm_radio_value_set(mark, 0);
        }
        elm_object_style_set(mark, GetParam().style);
        evas_object_smart_callback_add(
            mark, "changed", [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); },
            &changes);
        return mark;
    }
    Evas_Object* showMark() {
        Evas_Object* mark = addMark(stage().window());
        evas_object_geometry_set(mark, 156, 156, 48, 48);
        evas_object_show(mark);
        stage().settle();
        return mark;
    }
    static Area fill(Evas_Object* mark) {
        Area area;
        edje_object_part_geometry_get(elm_layout_edje_get(mark), "fill", &area.x, &area.y,
                                      &area.width, &area.height);
        return area;
    }
    static void turn(Evas_Object* mark, bool on) {
        elm_object_signal_emit(mark, on ? "elm,activate,check,on" : "elm,activate,check,off",
                               "elm");
    }

    int changes = 0;
};

TEST_P(MarkTest, ATouchTurnsItOn) {
    Evas_Object* mark = showMark();
    const int off = fill(mark).width;
    stage().tap(180, 180);
    stage().settle();
    EXPECT_TRUE(GetParam().isOn(mark));
    EXPECT_EQ(changes, 1);
    EXPECT_GT(fill(mark).width, off + 8);
}

TEST_P(MarkTest, TheSignalMovesThePictureAlone) {
    Evas_Object* mark = showMark();
    const int off = fill(mark).width;
    turn(mark, true);
    Stage::frames(4);
    const int between = fill(mark).width;
    stage().settle();
    const int on = fill(mark).width;
    EXPECT_GT(between, off);
    EXPECT_LT(between, on);
    EXPECT_FALSE(GetParam().isOn(mark));
    turn(mark, false);
    Stage::frames(4);
    EXPECT_LT(fill(mark).width, on);
    EXPECT_GT(fill(mark).width, off);
    stage().settle();
    EXPECT_EQ(fill(mark).width, off);
    EXPECT_EQ(changes, 0);
}

TEST_P(MarkTest, AStateRightAfterTheSignalDoesNotCutItsMovementShort) {
    Evas_Object* mark = showMark();
    const int off = fill(mark).width;
    turn(mark, true);
    GetParam().set(mark, true);
    Stage::frames(4);
    const int between = fill(mark).width;
    stage().settle();
    EXPECT_GT(between, off);
    EXPECT_LT(between, fill(mark).width);
    EXPECT_TRUE(GetParam().isOn(mark));
    EXPECT_EQ(changes, 0);
}

TEST_P(MarkTest, AnotherStateRightAfterTheSignalWins) {
    Evas_Object* mark = showMark();
    const int off = fill(mark).width;
    GetParam().set(mark, true);
    stage().settle();
    turn(mark, true);
    GetParam().set(mark, false);
    stage().settle();
    EXPECT_EQ(fill(mark).width, off);
}

TEST_P(MarkTest, AStateAloneShowsAtOnce) {
    Evas_Object* mark = showMark();
    GetParam().set(mark, true);
    Stage::frames(2);
    const int on = fill(mark).width;
    stage().settle();
    EXPECT_EQ(fill(mark).width, on);
    EXPECT_GT(on, 8);
}

TEST_P(MarkTest, LetsTheTouchThroughOnceToldSo) {
    int touches = 0;
    Evas_Object* below = evas_object_rectangle_add(stage().canvas());
    evas_object_color_set(below, 0, 0, 0, 0);
    evas_object_geometry_set(below, 0, 0, 360, 360);
    evas_object_show(below);
    evas_object_event_callback_add(
        below, EVAS_CALLBACK_MOUSE_DOWN,
        [](void* data, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &touches);
    Evas_Object* mark = showMark();
    evas_object_raise(mark);
    stage().tap(180, 180);
    EXPECT_EQ(touches, 0);
    EXPECT_EQ(changes, 1);
    elm_object_signal_emit(mark, "elm,event,pass,enabled", "elm");
    stage().settle();
    stage().tap(180, 180);
    EXPECT_EQ(touches, 1);
    elm_object_disabled_set(mark, EINA_TRUE);
    elm_object_disabled_set(mark, EINA_FALSE);
    stage().settle();
    stage().tap(180, 180);
    EXPECT_EQ(touches, 2);
    EXPECT_EQ(changes, 1);
}

TEST_P(MarkTest, ADisabledMarkStays) {
    Evas_Object* mark = showMark();
    elm_object_disabled_set(mark, EINA_TRUE);
    stage().settle();
    stage().tap(180, 180);
    stage().settle();
    EXPECT_FALSE(GetParam().isOn(mark));
    elm_object_disabled_set(mark, EINA_FALSE);
    stage().settle();
    stage().tap(180, 180);
    stage().settle();
    EXPECT_TRUE(GetParam().isOn(mark));
}

INSTANTIATE_TEST_SUITE_P(Theme, MarkTest, testing::Values(CHECK, RADIO),
                         [](const auto& info) { return std::string(info.param.name); });

/** A list whose rows end in marks that let the touch through. */
class MarkedListTest : public ScreenTest {
protected:
    static constexpr int COUNT = 8;

    void showList(Evas_Object* list) {
        for (int i = 0; i < COUNT; ++i) {
            items.at(static_cast<std::size_t>(i)) =
                elm_genlist_item_append(list, rowClass(), this, nullptr, ELM_GENLIST_ITEM_NONE,
                                        countSelection, &selections);
        }
        evas_object_show(list);
        stage().settle();
    }
    Evas_Object* fullList() {
        Evas_Object* list = elm_genlist_add(stage().window());
        elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
        evas_object_geometry_set(list, 0, 84, 360, 276);
        showList(list);
        return list;
    }

    std::array<Elm_Object_Item*, COUNT> items{};
    int selections = 0;

private:
    static void countSelection(void* data, Evas_Object*, void* info) {
        ++*static_cast<int*>(data);
        elm_genlist_item_selected_set(static_cast<Elm_Object_Item*>(info), EINA_FALSE);
    }
    static Evas_Object* addMark(void*, Evas_Object* list, const char*) {
        Evas_Object* layout = elm_layout_add(list);
        elm_layout_theme_set(layout, "layout", "list/C/type.2", "default");
        Evas_Object* check = elm_check_add(layout);
        elm_object_signal_emit(check, "elm,event,pass,enabled", "elm");
        elm_object_part_content_set(layout, "elm.swallow.content", check);
        return layout;
    }
    static Elm_Genlist_Item_Class* rowClass() {
        static Elm_Genlist_Item_Class* const made = [] {
            Elm_Genlist_Item_Class* rows = elm_genlist_item_class_new();
            rows->item_style = "1line";
            rows->func.text_get = [](void*, Evas_Object*, const char*) {
                return strdup("Vibration and sound");
            };
            rows->func.content_get = addMark;
            return rows;
        }();
        return made;
    }
};

TEST_F(MarkedListTest, ATapOnTheMarkIsATapOnTheRow) {
    Evas_Object* list = fullList();
    const Row first = Stage::rows(list).front();
    Evas_Object* check = stage().widgets("Elm_Check").front();
    const Area mark = Stage::area(check);
    EXPECT_GE(mark.height, 48);
    stage().tap(mark.x + mark.width - 10, first.area.middle().y);
    stage().settle();
    EXPECT_EQ(selections, 1);
    EXPECT_FALSE(elm_check_state_get(check));
}

TEST_F(MarkedListTest, TheFirstAndTheLastRowCanBeReadAndTouched) {
    Evas_Object* list = fullList();
    EXPECT_TRUE(stage().texts().front().area.insideCircle());
    for (int i = 0; i < 4; ++i) {
        stage().drag(180, 300, 0, -220);
        stage().settle();
    }
    const Row last = Stage::rows(list).back();
    ASSERT_TRUE(last.realized);
    EXPECT_LE(last.area.y + last.area.height, 288);
    EXPECT_TRUE(stage().texts().back().area.insideCircle());
}

TEST_F(MarkedListTest, RowsAreDrawnAndTouchedDownToTheRim) {
    fullList();
    EXPECT_GT(stage().texts().back().area.y, 288);
    stage().tap(180, 330);
    stage().settle();
    EXPECT_EQ(selections, 1);
}

TEST_F(MarkedListTest, AMirroredFaceHasTheMarksOnTheLeft) {
    elm_config_mirrored_set(EINA_TRUE);
    fullList();
    EXPECT_LT(Stage::area(stage().widgets("Elm_Check").front()).x, 100);
    takeStageDown();
    elm_config_mirrored_set(EINA_FALSE);
}

TEST_F(MarkedListTest, ThreeRowsFitIntoAPopup) {
    Evas_Object* popup = elm_popup_add(stage().window());
    elm_object_style_set(popup, "theme_bg");
    elm_object_part_text_set(popup, "title,text", "Type");
    Evas_Object* list = elm_genlist_add(popup);
    elm_genlist_mode_set(list, ELM_LIST_COMPRESS);
    showList(list);
    for (std::size_t i = 3; i < items.size(); ++i) {
        elm_object_item_del(items.at(i));
    }
    elm_object_content_set(popup, list);
    evas_object_show(popup);
    stage().settle();
    ASSERT_EQ(stage().texts().size(), 4U);
    for (const FoundText& text : stage().texts()) {
        EXPECT_TRUE(text.area.insideCircle()) << text.text << " at " << text.area.y;
    }
    const int before = Stage::rows(list).front().area.y;
    stage().drag(180, 250, 0, -100);
    stage().settle();
    EXPECT_EQ(Stage::rows(list).front().area.y, before) << "all rows fit, nothing to scroll";
}

} // namespace
