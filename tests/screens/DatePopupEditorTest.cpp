// The date popup as the editor opens it.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmRepeatItem.h"
#include "screens/DatePopupFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/LiveObjects.h"
#include "support/StoredData.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class DatePopupEditorTest : public EditorFixture {
protected:
    void openPopup() {
        stage().showRow(timePickerRow().getElmObjectItem());
        stage().tap(dateButton());
        stage().settle();
    }

    Evas_Object* dateButton() {
        return elm_object_part_content_get(timePickerRow().getCalendarObj(), "date.button");
    }

    static ClockAlarmDbData onDay(ClockAlarmDbData alarm, const std::string& day) {
        alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at(day + " 00:00:00"));
        return alarm;
    }

    void setDay(int day) {
        openPopup();
        face().tapDay(day);
        face().tapSet();
    }

    std::vector<std::string> repeatTexts() {
        Elm_Object_Item* item = elm_genlist_item_next_get(elm_genlist_first_item_get(genlist()));
        stage().showRow(item);
        for (const Row& row : Stage::rows(genlist()))
            if (row.item == item)
                return row.texts;
        return {};
    }

    ClockAlarmDbData theStoredAlarm() {
        const auto alarms = storedAlarms();
        EXPECT_EQ(alarms.size(), 1U);
        return alarms.empty() ? ClockAlarmDbData() : alarms.front();
    }

    DatePopupOnFace face() { return DatePopupOnFace(stage()); }
};

TEST_F(DatePopupEditorTest, TheDateButtonOpensIt) {
    createAlarm();
    EXPECT_FALSE(face().isOpen());
    openPopup();
    EXPECT_TRUE(face().isOpen());
}

TEST_F(DatePopupEditorTest, ANewAlarmOpensItOnToday) {
    createAlarm();
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-18");
}

TEST_F(DatePopupEditorTest, ItOpensOnTheDayThatTheWheelsLedTo) {
    createAlarm();
    pick(8, 0);
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-19");
    face().tapCancel();
    pick(10, 0);
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-18");
}

TEST_F(DatePopupEditorTest, ItOpensOnTheDayThatTheLineTells) {
    editAlarm(alarmAt(7, 0));
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    ASSERT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-19");
}

TEST_F(DatePopupEditorTest, ItOpensOnTheAlarmsDate) {
    editAlarm(onDay(alarmAt(7, 0), "2027-03-28"));
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2027-03-28");
}

TEST_F(DatePopupEditorTest, ItOpensOnTheDayThatWasSetLast) {
    createAlarm();
    setDay(25);
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-25");
}

TEST_F(DatePopupEditorTest, ItOpensOnTomorrowAfterAPastChoice) {
    createAlarm();
    openPopup();
    face().tapSet();
    openPopup();
    EXPECT_EQ(face().selectedDay(), "2026-11-19");
}

TEST_F(DatePopupEditorTest, ASecondTapWhileItIsOpenDoesNothing) {
    createAlarm();
    openPopup();
    face().tapDay(25);
    const int controllers = liveControllers();
    evas_object_smart_callback_call(dateButton(), "clicked", nullptr);
    stage().settle();
    EXPECT_EQ(stage().widgets("Elm_Calendar").size(), 1U);
    EXPECT_EQ(liveControllers(), controllers);
    EXPECT_EQ(face().selectedDay(), "2026-11-25");
    const Area button = Stage::area(dateButton());
    stage().tap(button.middle());
    stage().settle();
    EXPECT_EQ(liveControllers(), controllers);
}

TEST_F(DatePopupEditorTest, TwoHastyTapsOpenOne) {
    createAlarm();
    evas_object_smart_callback_call(dateButton(), "clicked", nullptr);
    evas_object_smart_callback_call(dateButton(), "clicked", nullptr);
    stage().settle();
    EXPECT_EQ(stage().widgets("Elm_Calendar").size(), 1U);
}

TEST_F(DatePopupEditorTest, ItOpensAgainAfterEachWayToClose) {
    createAlarm();
    openPopup();
    face().tapCancel();
    openPopup();
    ASSERT_TRUE(face().isOpen());
    stage().backKey();
    stage().settle();
    openPopup();
    ASSERT_TRUE(face().isOpen());
    face().tapDay(25);
    face().tapSet();
    openPopup();
    EXPECT_TRUE(face().isOpen());
}

TEST_F(DatePopupEditorTest, ItOpensAgainInTheTurnInWhichItCloses) {
    createAlarm();
    openPopup();
    evas_object_smart_callback_call(face().button("Cancel")->widget, "clicked", nullptr);
    evas_object_smart_callback_call(dateButton(), "clicked", nullptr);
    stage().settle();
    EXPECT_EQ(stage().widgets("Elm_Calendar").size(), 1U);
}

TEST_F(DatePopupEditorTest, TheBackKeyClosesThePopupAlone) {
    createAlarm();
    pick(8, 0);
    openPopup();
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(face().isOpen());
    EXPECT_TRUE(isOpen());
    EXPECT_FALSE(asksToDiscard());
}

TEST_F(DatePopupEditorTest, ItGoesWithTheEditor) {
    createAlarm();
    openPopup();
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(face().isOpen());
}

TEST_F(DatePopupEditorTest, ItGoesWithTheWindow) {
    createAlarm();
    openPopup();
    takeStageDown();
    EXPECT_FALSE(isOpen());
}

TEST_F(DatePopupEditorTest, AfterSetTheRepeatRowReadsNever) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 62;
    editAlarm(alarm);
    ASSERT_THAT(repeatTexts(), ElementsAre("Repeat weekly", "Mon Tue Wed Thu Fri "));
    setDay(25);
    EXPECT_THAT(repeatTexts(), ElementsAre("Repeat weekly", "Never"));
    EXPECT_EQ(dateText(), "Wed, Nov 25");
}

TEST_F(DatePopupEditorTest, AfterAPastChoiceTheRepeatRowReadsNever) {
    ClockAlarmDbData alarm = alarmAt(7, 0);
    alarm.repeatOnce = 0;
    alarm.repeatWeekly = 62;
    editAlarm(alarm);
    openPopup();
    face().tapSet();
    EXPECT_THAT(repeatTexts(), ElementsAre("Repeat weekly", "Never"));
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(DatePopupEditorTest, DoneStoresTheDay) {
    editAlarm(storedAlarm(7, 0));
    setDay(25);
    tapDone();
    const ClockAlarmDbData stored = theStoredAlarm();
    EXPECT_EQ(stored.autoDate, at("2026-11-25 00:00:00"));
    EXPECT_EQ(stored.manualDate, at("2026-11-25 00:00:00"));
    EXPECT_EQ(stored.repeatOnce, 1);
    EXPECT_EQ(stored.repeatWeekly, 0);
    EXPECT_THAT(usageEvents(), Contains("CK12 Set date"));
    EXPECT_EQ(civil(device().nextRing(stored.alarmMgrId)), "2026-11-25 07:00:00");
}

TEST_F(DatePopupEditorTest, DoneStoresTodayAsAnAutomaticDay) {
    editAlarm(storedAlarm(10, 0));
    openPopup();
    face().tapSet();
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
    tapDone();
    const ClockAlarmDbData stored = theStoredAlarm();
    EXPECT_EQ(stored.autoDate, at("2026-11-18 00:00:00"));
    EXPECT_EQ(stored.manualDate, 0);
    EXPECT_EQ(stored.repeatWeekly, 0);
    EXPECT_THAT(usageEvents(), Contains("CK12 Not set date"));
}

TEST_F(DatePopupEditorTest, DoneStoresTomorrowAfterAPastChoice) {
    editAlarm(storedAlarm(7, 0));
    openPopup();
    face().tapSet();
    tapDone();
    const ClockAlarmDbData stored = theStoredAlarm();
    EXPECT_EQ(stored.autoDate, at("2026-11-19 00:00:00"));
    EXPECT_EQ(stored.manualDate, 0);
    EXPECT_EQ(stored.repeatWeekly, 0);
}

TEST_F(DatePopupEditorTest, TheWheelsDoNotMoveADayThatWasSet) {
    createAlarm();
    setDay(25);
    pick(8, 0);
    EXPECT_EQ(dateText(), "Wed, Nov 25");
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Wed, Nov 25");
}

TEST_F(DatePopupEditorTest, TheWheelsMoveTheDayAgainAfterToday) {
    createAlarm();
    pick(10, 0);
    openPopup();
    face().tapDay(18);
    face().tapSet();
    pick(8, 0);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
}

TEST_F(DatePopupEditorTest, TheMinutesGoOnWhileItIsOpen) {
    createAlarm();
    pick(9, 42);
    openPopup();
    Stage::advance(61);
    EXPECT_EQ(dateText(), "Tomorrow - Thu, Nov 19");
    EXPECT_EQ(face().selectedDay(), "2026-11-18");
    face().tapSet();
    EXPECT_EQ(device().toasts().size(), 1U);
}

TEST_F(DatePopupEditorTest, ALanguageChangeReachesItAndTheRowBelow) {
    editAlarm(onDay(alarmAt(7, 0), "2026-11-25"));
    openPopup();
    const TestCatalogue french{{"IDS_COM_SK_SET", "Régler"}, {"IDS_COM_SK_CANCEL", "Annuler"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_TRUE(face().button("Annuler"));
    face().tapDay(26);
    face().tapButton("Régler");
    EXPECT_NE(dateText().find("26"), std::string::npos) << dateText();
}

TEST_F(DatePopupEditorTest, TheLayoutOfTheRowMayChangeWhileItIsOpen) {
    createAlarm();
    pick(23, 0);
    openPopup();
    ClockEventListener::raise(ClockEventListener::TIME_CHANGED);
    stage().settle();
    face().tapSet();
    EXPECT_EQ(dateText(), "Today - Wed, Nov 18");
    EXPECT_THAT(device().toasts(), IsEmpty());
}

} // namespace
