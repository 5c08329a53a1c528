// The screen on which the weekdays of an alarm are chosen.

#include <cstdlib>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmRepeatViewController.h"
#include "AlarmRepeatViewItem.h"
#include "screens/EmittedSignals.h"
#include "screens/PageBelow.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

const char* const LABELS[] = {"Every day",     "Every Sunday",    "Every Monday",
                              "Every Tuesday", "Every Wednesday", "Every Thursday",
                              "Every Friday",  "Every Saturday"};
constexpr int ROWS = 8;

class RepeatScreenTest : public ScreenTest {
protected:
    void show(int weekdays = 0) {
        alarm.repeatWeekly = weekdays;
        below = new PageBelow;
        stage().push(below);
        screen = new AlarmRepeatViewController(alarm);
        screen->setSelectedCb([this] { setsSeen.push_back(alarm.repeatWeekly); });
        alive = screen->getWeakPtr();
        stage().push(screen);
        takeEmittedSignals();
    }

    Evas_Object* list() { return screen->getEvasObj(); }
    Elm_Object_Item* item(int index) { return elm_genlist_nth_item_get(list(), index); }
    AlarmRepeatViewItem& row(int index) {
        return *static_cast<AlarmRepeatViewItem*>(elm_object_item_data_get(item(index)));
    }
    Evas_Object* check(int index) { return row(index).getCheckBoxObj(); }

    void tapRow(int index) { stage().tapRow(item(index)); }

    /** The rows whose checks are on, each one scrolled into view. */
    std::vector<int> rowsOn() {
        std::vector<int> on;
        for (int index = 0; index < ROWS; ++index) {
            stage().showRow(item(index));
            if (!check(index))
                ADD_FAILURE() << "no check in row " << index;
            else if (elm_check_state_get(check(index)))
                on.push_back(index);
        }
        return on;
    }

    /** Asks every row for its check, as a list does that shows them all. */
    void askForAllChecks() {
        for (int index = 0; index < ROWS; ++index)
            row(index).getItemClassStatic()->func.content_get(&row(index), list(), "elm.icon.2");
        takeEmittedSignals();
    }

    /** "3 on" for each signal since the last call that turns the check of a row. */
    std::vector<std::string> turns() {
        std::vector<std::string> turns;
        for (const EmittedSignal& signal : takeEmittedSignals()) {
            for (int index = 0; index < ROWS; ++index) {
                if (signal.object != check(index) || signal.source != "elm")
                    continue;
                if (signal.signal == "elm,activate,check,on")
                    turns.push_back(std::to_string(index) + " on");
                else if (signal.signal == "elm,activate,check,off")
                    turns.push_back(std::to_string(index) + " off");
            }
        }
        return turns;
    }

    ClockAlarmDbData alarm{};
    PageBelow* below = nullptr;
    AlarmRepeatViewController* screen = nullptr;
    app_assist::WWeakPtr<app_assist::WViewController> alive;
    /** The record's weekdays each time that the screen told of a choice. */
    std::vector<int> setsSeen;
};

const std::vector<int> EVERY_ROW = {0, 1, 2, 3, 4, 5, 6, 7};

TEST_F(RepeatScreenTest, HasEightRowsWithSundayFirst) {
    show();
    ASSERT_EQ(elm_genlist_items_count(list()), 8U);
    for (int index = 0; index < ROWS; ++index) {
        stage().showRow(item(index));
        EXPECT_THAT(Stage::rows(list()).at(static_cast<std::size_t>(index)).texts,
                    ElementsAre(LABELS[index]));
    }
}

TEST_F(RepeatScreenTest, TheOrderDoesNotFollowTheRegion) {
    device().setSetting("db/menu_widget/regionformat", "de_DE");
    show();
    EXPECT_THAT(Stage::rows(list()).at(1).texts, ElementsAre("Every Sunday"));
}

TEST_F(RepeatScreenTest, IsCalledRepeatWeekly) {
    show();
    EXPECT_STREQ(elm_object_item_part_text_get(screen->getNaviItem(), "elm.text.title"),
                 "Repeat weekly");
    EXPECT_TRUE(stage().shows("Repeat weekly"));
}

TEST_F(RepeatScreenTest, ItsListIsCompressedAndFillsThePage) {
    show();
    EXPECT_EQ(elm_genlist_mode_get(list()), ELM_LIST_COMPRESS);
    double x = 0;
    double y = 0;
    evas_object_size_hint_weight_get(list(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(EVAS_HINT_EXPAND, EVAS_HINT_EXPAND));
    evas_object_size_hint_align_get(list(), &x, &y);
    EXPECT_EQ(std::pair(x, y), std::pair(EVAS_HINT_FILL, EVAS_HINT_FILL));
}

struct ShownSet {
    int weekdays;
    std::vector<int> rows;
};

class RepeatScreenShownTest : public RepeatScreenTest,
                              public testing::WithParamInterface<ShownSet> {};

TEST_P(RepeatScreenShownTest, ShowsTheRecord) {
    show(GetParam().weekdays);
    EXPECT_EQ(rowsOn(), GetParam().rows);
    EXPECT_EQ(alarm.repeatWeekly, GetParam().weekdays);
    EXPECT_THAT(setsSeen, IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Sets, RepeatScreenShownTest,
                         testing::Values(ShownSet{0, {}}, ShownSet{127, EVERY_ROW},
                                         ShownSet{62, {2, 3, 4, 5, 6}}, ShownSet{65, {1, 7}},
                                         ShownSet{255, {1, 2, 3, 4, 5, 6, 7}}, ShownSet{128, {}}));

TEST_F(RepeatScreenTest, EveryDayTurnsAllOnAndThenAllOff) {
    show(62);
    askForAllChecks();
    row(0).onSelect(item(0));
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_THAT(turns(),
                ElementsAre("0 on", "1 on", "2 on", "3 on", "4 on", "5 on", "6 on", "7 on"));
    row(0).onSelect(item(0));
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_THAT(turns(), ElementsAre("0 off", "1 off", "2 off", "3 off", "4 off", "5 off", "6 off",
                                     "7 off"));
    EXPECT_THAT(setsSeen, ElementsAre(127, 0));
}

TEST_F(RepeatScreenTest, ATapOnEveryDayTurnsAllOn) {
    show();
    tapRow(0);
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_EQ(rowsOn(), EVERY_ROW);
    tapRow(0);
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_THAT(rowsOn(), IsEmpty());
}

TEST_F(RepeatScreenTest, EachDayHasItsBit) {
    show();
    int expected = 0;
    for (int index = 1; index < ROWS; ++index) {
        tapRow(index);
        expected += 1 << (index - 1);
        EXPECT_EQ(alarm.repeatWeekly, expected);
    }
    EXPECT_EQ(rowsOn(), EVERY_ROW);
    for (int index = 1; index < ROWS; ++index) {
        tapRow(index);
        expected -= 1 << (index - 1);
        EXPECT_EQ(alarm.repeatWeekly, expected);
    }
    EXPECT_THAT(rowsOn(), IsEmpty());
}

TEST_F(RepeatScreenTest, TheSeventhDayTurnsEveryDayOnFirst) {
    show(63);
    askForAllChecks();
    row(7).onSelect(item(7));
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_THAT(turns(), ElementsAre("0 on", "7 on"));
}

TEST_F(RepeatScreenTest, OneDayLessTurnsEveryDayOffFirst) {
    show(127);
    askForAllChecks();
    row(4).onSelect(item(4));
    EXPECT_EQ(alarm.repeatWeekly, 119);
    EXPECT_THAT(turns(), ElementsAre("0 off", "4 off"));
}

TEST_F(RepeatScreenTest, TheSixthDayLeavesEveryDayAlone) {
    show(62);
    askForAllChecks();
    row(7).onSelect(item(7));
    EXPECT_EQ(alarm.repeatWeekly, 126);
    EXPECT_THAT(turns(), ElementsAre("7 on"));
    row(7).onSelect(item(7));
    EXPECT_EQ(alarm.repeatWeekly, 62);
    EXPECT_THAT(turns(), ElementsAre("7 off"));
}

TEST_F(RepeatScreenTest, ACheckHearsTheSignalBeforeItsStateChanges) {
    show();
    tapRow(1);
    const std::vector<EmittedSignal> signals = takeEmittedSignals();
    ASSERT_FALSE(signals.empty());
    EXPECT_EQ(signals.back().object, check(1));
    EXPECT_FALSE(signals.back().wasOn);
    EXPECT_TRUE(elm_check_state_get(check(1)));
}

TEST_F(RepeatScreenTest, ATapOnTheCheckItselfCountsOnce) {
    show();
    ASSERT_NE(check(1), nullptr);
    const Spot spot = Stage::area(check(1)).middle();
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(alarm.repeatWeekly, 1);
    EXPECT_TRUE(elm_check_state_get(check(1)));
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_FALSE(elm_check_state_get(check(1)));
    EXPECT_THAT(setsSeen, ElementsAre(1, 0));
}

TEST_F(RepeatScreenTest, TwoQuickTapsUndoEachOther) {
    show(2);
    const Spot spot = stage().findText("Every Sunday")->area.middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(alarm.repeatWeekly, 2);
    EXPECT_FALSE(elm_check_state_get(check(1)));
    EXPECT_THAT(setsSeen, ElementsAre(3, 2));
}

TEST_F(RepeatScreenTest, DraggingTheListTogglesNothing) {
    show(62);
    ASSERT_NE(check(2), nullptr);
    const Spot spot = Stage::area(check(2)).middle();
    stage().drag(spot.x, spot.y, 0, -60);
    stage().settle();
    stage().drag(180, 220, 0, -80);
    stage().settle();
    EXPECT_EQ(alarm.repeatWeekly, 62);
    EXPECT_THAT(setsSeen, IsEmpty());
    EXPECT_EQ(rowsOn(), (std::vector<int>{2, 3, 4, 5, 6}));
}

TEST_F(RepeatScreenTest, ARowOutOfViewFollowsTheRecordWhenItComesBack) {
    show(63);
    stage().showRow(item(7));
    tapRow(7);
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_EQ(rowsOn(), EVERY_ROW);
    stage().showRow(item(7));
    tapRow(7);
    EXPECT_EQ(alarm.repeatWeekly, 63);
    stage().showRow(item(0));
    EXPECT_FALSE(elm_check_state_get(check(0)));
    tapRow(0);
    EXPECT_EQ(alarm.repeatWeekly, 127);
}

TEST_F(RepeatScreenTest, RowsOutOfViewCountAsDays) {
    show(63);
    stage().showRow(item(7));
    for (int index = 0; index < ROWS; ++index) {
        if (Evas_Object* const object = check(index); object && index != 7)
            evas_object_del(object);
    }
    ASSERT_EQ(check(1), nullptr);
    row(7).onSelect(item(7));
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_TRUE(elm_check_state_get(check(7)));
    row(0).onSelect(item(0));
    EXPECT_EQ(alarm.repeatWeekly, 0);
    EXPECT_FALSE(elm_check_state_get(check(7)));
}

TEST_F(RepeatScreenTest, AnInconsistentRecordIsNotCorrected) {
    show(0);
    askForAllChecks();
    alarm.repeatWeekly = 1;
    row(1).onSelect(item(1));
    EXPECT_EQ(alarm.repeatWeekly, 2);
    alarm.repeatWeekly = 0;
    row(1).onSelect(item(1));
    EXPECT_EQ(alarm.repeatWeekly, -1);
    row(0).onSelect(item(0));
    EXPECT_EQ(alarm.repeatWeekly, 127);
}

TEST_F(RepeatScreenTest, EveryChoiceIsToldOnce) {
    show();
    tapRow(1);
    tapRow(0);
    tapRow(7);
    EXPECT_THAT(setsSeen, ElementsAre(1, 127, 63));
}

TEST_F(RepeatScreenTest, TheLastFunctionCounts) {
    show();
    int other = 0;
    screen->setSelectedCb([&] { ++other; });
    tapRow(1);
    EXPECT_EQ(other, 1);
    EXPECT_THAT(setsSeen, IsEmpty());
}

TEST_F(RepeatScreenTest, WithoutAFunctionTapsStillToggle) {
    show();
    screen->setSelectedCb(nullptr);
    tapRow(1);
    EXPECT_EQ(alarm.repeatWeekly, 1);
}

TEST_F(RepeatScreenTest, OnlyTheWeekdaysAreWritten) {
    show();
    alarm.repeatOnce = 1;
    alarm.autoDate = 5;
    alarm.manualDate = 6;
    tapRow(1);
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.autoDate, 5);
    EXPECT_EQ(alarm.manualDate, 6);
}

TEST_F(RepeatScreenTest, SettingsAndLanguageRebuildTextsAndChecks) {
    for (const auto event :
         {ClockEventListener::SETTINGS_CHANGED, ClockEventListener::LANGUAGE_CHANGED}) {
        show();
        alarm.repeatWeekly = 127;
        const TestCatalogue german{{"IDS_ALM_BODY_EVERYDAY", "Jeden Tag"},
                                   {"IDS_CLOCK_BODY_REPEAT_WEEKLY", "Wiederholen"}};
        ClockEventListener::raise(event);
        stage().settle();
        EXPECT_TRUE(stage().shows("Jeden Tag"));
        EXPECT_TRUE(stage().shows("Wiederholen"));
        EXPECT_TRUE(elm_check_state_get(check(0)));
        EXPECT_TRUE(elm_check_state_get(check(1)));
        takeEmittedSignals();
        tapRow(0);
        EXPECT_EQ(alarm.repeatWeekly, 0);
        EXPECT_FALSE(elm_check_state_get(check(0)));
    }
}

TEST_F(RepeatScreenTest, OtherEventsAreIgnored) {
    show();
    alarm.repeatWeekly = 127;
    const Evas_Object* const before = check(0);
    for (const int event : {1, 2, 3, 5, 6, 7, 8, -1})
        ClockEventListener::raise(static_cast<ClockEventListener::EventType>(event));
    stage().settle();
    EXPECT_EQ(check(0), before);
    EXPECT_FALSE(elm_check_state_get(check(0)));
}

TEST_F(RepeatScreenTest, EventsBeforeTheListAndAfterItAreHarmless) {
    {
        AlarmRepeatViewController lonely(alarm);
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    }
    show();
    evas_object_del(list());
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
    stage().settle();
    EXPECT_FALSE(alive);
}

TEST_F(RepeatScreenTest, TheBackButtonLeavesAndKeepsWhatWasToggled) {
    show();
    tapRow(1);
    Evas_Object* const back = elm_object_item_part_content_get(screen->getNaviItem(), "prev_btn");
    ASSERT_NE(back, nullptr);
    EXPECT_STREQ(elm_object_style_get(back), "naviframe/back_btn/default");
    stage().tap(back);
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_TRUE(stage().shows("Page below"));
    EXPECT_EQ(alarm.repeatWeekly, 1);
    EXPECT_EQ(below->pops, 0);
}

TEST_F(RepeatScreenTest, TwoQuickTapsOnTheBackButtonLeaveOnePage) {
    show();
    const Spot spot =
        Stage::area(elm_object_item_part_content_get(screen->getNaviItem(), "prev_btn")).middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(below->pops, 0);
}

TEST_F(RepeatScreenTest, TheBackKeyLeavesAndKeepsWhatWasToggled) {
    show();
    tapRow(0);
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(alarm.repeatWeekly, 127);
    EXPECT_EQ(below->pops, 0);
    stage().backKey();
    EXPECT_EQ(below->pops, 1);
}

TEST_F(RepeatScreenTest, ATapWhileThePageIsLeavingIsHarmless) {
    show();
    const Spot spot = stage().findText("Every Sunday")->area.middle();
    stage().backKey();
    stage().tap(spot);
    stage().settle();
    EXPECT_FALSE(alive);
}

TEST_F(RepeatScreenTest, ThePageMayLeaveFromWithinATap) {
    show();
    screen->setSelectedCb([this] { screen->popOut(); });
    tapRow(1);
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(alarm.repeatWeekly, 1);
}

TEST_F(RepeatScreenTest, ThePageMayBeDestroyedFromWithinATapTwice) {
    show();
    screen->setSelectedCb([this] {
        screen->destroy();
        screen->destroy();
    });
    tapRow(0);
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(alarm.repeatWeekly, 127);
}

TEST_F(RepeatScreenTest, ThePageGoesWithTheWindow) {
    show(62);
    tapRow(1);
    takeStageDown();
    EXPECT_FALSE(alive);
    EXPECT_EQ(alarm.repeatWeekly, 63);
}

TEST_F(RepeatScreenTest, Picture) {
    show(62);
    tapRow(1);
    stage().settle();
    stage().screenshot("repeat-screen");
}

TEST_F(RepeatScreenTest, FormatsInLabelsAreOnlyText) {
    const TestCatalogue hostile{{"IDS_ALM_BODY_EVERYDAY", "%n"},
                                {"IDS_ALM_BODY_EVERY_SUNDAY", "%s%s"},
                                {"IDS_CLOCK_BODY_REPEAT_WEEKLY", "%n%n"}};
    show();
    EXPECT_TRUE(stage().shows("%n"));
    EXPECT_TRUE(stage().shows("%s%s"));
    EXPECT_TRUE(stage().shows("%n%n"));
}

class RepeatViewRowTest : public RepeatScreenTest {
protected:
    static std::string text(AlarmRepeatViewItem& row, const char* part) {
        const std::unique_ptr<char, decltype(&std::free)> answer(
            row.getItemClassStatic()->func.text_get(&row, nullptr, part), &std::free);
        return answer ? answer.get() : "(null)";
    }
};

TEST_F(RepeatViewRowTest, AllRowsShareOneItemClass) {
    AlarmRepeatViewItem one(alarm, 0);
    AlarmRepeatViewItem other(alarm, 1);
    EXPECT_EQ(one.getItemClassStatic(), other.getItemClassStatic());
    EXPECT_STREQ(one.getItemClassStatic()->item_style, "1line");
    EXPECT_EQ(one.getItemClassNew(), nullptr);
}

TEST_F(RepeatViewRowTest, AnIndexOutsideTheWeekHasNoLabel) {
    for (const int index : {-1, 8, 1000}) {
        AlarmRepeatViewItem stray(alarm, index);
        EXPECT_EQ(text(stray, "elm.text.main.left"), "(null)") << index;
    }
}

TEST_F(RepeatViewRowTest, ServesNoOtherPart) {
    show();
    for (const char* part : {"elm.text", "elm.icon.2", "elm.text.main.left.top", ""}) {
        EXPECT_EQ(text(row(1), part), "(null)") << part;
    }
    EXPECT_EQ(text(row(1), nullptr), "(null)");
    for (const char* part : {"elm.icon", "elm.icon.1", "elm.text.main.left", ""}) {
        EXPECT_EQ(row(1).getItemClassStatic()->func.content_get(&row(1), list(), part), nullptr)
            << part;
    }
    EXPECT_EQ(row(1).getItemClassStatic()->func.content_get(&row(1), list(), nullptr), nullptr);
}

TEST_F(RepeatViewRowTest, TheCheckLetsTouchesThrough) {
    show();
    takeEmittedSignals();
    Evas_Object* const layout =
        row(1).getItemClassStatic()->func.content_get(&row(1), list(), "elm.icon.2");
    EXPECT_THAT(takeSignalsTo(check(1)), ElementsAre("elm: elm,event,pass,enabled"));
    EXPECT_STREQ(elm_object_style_get(check(1)), "default");
    EXPECT_EQ(elm_object_part_content_get(layout, "elm.swallow.content"), check(1));
    evas_object_del(layout);
}

TEST_F(RepeatViewRowTest, ThereIsNoCheckBeforeTheRowIsShown) {
    const AlarmRepeatViewItem lonely(alarm, 1);
    EXPECT_EQ(lonely.getCheckBoxObj(), nullptr);
}

TEST_F(RepeatViewRowTest, TheCheckGoesWithItsWidget) {
    show();
    Evas_Object* const shown = check(1);
    Evas_Object* const layout =
        row(1).getItemClassStatic()->func.content_get(&row(1), list(), "elm.icon.2");
    EXPECT_NE(check(1), shown);
    evas_object_del(layout);
    EXPECT_EQ(check(1), shown);
}

TEST_F(RepeatViewRowTest, AStrayIndexHasACheckThatIsOff) {
    show(62);
    AlarmRepeatViewItem stray(alarm, 8);
    Evas_Object* const layout =
        stray.getItemClassStatic()->func.content_get(&stray, list(), "elm.icon.2");
    ASSERT_NE(stray.getCheckBoxObj(), nullptr);
    EXPECT_FALSE(elm_check_state_get(stray.getCheckBoxObj()));
    evas_object_del(layout);
}

TEST_F(RepeatViewRowTest, WithoutAFunctionATapDoesNothing) {
    AlarmRepeatViewItem lonely(alarm, 1);
    lonely.onSelect(nullptr);
    int taps = 0;
    lonely.setSelectedCb([&] { ++taps; });
    lonely.onSelect(nullptr);
    EXPECT_EQ(taps, 1);
}

TEST_F(RepeatViewRowTest, AMissingRowIsLogged) {
    AlarmRepeatViewItem lonely(alarm, 1);
    Elm_Genlist_Item_Class* const itemClass = lonely.getItemClassStatic();
    EXPECT_EQ(itemClass->func.text_get(nullptr, nullptr, "elm.text.main.left"), nullptr);
    EXPECT_EQ(itemClass->func.content_get(nullptr, nullptr, "elm.icon.2"), nullptr);
    itemClass->func.del(nullptr, nullptr);
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!"));
}

} // namespace
