#include "device/alarm_server.h"

#include <filesystem>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "host/ClockStore.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace fs = std::filesystem;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

alarm_schedule_s scheduleAt(int hour, int minute, int weekdays = 0) {
    alarm_schedule_s schedule{};
    schedule.alarm_id = 1;
    schedule.enabled = 1;
    schedule.hour = hour;
    schedule.minute = minute;
    schedule.weekdays = weekdays;
    return schedule;
}

alarm_schedule_s scheduleOn(int year, int month, int day, int hour, int minute) {
    auto schedule = scheduleAt(hour, minute);
    schedule.year = year;
    schedule.month = month;
    schedule.day = day;
    return schedule;
}

class AlarmServerTest : public testing::Test {
protected:
    std::string path() const { return host.dataDir() + "/clock.db"; }

    static int32_t registered(const alarm_schedule_s& schedule) {
        int32_t id = -1;
        EXPECT_EQ(alarm_server_register(&schedule, &id), ALARM_SERVER_ERROR_NONE);
        EXPECT_GT(id, 0);
        return id;
    }
    // The next ring as a local time, "never" when there is none.
    static std::string nextRing(int32_t id) {
        int64_t ring = -1;
        EXPECT_EQ(alarm_server_get(id, nullptr, &ring), ALARM_SERVER_ERROR_NONE);
        return ring == 0 ? "never" : civil(ring);
    }
    static std::vector<int32_t> all() {
        std::vector<int32_t> ids;
        const auto collect = [](int32_t id, const alarm_schedule_s*, int64_t, void* data) {
            static_cast<std::vector<int32_t>*>(data)->push_back(id);
            return 1;
        };
        EXPECT_EQ(alarm_server_foreach(collect, &ids), ALARM_SERVER_ERROR_NONE);
        return ids;
    }

    DeviceHost host;
};

TEST_F(AlarmServerTest, AScheduleComesBackAsItWasRegistered) {
    alarm_schedule_s schedule = scheduleOn(2026, 12, 24, 18, 30);
    schedule.alarm_id = 77;
    const auto id = registered(schedule);
    alarm_schedule_s stored{};
    ASSERT_EQ(alarm_server_get(id, &stored, nullptr), ALARM_SERVER_ERROR_NONE);
    EXPECT_EQ(stored.alarm_id, 77);
    EXPECT_EQ(stored.enabled, 1);
    EXPECT_EQ(stored.hour, 18);
    EXPECT_EQ(stored.minute, 30);
    EXPECT_EQ(stored.weekdays, 0);
    EXPECT_EQ(stored.year, 2026);
    EXPECT_EQ(stored.month, 12);
    EXPECT_EQ(stored.day, 24);
}

TEST_F(AlarmServerTest, TheScheduleStandsBesideTheAlarms) {
    registered(scheduleAt(7, 30, 62));
    OutsideView view(path());
    EXPECT_EQ(view.value("SELECT alarm_id, enabled, hour, minute, weekdays, year, month, day FROM "
                         "alarm_schedule"),
              "1|1|7|30|62|0|0|0");
    EXPECT_EQ(view.value("SELECT version FROM schema_version WHERE owner = 'alarm-server'"), "1");
}

TEST_F(AlarmServerTest, AnUpdateReplacesTheSchedule) {
    const auto id = registered(scheduleAt(7, 30));
    const auto other = registered(scheduleAt(8, 0));
    auto schedule = scheduleAt(9, 45, 127);
    schedule.enabled = 0;
    ASSERT_EQ(alarm_server_update(id, &schedule), ALARM_SERVER_ERROR_NONE);
    alarm_schedule_s stored{};
    alarm_server_get(id, &stored, nullptr);
    EXPECT_EQ(stored.hour, 9);
    EXPECT_EQ(stored.minute, 45);
    EXPECT_EQ(stored.weekdays, 127);
    EXPECT_EQ(stored.enabled, 0);
    alarm_server_get(other, &stored, nullptr);
    EXPECT_EQ(stored.hour, 8);
}

TEST_F(AlarmServerTest, ARemovedScheduleIsGoneAndItsIdIsNotUsedAgain) {
    const auto id = registered(scheduleAt(7, 30));
    ASSERT_EQ(alarm_server_unregister(id), ALARM_SERVER_ERROR_NONE);
    EXPECT_EQ(alarm_server_get(id, nullptr, nullptr), ALARM_SERVER_ERROR_NOT_FOUND);
    EXPECT_EQ(alarm_server_unregister(id), ALARM_SERVER_ERROR_NOT_FOUND);
    const auto schedule = scheduleAt(8, 0);
    EXPECT_EQ(alarm_server_update(id, &schedule), ALARM_SERVER_ERROR_NOT_FOUND);
    EXPECT_NE(registered(schedule), id);
}

TEST_F(AlarmServerTest, SchedulesAreListedByIdAndTheListCanBeLeft) {
    const auto a = registered(scheduleAt(9, 0));
    const auto b = registered(scheduleAt(8, 0));
    registered(scheduleAt(7, 0));
    EXPECT_EQ(all().size(), 3U);
    EXPECT_LT(a, b);
    int calls = 0;
    const auto stop = [](int32_t, const alarm_schedule_s*, int64_t, void* data) {
        return ++*static_cast<int*>(data) == 2 ? 0 : 1;
    };
    EXPECT_EQ(alarm_server_foreach(stop, &calls), ALARM_SERVER_ERROR_NONE);
    EXPECT_EQ(calls, 2);
}

TEST_F(AlarmServerTest, TheListMayBeChangedWhileItIsWalked) {
    registered(scheduleAt(7, 0));
    registered(scheduleAt(8, 0));
    const auto remove = [](int32_t id, const alarm_schedule_s*, int64_t, void*) {
        EXPECT_EQ(alarm_server_unregister(id), ALARM_SERVER_ERROR_NONE);
        return 1;
    };
    EXPECT_EQ(alarm_server_foreach(remove, nullptr), ALARM_SERVER_ERROR_NONE);
    EXPECT_THAT(all(), IsEmpty());
}

// --- The next ring -------------------------------------------------------------------------

TEST_F(AlarmServerTest, TheNextRingFollowsTheClock) {
    const TimeZoneForTest zone("Europe/Berlin");
    FrozenTime now(at("2026-11-20 07:00:00"));
    const auto once = registered(scheduleOn(2026, 11, 20, 7, 30));
    const auto workdays = registered(scheduleAt(7, 30, 62));
    const auto next = registered(scheduleAt(7, 30));
    EXPECT_EQ(nextRing(once), "2026-11-20 07:30:00");
    EXPECT_EQ(nextRing(workdays), "2026-11-20 07:30:00");
    now.set(at("2026-11-20 07:30:00"));
    EXPECT_EQ(nextRing(once), "never");
    EXPECT_EQ(nextRing(workdays), "2026-11-23 07:30:00");
    EXPECT_EQ(nextRing(next), "2026-11-21 07:30:00");
    // The clock is set back.
    now.set(at("2026-11-19 23:00:00"));
    EXPECT_EQ(nextRing(once), "2026-11-20 07:30:00");
    EXPECT_EQ(nextRing(workdays), "2026-11-20 07:30:00");
}

TEST_F(AlarmServerTest, TheNextRingFollowsTheTimeZone) {
    const TimeZoneForTest zone("Europe/Berlin");
    const FrozenTime now(at("2026-11-20 06:00:00"));
    const auto id = registered(scheduleAt(7, 30, 127));
    EXPECT_EQ(nextRing(id), "2026-11-20 07:30:00");
    TimeZoneForTest::set("Asia/Kolkata"); // 10:30 there
    EXPECT_EQ(nextRing(id), "2026-11-21 07:30:00");
    TimeZoneForTest::set("America/New_York"); // midnight there
    EXPECT_EQ(nextRing(id), "2026-11-20 07:30:00");
}

TEST_F(AlarmServerTest, TheNextRingSurvivesSummerTime) {
    const TimeZoneForTest zone("Europe/Berlin");
    FrozenTime now(at("2026-03-28 12:00:00"));
    const auto skipped = registered(scheduleAt(2, 30, 127));
    const auto morning = registered(scheduleAt(7, 0, 127));
    EXPECT_EQ(nextRing(skipped), "2026-03-29 03:00:00");
    EXPECT_EQ(nextRing(morning), "2026-03-29 07:00:00");
    now.set(at("2026-10-25 02:30:00"));
    EXPECT_EQ(nextRing(skipped), "2026-10-26 02:30:00");
}

TEST_F(AlarmServerTest, AScheduleThatIsSwitchedOffDoesNotRing) {
    auto schedule = scheduleAt(7, 30, 127);
    schedule.enabled = 0;
    EXPECT_EQ(nextRing(registered(schedule)), "never");
}

TEST_F(AlarmServerTest, AScheduleEditedByHandIntoNonsenseDoesNotRing) {
    const auto id = registered(scheduleAt(7, 30, 127));
    OutsideView(path()).rows("UPDATE alarm_schedule SET hour = 99");
    EXPECT_EQ(nextRing(id), "never");
}

// --- Bad arguments and stores --------------------------------------------------------------

TEST_F(AlarmServerTest, FieldsOutOfRangeAreRefused) {
    const auto refused = [](void (*spoil)(alarm_schedule_s&)) {
        auto schedule = scheduleAt(7, 30);
        const auto good = registered(schedule);
        spoil(schedule);
        int32_t id = -7;
        EXPECT_EQ(alarm_server_register(&schedule, &id), ALARM_SERVER_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(id, -7);
        EXPECT_EQ(alarm_server_update(good, &schedule), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    };
    refused([](alarm_schedule_s& s) { s.hour = 24; });
    refused([](alarm_schedule_s& s) { s.hour = -1; });
    refused([](alarm_schedule_s& s) { s.minute = 60; });
    refused([](alarm_schedule_s& s) { s.minute = -1; });
    refused([](alarm_schedule_s& s) { s.weekdays = 128; });
    refused([](alarm_schedule_s& s) { s.weekdays = -1; });
    refused([](alarm_schedule_s& s) { s.enabled = 2; });
    refused([](alarm_schedule_s& s) { s = scheduleOn(2026, 2, 29, 7, 0); });
    refused([](alarm_schedule_s& s) { s = scheduleOn(2026, 13, 1, 7, 0); });
    refused([](alarm_schedule_s& s) { s = scheduleOn(2026, 1, 0, 7, 0); });
    refused([](alarm_schedule_s& s) { s = scheduleOn(-1, 1, 1, 7, 0); });
    refused([](alarm_schedule_s& s) { s = scheduleOn(10000, 1, 1, 7, 0); });
}

TEST_F(AlarmServerTest, NullArgumentsAreRefused) {
    const auto schedule = scheduleAt(7, 30);
    int32_t id = -7;
    EXPECT_EQ(alarm_server_register(nullptr, &id), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(alarm_server_register(&schedule, nullptr), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(alarm_server_update(1, nullptr), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(alarm_server_foreach(nullptr, nullptr), ALARM_SERVER_ERROR_INVALID_PARAMETER);
    EXPECT_THAT(all(), IsEmpty());
}

TEST_F(AlarmServerTest, AStoreThatCannotBeUsedIsReported) {
    const auto schedule = scheduleAt(7, 30);
    fs::remove_all(host.dataDir());
    int32_t id = -7;
    const auto expectError = [](const std::function<int()>& call) {
        int result = 0;
        const auto log = standardErrorOf([&] { result = call(); });
        EXPECT_EQ(result, ALARM_SERVER_ERROR_IO);
        EXPECT_THAT(log, HasSubstr("No such file or directory"));
    };
    expectError([&] { return alarm_server_register(&schedule, &id); });
    expectError([&] { return alarm_server_update(1, &schedule); });
    expectError([&] { return alarm_server_unregister(1); });
    expectError([&] { return alarm_server_get(1, nullptr, nullptr); });
    expectError([&] {
        return alarm_server_foreach(
            [](int32_t, const alarm_schedule_s*, int64_t, void*) { return 1; }, nullptr);
    });
    EXPECT_EQ(id, -7);
}

TEST_F(AlarmServerTest, ALockedStoreRefusesANewSchedule) {
    const auto schedule = scheduleAt(7, 30);
    const auto first = registered(schedule);
    const LockedStore lock(path());
    int32_t id = -7;
    const auto log = standardErrorOf(
        [&] { EXPECT_EQ(alarm_server_register(&schedule, &id), ALARM_SERVER_ERROR_IO); });
    EXPECT_THAT(log, HasSubstr("locked"));
    EXPECT_EQ(id, -7);
    EXPECT_THAT(all(), ElementsAre(first));
}

} // namespace
