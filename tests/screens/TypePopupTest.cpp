// The popup in which the alert type is chosen.

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <app_assist/WContentViewController.h>

#include "AlarmTypePopupViewController.h"
#include "AlarmTypePopupViewItem.h"
#include "screens/EmittedSignals.h"
#include "screens/PageBelow.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

const char* const LABELS[] = {"Sound", "Vibration", "Vibration and sound"};

class TypePopupTest : public ScreenTest {
protected:
    void show(int type = 0) {
        alarm.type = type;
        page = new PageBelow;
        stage().push(page);
        popup = new AlarmTypePopupViewController(alarm);
        popup->setSelectedCb([this] { typesSeen.push_back(alarm.type); });
        alive = popup->getWeakPtr();
        page->attachPopup(popup);
        stage().settle();
        takeEmittedSignals();
    }

    bool isOpen() const { return static_cast<bool>(alive); }
    Evas_Object* list() { return elm_object_content_get(popup->getEvasObj()); }
    Elm_Object_Item* item(int index) { return elm_genlist_nth_item_get(list(), index); }
    AlarmTypePopupViewItem& row(int index) {
        return *static_cast<AlarmTypePopupViewItem*>(elm_object_item_data_get(item(index)));
    }
    std::vector<Evas_Object*> radios() { return stage().widgets("Radio"); }
    /** As it is drawn: the values of a radio that stands alone tell nothing. */
    static bool isOn(const Evas_Object* radio) {
        double value = 0;
        const char* const state =
            edje_object_part_state_get(elm_layout_edje_get(radio), "fill", &value);
        return std::string(state ? state : "") == "on";
    }
    void choose(const std::string& label) {
        stage().tapText(label);
        stage().settle();
    }

    ClockAlarmDbData alarm{};
    PageBelow* page = nullptr;
    AlarmTypePopupViewController* popup = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> alive;
    /** The record's type each time that the popup told of a choice. */
    std::vector<int> typesSeen;
};

TEST_F(TypePopupTest, OffersThreeTypes) {
    show();
    EXPECT_TRUE(stage().shows("Type"));
    const std::vector<Row> rows = Stage::rows(list());
    ASSERT_EQ(rows.size(), 3U);
    for (std::size_t i = 0; i < 3; ++i)
        EXPECT_THAT(rows[i].texts, ElementsAre(LABELS[i]));
}

TEST_F(TypePopupTest, HasTheThemedBackgroundAndATitleThatIsTranslated) {
    show();
    EXPECT_STREQ(elm_object_style_get(popup->getEvasObj()), "theme_bg");
    const TestCatalogue german{{"IDS_ALM_BODY_TYPE", "Art"}};
    stage().settle();
    EXPECT_TRUE(stage().shows("Art"));
}

TEST_F(TypePopupTest, ItsListIsCompressedAndFillsThePopup) {
    show();
    EXPECT_EQ(elm_genlist_mode_get(list()), ELM_LIST_COMPRESS);
    double x = 0;
    double y = 0;
    evas_object_size_hint_weight_get(list(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    evas_object_size_hint_align_get(list(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
}

TEST_F(TypePopupTest, AListThatIsNeverShownStandsBesideTheOther) {
    show();
    int lists = 0;
    int hidden = 0;
    for (Evas_Object* object = evas_object_bottom_get(stage().canvas()); object;
         object = evas_object_above_get(object)) {
        if (object == list() || !elm_object_widget_check(object) ||
            std::string(elm_object_widget_type_get(object)).find("Genlist") == std::string::npos)
            continue;
        ++lists;
        hidden += !evas_object_visible_get(object);
    }
    EXPECT_EQ(lists, 1);
    EXPECT_EQ(hidden, 1);
    EXPECT_EQ(stage().widgets("Genlist").size(), 1U);
}

class TypePopupTypeTest : public TypePopupTest, public testing::WithParamInterface<int> {};

INSTANTIATE_TEST_SUITE_P(Types, TypePopupTypeTest, testing::Values(0, 1, 2));

TEST_P(TypePopupTypeTest, ShowsTheTypeOfTheRecord) {
    show(GetParam());
    ASSERT_EQ(radios().size(), 3U);
    for (const Evas_Object* radio : radios()) {
        EXPECT_EQ(isOn(radio), elm_radio_value_get(radio) == GetParam());
        EXPECT_STREQ(elm_object_style_get(radio), "list");
    }
    EXPECT_EQ(alarm.type, GetParam());
}

TEST_P(TypePopupTypeTest, AChoiceIsWrittenToldAndClosesThePopup) {
    show(1);
    alarm.type = 7;
    choose(LABELS[GetParam()]);
    EXPECT_EQ(alarm.type, GetParam());
    EXPECT_THAT(typesSeen, ElementsAre(GetParam()));
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(stage().shows("Type"));
    EXPECT_EQ(page->pops, 0);
}

TEST_P(TypePopupTypeTest, ChoosingTheChosenTypeCountsAsWell) {
    show(GetParam());
    choose(LABELS[GetParam()]);
    EXPECT_EQ(alarm.type, GetParam());
    EXPECT_THAT(typesSeen, ElementsAre(GetParam()));
    EXPECT_FALSE(isOpen());
}

TEST_P(TypePopupTypeTest, ATapOnTheRadioIsATapOnTheRow) {
    show((GetParam() + 1) % 3);
    for (Evas_Object* radio : radios()) {
        if (elm_radio_value_get(radio) == GetParam()) {
            stage().tap(radio);
            break;
        }
    }
    stage().settle();
    EXPECT_EQ(alarm.type, GetParam());
    EXPECT_THAT(typesSeen, ElementsAre(GetParam()));
    EXPECT_FALSE(isOpen());
}

TEST_P(TypePopupTypeTest, AChoiceTurnsItsRadioOn) {
    show((GetParam() + 1) % 3);
    Evas_Object* chosen = nullptr;
    for (Evas_Object* radio : radios()) {
        if (elm_radio_value_get(radio) == GetParam())
            chosen = radio;
    }
    ASSERT_NE(chosen, nullptr);
    ASSERT_FALSE(isOn(chosen));
    row(GetParam()).setSelectedCb(nullptr); // The popup stays.
    stage().tapText(LABELS[GetParam()]);
    stage().settle();
    EXPECT_THAT(takeSignalsTo(chosen), ElementsAre("elm: elm,activate,check,on"));
    EXPECT_TRUE(isOn(chosen));
    EXPECT_EQ(elm_radio_state_value_get(chosen), GetParam());
    EXPECT_FALSE(elm_genlist_item_selected_get(item(GetParam())));
    EXPECT_TRUE(isOpen());
}

TEST_F(TypePopupTest, AnUnknownTypeTurnsNoRadioOn) {
    for (const int type : {3, -1}) {
        show(type);
        ASSERT_EQ(radios().size(), 3U);
        for (const Evas_Object* radio : radios())
            EXPECT_FALSE(isOn(radio)) << type;
        stage().backKey();
        stage().settle();
        EXPECT_EQ(alarm.type, type);
    }
}

TEST_F(TypePopupTest, TheBackKeyClosesItWithItsAnimationAndReachesNobodyElse) {
    show(2);
    stage().backKey();
    Stage::frames(2);
    EXPECT_TRUE(isOpen() && stage().shows("Sound")) << "it is still fading";
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 2);
    EXPECT_THAT(typesSeen, IsEmpty());
    EXPECT_EQ(page->pops, 0);
    stage().backKey();
    EXPECT_EQ(page->pops, 1);
}

TEST_F(TypePopupTest, TwoBackKeysCloseNothingElse) {
    show();
    stage().backKey();
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(page->pops, 0);
}

TEST_F(TypePopupTest, AChoiceAndThenTheBackKeyCloseItOnce) {
    show();
    stage().tapText("Vibration");
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 1);
    EXPECT_EQ(page->pops, 0);
}

TEST_F(TypePopupTest, ADoubleTapClosesItOnce) {
    show();
    const Spot spot = stage().findText("Vibration")->area.middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 1);
    EXPECT_EQ(page->pops, 0);
}

TEST_F(TypePopupTest, DraggingTheListChoosesNothing) {
    show(0);
    const Spot spot = stage().findText("Vibration")->area.middle();
    stage().drag(spot.x, spot.y, 0, -70);
    stage().settle();
    EXPECT_EQ(alarm.type, 0);
    EXPECT_TRUE(isOpen());
}

TEST_F(TypePopupTest, ItsOwnDismissalDeletesIt) {
    show(2);
    elm_popup_dismiss(popup->getEvasObj());
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 2);
    EXPECT_THAT(typesSeen, IsEmpty());
}

TEST_F(TypePopupTest, TheLastFunctionCounts) {
    show();
    int other = 0;
    popup->setSelectedCb([&] { ++other; });
    choose("Vibration");
    EXPECT_EQ(other, 1);
    EXPECT_THAT(typesSeen, IsEmpty());
}

TEST_F(TypePopupTest, WithoutAFunctionAChoiceStillCounts) {
    show();
    popup->setSelectedCb(nullptr);
    choose("Vibration");
    EXPECT_EQ(alarm.type, 1);
    EXPECT_FALSE(isOpen());
}

TEST_F(TypePopupTest, TheFunctionMayDestroyThePopup) {
    show();
    popup->setSelectedCb([this] {
        popup->destroy();
        popup->destroy();
    });
    choose("Vibration and sound");
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 2);
}

TEST_F(TypePopupTest, TheFunctionMayDestroyThePageBelow) {
    show();
    const auto pageAlive = page->getWeakPtr();
    popup->setSelectedCb([this] { page->destroy(); });
    choose("Vibration");
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(pageAlive);
    EXPECT_EQ(alarm.type, 1);
}

TEST_F(TypePopupTest, ThePopupGoesWithThePageWhileItIsOpen) {
    show();
    page->destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(TypePopupTest, ThePopupGoesWithThePageWhileItIsClosing) {
    show();
    stage().backKey();
    ASSERT_TRUE(isOpen());
    page->destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(TypePopupTest, ThePopupGoesWithTheWindow) {
    show();
    takeStageDown();
    EXPECT_FALSE(isOpen());
}

TEST_F(TypePopupTest, ThePopupGoesWithTheWindowWhileItIsClosing) {
    show();
    stage().tapText("Vibration");
    takeStageDown();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(alarm.type, 1);
}

TEST_F(TypePopupTest, APopupThatWasNeverShownCanGo) {
    const AlarmTypePopupViewController lonely(alarm);
    EXPECT_EQ(lonely.getEvasObj(), nullptr);
}

TEST_F(TypePopupTest, FormatsInLabelsAreOnlyText) {
    const TestCatalogue hostile{{"IDS_ALM_BODY_TYPE", "%n"},
                                {"IDS_ALM_BODY_SOUND", "%s%s"},
                                {"IDS_ALM_BODY_ALERTTYEP_VIBRATION", "%n%n"}};
    show();
    EXPECT_TRUE(stage().shows("%n"));
    EXPECT_TRUE(stage().shows("%s%s"));
    EXPECT_TRUE(stage().shows("%n%n"));
}

TEST_F(TypePopupTest, Picture) {
    show(2);
    stage().screenshot("type-popup");
}

TEST_F(TypePopupTest, EverythingThatMattersLiesOnTheRoundFace) {
    show();
    for (const char* wanted : {"Type", "Vibration"}) {
        const auto found = stage().findText(wanted);
        ASSERT_TRUE(found) << wanted;
        EXPECT_TRUE(found->area.insideCircle()) << wanted;
    }
}

class TypePopupRowTest : public TypePopupTest {
protected:
    static std::string text(AlarmTypePopupViewItem& row, const char* part) {
        const std::unique_ptr<char, decltype(&std::free)> answer(
            row.getItemClassStatic()->func.text_get(&row, nullptr, part), &std::free);
        return answer ? answer.get() : "(null)";
    }
    Evas_Object* content(AlarmTypePopupViewItem& row, const char* part) {
        return row.getItemClassStatic()->func.content_get(&row, list(), part);
    }
};

TEST_F(TypePopupRowTest, AllRowsShareOneItemClass) {
    AlarmTypePopupViewItem one(alarm, 0);
    AlarmTypePopupViewItem other(alarm, 1);
    EXPECT_EQ(one.getItemClassStatic(), other.getItemClassStatic());
    EXPECT_STREQ(one.getItemClassStatic()->item_style, "1line");
    EXPECT_EQ(one.getItemClassNew(), nullptr);
}

TEST_F(TypePopupRowTest, ServesNoOtherPart) {
    show();
    for (const char* part : {"elm.text", "elm.icon.2", "elm.text.main.left.top", ""})
        EXPECT_EQ(text(row(1), part), "(null)") << part;
    EXPECT_EQ(text(row(1), nullptr), "(null)");
    for (const char* part : {"elm.icon", "elm.icon.1", "elm.text.main.left", ""})
        EXPECT_EQ(content(row(1), part), nullptr) << part;
    EXPECT_EQ(content(row(1), nullptr), nullptr);
}

TEST_F(TypePopupRowTest, TheRadioLetsTouchesThrough) {
    show();
    Evas_Object* const layout = content(row(1), "elm.icon.2");
    Evas_Object* const radio = elm_object_part_content_get(layout, "elm.swallow.content");
    ASSERT_NE(radio, nullptr);
    EXPECT_THAT(takeSignalsTo(radio), ElementsAre("elm: elm,event,pass,enabled"));
    EXPECT_EQ(elm_radio_value_get(radio), 1);
    evas_object_del(layout);
}

TEST_F(TypePopupRowTest, AnIndexWithoutATypeHasNoLabelAndWritesNothing) {
    show(2);
    for (const int index : {-1, 3}) {
        AlarmTypePopupViewItem stray(alarm, index);
        EXPECT_EQ(text(stray, "elm.text.main.left"), "(null)");
        int taps = 0;
        stray.setSelectedCb([&] { ++taps; });
        stray.onSelect(item(0));
        EXPECT_EQ(alarm.type, 2);
        EXPECT_EQ(taps, 1);
    }
}

TEST_F(TypePopupRowTest, ASelectionWithoutAnItemDoesNothing) {
    show(2);
    row(0).onSelect(nullptr);
    EXPECT_EQ(alarm.type, 2);
    EXPECT_THAT(typesSeen, IsEmpty());
    EXPECT_THAT(takeEmittedSignals(), IsEmpty());
}

TEST_F(TypePopupRowTest, ASelectedItemIsUnselected) {
    show(2);
    auto* const other = new AlarmTypePopupViewItem(alarm, 1);
    // Without the framework's callback, which would unselect it before.
    Elm_Object_Item* const item =
        elm_genlist_item_append(list(), other->getItemClassStatic(), other, nullptr,
                                ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_selected_set(item, EINA_TRUE);
    ASSERT_TRUE(elm_genlist_item_selected_get(item));
    other->onSelect(item);
    EXPECT_FALSE(elm_genlist_item_selected_get(item));
    EXPECT_EQ(alarm.type, 1);
}

TEST_F(TypePopupRowTest, WithoutAFunctionTheTypeIsWritten) {
    show(2);
    AlarmTypePopupViewItem lonely(alarm, 0);
    lonely.onSelect(item(0));
    EXPECT_EQ(alarm.type, 0);
    EXPECT_TRUE(isOpen());
}

TEST_F(TypePopupRowTest, AMissingRowIsLogged) {
    show();
    Elm_Genlist_Item_Class* const itemClass = row(0).getItemClassStatic();
    EXPECT_EQ(itemClass->func.text_get(nullptr, nullptr, "elm.text.main.left"), nullptr);
    EXPECT_EQ(itemClass->func.content_get(nullptr, nullptr, "elm.icon.2"), nullptr);
    itemClass->func.del(nullptr, nullptr);
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!"));
}

} // namespace
