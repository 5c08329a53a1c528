#include "clock/ClockAlarmDbModel.h"

#include <array>
#include <cstdint>
#include <ctime>
#include <filesystem>
#include <limits>
#include <set>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>

#include "host/ClockStore.h"
#include "host/Helper.h"
#include "rules/FrozenTime.h"
#include "rules/TimeZoneForTest.h"

namespace fs = std::filesystem;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class ClockAlarmDbModelTest : public testing::Test {
protected:
    void TearDown() override { ClockAlarmDbModel::setChangedCb({}); }

    std::string path() const { return host.dataDir() + "/clock.db"; }

    static std::vector<ClockAlarmDbData> alarms() {
        std::vector<ClockAlarmDbData> list;
        EXPECT_TRUE(ClockAlarmDbModel().getAllAlarmList(list));
        return list;
    }
    static std::vector<int> ids() {
        std::vector<int> all;
        for (const auto& alarm : alarms())
            all.push_back(alarm.id);
        return all;
    }
    static bool insert(const ClockAlarmDbData& alarm) {
        return ClockAlarmDbModel().insertAlarmData(alarm);
    }

    DeviceHost host;
};

// In the order of the members, each with a value of its own.
ClockAlarmDbData filledRecord() {
    return {101,
            7,
            103,
            1,
            105,
            106,
            107,
            108,
            109,
            110,
            11,
            12,
            "Früh \"auf\"; 'los'",
            "Asia/Kolkata",
            0,
            62,
            1,
            10,
            4,
            2,
            1,
            "/tones/a b.ogg",
            9,
            124,
            1,
            26};
}

auto membersOf(const ClockAlarmDbData& a) {
    return std::tie(a.leading, a.id, a.alarmMgrId, a.enable, a.alarmTime, a.alarmTimeBase,
                    a.createTime, a.updateTime, a.autoDate, a.manualDate, a.hour, a.min, a.name,
                    a.timeZone, a.repeatOnce, a.repeatWeekly, a.snooze, a.snoozeDuration,
                    a.snoozeRepeat, a.snoozeCount, a.type, a.soundPath, a.volume, a.trailing,
                    a.increaseVolume, a.tonePosition);
}

TEST_F(ClockAlarmDbModelTest, AStoredAlarmComesBackWithEveryMember) {
    ASSERT_TRUE(insert(filledRecord()));
    const auto stored = alarms();
    ASSERT_EQ(stored.size(), 1U);
    EXPECT_EQ(membersOf(stored[0]), membersOf(filledRecord()));
}

TEST_F(ClockAlarmDbModelTest, EveryMemberStandsInItsOwnColumn) {
    ASSERT_TRUE(insert(filledRecord()));
    OutsideView view(path());
    EXPECT_EQ(view.value("SELECT leading, id, alarm_mgr_id, enable, alarm_time, alarm_time_base, "
                         "create_time, update_time, auto_date, manual_date, hour, min, name, "
                         "time_zone, repeat_once, repeat_weekly, snooze, snooze_duration, "
                         "snooze_repeat, snooze_count, type, sound_path, volume, trailing, "
                         "increase_volume, tone_position FROM alarm"),
              "101|7|103|1|105|106|107|108|109|110|11|12|Früh \"auf\"; 'los'|Asia/Kolkata|0|62|1|"
              "10|4|2|1|/tones/a b.ogg|9|124|1|26");
    EXPECT_EQ(view.value("SELECT owner, version FROM schema_version"), "clock|1");
}

TEST_F(ClockAlarmDbModelTest, AnEmptyStoreHasNoAlarms) {
    EXPECT_THAT(alarms(), IsEmpty());
    EXPECT_EQ(ClockAlarmDbModel().getNumberOfEnabledAlarmList(), 0);
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(-1)), -1);
}

TEST_F(ClockAlarmDbModelTest, AlarmsAreListedByTimeOfDayAndThenById) {
    insert(storableAlarm(1, 9, 0));
    insert(storableAlarm(2, 7, 30));
    insert(storableAlarm(4, 7, 5));
    insert(storableAlarm(3, 7, 5));
    EXPECT_THAT(ids(), ElementsAre(3, 4, 2, 1));
}

TEST_F(ClockAlarmDbModelTest, TheListIsAppendedTo) {
    insert(storableAlarm(1));
    std::vector<ClockAlarmDbData> list{storableAlarm(99)};
    ASSERT_TRUE(ClockAlarmDbModel().getAllAlarmList(list));
    ASSERT_EQ(list.size(), 2U);
    EXPECT_EQ(list[0].id, 99);
    EXPECT_EQ(list[1].id, 1);
}

TEST_F(ClockAlarmDbModelTest, OnlyAlarmsThatAreSwitchedOnAreCounted) {
    auto off = storableAlarm(3);
    off.enable = 0;
    insert(storableAlarm(1));
    insert(storableAlarm(2));
    insert(off);
    EXPECT_EQ(ClockAlarmDbModel().getNumberOfEnabledAlarmList(), 2);
}

// --- Changing ------------------------------------------------------------------------------

TEST_F(ClockAlarmDbModelTest, AnUpdateRewritesTheAlarmWithItsIdAlone) {
    insert(storableAlarm(1));
    insert(storableAlarm(7));
    ASSERT_TRUE(ClockAlarmDbModel().updateAlarmData(filledRecord(), true, true));
    const auto stored = alarms();
    ASSERT_EQ(stored.size(), 2U);
    EXPECT_EQ(stored[0].id, 1);
    EXPECT_EQ(stored[0].name, "");
    EXPECT_EQ(membersOf(stored[1]), membersOf(filledRecord()));
}

TEST_F(ClockAlarmDbModelTest, AnUpdateCanLeaveTheScheduleAsItIs) {
    auto alarm = storableAlarm(1);
    alarm.alarmMgrId = 40;
    insert(alarm);
    alarm.alarmMgrId = 50;
    alarm.name = "new";
    ASSERT_TRUE(ClockAlarmDbModel().updateAlarmData(alarm, false, true));
    EXPECT_EQ(alarms()[0].alarmMgrId, 40);
    EXPECT_EQ(alarms()[0].name, "new");
    ASSERT_TRUE(ClockAlarmDbModel().updateAlarmData(alarm, true, true));
    EXPECT_EQ(alarms()[0].alarmMgrId, 50);
}

TEST_F(ClockAlarmDbModelTest, AnUpdateOfAnUnknownAlarmFailsAndSaysSo) {
    insert(storableAlarm(1));
    const auto log = standardErrorOf(
        [] { EXPECT_FALSE(ClockAlarmDbModel().updateAlarmData(storableAlarm(2), true, true)); });
    EXPECT_THAT(log, HasSubstr("alarm 2 is not stored"));
    EXPECT_THAT(ids(), ElementsAre(1));
}

TEST_F(ClockAlarmDbModelTest, RemovingDeletesTheAlarmWithTheIdAlone) {
    insert(storableAlarm(1));
    insert(storableAlarm(2));
    ClockAlarmDbData onlyId;
    onlyId.id = 1;
    ASSERT_TRUE(ClockAlarmDbModel().removeAlarmData(onlyId));
    EXPECT_THAT(ids(), ElementsAre(2));
    const auto log =
        standardErrorOf([&] { EXPECT_FALSE(ClockAlarmDbModel().removeAlarmData(onlyId)); });
    EXPECT_THAT(log, HasSubstr("alarm 1 is not stored"));
}

TEST_F(ClockAlarmDbModelTest, AnIdThatIsTakenIsRefused) {
    insert(storableAlarm(1, 7, 0));
    const auto log = standardErrorOf([] { EXPECT_FALSE(insert(storableAlarm(1, 8, 0))); });
    EXPECT_THAT(log, HasSubstr("alarm 1 cannot be stored: UNIQUE constraint failed"));
    EXPECT_EQ(alarms()[0].hour, 7);
}

TEST_F(ClockAlarmDbModelTest, ListenersHearOfEveryChangeAndOfNothingElse) {
    int changes = 0;
    ClockAlarmDbModel::setChangedCb([&] { ++changes; });
    insert(storableAlarm(1));
    EXPECT_EQ(changes, 1);
    ClockAlarmDbModel().updateAlarmData(storableAlarm(1), true, true);
    EXPECT_EQ(changes, 2);
    ClockAlarmDbModel().updateAlarmData(storableAlarm(1), true, false);
    EXPECT_EQ(changes, 2);
    alarms();
    ClockAlarmDbModel().reserveAlarmId();
    ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(1));
    standardErrorOf([] {
        insert(storableAlarm(1));
        ClockAlarmDbModel().updateAlarmData(storableAlarm(5), true, true);
        ClockAlarmDbModel().removeAlarmData(storableAlarm(5));
    });
    EXPECT_EQ(changes, 2);
    ClockAlarmDbModel().removeAlarmData(storableAlarm(1));
    EXPECT_EQ(changes, 3);
    ClockAlarmDbModel::setChangedCb({});
    insert(storableAlarm(2));
    EXPECT_EQ(changes, 3);
}

TEST_F(ClockAlarmDbModelTest, AListenerMayReadTheStoreAndReplaceItself) {
    std::vector<std::vector<int>> seen;
    ClockAlarmDbModel::setChangedCb([&] {
        seen.push_back(ids());
        ClockAlarmDbModel::setChangedCb({});
    });
    insert(storableAlarm(1));
    insert(storableAlarm(2));
    EXPECT_THAT(seen, ElementsAre(ElementsAre(1)));
}

// --- Ids -----------------------------------------------------------------------------------

TEST_F(ClockAlarmDbModelTest, AnAlarmWithoutIdGetsOne) {
    insert(storableAlarm(-1));
    insert(storableAlarm(-1, 8));
    EXPECT_THAT(ids(), ElementsAre(1, 2));
}

TEST_F(ClockAlarmDbModelTest, AnIdIsNeverHandedOutTwice) {
    EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), 1);
    EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), 2);
    insert(storableAlarm(2));
    insert(storableAlarm(-1, 8)); // 3
    ClockAlarmDbModel().removeAlarmData(storableAlarm(3));
    ClockAlarmDbModel().removeAlarmData(storableAlarm(2));
    EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), 4);
    insert(storableAlarm(20));
    ClockAlarmDbModel().removeAlarmData(storableAlarm(20));
    EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), 21);
}

TEST_F(ClockAlarmDbModelTest, WhenIdsRunOutNoAlarmIsLost) {
    insert(storableAlarm(std::numeric_limits<std::int32_t>::max()));
    const auto log = standardErrorOf([] {
        EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), -1);
        EXPECT_FALSE(insert(storableAlarm(-1)));
    });
    EXPECT_THAT(log, HasSubstr("every alarm id has been handed out"));
    EXPECT_EQ(alarms().size(), 1U);
}

// --- Duplicates ----------------------------------------------------------------------------

struct DuplicateCase {
    const char* what;
    int hour, minute, weekdays;
    const char* day;
    int otherHour, otherMinute, otherWeekdays;
    const char* otherDay;
    bool duplicate;
};

class ClockAlarmDuplicateTest : public ClockAlarmDbModelTest,
                                public testing::WithParamInterface<DuplicateCase> {
protected:
    static ClockAlarmDbData alarmOf(int id, int hour, int minute, int weekdays, const char* day) {
        auto alarm = storableAlarm(id, hour, minute, weekdays);
        alarm.timeZone = "Europe/Berlin";
        alarm.autoDate = day ? static_cast<int>(at((std::string(day) + " 00:00:00").c_str())) : 0;
        return alarm;
    }
};

TEST_P(ClockAlarmDuplicateTest, HaveTheSameTimeAndTheSameDays) {
    const DuplicateCase& c = GetParam();
    const TimeZoneForTest zone("Europe/Berlin");
    const FrozenTime now(at("2026-11-20 12:00:00"));
    ASSERT_TRUE(insert(alarmOf(5, c.hour, c.minute, c.weekdays, c.day)));
    const auto other = alarmOf(-1, c.otherHour, c.otherMinute, c.otherWeekdays, c.otherDay);
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(other), c.duplicate ? 5 : -1) << c.what;
}

INSTANTIATE_TEST_SUITE_P(
    Pairs, ClockAlarmDuplicateTest,
    testing::Values(
        DuplicateCase{"same week", 7, 0, 62, nullptr, 7, 0, 62, nullptr, true},
        DuplicateCase{"other hour", 7, 0, 62, nullptr, 8, 0, 62, nullptr, false},
        DuplicateCase{"other minute", 7, 0, 62, nullptr, 7, 1, 62, nullptr, false},
        DuplicateCase{"other week", 7, 0, 62, nullptr, 7, 0, 63, nullptr, false},
        DuplicateCase{"once and weekly", 7, 0, 0, "2026-11-21", 7, 0, 64, nullptr, false},
        DuplicateCase{"same day", 7, 0, 0, "2026-11-25", 7, 0, 0, "2026-11-25", true},
        DuplicateCase{"other day", 7, 0, 0, "2026-11-25", 7, 0, 0, "2026-11-26", false},
        DuplicateCase{"both without a day", 7, 0, 0, nullptr, 7, 0, 0, nullptr, true},
        // At noon the next 07:00 is tomorrow's, the next 13:00 today's.
        DuplicateCase{"tomorrow by itself", 7, 0, 0, nullptr, 7, 0, 0, "2026-11-21", true},
        DuplicateCase{"not today", 7, 0, 0, nullptr, 7, 0, 0, "2026-11-20", false},
        DuplicateCase{"today by itself", 13, 0, 0, "2026-11-20", 13, 0, 0, nullptr, true},
        DuplicateCase{"rung yesterday", 13, 0, 0, "2026-11-19", 13, 0, 0, nullptr, false},
        DuplicateCase{"in the gap", 2, 30, 0, "2027-03-28", 2, 30, 0, "2027-03-28", true}));

TEST_F(ClockAlarmDbModelTest, TheSmallestOfSeveralDuplicatesIsTaken) {
    for (const int id : {9, 3, 6})
        insert(storableAlarm(id, 7, 0, 127));
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(-1, 7, 0, 127)), 3);
}

TEST_F(ClockAlarmDbModelTest, AnAlarmIsADuplicateOfItselfAndOfOnesThatAreSwitchedOff) {
    auto off = storableAlarm(4, 7, 0, 127);
    off.enable = 0;
    insert(off);
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(4, 7, 0, 127)), 4);
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(-1, 7, 0, 127)), 4);
}

TEST_F(ClockAlarmDbModelTest, ADayPickedInAnotherZoneIsThatDay) {
    auto alarm = storableAlarm(4, 7, 0);
    alarm.timeZone = "Europe/Berlin";
    {
        const TimeZoneForTest zone("Europe/Berlin");
        alarm.autoDate = static_cast<int>(at("2026-11-25 00:00:00"));
    }
    insert(alarm);
    const TimeZoneForTest zone("America/New_York");
    auto other = storableAlarm(-1, 7, 0);
    other.timeZone = "America/New_York";
    other.autoDate = static_cast<int>(at("2026-11-25 00:00:00"));
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(other), 4);
    other.autoDate = static_cast<int>(at("2026-11-24 00:00:00"));
    EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(other), -1);
}

// --- Stores that cannot be used ------------------------------------------------------------

// Every operation must report the reason and return without a result.
void expectEveryOperationFails(const std::string& reason, bool readingWorks = false) {
    const auto expectLog = [&](const std::function<void()>& operation) {
        EXPECT_THAT(standardErrorOf(operation), HasSubstr(reason));
    };
    expectLog([] { EXPECT_FALSE(ClockAlarmDbModel().insertAlarmData(storableAlarm(50))); });
    expectLog([] { EXPECT_FALSE(ClockAlarmDbModel().insertAlarmData(storableAlarm(-1))); });
    expectLog(
        [] { EXPECT_FALSE(ClockAlarmDbModel().updateAlarmData(storableAlarm(1, 9), true, true)); });
    expectLog([] { EXPECT_FALSE(ClockAlarmDbModel().removeAlarmData(storableAlarm(1))); });
    expectLog([] { EXPECT_EQ(ClockAlarmDbModel().reserveAlarmId(), -1); });
    if (readingWorks)
        return;
    expectLog([] { EXPECT_EQ(ClockAlarmDbModel().getNumberOfEnabledAlarmList(), 0); });
    expectLog([] { EXPECT_EQ(ClockAlarmDbModel().isDuplicatedAlarmData(storableAlarm(1)), -1); });
    expectLog([] {
        std::vector<ClockAlarmDbData> list{storableAlarm(99)};
        EXPECT_FALSE(ClockAlarmDbModel().getAllAlarmList(list));
        EXPECT_EQ(list.size(), 1U);
    });
}

TEST_F(ClockAlarmDbModelTest, ALockedStoreCanBeReadAndRefusesChanges) {
    insert(storableAlarm(1));
    {
        const LockedStore lock(path());
        expectEveryOperationFails("locked", true);
        EXPECT_THAT(ids(), ElementsAre(1));
        EXPECT_EQ(ClockAlarmDbModel().getNumberOfEnabledAlarmList(), 1);
    }
    EXPECT_TRUE(insert(storableAlarm(2)));
    EXPECT_EQ(alarms()[0].hour, 7);
}

TEST_F(ClockAlarmDbModelTest, AMissingFolderIsReported) {
    fs::remove_all(host.dataDir());
    expectEveryOperationFails("No such file or directory");
    EXPECT_FALSE(fs::exists(host.dataDir()));
}

TEST_F(ClockAlarmDbModelTest, AStoreOfANewerVersionIsRefusedAndLeft) {
    insert(storableAlarm(1));
    OutsideView(path()).rows("UPDATE schema_version SET version = 9 WHERE owner = 'clock'");
    expectEveryOperationFails("written by a newer version (clock 9, this one knows 1)");
    OutsideView view(path());
    EXPECT_EQ(view.value("SELECT hour FROM alarm WHERE id = 1"), "7");
    EXPECT_EQ(view.value("SELECT COUNT(*) FROM alarm"), "1");
}

TEST_F(ClockAlarmDbModelTest, ADamagedStoreIsMovedAsideWithALogLine) {
    writeFile(path(), "no database");
    const auto log = standardErrorOf([] { EXPECT_TRUE(insert(storableAlarm(1))); });
    EXPECT_THAT(log, HasSubstr("clock.db was damaged, it is kept as " + path() + ".corrupt-"));
    EXPECT_THAT(ids(), ElementsAre(1));
    std::string kept;
    for (const auto& entry : fs::directory_iterator(host.dataDir()))
        if (entry.path().string().find(".corrupt-") != std::string::npos)
            kept = readFile(entry.path());
    EXPECT_EQ(kept, "no database");
}

TEST_F(ClockAlarmDbModelTest, ADamagedTableIsReported) {
    insert(storableAlarm(1));
    OutsideView(path()).rows("ALTER TABLE alarm RENAME TO elsewhere");
    expectEveryOperationFails("no such table");
    EXPECT_EQ(OutsideView(path()).value("SELECT COUNT(*) FROM elsewhere"), "1");
}

TEST_F(ClockAlarmDbModelTest, AFullDiskIsReportedAndLosesNothing) {
    insert(storableAlarm(1));
    EXPECT_EQ(inAnotherProcess([&] {
                  signal(SIGXFSZ, SIG_IGN);
                  const rlimit none{0, 0};
                  setrlimit(RLIMIT_FSIZE, &none);
                  auto large = storableAlarm(2);
                  large.name.assign(100000, 'x');
                  return insert(large) ? 1 : 0;
              }),
              0);
    EXPECT_THAT(ids(), ElementsAre(1));
    EXPECT_TRUE(insert(storableAlarm(2)));
}

TEST_F(ClockAlarmDbModelTest, AReadOnlyStoreCanBeReadAndRefusesChanges) {
    insert(storableAlarm(1));
    for (const auto& folder : {fs::path(host.dataDir()).parent_path(), fs::path(host.dataDir())})
        fs::permissions(folder, fs::perms(0555));
    fs::permissions(path(), fs::perms(0444));
    EXPECT_EQ(inAnotherProcess([&] {
                  if (geteuid() == 0 && (setgid(65534) != 0 || setuid(65534) != 0))
                      return 99;
                  std::vector<ClockAlarmDbData> list;
                  if (!ClockAlarmDbModel().getAllAlarmList(list) || list.size() != 1)
                      return 1;
                  return insert(storableAlarm(2)) ? 2 : 0;
              }),
              0);
    fs::permissions(host.dataDir(), fs::perms(0755));
    fs::permissions(fs::path(host.dataDir()).parent_path(), fs::perms(0755));
    fs::permissions(path(), fs::perms(0644));
    EXPECT_THAT(ids(), ElementsAre(1));
}

// --- Processes that die --------------------------------------------------------------------

TEST_F(ClockAlarmDbModelTest, AKilledProcessLosesNoAlarmThatItWasToldIsStored) {
    std::size_t reported = 0;
    for (int round = 0; round < 6; ++round) {
        int channel[2];
        ASSERT_EQ(pipe(channel), 0);
        const pid_t writer = fork();
        if (writer == 0) {
            for (;;) {
                const auto id = ClockAlarmDbModel().reserveAlarmId();
                if (!insert(storableAlarm(id, id % 24, id % 60)) ||
                    write(channel[1], &id, sizeof id) != sizeof id)
                    _exit(1);
            }
        }
        close(channel[1]);
        std::set<std::int32_t> committed;
        std::int32_t id = 0;
        const auto enough = 5 + 3 * static_cast<std::size_t>(round);
        while (committed.size() < enough && read(channel[0], &id, sizeof id) == sizeof id)
            committed.insert(id);
        kill(writer, SIGKILL);
        while (read(channel[0], &id, sizeof id) == sizeof id)
            committed.insert(id);
        close(channel[0]);
        EXPECT_EQ(waitFor(writer), -1) << "the writer was to be killed in the middle";
        reported += committed.size();

        const auto stored = ids();
        const std::set<std::int32_t> found(stored.begin(), stored.end());
        for (const auto wanted : committed)
            EXPECT_TRUE(found.contains(wanted)) << "alarm " << wanted << " is lost";
        EXPECT_EQ(OutsideView(path()).value("PRAGMA integrity_check"), "ok");
    }
    EXPECT_GE(reported, 75U);
}

TEST_F(ClockAlarmDbModelTest, ManyProcessesStoreAtOnceUnderDifferentIds) {
    std::vector<pid_t> writers;
    for (int i = 0; i < 4; ++i) {
        writers.push_back(fork());
        if (writers.back() == 0) {
            for (int n = 0; n < 10; ++n)
                if (!insert(storableAlarm(-1)))
                    _exit(1);
            _exit(0);
        }
    }
    for (const pid_t writer : writers)
        EXPECT_EQ(waitFor(writer), 0);
    const auto stored = ids();
    EXPECT_EQ(stored.size(), 40U);
    EXPECT_EQ(std::set<int>(stored.begin(), stored.end()).size(), 40U);
}

} // namespace
