#include "clock/ClockAlarmManagerModel.h"

#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "clock/ClockAlarmDbModel.h"
#include "device/alarm_server.h"
#include "host/ClockStore.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace fs = std::filesystem;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class ClockAlarmManagerModelTest : public testing::Test {
protected:
    std::string path() const { return host.dataDir() + "/clock.db"; }

    // "hour:minute weekdays date" of every schedule.
    std::vector<std::string> schedules() const {
        OutsideView view(path());
        return view.rows(
            "SELECT alarm_id || ' ' || hour || ':' || minute || ' ' || weekdays || ' ' "
            "|| year || '-' || month || '-' || day || ' ' || enabled "
            "FROM alarm_schedule ORDER BY schedule_id");
    }
    static ClockAlarmDbData storedAlarm(int id) {
        std::vector<ClockAlarmDbData> list;
        ClockAlarmDbModel().getAllAlarmList(list);
        for (const auto& alarm : list)
            if (alarm.id == id)
                return alarm;
        ADD_FAILURE() << "alarm " << id << " is not stored";
        return storableAlarm(-1);
    }
    static ClockAlarmDbData createAlarm(int hour, int weekdays = 127) {
        auto alarm = storableAlarm(-1, hour, 0, weekdays);
        EXPECT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
        EXPECT_TRUE(ClockAlarmDbModel().insertAlarmData(alarm));
        return alarm;
    }

    DeviceHost host;
};

TEST_F(ClockAlarmManagerModelTest, RegisteringGivesANewAlarmItsTwoIds) {
    auto alarm = storableAlarm(-1, 7, 30, 62);
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
    EXPECT_EQ(alarm.id, 1);
    EXPECT_GT(alarm.alarmMgrId, 0);
    alarm_schedule_s schedule{};
    ASSERT_EQ(alarm_server_get(alarm.alarmMgrId, &schedule, nullptr), 0);
    EXPECT_EQ(schedule.alarm_id, 1);
    EXPECT_THAT(schedules(), ElementsAre("1 7:30 62 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, RegisteringKeepsAnIdThatIsThere) {
    auto alarm = storableAlarm(12, 7, 30, 62);
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
    EXPECT_EQ(alarm.id, 12);
    EXPECT_THAT(schedules(), ElementsAre("12 7:30 62 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, TheDayOfAOneTimeAlarmIsThatOfTheZoneInWhichItWasSaved) {
    auto alarm = storableAlarm(1, 7, 0);
    alarm.timeZone = "Asia/Kolkata";
    {
        const TimeZoneForTest zone("Asia/Kolkata");
        alarm.autoDate = static_cast<int>(at("2026-11-25 00:00:00"));
    }
    const TimeZoneForTest zone("America/New_York");
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
    // Without a zone, or with one that is unknown, the current one counts.
    for (const char* unknown : {"", "Mars/Olympus_Mons"}) {
        alarm.timeZone = unknown;
        alarm.autoDate = static_cast<int>(at("2026-11-26 00:00:00"));
        ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
        EXPECT_THAT(schedules(), ElementsAre("1 7:0 0 2026-11-26 1"));
    }
    alarm.timeZone = "Asia/Kolkata";
    TimeZoneForTest::set("Asia/Kolkata");
    alarm.autoDate = static_cast<int>(at("2026-11-25 00:00:00"));
    TimeZoneForTest::set("America/New_York");
    ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 0 2026-11-25 1"));
}

TEST_F(ClockAlarmManagerModelTest, ADayWithoutMidnightIsStillThatDay) {
    const TimeZoneForTest zone("Asia/Beirut");
    auto alarm = storableAlarm(1, 7, 0);
    alarm.timeZone = "Asia/Beirut";
    // The two instants that stand for a midnight that does not exist.
    for (const char* midnight : {"2026-03-28 23:00:00", "2026-03-29 01:00:00"}) {
        alarm.autoDate = static_cast<int>(at(midnight));
        ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
        EXPECT_THAT(schedules(), ElementsAre("1 7:0 0 2026-3-29 1")) << midnight;
    }
}

TEST_F(ClockAlarmManagerModelTest, WeekdaysGoBeforeADate) {
    auto alarm = storableAlarm(1, 7, 0, 62);
    alarm.autoDate = 1795176000;
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 62 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, AnAlarmThatIsSwitchedOffIsKeptSilent) {
    auto alarm = storableAlarm(1, 7, 0, 62);
    alarm.enable = 0;
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 62 0-0-0 0"));
}

TEST_F(ClockAlarmManagerModelTest, UpdatingReSchedulesUnderTheSameId) {
    auto alarm = createAlarm(7);
    const auto schedule = alarm.alarmMgrId;
    alarm.hour = 9;
    ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
    EXPECT_EQ(alarm.alarmMgrId, schedule);
    EXPECT_THAT(schedules(), ElementsAre("1 9:0 127 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, UpdatingWithoutAKnownScheduleRegistersAnew) {
    auto alarm = createAlarm(7);
    for (const int unknown : {alarm.alarmMgrId, 0, -1, 999}) {
        alarm.alarmMgrId = unknown;
        OutsideView(path()).rows("DELETE FROM alarm_schedule");
        ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
        EXPECT_NE(alarm.alarmMgrId, unknown);
        EXPECT_EQ(alarm_server_get(alarm.alarmMgrId, nullptr, nullptr), 0);
    }
}

TEST_F(ClockAlarmManagerModelTest, UnregisteringCancelsTheScheduleOfTheRecordAlone) {
    const auto first = createAlarm(7);
    const auto second = createAlarm(8);
    ClockAlarmDbData onlyIds;
    onlyIds.id = first.id;
    onlyIds.alarmMgrId = first.alarmMgrId;
    ASSERT_TRUE(ClockAlarmManagerModel::unregisterAlarmFromServer(onlyIds));
    EXPECT_THAT(schedules(), ElementsAre("2 8:0 127 0-0-0 1"));
    const auto log = standardErrorOf(
        [&] { EXPECT_FALSE(ClockAlarmManagerModel::unregisterAlarmFromServer(onlyIds)); });
    EXPECT_THAT(log, HasSubstr("alarm_server_unregister failed"));
}

TEST_F(ClockAlarmManagerModelTest, ARefusedAlarmIsReportedAndKeepsItsIds) {
    auto alarm = storableAlarm(3, 25, 0, 127);
    const auto log = standardErrorOf([&] {
        EXPECT_FALSE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
        EXPECT_FALSE(ClockAlarmManagerModel::updateAlarmOnServer(alarm));
    });
    EXPECT_THAT(log, HasSubstr("alarm_server_register failed(id = 3, ret = -1)"));
    EXPECT_THAT(log, HasSubstr("alarm_server_update failed(id = 3, ret = -1)"));
    EXPECT_EQ(alarm.alarmMgrId, -1);
    EXPECT_EQ(alarm.id, 3);
}

TEST_F(ClockAlarmManagerModelTest, WithoutAStoreNothingIsRegistered) {
    fs::remove_all(host.dataDir());
    auto alarm = storableAlarm(-1);
    const auto log = standardErrorOf([&] {
        EXPECT_FALSE(ClockAlarmManagerModel::registerAlarmToServer(alarm));
        EXPECT_FALSE(ClockAlarmManagerModel::synchronize());
    });
    EXPECT_THAT(log, HasSubstr("No such file or directory"));
    EXPECT_EQ(alarm.alarmMgrId, -1);
}

// --- After a crash -------------------------------------------------------------------------

TEST_F(ClockAlarmManagerModelTest, SynchronizingLeavesWhatAgrees) {
    createAlarm(7);
    createAlarm(8);
    const auto before = schedules();
    const auto log = standardErrorOf([] { EXPECT_TRUE(ClockAlarmManagerModel::synchronize()); });
    EXPECT_EQ(schedules(), before);
    EXPECT_THAT(log, IsEmpty());
}

TEST_F(ClockAlarmManagerModelTest, SynchronizingSchedulesAStoredAlarm) {
    const auto alarm = createAlarm(7);
    OutsideView(path()).rows("DELETE FROM alarm_schedule");
    int changes = 0;
    ClockAlarmDbModel::setChangedCb([&] { ++changes; });
    ASSERT_TRUE(ClockAlarmManagerModel::synchronize());
    ClockAlarmDbModel::setChangedCb({});
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 127 0-0-0 1"));
    EXPECT_NE(storedAlarm(1).alarmMgrId, alarm.alarmMgrId);
    EXPECT_EQ(alarm_server_get(storedAlarm(1).alarmMgrId, nullptr, nullptr), 0);
    EXPECT_EQ(changes, 0) << "nothing has changed for those who look";
}

TEST_F(ClockAlarmManagerModelTest, SynchronizingCancelsAScheduleWithoutAlarm) {
    createAlarm(7);
    auto orphan = storableAlarm(-1, 9, 0, 127);
    ASSERT_TRUE(ClockAlarmManagerModel::registerAlarmToServer(orphan));
    ASSERT_TRUE(ClockAlarmManagerModel::synchronize());
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 127 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, SynchronizingCorrectsAScheduleThatDiffers) {
    auto alarm = createAlarm(7);
    alarm.hour = 9;
    ASSERT_TRUE(ClockAlarmManagerModel::updateAlarmOnServer(alarm)); // and then it was killed
    ASSERT_TRUE(ClockAlarmManagerModel::synchronize());
    EXPECT_THAT(schedules(), ElementsAre("1 7:0 127 0-0-0 1"));
}

TEST_F(ClockAlarmManagerModelTest, SynchronizingDoesNotTakeAScheduleOfAnotherAlarm) {
    auto alarm = createAlarm(7);
    const auto other = createAlarm(8);
    alarm.alarmMgrId = other.alarmMgrId;
    ASSERT_TRUE(ClockAlarmDbModel().updateAlarmData(alarm, true, false));
    ASSERT_TRUE(ClockAlarmManagerModel::synchronize());
    EXPECT_THAT(schedules(),
                testing::UnorderedElementsAre("1 7:0 127 0-0-0 1", "2 8:0 127 0-0-0 1"));
    EXPECT_NE(storedAlarm(1).alarmMgrId, storedAlarm(2).alarmMgrId);
}

TEST_F(ClockAlarmManagerModelTest, SynchronizingAnUnreadableStoreCancelsNothing) {
    createAlarm(7);
    OutsideView(path()).rows("ALTER TABLE alarm RENAME TO elsewhere");
    standardErrorOf([] { EXPECT_FALSE(ClockAlarmManagerModel::synchronize()); });
    EXPECT_EQ(schedules().size(), 1U);
}

} // namespace
