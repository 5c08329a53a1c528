#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class EditorPageTest : public EditorFixture {};

TEST_F(EditorPageTest, ANewAlarmIsCalledCreate) {
    createAlarm();
    EXPECT_TRUE(stage().shows("Create"));
    EXPECT_FALSE(stage().shows("Edit"));
    EXPECT_TRUE(stage().shows("Cancel"));
    EXPECT_TRUE(stage().shows("Done"));
}

TEST_F(EditorPageTest, AnExistingAlarmIsCalledEdit) {
    editAlarm(storedAlarm(7, 0));
    EXPECT_TRUE(stage().shows("Edit"));
    EXPECT_FALSE(stage().shows("Create"));
}

TEST_F(EditorPageTest, TheTimeComesFirstAndTheNameLast) {
    createAlarm();
    EXPECT_NE(picker(), nullptr);
    Elm_Object_Item* const last = elm_genlist_last_item_get(genlist());
    stage().showRow(last);
    EXPECT_TRUE(stage().shows("Alarm name"));
    EXPECT_EQ(elm_genlist_item_select_mode_get(last), ELM_OBJECT_SELECT_MODE_DISPLAY_ONLY);
}

TEST_F(EditorPageTest, TheListIsCompressedAndFillsThePage) {
    createAlarm();
    EXPECT_EQ(elm_genlist_mode_get(genlist()), ELM_LIST_COMPRESS);
    EXPECT_EQ(Stage::area(genlist()).width, Stage::SIZE);
}

TEST_F(EditorPageTest, ANewAlarmStartsAtSixWithVolumeSeven) {
    ClockAlarmDbData other{};
    other.hour = 11;
    other.min = 45;
    other.volume = 2;
    openEditor(other, true);
    std::tm shown{};
    ASSERT_TRUE(elm_datetime_value_get(picker(), &shown));
    EXPECT_EQ(shown.tm_hour, 6);
    EXPECT_EQ(shown.tm_min, 0);
    EXPECT_THAT(device().callsTo("sound_manager_set_volume"),
                ElementsAre("sound_manager_set_volume(SOUND_TYPE_ALARM, 7)"));
}

TEST_F(EditorPageTest, AnExistingAlarmBringsItsTimeAndVolume) {
    editAlarm(storedAlarm(17, 35));
    std::tm shown{};
    ASSERT_TRUE(elm_datetime_value_get(picker(), &shown));
    EXPECT_EQ(shown.tm_hour, 17);
    EXPECT_EQ(shown.tm_min, 35);
    EXPECT_THAT(device().callsTo("sound_manager_set_volume"),
                ElementsAre("sound_manager_set_volume(SOUND_TYPE_ALARM, 5)"));
}

TEST_F(EditorPageTest, AVolumeThatCannotBeSetIsLoggedAndTheEditorStands) {
    device().fail("sound_manager_set_volume");
    createAlarm();
    expectLog("Failed to set alarm session volume(volume = 7)");
    EXPECT_TRUE(stage().shows("Done"));
}

TEST_F(EditorPageTest, AVibratingAlarmTellsWhyRowsAreMissing) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.type = CLOCK_ALARM_TYPE_VIBRATION;
    editAlarm(alarm);
    EXPECT_THAT(errorLines(), ElementsAre("Sound Type is [1]. So there is no Volume, Tone item",
                                          "Sound Type is [1]. So there is no Increase Volume"));
}

TEST_F(EditorPageTest, AnAlarmWithSoundMissesNoRows) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    for (const int type : {0, 2}) {
        alarm.type = type;
        editAlarm(alarm);
        EXPECT_THAT(errorLines(), IsEmpty());
    }
}

TEST_F(EditorPageTest, ChoosingAnotherAlertTypeKeepsTimeAndName) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    for (const int type : {0, 1, 2, 9}) {
        alarm.type = type;
        editAlarm(alarm);
        errorLines();
        AlarmTimePickerItem* first = &timePickerRow();
        AlarmNameItem* last = &nameRow();
        editor()._onTypePopupViewSelectedCb();
        stage().settle();
        EXPECT_EQ(&timePickerRow(), first);
        EXPECT_EQ(&nameRow(), last);
    }
}

TEST_F(EditorPageTest, WithoutThemesTheEditorStandsAndSaysSo) {
    device().setResourceRoot("/nonexistent");
    createAlarm();
    EXPECT_THAT(takeErrors(), Contains("path is NULL !!"));
    EXPECT_TRUE(stage().shows("Done"));
    tapDone();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(storedAlarms().size(), 1U);
    takeErrors();
}

TEST_F(EditorPageTest, BothThemesAreLookedUpByName) {
    createAlarm();
    EXPECT_THAT(
        device().callsTo("app_resource_manager_get"),
        Contains(
            R"(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "edje/AlarmCustomTheme.edj"))"));
    EXPECT_THAT(
        device().callsTo("app_resource_manager_get"),
        Contains(
            R"(app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, "edje/AlarmEditViewController.edj"))"));
    EXPECT_EQ(device().openResourceManagers(), 1);
    tapCancel();
    EXPECT_EQ(device().openResourceManagers(), 0);
}

TEST_F(EditorPageTest, AnEditorThatWasNeverShownLeavesTheResourceManagerAlone) {
    const AlarmEditViewController editor(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true);
    EXPECT_THAT(device().callsTo("app_resource_manager_release"), IsEmpty());
}

TEST_F(EditorPageTest, TheDateButtonOpensOneDatePopup) {
    createAlarm();
    const int before = liveControllers();
    const Spot button = stage().findText("DATE")->area.middle();
    stage().tap(button);
    stage().tap(button);
    stage().settle();
    EXPECT_EQ(liveControllers(), before + 1);
    EXPECT_EQ(stage().widgets("Popup").size(), 1U);
    // A click that was already on its way.
    Evas_Object* const dateButton =
        elm_object_part_content_get(timePickerRow().getCalendarObj(), "date.button");
    evas_object_smart_callback_call(dateButton, "clicked", nullptr);
    stage().settle();
    EXPECT_EQ(liveControllers(), before + 1);
}

TEST_F(EditorPageTest, TheDatePopupOpensAgainAfterItHasClosed) {
    createAlarm();
    const int before = liveControllers();
    for (int i = 0; i < 2; ++i) {
        stage().tapText("DATE");
        stage().settle();
        EXPECT_EQ(liveControllers(), before + 1);
        stage().backKey();
        stage().settle();
        EXPECT_EQ(liveControllers(), before);
        EXPECT_TRUE(isOpen());
    }
}

TEST_F(EditorPageTest, AChangedClockRebuildsTheTimePickerRow) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.repeatWeekly = 0;
    alarm.autoDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
    editAlarm(alarm);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    VirtualClock::setNow("Europe/Berlin", "2026-11-19 05:00:00");
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle();
    EXPECT_EQ(dateText(), "Today - Thu, Nov 19");
}

TEST_F(EditorPageTest, AnotherLanguageChangesEveryText) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.repeatWeekly = 127;
    editAlarm(alarm);
    EXPECT_EQ(dateText(), "Every day");
    const TestCatalogue german{{"IDS_COM_SK_EDIT", "Bearbeiten"},
                               {"IDS_ALM_BODY_EVERYDAY", "Jeden Tag"},
                               {"IDS_COM_BODY_DATE", "Tag"},
                               {"IDS_ALM_BODY_ALARM_NAME", "Name des Weckers"},
                               {"IDS_TPLATFORM_ACBUTTON_CANCEL_ABB", "Nein"},
                               {"IDS_TPLATFORM_ACBUTTON_DONE_ABB", "Ja"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_TRUE(stage().shows("Bearbeiten"));
    EXPECT_TRUE(stage().shows("Nein"));
    EXPECT_TRUE(stage().shows("Ja"));
    EXPECT_TRUE(stage().shows("TAG"));
    EXPECT_EQ(dateText(), "Jeden Tag");
    stage().showRow(nameRow().getElmObjectItem());
    EXPECT_TRUE(stage().shows("Name des Weckers"));
}

TEST_F(EditorPageTest, AnotherLanguageKeepsTheTitleOfANewAlarm) {
    createAlarm();
    const TestCatalogue german{{"IDS_COM_BODY_CREATE", "Anlegen"},
                               {"IDS_COM_SK_EDIT", "Bearbeiten"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_TRUE(stage().shows("Anlegen"));
}

TEST_F(EditorPageTest, OtherEventsAreIgnored) {
    createAlarm();
    const Evas_Object* before = picker();
    for (const int type : {0, 1, 2, 5, 8, -1})
        ClockEventListener::raise(static_cast<ClockEventListener::EventType>(type));
    stage().settle();
    EXPECT_EQ(picker(), before);
    EXPECT_EQ(liveTimers(), 1);
}

TEST_F(EditorPageTest, EventsAfterTheListHasDiedAreHarmless) {
    createAlarm();
    evas_object_del(genlist());
    for (const int type : {3, 4, 6, 7})
        ClockEventListener::raise(static_cast<ClockEventListener::EventType>(type));
    editor()._onTypePopupViewSelectedCb();
    AlarmEditViewController::_updateDateTextTimerCb(&editor());
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorPageTest, OpeningAndLeavingOftenLeavesNothingBehind) {
    createAlarm();
    tapCancel();
    const unsigned extensions = eina_list_count(elm_theme_extension_list_get(nullptr));
    EXPECT_GE(extensions, 1U);
    for (int i = 0; i < 5; ++i) {
        createAlarm();
        tapCancel();
        EXPECT_FALSE(isOpen());
    }
    EXPECT_EQ(liveTimers(), 0);
    EXPECT_EQ(device().openResourceManagers(), 0);
    EXPECT_EQ(eina_list_count(elm_theme_extension_list_get(nullptr)), extensions);
}

TEST_F(EditorPageTest, EverythingThatMattersLiesOnTheRoundFace) {
    createAlarm();
    typeName("Gym");
    for (const char* wanted : {"Gym", "Alarm name", "Done", "Cancel"}) {
        const auto found = stage().findText(wanted);
        ASSERT_TRUE(found) << wanted;
        EXPECT_TRUE(found->area.insideCircle()) << wanted;
    }
}

TEST_F(EditorPageTest, PictureOfANewAlarm) {
    createAlarm();
    stage().screenshot("editor-fresh");
}

TEST_F(EditorPageTest, PictureWithADate) {
    createAlarm();
    pick(17, 45);
    stage().settle();
    stage().screenshot("editor-date");
}

TEST_F(EditorPageTest, PictureOfTheTwelveHourPicker) {
    device().setSetting("db/menu_widget/regionformat", "en_US");
    device().setSetting("db/menu_widget/regionformat_time1224", 1);
    createAlarm();
    pick(17, 45);
    stage().settle();
    stage().screenshot("editor-12h");
}

TEST_F(EditorPageTest, PictureOfAName) {
    createAlarm();
    typeName("Morning run");
    stage().screenshot("editor-name");
}

TEST_F(EditorPageTest, PictureOfTheQuestion) {
    createAlarm();
    pick(17, 45);
    tapCancel();
    stage().screenshot("editor-discard");
}

} // namespace
