#include <functional>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <clock/ClockAlarmDbModel.h>
#include <device/alarm_server.h>

#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::StartsWith;

namespace {

constexpr const char* INDICATOR = "memory/private/com.vendra.indicator/alarm";
constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";
constexpr const char* DUPLICATE = "IDS_CLOCK_TPOP_ALARM_ALREADY_SET_FOR_PS_EXISTING_ALARM_UPDATED";

class EditorSaveTest : public EditorFixture {
protected:
    /** The names of the calls that store, schedule and announce, in order. */
    static std::vector<std::string> savingCalls() {
        std::vector<std::string> names;
        for (const std::string& call : device().calls()) {
            const std::string name = call.substr(0, call.find('('));
            if (name.starts_with("alarm_server_") || name.starts_with("notification_") ||
                name == "vconf_set_int")
                names.push_back(name);
        }
        return names;
    }

    /** Opens, taps Done, and returns the stored alarms. */
    std::vector<ClockAlarmDbData> done() {
        tapDone();
        EXPECT_FALSE(isOpen());
        return storedAlarms();
    }

    /** A one-time alarm in the store. */
    ClockAlarmDbData oneTimeAlarm(int hour, int minute, const char* day) {
        ClockAlarmDbData alarm = storedAlarm(hour, minute);
        alarm.repeatOnce = 1;
        alarm.repeatWeekly = 0;
        alarm.autoDate = static_cast<std::int32_t>(at(std::string(day) + " 00:00:00"));
        ClockAlarmDbModel().updateAlarmData(alarm, true, false);
        return alarm;
    }
};

TEST_F(EditorSaveTest, ANewAlarmIsScheduledStoredAndAnnounced) {
    createAlarm();
    device().clearCalls();
    const auto alarms = done();
    EXPECT_THAT(savingCalls(), ElementsAre("alarm_server_register",
                                           "notification_status_message_post", "vconf_set_int"));
    ASSERT_EQ(alarms.size(), 1U);
    const ClockAlarmDbData& alarm = alarms.front();
    EXPECT_GE(alarm.id, 0);
    ASSERT_TRUE(device().schedules().contains(alarm.alarmMgrId));
    EXPECT_EQ(device().schedules().at(alarm.alarmMgrId).alarm_id, alarm.id);
    EXPECT_EQ(alarm.enable, 1);
    EXPECT_EQ(alarm.hour, 6);
    EXPECT_EQ(alarm.min, 0);
    EXPECT_EQ(alarm.volume, 7);
    EXPECT_EQ(alarm.soundPath, CLOCK_ALARM_DEFAULT_TONE);
    EXPECT_EQ(alarm.timeZone, "Europe/Berlin");
    EXPECT_EQ(alarm.repeatOnce, 1);
    EXPECT_EQ(alarm.snooze, 1);
    EXPECT_EQ(device().setting(INDICATOR), DeviceSetting(1));
}

TEST_F(EditorSaveTest, TheToastTellsHowFarTheAlarmIs) {
    createAlarm();
    done();
    EXPECT_THAT(device().toasts(), ElementsAre("Alarm set for 20 hours, 19 minutes from now."));
}

TEST_F(EditorSaveTest, TimesAreThoseOfTheMomentOfSaving) {
    createAlarm();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 10:15:30");
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(civil(alarms[0].createTime).substr(0, 16), "2026-11-18 10:15");
    EXPECT_EQ(alarms[0].updateTime, alarms[0].createTime);
    EXPECT_EQ(civil(alarms[0].alarmTime), "2026-11-18 06:00:00");
    EXPECT_EQ(alarms[0].alarmTimeBase, alarms[0].alarmTime);
}

TEST_F(EditorSaveTest, ATimeThatIsOverRingsTomorrow) {
    createAlarm();
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(civil(alarms[0].autoDate), "2026-11-19 00:00:00");
    EXPECT_EQ(alarms[0].manualDate, 0);
}

TEST_F(EditorSaveTest, TheCurrentMinuteRingsTomorrow) {
    createAlarm();
    pick(9, 41);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].hour, 9);
    EXPECT_EQ(alarms[0].min, 41);
    EXPECT_EQ(civil(alarms[0].autoDate), "2026-11-19 00:00:00");
}

TEST_F(EditorSaveTest, TheNextMinuteRingsToday) {
    createAlarm();
    pick(9, 42);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(civil(alarms[0].autoDate), "2026-11-18 00:00:00");
}

TEST_F(EditorSaveTest, TheTimeIsReadFromTheWheels) {
    createAlarm();
    // Without the signal: the record has not heard of it.
    std::tm time{};
    elm_datetime_value_get(picker(), &time);
    time.tm_hour = 21;
    time.tm_min = 5;
    elm_datetime_value_set(picker(), &time);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].hour, 21);
    EXPECT_EQ(alarms[0].min, 5);
}

TEST_F(EditorSaveTest, ATypedNameIsStored) {
    createAlarm();
    typeName("Gym <3 & more");
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "Gym <3 & more");
    EXPECT_THAT(usageEvents(), Contains("CK08 Name entered"));
}

TEST_F(EditorSaveTest, BlanksBeforeANameAreDropped) {
    createAlarm();
    typeName("  Gym ");
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "Gym ");
}

TEST_F(EditorSaveTest, ANameOfBlanksIsNoName) {
    createAlarm();
    typeName("   ");
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "");
    EXPECT_THAT(usageEvents(), Contains("CK08 No name"));
}

TEST_F(EditorSaveTest, ANameWhoseFieldWasNeverShownIsKept) {
    editAlarm(storedAlarm(7, 0));
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "Old");
    EXPECT_THAT(usageEvents(), Contains("CK08 Name entered"));
}

TEST_F(EditorSaveTest, ANameWhoseFieldHasScrolledAwayIsStored) {
    createAlarm();
    typeName("Gym");
    stage().showRow(timePickerRow().getElmObjectItem());
    stage().settle();
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "Gym");
}

TEST_F(EditorSaveTest, TimeAndNameOfWidgetsThatAreGoneAreStored) {
    createAlarm();
    pick(20, 15);
    typeName("Gym");
    evas_object_del(nameRow().getNameEntryObj());
    ASSERT_EQ(nameRow().getNameEntryObj(), nullptr);
    if (Evas_Object* wheels = picker())
        evas_object_del(wheels);
    ASSERT_EQ(picker(), nullptr);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].name, "Gym");
    EXPECT_EQ(alarms[0].hour, 20);
    EXPECT_EQ(alarms[0].min, 15);
}

TEST_F(EditorSaveTest, UsageOfANewAlarmIsLoggedInOrder) {
    createAlarm();
    done();
    EXPECT_THAT(usageEvents(), ElementsAre("CK08 No name", "CK12 Not set date", "CK11 Sound",
                                           "CK13 OFF", "CK14 ON"));
}

struct UsageCase {
    const char* about;
    std::function<void(ClockAlarmDbData&)> prepare;
    std::vector<std::string> events;
};

void PrintTo(const UsageCase& usage, std::ostream* out) {
    *out << usage.about;
}

class EditorUsageTest : public EditorSaveTest, public testing::WithParamInterface<UsageCase> {};

TEST_P(EditorUsageTest, IsLogged) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    GetParam().prepare(alarm);
    editAlarm(alarm);
    done();
    EXPECT_EQ(usageEvents(), GetParam().events);
    errorLines();
}

INSTANTIATE_TEST_SUITE_P(
    Records, EditorUsageTest,
    testing::Values(UsageCase{"vibration, louder and louder, no snooze",
                              [](auto& a) {
                                  a.type = 1;
                                  a.increaseVolume = 1;
                                  a.snooze = 0;
                              },
                              {"CK08 Name entered", "CK12 Not set date", "CK11 Vibrate", "CK13 ON",
                               "CK14 OFF"}},
                    UsageCase{"vibration and sound",
                              [](auto& a) { a.type = 2; },
                              {"CK08 Name entered", "CK12 Not set date", "CK11 Vibrate and sound",
                               "CK13 OFF", "CK14 ON"}},
                    UsageCase{"values without a name",
                              [](auto& a) {
                                  a.type = 3;
                                  a.increaseVolume = 2;
                                  a.snooze = -1;
                              },
                              {"CK08 Name entered", "CK12 Not set date"}},
                    UsageCase{"a picked date",
                              [](auto& a) {
                                  a.repeatWeekly = 0;
                                  a.autoDate = a.manualDate =
                                      static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
                              },
                              {"CK08 Name entered", "CK12 Set date", "CK11 Sound", "CK13 OFF",
                               "CK14 ON"}},
                    UsageCase{"an automatic date",
                              [](auto& a) {
                                  a.repeatWeekly = 0;
                                  a.autoDate = static_cast<std::int32_t>(at("2026-11-19 00:00:00"));
                              },
                              {"CK08 Name entered", "CK12 Not set date", "CK11 Sound", "CK13 OFF",
                               "CK14 ON"}}));

TEST_F(EditorSaveTest, AWeeklyAlarmHasNoDates) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.repeatWeekly = 3;
    alarm.repeatOnce = 1;
    alarm.manualDate = 5;
    editAlarm(alarm);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].repeatWeekly, 3);
    EXPECT_EQ(alarms[0].repeatOnce, 0);
    EXPECT_EQ(alarms[0].autoDate, 0);
    EXPECT_EQ(alarms[0].manualDate, 0);
}

TEST_F(EditorSaveTest, APickedDateIsKept) {
    ClockAlarmDbData alarm = oneTimeAlarm(7, 0, "2026-12-24");
    alarm.manualDate = alarm.autoDate;
    editAlarm(alarm);
    pick(8, 30);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(civil(alarms[0].autoDate), "2026-12-24 00:00:00");
    EXPECT_EQ(alarms[0].manualDate, alarms[0].autoDate);
    EXPECT_EQ(alarms[0].hour, 8);
}

TEST_F(EditorSaveTest, EditingRemovesTheNotificationAndUpdatesScheduleAndStore) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.snoozeCount = 2;
    alarm.enable = 0;
    editAlarm(alarm);
    pick(8, 30);
    device().clearCalls();
    const auto alarms = done();
    EXPECT_THAT(savingCalls(), ElementsAre("notification_delete_by_tag", "alarm_server_update",
                                           "notification_status_message_post", "vconf_set_int"));
    EXPECT_THAT(device().notifications(), IsEmpty());
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].id, alarm.id);
    EXPECT_EQ(alarms[0].alarmMgrId, alarm.alarmMgrId);
    EXPECT_EQ(alarms[0].hour, 8);
    EXPECT_EQ(alarms[0].snoozeCount, 0);
    EXPECT_EQ(alarms[0].enable, 1);
    EXPECT_EQ(device().schedules().at(alarm.alarmMgrId).hour, 8);
    EXPECT_THAT(device().toasts(), ElementsAre(StartsWith("Alarm set for ")));
}

TEST_F(EditorSaveTest, ANewAlarmRemovesNoNotification) {
    device().postNotification("-1", "something else");
    createAlarm();
    done();
    EXPECT_THAT(device().callsTo("notification_delete_by_tag"), IsEmpty());
}

TEST_F(EditorSaveTest, ADuplicateNewAlarmTakesOverTheStoredOne) {
    const ClockAlarmDbData old = oneTimeAlarm(6, 0, "2026-11-19");
    createAlarm();
    device().clearCalls();
    const auto alarms = done();
    EXPECT_THAT(savingCalls(), ElementsAre("alarm_server_update", "notification_delete_by_tag",
                                           "notification_status_message_post", "vconf_set_int"));
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].id, old.id);
    EXPECT_EQ(alarms[0].alarmMgrId, old.alarmMgrId);
    EXPECT_EQ(alarms[0].name, "");
    EXPECT_EQ(alarms[0].volume, 7);
    EXPECT_THAT(device().notifications(), IsEmpty());
    EXPECT_THAT(device().toasts(),
                ElementsAre("An alarm is already set for 06:00. Existing alarm updated."));
    EXPECT_EQ(device().setting(INDICATOR), DeviceSetting(1));
}

TEST_F(EditorSaveTest, AnAlarmThatDuplicatesOnlyItselfIsUpdated) {
    const ClockAlarmDbData old = storedAlarm(6, 0);
    editAlarm(old);
    typeName("er");
    device().clearCalls();
    const auto alarms = done();
    EXPECT_THAT(savingCalls(), ElementsAre("notification_delete_by_tag", "alarm_server_update",
                                           "notification_status_message_post", "vconf_set_int"));
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].id, old.id);
    EXPECT_NE(alarms[0].name, "Old");
    EXPECT_THAT(device().toasts(), ElementsAre(StartsWith("An alarm is already set for 06:00")));
}

TEST_F(EditorSaveTest, EditingIntoAnotherAlarmsTimeDeletesTheOther) {
    const ClockAlarmDbData other = storedAlarm(8, 30);
    const ClockAlarmDbData edited = storedAlarm(7, 0);
    editAlarm(edited);
    pick(8, 30);
    device().clearCalls();
    const auto alarms = done();
    EXPECT_THAT(savingCalls(),
                ElementsAre("notification_delete_by_tag", "notification_delete_by_tag",
                            "alarm_server_unregister", "alarm_server_update",
                            "notification_status_message_post", "vconf_set_int"));
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].id, edited.id);
    EXPECT_EQ(alarms[0].hour, 8);
    EXPECT_EQ(alarms[0].min, 30);
    EXPECT_FALSE(device().schedules().contains(other.alarmMgrId));
    EXPECT_TRUE(device().schedules().contains(edited.alarmMgrId));
    EXPECT_THAT(device().notifications(), IsEmpty());
    EXPECT_THAT(device().toasts(),
                ElementsAre("An alarm is already set for 08:30. Existing alarm updated."));
}

struct HoursCase {
    std::optional<int> setting;
    const char* time;
};

class DuplicateToastTest : public EditorSaveTest, public testing::WithParamInterface<HoursCase> {};

TEST_P(DuplicateToastTest, WritesTheTimeAsTheSettingSays) {
    if (GetParam().setting)
        device().setSetting(HOURS_KEY, *GetParam().setting);
    editAlarm(storedAlarm(17, 5));
    done();
    EXPECT_THAT(device().toasts(),
                ElementsAre(MatchesRegex(std::string("An alarm is already set for ") +
                                         GetParam().time + "\\. Existing alarm updated\\.")));
}

INSTANTIATE_TEST_SUITE_P(Settings, DuplicateToastTest,
                         testing::Values(HoursCase{1, "0?5:05.+PM"}, HoursCase{2, "17:05"},
                                         HoursCase{0, "17:05"}, HoursCase{std::nullopt, "17:05"}));

TEST_F(EditorSaveTest, AHostileTranslationOfTheDuplicateToastIsShownAsItIs) {
    editAlarm(storedAlarm(7, 0));
    const TestCatalogue hostile{{DUPLICATE, "%n%s%s%d"}};
    AlarmEditViewController::_createNotiToastForDuplicatedAlarm(&editor());
    EXPECT_THAT(device().toasts(), ElementsAre("%n%s%s%d"));
}

TEST_F(EditorSaveTest, ALongTranslationOfTheDuplicateToastIsCut) {
    editAlarm(storedAlarm(7, 0));
    const TestCatalogue wordy{{DUPLICATE, "%s " + std::string(2000, 'x')}};
    AlarmEditViewController::_createNotiToastForDuplicatedAlarm(&editor());
    ASSERT_EQ(device().toasts().size(), 1U);
    EXPECT_EQ(device().toasts().front().size(), 511U);
    EXPECT_THAT(device().toasts().front(), StartsWith("07:00 x"));
}

TEST_F(EditorSaveTest, TheIndicatorCountsTheAlarmsThatAreOn) {
    storedAlarm(5, 0);
    ClockAlarmDbData off = storedAlarm(5, 30);
    off.enable = 0;
    ClockAlarmDbModel().updateAlarmData(off, true, false);
    createAlarm();
    done();
    EXPECT_THAT(device().callsTo("vconf_set_int"),
                ElementsAre(R"(vconf_set_int("memory/private/com.vendra.indicator/alarm", 2))"));
}

TEST_F(EditorSaveTest, ARefusingAlarmServerStillLeavesAStoredAlarm) {
    device().fail("alarm_server_register", ALARM_SERVER_ERROR_IO);
    createAlarm();
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(alarms[0].alarmMgrId, -1);
    EXPECT_EQ(device().setting(INDICATOR), DeviceSetting(1));
    EXPECT_THAT(errorLines(), ElementsAre(StartsWith("alarm_server_register failed")));
}

TEST_F(EditorSaveTest, WithoutAStoreDoneStillLeaves) {
    createAlarm();
    device().setDataPath(std::nullopt);
    tapDone();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(errorLines().empty());
}

TEST_F(EditorSaveTest, AHastyDoubleTapSavesOnce) {
    openEditor(ClockAlarmDbData(), true, ALARM_EDIT_VIEW_CALLER_OTHER_APPLICATION);
    stage().tapText("Done");
    stage().tapText("Done");
    stage().settle();
    EXPECT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(device().toasts().size(), 1U);
}

TEST_F(EditorSaveTest, SummerTimeDoesNotShiftTheAlarm) {
    VirtualClock::setNow("Europe/Berlin", "2026-03-29 00:10:00");
    createAlarm();
    pick(8, 0);
    const auto alarms = done();
    ASSERT_EQ(alarms.size(), 1U);
    EXPECT_EQ(civil(alarms[0].alarmTime), "2026-03-29 08:00:00");
    EXPECT_THAT(device().toasts(), ElementsAre("Alarm set for 6 hours, 50 minutes from now."));
}

TEST_F(EditorSaveTest, EveryStepToleratesAMissingEditor) {
    for (void (*step)(void*) :
         {AlarmEditViewController::_saveAlarmName, AlarmEditViewController::_saveAlarmTime,
          AlarmEditViewController::_saveAlarmData, AlarmEditViewController::_registerAlarmData,
          AlarmEditViewController::_createNotiToastForTimeOffest,
          AlarmEditViewController::_createNotiToastForDuplicatedAlarm}) {
        step(nullptr);
        EXPECT_THAT(takeErrors(), ElementsAre("Data is NULL !!"));
    }
    EXPECT_THAT(device().calls(), IsEmpty());
}

} // namespace
