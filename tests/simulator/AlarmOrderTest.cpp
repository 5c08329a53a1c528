// Which alarm comes where in the list.

#include "AlarmOrder.h"

#include <algorithm>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "base/CivilTime.h"
#include "support/StoredData.h"
#include "support/VirtualClock.h"

using simulator::keepOrder;
using simulator::nextAlarm;
using simulator::NextAlarm;
using simulator::orderAlarms;
using simulator::upcomingRing;
using testing::ElementsAre;
using testing::ElementsAreArray;

namespace {

constexpr int MONDAY = 2;
constexpr int FRIDAY = 32;
constexpr const char* BERLIN = "Europe/Berlin";

/** A day of November 2026; none = the next time the clock shows the time. */
ClockAlarmDbData alarm(int id, int hour, int minute, bool on, int weekdays = 0, int day = 0) {
    ClockAlarmDbData alarm = alarmAt(hour, minute, weekdays);
    alarm.id = id;
    alarm.enable = on ? 1 : 0;
    if (day != 0) {
        alarm.autoDate =
            static_cast<std::int32_t>(base::toInstant({{2026, 11, day}, 0, 0, 0}, BERLIN));
    }
    return alarm;
}

struct Row {
    const char* what;
    std::vector<ClockAlarmDbData> alarms;
    std::vector<int> order;
    int next; ///< -1 = none.
};

// It is Wednesday, 18 November, 09:41.
const std::vector<Row> ROWS{
    {"nothing", {}, {}, -1},
    {"the soonest ring first, not the earliest time",
     {alarm(1, 7, 0, true), alarm(2, 22, 0, true), alarm(3, 9, 42, true)},
     {3, 2, 1},
     3},
    {"this minute has begun: its ring is tomorrow's",
     {alarm(1, 9, 41, true), alarm(2, 9, 40, true)},
     {2, 1},
     2},
    {"weekdays and days count",
     {alarm(1, 10, 0, true, MONDAY), alarm(2, 11, 0, true, FRIDAY), alarm(3, 9, 0, true, 0, 20)},
     {3, 2, 1},
     3},
    {"those that are switched off come last, by their time of day",
     {alarm(1, 23, 0, false), alarm(2, 12, 30, false, MONDAY), alarm(3, 12, 0, false, 0, 20),
      alarm(4, 8, 0, true)},
     {4, 3, 2, 1},
     4},
    {"one whose day is over does not ring",
     {alarm(1, 23, 0, true, 0, 17), alarm(2, 6, 0, false), alarm(3, 8, 0, true)},
     {3, 2, 1},
     3},
    {"the same ring: the older one first",
     {alarm(7, 8, 0, true), alarm(5, 8, 0, true, 0, 19)},
     {5, 7},
     7},
    {"all are off", {alarm(2, 8, 0, false), alarm(1, 8, 0, false)}, {1, 2}, -1},
};

std::vector<int> idsOf(const std::vector<ClockAlarmDbData>& alarms) {
    std::vector<int> ids(alarms.size());
    std::transform(alarms.begin(), alarms.end(), ids.begin(),
                   [](const ClockAlarmDbData& alarm) { return alarm.id; });
    return ids;
}

class AlarmOrderTest : public testing::Test {
protected:
    void SetUp() override { VirtualClock::setNow(BERLIN, "2026-11-18 09:41:00"); }
};

} // namespace

TEST_F(AlarmOrderTest, theNextRingComesFirst) {
    for (const Row& row : ROWS) {
        auto alarms = row.alarms;
        const auto next = nextAlarm(alarms, VirtualClock::now());
        EXPECT_EQ(next ? next->id : -1, row.next) << row.what;
        orderAlarms(alarms, VirtualClock::now());
        EXPECT_THAT(idsOf(alarms), ElementsAreArray(row.order)) << row.what;
    }
}

TEST_F(AlarmOrderTest, anEarlierOrderIsKept) {
    std::vector alarms{alarm(1, 7, 0, false), alarm(2, 8, 0, true), alarm(9, 6, 0, true),
                       alarm(3, 9, 0, true)};
    keepOrder(alarms, {3, 4, 1, 2});
    EXPECT_THAT(idsOf(alarms), ElementsAre(3, 1, 2, 9)) << "a new one comes last";
}

TEST_F(AlarmOrderTest, aRingFollowsTheTimeZone) {
    const auto at = [](const char* zone, int hour) {
        return base::toInstant({{2026, 11, 18}, hour, 0, 0}, zone);
    };
    const ClockAlarmDbData noon = alarm(1, 12, 0, true);
    EXPECT_EQ(upcomingRing(noon, VirtualClock::now()), at(BERLIN, 12));
    VirtualClock::setZone("America/New_York");
    EXPECT_EQ(upcomingRing(noon, VirtualClock::now()), at("America/New_York", 12));
    EXPECT_EQ(nextAlarm({noon}, VirtualClock::now()), (NextAlarm{1, at("America/New_York", 12)}));
}

TEST_F(AlarmOrderTest, oneThatIsOffOrOverDoesNotRing) {
    EXPECT_FALSE(upcomingRing(alarm(1, 12, 0, false), VirtualClock::now()));
    EXPECT_FALSE(upcomingRing(alarm(1, 12, 0, true, 0, 17), VirtualClock::now()));
    EXPECT_FALSE(upcomingRing(alarm(1, 9, 41, true, 0, 18), VirtualClock::now()));
    EXPECT_TRUE(upcomingRing(alarm(1, 9, 42, true, 0, 18), VirtualClock::now()));
}
