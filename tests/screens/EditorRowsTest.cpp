// The editor's rows together: their order, and what they do to the editor and to each other.

#include <algorithm>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmIncreaseVolumeItem.h"
#include "AlarmRepeatItem.h"
#include "AlarmSnoozeItem.h"
#include "AlarmToneItem.h"
#include "AlarmTypeItem.h"
#include "AlarmVolumeItem.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

const std::vector<std::string> SILENT_ROWS = {"time", "repeat", "type", "snooze", "name"};
const std::vector<std::string> SOUND_ROWS = {"time",   "repeat",          "type", "volume", "tone",
                                             "snooze", "increase volume", "name"};

class EditorRowsTest : public EditorFixture {
protected:
    static std::string kindOf(app_assist::WGenlistItem* row) {
        if (dynamic_cast<AlarmTimePickerItem*>(row))
            return "time";
        if (dynamic_cast<AlarmRepeatItem*>(row))
            return "repeat";
        if (dynamic_cast<AlarmTypeItem*>(row))
            return "type";
        if (dynamic_cast<AlarmVolumeItem*>(row))
            return "volume";
        if (dynamic_cast<AlarmToneItem*>(row))
            return "tone";
        if (dynamic_cast<AlarmSnoozeItem*>(row))
            return "snooze";
        if (dynamic_cast<AlarmIncreaseVolumeItem*>(row))
            return "increase volume";
        return dynamic_cast<AlarmNameItem*>(row) ? "name" : "unknown";
    }

    /** The rows from the top. */
    std::vector<std::string> kinds() {
        std::vector<std::string> kinds;
        for (const Row& shown : Stage::rows(genlist()))
            kinds.push_back(kindOf(
                static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(shown.item))));
        return kinds;
    }

    template <class RowClass>
    std::vector<std::string> textsOf() {
        Elm_Object_Item* const item = rowOf<RowClass>()->getElmObjectItem();
        stage().showRow(item);
        for (const Row& shown : Stage::rows(genlist())) {
            if (shown.item == item)
                return shown.texts;
        }
        return {};
    }

    /** The switch of a row, scrolled into view. */
    template <class RowClass>
    Evas_Object* switchOf() {
        Elm_Object_Item* const item = rowOf<RowClass>()->getElmObjectItem();
        stage().showRow(item);
        for (const Row& shown : Stage::rows(genlist())) {
            if (shown.item != item)
                continue;
            for (Evas_Object* check : stage().widgets("Check")) {
                const int y = Stage::area(check).middle().y;
                if (y >= shown.area.y && y < shown.area.y + shown.area.height)
                    return check;
            }
        }
        return nullptr;
    }

    static ClockAlarmDbData alarmOfType(int type) {
        ClockAlarmDbData alarm{};
        alarm.type = type;
        alarm.timeZone = "Europe/Berlin";
        alarm.name = "Gym";
        return alarm;
    }
};

TEST_F(EditorRowsTest, AnAlarmWithSoundHasItsRowsInOrder) {
    for (const int type : {0, 2}) {
        editAlarm(alarmOfType(type));
        EXPECT_EQ(kinds(), SOUND_ROWS);
        EXPECT_THAT(errorLines(), IsEmpty());
    }
}

TEST_F(EditorRowsTest, InUltraPowerSavingThereIsNoTone) {
    std::vector<std::string> rows = SOUND_ROWS;
    rows.erase(std::find(rows.begin(), rows.end(), "tone"));
    device().setSetting("db/setting/psmode", 2);
    createAlarm();
    EXPECT_EQ(kinds(), rows);
    chooseType("Vibration");
    EXPECT_EQ(kinds(), SILENT_ROWS);
    chooseType("Sound");
    EXPECT_EQ(kinds(), rows);
}

TEST_F(EditorRowsTest, AVibratingAlarmHasFiveRows) {
    editAlarm(alarmOfType(1));
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    EXPECT_EQ(kinds(), SILENT_ROWS);
    errorLines();
}

TEST_F(EditorRowsTest, AnUnknownTypeHasFiveRowsAndNoComplaint) {
    editAlarm(alarmOfType(9));
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    EXPECT_EQ(kinds(), SILENT_ROWS);
    EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type"));
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(EditorRowsTest, ANewAlarmSnoozesAndDoesNotRise) {
    createAlarm();
    EXPECT_TRUE(elm_check_state_get(switchOf<AlarmSnoozeItem>()));
    EXPECT_FALSE(elm_check_state_get(switchOf<AlarmIncreaseVolumeItem>()));
    EXPECT_THAT(textsOf<AlarmRepeatItem>(), ElementsAre("Repeat weekly", "Never"));
    EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type", "Sound"));
}

// The alert type.

TEST_F(EditorRowsTest, ChoosingVibrationTakesTheRowsOfSoundAway) {
    createAlarm();
    chooseType("Vibration");
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    EXPECT_EQ(kinds(), SILENT_ROWS);
    EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type", "Vibration"));
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(EditorRowsTest, ChoosingSoundBringsTheRowsBackInTheirPlaces) {
    for (const char* label : {"Sound", "Vibration and sound"}) {
        editAlarm(alarmOfType(1));
        errorLines();
        chooseType(label);
        EXPECT_EQ(kinds(), SOUND_ROWS);
        EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type", label));
    }
}

TEST_F(EditorRowsTest, ChoosingTypesBackAndForthKeepsTheOrder) {
    createAlarm();
    for (int i = 0; i < 3; ++i) {
        chooseType("Vibration");
        EXPECT_EQ(kinds(), SILENT_ROWS);
        chooseType("Vibration and sound");
        EXPECT_EQ(kinds(), SOUND_ROWS);
    }
    EXPECT_EQ(elm_genlist_item_select_mode_get(nameRow().getElmObjectItem()),
              ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
}

TEST_F(EditorRowsTest, ChoosingAmongTypesWithSoundKeepsTheRows) {
    createAlarm();
    auto* const rising = rowOf<AlarmIncreaseVolumeItem>();
    for (const char* label : {"Vibration and sound", "Sound", "Sound"}) {
        chooseType(label);
        EXPECT_EQ(rowOf<AlarmIncreaseVolumeItem>(), rising);
        EXPECT_EQ(kinds(), SOUND_ROWS);
        EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type", label));
    }
}

TEST_F(EditorRowsTest, ChoosingVibrationAgainKeepsTheRows) {
    editAlarm(alarmOfType(1));
    errorLines();
    auto* const snooze = rowOf<AlarmSnoozeItem>();
    chooseType("Vibration");
    EXPECT_EQ(kinds(), SILENT_ROWS);
    EXPECT_EQ(rowOf<AlarmSnoozeItem>(), snooze);
}

TEST_F(EditorRowsTest, ARisingVolumeSurvivesAWhileWithoutItsRow) {
    createAlarm();
    tapRow<AlarmIncreaseVolumeItem>();
    chooseType("Vibration");
    chooseType("Sound");
    EXPECT_TRUE(elm_check_state_get(switchOf<AlarmIncreaseVolumeItem>()));
}

TEST_F(EditorRowsTest, TheBackKeyInTheTypePopupKeepsTheType) {
    createAlarm();
    tapRow<AlarmTypeItem>();
    ASSERT_EQ(stage().widgets("Radio").size(), 3U);
    stage().backKey();
    stage().settle();
    EXPECT_THAT(stage().widgets("Radio"), IsEmpty());
    EXPECT_TRUE(isOpen());
    EXPECT_THAT(textsOf<AlarmTypeItem>(), ElementsAre("Alarm type", "Sound"));
}

TEST_F(EditorRowsTest, ADoubleTapOnTheTypeRowOpensOnePopup) {
    createAlarm();
    stage().showRow(rowOf<AlarmTypeItem>()->getElmObjectItem());
    const int before = liveControllers();
    const Spot spot = stage().findText("Alarm type")->area.middle();
    stage().tap(spot);
    EXPECT_EQ(liveControllers(), before + 1);
    rowOf<AlarmTypeItem>()->onSelect(rowOf<AlarmTypeItem>()->getElmObjectItem());
    EXPECT_EQ(liveControllers(), before + 1);
    stage().settle();
    stage().backKey();
    stage().settle();
    EXPECT_EQ(liveControllers(), before);
}

TEST_F(EditorRowsTest, TheTypePopupOpensAgainAndAgain) {
    createAlarm();
    const int before = liveControllers();
    for (int i = 0; i < 3; ++i) {
        tapRow<AlarmTypeItem>();
        EXPECT_EQ(liveControllers(), before + 1);
        stage().backKey();
        stage().settle();
        EXPECT_EQ(liveControllers(), before);
    }
}

TEST_F(EditorRowsTest, TheEditorMayGoWhileTheTypePopupIsOpen) {
    createAlarm();
    tapRow<AlarmTypeItem>();
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_THAT(stage().widgets("Radio"), IsEmpty());
    EXPECT_EQ(liveTimers(), 0);
}

TEST_F(EditorRowsTest, TheEditorMayGoWhileTheTypePopupCloses) {
    createAlarm();
    tapRow<AlarmTypeItem>();
    stage().tapText("Vibration");
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
}

// The weekly repeat.

TEST_F(EditorRowsTest, TheRepeatRowOpensTheRepeatScreen) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    EXPECT_TRUE(stage().shows("Every Sunday"));
    EXPECT_FALSE(stage().shows("Done"));
    EXPECT_TRUE(isOpen());
}

TEST_F(EditorRowsTest, ChosenDaysReachTheRowAndTheDateLine) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every Sunday");
    stage().tapText("Every Monday");
    EXPECT_EQ(dateText(), "Mon Sun ") << "while the screen is still open";
    stage().backKey();
    stage().settle();
    EXPECT_EQ(dateText(), "Mon Sun ");
    EXPECT_THAT(textsOf<AlarmRepeatItem>(), ElementsAre("Repeat weekly", "Mon Sun "));
    EXPECT_TRUE(isOpen());
}

TEST_F(EditorRowsTest, EveryDayReachesTheRowAndTheDateLine) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every day");
    stage().backKey();
    stage().settle();
    EXPECT_EQ(dateText(), "Every day");
    EXPECT_THAT(textsOf<AlarmRepeatItem>(), ElementsAre("Repeat weekly", "Every day"));
}

TEST_F(EditorRowsTest, WithoutDaysTheDateLineTellsTheDateAgain) {
    ClockAlarmDbData alarm = alarmOfType(0);
    alarm.repeatWeekly = 127;
    alarm.repeatOnce = 0;
    editAlarm(alarm);
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every day");
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    stage().backKey();
    stage().settle();
    EXPECT_THAT(textsOf<AlarmRepeatItem>(), ElementsAre("Repeat weekly", "Never"));
}

TEST_F(EditorRowsTest, ADoubleTapOnTheRepeatRowOpensOneScreen) {
    createAlarm();
    stage().showRow(rowOf<AlarmRepeatItem>()->getElmObjectItem());
    const int before = liveControllers();
    const Spot spot = stage().findText("Repeat weekly")->area.middle();
    stage().tap(spot);
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(liveControllers(), before + 1);
    rowOf<AlarmRepeatItem>()->onSelect(nullptr);
    stage().settle();
    EXPECT_EQ(liveControllers(), before + 1);
    stage().backKey();
    stage().settle();
    EXPECT_EQ(liveControllers(), before);
    EXPECT_TRUE(stage().shows("Done"));
}

TEST_F(EditorRowsTest, TheRepeatScreenOpensAgainAndAgain) {
    createAlarm();
    const int before = liveControllers();
    for (int i = 0; i < 3; ++i) {
        tapRow<AlarmRepeatItem>();
        EXPECT_EQ(liveControllers(), before + 1);
        stage().backKey();
        stage().settle();
        EXPECT_EQ(liveControllers(), before);
    }
}

TEST_F(EditorRowsTest, ChosenDaysAreSaved) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every Monday");
    stage().backKey();
    stage().settle();
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms().front().repeatWeekly, 2);
    EXPECT_EQ(storedAlarms().front().repeatOnce, 0);
}

TEST_F(EditorRowsTest, ChosenDaysAreAChange) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every Sunday");
    stage().backKey();
    stage().settle();
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
}

TEST_F(EditorRowsTest, TheWindowMayGoWhileTheRepeatScreenIsOpen) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every Sunday");
    takeStageDown();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorRowsTest, TheRepeatScreenGoesWithTheEditorBelowIt) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    stage().tapText("Every Sunday");
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(stage().shows("Every Sunday"));
    EXPECT_TRUE(stage().shows("Plain page"));
}

TEST_F(EditorRowsTest, EventsWhileTheRepeatScreenIsOpenAreHarmless) {
    createAlarm();
    tapRow<AlarmRepeatItem>();
    for (const int event : {0, 3, 4, 6, 7})
        ClockEventListener::raise(static_cast<ClockEventListener::EventType>(event));
    stage().settle();
    stage().tapText("Every Sunday");
    stage().backKey();
    stage().settle();
    EXPECT_THAT(textsOf<AlarmRepeatItem>(), ElementsAre("Repeat weekly", "Sun "));
}

// The switches.

TEST_F(EditorRowsTest, SwitchesAreSaved) {
    createAlarm();
    tapRow<AlarmSnoozeItem>();
    stage().tap(switchOf<AlarmIncreaseVolumeItem>());
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms().front().snooze, 0);
    EXPECT_EQ(storedAlarms().front().increaseVolume, 1);
}

TEST_F(EditorRowsTest, ASwitchThatWasTurnedIsAChangeUntilItIsTurnedBack) {
    createAlarm();
    tapRow<AlarmSnoozeItem>();
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
    stage().backKey();
    stage().settle();
    tapRow<AlarmSnoozeItem>();
    tapCancel();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorRowsTest, DraggingTheListOverASwitchDoesNotFlipIt) {
    createAlarm();
    Evas_Object* const check = switchOf<AlarmSnoozeItem>();
    const int y = Stage::area(check).middle().y;
    for (const int way : {-70, 70, -30}) {
        const Spot spot = Stage::area(check).middle();
        stage().drag(spot.x, spot.y, 0, way);
        stage().settle();
        EXPECT_TRUE(elm_check_state_get(check)) << way;
    }
    EXPECT_NE(Stage::area(check).middle().y, y) << "the list has followed the finger";
    tapCancel();
    EXPECT_FALSE(isOpen()) << "nothing has changed";
}

TEST_F(EditorRowsTest, ASwipeOverASwitchDoesNotFlipIt) {
    createAlarm();
    Evas_Object* const check = switchOf<AlarmSnoozeItem>();
    const Spot spot = Stage::area(check).middle();
    stage().flick(spot.x, spot.y, 0, -60);
    stage().settle();
    tapCancel();
    EXPECT_FALSE(isOpen()) << "nothing has changed";
}

TEST_F(EditorRowsTest, ASwitchKeepsItsStateOutOfView) {
    createAlarm();
    tapRow<AlarmSnoozeItem>();
    stage().showRow(timePickerRow().getElmObjectItem());
    EXPECT_FALSE(stage().shows("Snooze"));
    EXPECT_FALSE(elm_check_state_get(switchOf<AlarmSnoozeItem>()));
    tapRow<AlarmSnoozeItem>();
    EXPECT_TRUE(elm_check_state_get(switchOf<AlarmSnoozeItem>()));
}

TEST_F(EditorRowsTest, TheSwitchesCanBeUsedFromAKeyboard) {
    createAlarm();
    Evas_Object* const check = switchOf<AlarmSnoozeItem>();
    elm_object_focus_set(check, EINA_TRUE);
    stage().settle();
    ASSERT_TRUE(elm_object_focus_get(check));
    stage().key("Return");
    stage().settle();
    EXPECT_FALSE(elm_check_state_get(switchOf<AlarmSnoozeItem>()));
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
}

class EditorRowsLanguageTest : public EditorRowsTest {
protected:
    /** Changes the language while a row is in view. */
    template <class RowClass>
    std::vector<std::string> textsAfterChange() {
        createAlarm();
        textsOf<RowClass>();
        const TestCatalogue german{{"IDS_CLOCK_BODY_REPEAT_WEEKLY", "Wiederholen"},
                                   {"IDS_CLOCK_MBODY_NEVER", "Nie"},
                                   {"IDS_CLOCK_TMBODY_ALARM_TYPE", "Art"},
                                   {"IDS_ALM_BODY_SOUND", "Ton"},
                                   {"IDS_ALM_BODY_SNOOZE", "Schlummern"},
                                   {"IDS_CLOCK_MBODY_INCREASE_VOLUME", "Lauter werden"}};
        ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
        stage().settle();
        return textsOf<RowClass>();
    }
};

TEST_F(EditorRowsLanguageTest, AnotherLanguageChangesTheRepeatRow) {
    EXPECT_THAT(textsAfterChange<AlarmRepeatItem>(), ElementsAre("Wiederholen", "Nie"));
}

TEST_F(EditorRowsLanguageTest, AnotherLanguageChangesTheTypeRow) {
    EXPECT_THAT(textsAfterChange<AlarmTypeItem>(), ElementsAre("Art", "Ton"));
}

TEST_F(EditorRowsLanguageTest, AnotherLanguageChangesTheSnoozeRow) {
    EXPECT_THAT(textsAfterChange<AlarmSnoozeItem>(), Contains("Schlummern"));
}

TEST_F(EditorRowsLanguageTest, AnotherLanguageChangesTheIncreaseVolumeRow) {
    EXPECT_THAT(textsAfterChange<AlarmIncreaseVolumeItem>(), Contains("Lauter werden"));
}

TEST_F(EditorRowsTest, HostileTranslationsSpoilTextsOnly) {
    const TestCatalogue hostile{
        {"IDS_CLOCK_SBODY_SOUND_THE_ALARM_P1SD_TIMES_AT_P2SD_MINUTE_INTERVALS", "%n"},
        {"IDS_CLOCK_SBODY_INCREASE_THE_ALARM_VOLUME_FOR_THE_FIRST_PD_SECONDS", "%s%s"}};
    createAlarm();
    EXPECT_THAT(textsOf<AlarmSnoozeItem>(), Contains("%n"));
    EXPECT_THAT(textsOf<AlarmIncreaseVolumeItem>(), Contains("%s%s"));
}

TEST_F(EditorRowsTest, Pictures) {
    createAlarm();
    textsOf<AlarmTypeItem>();
    stage().screenshot("editor-repeat-and-type");
    textsOf<AlarmSnoozeItem>();
    stage().screenshot("editor-snooze");
}

} // namespace
