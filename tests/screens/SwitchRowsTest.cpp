// The editor's rows with a switch: snooze, and gradually increasing volume.

#include <cstdint>
#include <cstdlib>
#include <functional>
#include <memory>
#include <ostream>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmIncreaseVolumeItem.h"
#include "AlarmSnoozeItem.h"
#include "screens/EmittedSignals.h"
#include "screens/RowPage.h"
#include "screens/TestCatalogue.h"
#include "support/ScreenTest.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char* ON = "elm: elm,activate,check,on";
constexpr const char* OFF = "elm: elm,activate,check,off";

struct SwitchKind {
    const char* name;
    std::int32_t ClockAlarmDbData::*option;
    std::function<AlarmSwitchItem*(ClockAlarmDbData&)> make;
    const char* title;
    const char* explanation;
    const char* titleId;
    const char* explanationId;
};

void PrintTo(const SwitchKind& kind, std::ostream* out) {
    *out << kind.name;
}

class SwitchRowsTest : public ScreenTest, public testing::WithParamInterface<SwitchKind> {
protected:
    void show(int option = 0) {
        alarm.*GetParam().option = option;
        row = GetParam().make(alarm);
        row->setSelectedCb([this] { valuesSeen.push_back(value()); });
        page = new RowPage(row);
        stage().push(page);
        takeEmittedSignals();
    }

    std::int32_t value() const { return alarm.*GetParam().option; }
    Evas_Object* check() {
        const auto found = stage().widgets("Check");
        return found.empty() ? nullptr : found.back();
    }
    bool isOn() { return elm_check_state_get(check()); }
    void tapRow() { stage().tapText(GetParam().title); }
    void tapSwitch() { stage().tap(check()); }
    void refresh() {
        elm_genlist_item_update(page->item());
        stage().settle();
    }

    /** What the row answers for a part; "(null)" for nothing. */
    std::string answer(const char* part) {
        const ItemClass itemClass(row->getItemClassNew(), &elm_genlist_item_class_free);
        const std::unique_ptr<char, decltype(&std::free)> text(
            itemClass->func.text_get(row, page->genlist(), part), &std::free);
        return text ? text.get() : "(null)";
    }
    std::string explanation() { return answer("elm.text.multiline"); }

    using ItemClass =
        std::unique_ptr<Elm_Genlist_Item_Class, decltype(&elm_genlist_item_class_free)>;

    ClockAlarmDbData alarm{};
    AlarmSwitchItem* row = nullptr;
    RowPage* page = nullptr;
    /** The option each time that the row called its function. */
    std::vector<int> valuesSeen;
};

INSTANTIATE_TEST_SUITE_P(
    Rows, SwitchRowsTest,
    testing::Values(
        SwitchKind{"Snooze", &ClockAlarmDbData::snooze,
                   [](ClockAlarmDbData& alarm) { return new AlarmSnoozeItem(alarm); }, "Snooze",
                   "Sound the alarm 3 times at 5-minute intervals.", "IDS_ALM_BODY_SNOOZE",
                   "IDS_CLOCK_SBODY_SOUND_THE_ALARM_P1SD_TIMES_AT_P2SD_MINUTE_INTERVALS"},
        SwitchKind{"IncreaseVolume", &ClockAlarmDbData::increaseVolume,
                   [](ClockAlarmDbData& alarm) { return new AlarmIncreaseVolumeItem(alarm); },
                   "Increase volume", "Increase the alarm volume for the first 60 seconds.",
                   "IDS_CLOCK_MBODY_INCREASE_VOLUME",
                   "IDS_CLOCK_SBODY_INCREASE_THE_ALARM_VOLUME_FOR_THE_FIRST_PD_SECONDS"}),
    [](const auto& info) { return info.param.name; });

TEST_P(SwitchRowsTest, ShowsItsTitleAndItsExplanation) {
    show();
    EXPECT_THAT(Stage::rows(page->genlist()).front().texts,
                ElementsAre(GetParam().title, GetParam().explanation));
}

TEST_P(SwitchRowsTest, TheSwitchStartsAsTheRecordHasIt) {
    show(1);
    EXPECT_TRUE(isOn());
    EXPECT_STREQ(elm_object_style_get(check()), "on&off");
}

TEST_P(SwitchRowsTest, TheSwitchStartsOffWhenTheOptionIsOff) {
    show(0);
    EXPECT_FALSE(isOn());
    EXPECT_THAT(valuesSeen, IsEmpty());
}

TEST_P(SwitchRowsTest, OnlyTheLowByteOfTheFieldCounts) {
    show(0x100);
    EXPECT_FALSE(isOn());
    for (const auto& [stored, on] : {std::pair(2, true), std::pair(-256, false),
                                     std::pair(0x1ff, true), std::pair(-1, true)}) {
        alarm.*GetParam().option = stored;
        refresh();
        EXPECT_EQ(isOn(), on) << stored;
        EXPECT_EQ(value(), stored) << "showing it writes nothing";
    }
}

TEST_P(SwitchRowsTest, ATapOnTheRowTurnsTheOptionOff) {
    show(1);
    tapRow();
    EXPECT_EQ(value(), 0);
    EXPECT_FALSE(isOn());
    EXPECT_THAT(takeSignalsTo(check()), ElementsAre(OFF));
    EXPECT_FALSE(elm_genlist_item_selected_get(page->item()));
}

TEST_P(SwitchRowsTest, AnotherTapOnTheRowTurnsItOnAgain) {
    show(1);
    tapRow();
    stage().settle();
    takeEmittedSignals();
    tapRow();
    EXPECT_EQ(value(), 1);
    EXPECT_TRUE(isOn());
    EXPECT_THAT(takeSignalsTo(check()), ElementsAre(ON));
}

TEST_P(SwitchRowsTest, ASelectedItemIsUnselected) {
    show(1);
    auto* const other = GetParam().make(alarm);
    const ItemClass itemClass(other->getItemClassNew(), &elm_genlist_item_class_free);
    // Without the framework's callback, which would unselect it before.
    Elm_Object_Item* const item = elm_genlist_item_append(
        page->genlist(), itemClass.get(), other, nullptr, ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
    elm_genlist_item_selected_set(item, EINA_TRUE);
    ASSERT_TRUE(elm_genlist_item_selected_get(item));
    other->onSelect(item);
    EXPECT_FALSE(elm_genlist_item_selected_get(item));
    EXPECT_EQ(value(), 0);
}

TEST_P(SwitchRowsTest, TheSwitchHearsTheSignalBeforeItsStateChanges) {
    show(0);
    tapRow();
    const std::vector<EmittedSignal> signals = takeEmittedSignals();
    ASSERT_EQ(signals.size(), 1U);
    EXPECT_FALSE(signals.front().wasOn);
    EXPECT_TRUE(isOn());
}

TEST_P(SwitchRowsTest, TheKnobMovesWithTheTap) {
    show(0);
    const SignalCount moved(check(), "elm,activate,check,on");
    tapRow();
    stage().settle();
    EXPECT_EQ(moved.count(), 1);
}

TEST_P(SwitchRowsTest, ATapOnTheExplanationIsATapOnTheRow) {
    show(0);
    stage().tapText(GetParam().explanation);
    EXPECT_EQ(value(), 1);
    EXPECT_TRUE(isOn());
    EXPECT_THAT(valuesSeen, ElementsAre(0));
}

TEST_P(SwitchRowsTest, TwoQuickTapsOnTheRowUndoEachOther) {
    show(1);
    const Spot spot = stage().findText(GetParam().title)->area.middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(value(), 1);
    EXPECT_TRUE(isOn());
    EXPECT_THAT(valuesSeen, ElementsAre(1, 0));
}

TEST_P(SwitchRowsTest, ATapOnTheSwitchWritesItsNewState) {
    show(1);
    tapSwitch();
    EXPECT_EQ(value(), 0);
    EXPECT_FALSE(isOn());
    tapSwitch();
    EXPECT_EQ(value(), 1);
    EXPECT_TRUE(isOn());
}

TEST_P(SwitchRowsTest, ATapOnTheSwitchEmitsNoSignalOfTheRows) {
    show(1);
    tapSwitch();
    tapSwitch();
    EXPECT_THAT(takeEmittedSignals(), IsEmpty());
}

TEST_P(SwitchRowsTest, TwoQuickTapsOnTheSwitchUndoEachOther) {
    show(0);
    const Spot spot = Stage::area(check()).middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(value(), 0);
    EXPECT_FALSE(isOn());
    EXPECT_THAT(valuesSeen, ElementsAre(1, 0));
}

TEST_P(SwitchRowsTest, TheFunctionRunsOnceBeforeATapOnTheRowAndOnceAfterOneOnTheSwitch) {
    show(1);
    tapRow();
    EXPECT_THAT(valuesSeen, ElementsAre(1));
    tapSwitch();
    EXPECT_THAT(valuesSeen, ElementsAre(1, 1));
    tapSwitch();
    EXPECT_THAT(valuesSeen, ElementsAre(1, 1, 0));
}

TEST_P(SwitchRowsTest, TheLastFunctionCounts) {
    show(1);
    int other = 0;
    row->setSelectedCb([&] { ++other; });
    tapRow();
    tapSwitch();
    EXPECT_EQ(other, 2);
    EXPECT_THAT(valuesSeen, IsEmpty());
}

TEST_P(SwitchRowsTest, WithoutAFunctionTapsStillSwitch) {
    show(1);
    row->setSelectedCb(nullptr);
    tapRow();
    EXPECT_EQ(value(), 0);
    tapSwitch();
    EXPECT_EQ(value(), 1);
}

TEST_P(SwitchRowsTest, TheSwitchDecidesNotTheRecord) {
    show(1);
    alarm.*GetParam().option = 0;
    tapRow();
    EXPECT_EQ(value(), 0);
    EXPECT_FALSE(isOn());
}

TEST_P(SwitchRowsTest, ARefreshedListShowsTheRecord) {
    show(1);
    alarm.*GetParam().option = 0;
    refresh();
    EXPECT_FALSE(isOn());
    alarm.*GetParam().option = 1;
    refresh();
    EXPECT_TRUE(isOn());
    EXPECT_THAT(valuesSeen, IsEmpty());
    tapSwitch();
    EXPECT_EQ(value(), 0);
    tapRow();
    EXPECT_EQ(value(), 1);
}

TEST_P(SwitchRowsTest, ARefreshFromWithinTheFunctionIsHarmless) {
    show(1);
    row->setSelectedCb([this] { elm_genlist_item_update(page->item()); });
    for (int i = 0; i < 4; ++i) {
        const int before = value();
        i % 2 == 0 ? tapRow() : tapSwitch();
        stage().settle();
        EXPECT_EQ(value(), 1 - before);
        EXPECT_EQ(isOn(), value() == 1);
    }
}

TEST_P(SwitchRowsTest, AFingerThatLeavesTheSwitchDoesNotSwitch) {
    show(1);
    const Spot spot = Stage::area(check()).middle();
    stage().drag(spot.x, spot.y, -120, 0);
    EXPECT_EQ(value(), 1);
    EXPECT_TRUE(isOn());
}

TEST_P(SwitchRowsTest, OtherPartsHaveNeitherTextNorContent) {
    show();
    const ItemClass itemClass(row->getItemClassNew(), &elm_genlist_item_class_free);
    for (const char* part : {"elm.text", "elm.icon.2", "elm.text.main.left", ""}) {
        EXPECT_EQ(answer(part), "(null)") << part;
        EXPECT_EQ(itemClass->func.content_get(row, page->genlist(), part), nullptr) << part;
    }
    EXPECT_EQ(answer(nullptr), "(null)");
    EXPECT_EQ(itemClass->func.content_get(row, page->genlist(), nullptr), nullptr);
    EXPECT_EQ(answer("elm.icon"), "(null)");
    EXPECT_EQ(itemClass->func.content_get(row, page->genlist(), "elm.text.main"), nullptr);
}

TEST_P(SwitchRowsTest, TheSwitchKeepsItsTouchesToItself) {
    show();
    EXPECT_FALSE(evas_object_repeat_events_get(check()));
    EXPECT_FALSE(evas_object_propagate_events_get(check()));
}

TEST_P(SwitchRowsTest, EachItemClassIsANewOneOfTheMultilineStyle) {
    show();
    const ItemClass one(row->getItemClassNew(), &elm_genlist_item_class_free);
    const ItemClass other(row->getItemClassNew(), &elm_genlist_item_class_free);
    EXPECT_NE(one, other);
    EXPECT_STREQ(one->item_style, "multiline_sub.main.1icon");
    EXPECT_EQ(row->getItemClassStatic(), nullptr);
}

TEST_P(SwitchRowsTest, FormatsInTranslationsAreOnlyText) {
    show();
    for (const char* hostile : {"%n", "%s%s", "%n%n", "%d%s", "%*d%d", "%9$d", "%"}) {
        const TestCatalogue catalogue{{GetParam().titleId, hostile},
                                      {GetParam().explanationId, hostile}};
        EXPECT_EQ(answer("elm.text.main"), hostile);
        EXPECT_EQ(explanation(), hostile);
        refresh();
    }
}

TEST_P(SwitchRowsTest, WithoutATranslationTheIdentifiersAreShown) {
    show();
    const TestCatalogue empty{};
    EXPECT_EQ(answer("elm.text.main"), GetParam().titleId);
    EXPECT_EQ(explanation(), GetParam().explanationId);
}

TEST_P(SwitchRowsTest, AMissingRowIsLogged) {
    show();
    const ItemClass itemClass(row->getItemClassNew(), &elm_genlist_item_class_free);
    EXPECT_EQ(itemClass->func.text_get(nullptr, page->genlist(), "elm.text.main"), nullptr);
    EXPECT_EQ(itemClass->func.content_get(nullptr, page->genlist(), "elm.icon"), nullptr);
    itemClass->func.del(nullptr, page->genlist());
    EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!", "Data is NULL !!"));
}

TEST_P(SwitchRowsTest, ARowThatIsNotShownSwitchesTheRecord) {
    const std::unique_ptr<AlarmSwitchItem> lonely(GetParam().make(alarm));
    alarm.*GetParam().option = 1;
    lonely->onSelect(nullptr);
    EXPECT_EQ(value(), 0);
    lonely->onSelect(nullptr);
    EXPECT_EQ(value(), 1);
    alarm.*GetParam().option = 0x100;
    lonely->onSelect(nullptr);
    EXPECT_EQ(value(), 1);
}

TEST_P(SwitchRowsTest, ThePageMayGoFromWithinATap) {
    for (const bool onSwitch : {false, true}) {
        show(1);
        const auto alive = page->getWeakPtr();
        row->setSelectedCb([this] { page->destroy(); });
        onSwitch ? tapSwitch() : tapRow();
        stage().settle();
        EXPECT_FALSE(alive);
        EXPECT_EQ(value(), 0) << "what was tapped still counts";
    }
}

TEST_P(SwitchRowsTest, TheFinishedPageLeavesNothingBehind) {
    show(1);
    tapRow();
    const auto alive = page->getWeakPtr();
    page->destroy();
    stage().settle();
    EXPECT_FALSE(alive);
    EXPECT_EQ(value(), 0);
}

class SnoozeRowTest : public SwitchRowsTest {};

INSTANTIATE_TEST_SUITE_P(Rows, SnoozeRowTest,
                         testing::Values(SwitchKind{
                             "Snooze", &ClockAlarmDbData::snooze,
                             [](ClockAlarmDbData& alarm) { return new AlarmSnoozeItem(alarm); },
                             "Snooze", "", "", ""}),
                         [](const auto& info) { return info.param.name; });

TEST_P(SnoozeRowTest, TellsWhatTheRecordHolds) {
    show();
    alarm.snoozeRepeat = 10;
    alarm.snoozeDuration = 15;
    EXPECT_EQ(explanation(), "Sound the alarm 10 times at 15-minute intervals.");
}

TEST_P(SnoozeRowTest, LeavesTheOtherOptionsAlone) {
    alarm.increaseVolume = 1;
    alarm.snoozeCount = 2;
    show(1);
    tapRow();
    EXPECT_EQ(alarm.increaseVolume, 1);
    EXPECT_EQ(alarm.snoozeCount, 2);
    EXPECT_EQ(alarm.snoozeRepeat, 3);
    EXPECT_EQ(alarm.snoozeDuration, 5);
}

class IncreaseVolumeRowTest : public SwitchRowsTest {};

INSTANTIATE_TEST_SUITE_P(Rows, IncreaseVolumeRowTest,
                         testing::Values(SwitchKind{"IncreaseVolume",
                                                    &ClockAlarmDbData::increaseVolume,
                                                    [](ClockAlarmDbData& alarm) {
                                                        return new AlarmIncreaseVolumeItem(alarm);
                                                    },
                                                    "Increase volume", "", "", ""}),
                         [](const auto& info) { return info.param.name; });

TEST_P(IncreaseVolumeRowTest, AlwaysSaysSixtySeconds) {
    alarm.snoozeRepeat = 7;
    alarm.snoozeDuration = 8;
    alarm.volume = 9;
    show();
    EXPECT_EQ(explanation(), "Increase the alarm volume for the first 60 seconds.");
}

TEST_P(IncreaseVolumeRowTest, LeavesTheOtherOptionsAlone) {
    alarm.snooze = 1;
    show(1);
    tapRow();
    EXPECT_EQ(alarm.snooze, 1);
    EXPECT_EQ(alarm.volume, 0);
}

} // namespace
