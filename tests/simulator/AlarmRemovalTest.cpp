// An alarm is removed by holding its row.

#include <string>

#include <gmock/gmock.h>

#include "AlarmListFixture.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

class AlarmRemovalTest : public AlarmListFixture {
protected:
    void holdRow(const std::string& time) { hold(placeOf(time)); }
    bool asks() { return stage().shows("Remove"); }
};

} // namespace

TEST_F(AlarmRemovalTest, aHeldAlarmIsRemovedOnceAPersonSaysSo) {
    add(10, 30, true, WEDNESDAY, "Gym & <b>tea</b>");
    const auto other = add(11, 0, true, WEDNESDAY);
    openPage();
    holdRow("10:30");
    EXPECT_TRUE(asks()) << readFace();
    EXPECT_TRUE(stage().shows("10:30"));
    EXPECT_THAT(readFace(), HasSubstr("Gym & <b>tea</b>"));
    EXPECT_THAT(readFace(), HasSubstr("This alarm will be removed."));
    EXPECT_THAT(alarms(), SizeIs(2));
    EXPECT_EQ(pages(), 1U) << "the editor stays closed";
    tapText("Remove");
    ASSERT_THAT(alarms(), SizeIs(1));
    EXPECT_EQ(alarms().front().id, other.id);
    EXPECT_THAT(device().schedules(), SizeIs(1));
    EXPECT_TRUE(rings(other));
    EXPECT_THAT(times(), ElementsAre("11:00"));
    EXPECT_EQ(device().setting("memory/private/com.vendra.indicator/alarm"), DeviceSetting(1));
}

TEST_F(AlarmRemovalTest, theLastAlarmThatGoesLeavesAnEmptyList) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    device().postNotification(std::to_string(alarm.id), "Missed");
    openPage();
    holdRow("10:30");
    tapText("Remove");
    EXPECT_TRUE(stage().shows("No alarms")) << readFace();
    EXPECT_THAT(device().notifications(), IsEmpty());
}

TEST_F(AlarmRemovalTest, cancelAndTheBackKeyKeepTheAlarm) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    holdRow("10:30");
    tapText("Cancel");
    EXPECT_FALSE(asks());
    holdRow("10:30");
    EXPECT_TRUE(asks());
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(asks());
    EXPECT_THAT(alarms(), SizeIs(1));
    EXPECT_TRUE(stage().shows("World clock")) << "the back key closes the question alone";
}

TEST_F(AlarmRemovalTest, theNeighbourOfOneFarDownComesIntoView) {
    for (int minute = 42; minute < 52; ++minute)
        add(9, minute, true, WEDNESDAY);
    openPage();
    for (int drag = 0; drag < 14; ++drag)
        stage().drag(60, 250, 0, -150);
    stage().settle();
    holdRow("09:51");
    tapText("Remove");
    EXPECT_TRUE(stage().shows("09:50")) << readFace();
}

TEST_F(AlarmRemovalTest, aFingerThatRestsOnTheSwitchFlipsIt) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    openPage();
    hold(Stage::area(switchOf("10:30")).middle());
    EXPECT_FALSE(asks());
    EXPECT_EQ(stored(alarm).enable, 0);
}

TEST_F(AlarmRemovalTest, aFingerThatScrollsSlowlyDoesNotAsk) {
    for (int hour = 10; hour < 15; ++hour)
        add(hour, 0, true, WEDNESDAY);
    openPage();
    const int before = placeOf("10:00").y;
    stage().drag(100, 200, 0, -80, 2000);
    stage().settle();
    EXPECT_LT(placeOf("10:00").y, before - 40);
    EXPECT_FALSE(asks());
    EXPECT_EQ(pages(), 1U);
    hold({100, 180});
    EXPECT_TRUE(asks()) << readFace();
}

TEST_F(AlarmRemovalTest, aStoreThatFailsKeepsTheAlarmAndItsRing) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    openPage();
    edit("CREATE TRIGGER refuse BEFORE DELETE ON alarm BEGIN SELECT RAISE(ABORT, 'full'); END");
    holdRow("10:30");
    tapText("Remove");
    EXPECT_THAT(takeErrors(), ElementsAre(HasSubstr("alarm 1 cannot be removed: full")));
    EXPECT_TRUE(stage().shows("10:30"));
    EXPECT_TRUE(rings(alarm));
}

TEST_F(AlarmRemovalTest, aSchedulerThatFailsIsLogged) {
    add(10, 30, true, WEDNESDAY);
    openPage();
    device().fail("alarm_server_unregister", ALARM_SERVER_ERROR_IO);
    holdRow("10:30");
    tapText("Remove");
    expectLog("alarm_server_unregister failed(schedule = 1, ret = -3)");
    EXPECT_THAT(alarms(), IsEmpty());
}
