// Alarms are switched on and off in their rows.

#include <string>
#include <vector>

#include <gmock/gmock.h>

#include "AlarmListFixture.h"
#include "base/CivilTime.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr const char* COUNT = "memory/private/com.vendra.indicator/alarm";

class AlarmSwitchTest : public AlarmListFixture {
protected:
    void refuseWrites() {
        edit("CREATE TRIGGER refuse BEFORE UPDATE ON alarm BEGIN SELECT RAISE(ABORT, 'full'); END");
    }
    int count() { return std::get<int>(device().setting(COUNT).value_or(-1)); }
    static std::int32_t midnight(int month, int day) {
        return static_cast<std::int32_t>(
            base::toInstant({{2026, month, day}, 0, 0, 0}, "Europe/Berlin"));
    }
};

} // namespace

TEST_F(AlarmSwitchTest, aTapOfItsSwitchTurnsAnAlarmOff) {
    const auto alarm = add(10, 30, true, WEDNESDAY, "Tea");
    const auto other = add(11, 0, true, WEDNESDAY);
    openPage();
    EXPECT_TRUE(isOn("10:30"));
    flip("10:30");
    EXPECT_FALSE(isOn("10:30"));
    EXPECT_EQ(stored(alarm).enable, 0);
    EXPECT_FALSE(rings(alarm));
    EXPECT_TRUE(rings(other));
    EXPECT_EQ(stored(alarm).alarmMgrId, alarm.alarmMgrId) << "its schedule is the same one";
    EXPECT_EQ(count(), 1);
    EXPECT_THAT(device().toasts(), IsEmpty());
    EXPECT_EQ(pages(), 1U) << "the editor stays closed";
}

TEST_F(AlarmSwitchTest, aTapOfItsSwitchTurnsAnAlarmOnAndTellsWhenItRings) {
    const auto alarm = add(10, 30, false, WEDNESDAY);
    device().postNotification(std::to_string(alarm.id), "Missed");
    openPage();
    EXPECT_FALSE(isOn("10:30"));
    flip("10:30");
    EXPECT_TRUE(isOn("10:30"));
    EXPECT_EQ(stored(alarm).enable, 1);
    EXPECT_TRUE(rings(alarm));
    EXPECT_EQ(count(), 1);
    EXPECT_THAT(device().toasts(), ElementsAre("Alarm set for 49 minutes from now."));
    EXPECT_THAT(device().notifications(), IsEmpty());
}

TEST_F(AlarmSwitchTest, aOneTimeAlarmOfThePastRingsTheNextTime) {
    ClockAlarmDbData past;
    past.leading = 0;
    past.hour = 9;
    past.timeZone = "Europe/Berlin";
    past.autoDate = past.manualDate = midnight(11, 2);
    past.enable = 1;
    const auto alarm = add(past);
    openPage();
    EXPECT_FALSE(isOn("09:00")) << "it will not ring any more";
    EXPECT_TRUE(stage().shows("Off")) << readFace();
    flip("09:00");
    EXPECT_TRUE(isOn("09:00"));
    EXPECT_EQ(stored(alarm).autoDate, midnight(11, 19));
    EXPECT_EQ(stored(alarm).manualDate, 0);
    EXPECT_EQ(device().nextRing(alarm.alarmMgrId),
              base::toInstant({{2026, 11, 19}, 9, 0, 0}, "Europe/Berlin"));
    EXPECT_THAT(device().toasts(), ElementsAre("Alarm set for 23 hours, 19 minutes from now."));
    EXPECT_TRUE(stage().shows("Tomorrow")) << readFace();
}

TEST_F(AlarmSwitchTest, aPickedDayStays) {
    ClockAlarmDbData picked;
    picked.leading = 0;
    picked.hour = 9;
    picked.timeZone = "Europe/Berlin";
    picked.autoDate = picked.manualDate = midnight(12, 24);
    const auto alarm = add(picked);
    openPage();
    EXPECT_TRUE(stage().shows("Thu, Dec 24")) << readFace();
    flip("09:00");
    EXPECT_EQ(stored(alarm).manualDate, midnight(12, 24));
    EXPECT_EQ(device().nextRing(alarm.alarmMgrId),
              base::toInstant({{2026, 12, 24}, 9, 0, 0}, "Europe/Berlin"));
}

TEST_F(AlarmSwitchTest, fastTapsEndWhereTheLastOneLeads) {
    const auto alarm = add(10, 30, false, WEDNESDAY);
    openPage();
    const Spot spot = Stage::area(switchOf("10:30")).middle();
    for (int taps = 0; taps < 7; ++taps)
        stage().tap(spot);
    stage().settle();
    EXPECT_TRUE(isOn("10:30"));
    EXPECT_EQ(stored(alarm).enable, 1);
    EXPECT_TRUE(rings(alarm));
    stage().tap(spot);
    stage().settle();
    EXPECT_FALSE(isOn("10:30"));
    EXPECT_FALSE(rings(alarm));
    EXPECT_EQ(pages(), 1U);
}

TEST_F(AlarmSwitchTest, aSchedulerThatFailsLeavesEverythingAsItWas) {
    const auto alarm = add(10, 30, false, WEDNESDAY);
    openPage();
    device().fail("alarm_server_update", ALARM_SERVER_ERROR_IO);
    flip("10:30");
    EXPECT_FALSE(isOn("10:30")) << "the switch goes back";
    EXPECT_EQ(stored(alarm).enable, 0);
    EXPECT_FALSE(rings(alarm));
    EXPECT_THAT(device().toasts(), IsEmpty());
    expectLog("alarm_server_update failed(id = 1, ret = -3)");
    expectLog("Alarm 1 stays switched off");
    device().succeed("alarm_server_update");
    flip("10:30");
    EXPECT_TRUE(isOn("10:30"));
    EXPECT_TRUE(rings(alarm));
}

TEST_F(AlarmSwitchTest, aStoreThatFailsLeavesEverythingAsItWas) {
    const auto on = add(10, 30, true, WEDNESDAY);
    openPage();
    refuseWrites();
    flip("10:30");
    EXPECT_TRUE(isOn("10:30")) << "the switch goes back";
    EXPECT_EQ(stored(on).enable, 1);
    EXPECT_EQ(stored(on).updateTime, on.updateTime);
    EXPECT_TRUE(rings(on)) << "what is stored as on must ring";
    EXPECT_THAT(takeErrors(), ElementsAre(HasSubstr("alarm 1 cannot be stored: full"),
                                          "Alarm 1 stays switched on"));
    edit("DROP TRIGGER refuse");
    flip("10:30");
    EXPECT_FALSE(rings(on));
    EXPECT_EQ(stored(on).enable, 0);
}

TEST_F(AlarmSwitchTest, anAlarmThatHasLostItsScheduleGetsAnother) {
    const auto alarm = add(10, 30, false, WEDNESDAY);
    device().dropSchedule(alarm.alarmMgrId);
    openPage();
    flip("10:30");
    EXPECT_NE(stored(alarm).alarmMgrId, alarm.alarmMgrId);
    EXPECT_TRUE(rings(alarm));
}

TEST_F(AlarmSwitchTest, whatAnotherProgramHasChangedIsKept) {
    const auto alarm = add(10, 30, false, WEDNESDAY);
    openPage();
    edit("UPDATE alarm SET name = 'Tea', hour = 12");
    flip("10:30");
    EXPECT_EQ(stored(alarm).name, "Tea");
    EXPECT_EQ(stored(alarm).hour, 12);
    EXPECT_EQ(stored(alarm).enable, 1);
    EXPECT_TRUE(stage().shows("12:30")) << readFace();
}

TEST_F(AlarmSwitchTest, anAlarmThatAnotherProgramHasRemovedGoes) {
    add(10, 30, false, WEDNESDAY);
    openPage();
    edit("DELETE FROM alarm");
    flip("10:30");
    expectLog("Alarm 1 is not stored");
    EXPECT_TRUE(stage().shows("No alarms")) << readFace();
}

TEST_F(AlarmSwitchTest, theRestOfTheRowOpensTheEditor) {
    add(10, 30, true, WEDNESDAY, "Tea");
    openPage();
    const Area area = Stage::area(switchOf("10:30"));
    stage().tap(area.x - 8, area.middle().y);
    stage().settle();
    EXPECT_EQ(pages(), 2U);
    EXPECT_TRUE(stage().shows("Edit")) << readFace();
    takeStageDown();
    // What the editor says about its name field is its own affair.
    takeErrors();
}

TEST_F(AlarmSwitchTest, aDragThatBeginsOnASwitchScrolls) {
    for (int hour = 10; hour < 15; ++hour)
        add(hour, 0, true, WEDNESDAY);
    openPage();
    const Spot spot = Stage::area(switchOf("10:00")).middle();
    const int before = placeOf("10:00").y;
    stage().drag(spot.x, spot.y, 0, -60);
    stage().settle();
    EXPECT_LT(placeOf("10:00").y, before - 20);
    for (const ClockAlarmDbData& alarm : alarms())
        EXPECT_EQ(alarm.enable, 1) << alarm.hour;
    EXPECT_EQ(pages(), 1U);
}

TEST_F(AlarmSwitchTest, aSwitchWhileThePageGoesDoesNothing) {
    const auto alarm = add(10, 30, true, WEDNESDAY);
    openPage();
    const Spot spot = Stage::area(switchOf("10:30")).middle();
    stage().tapText("World clock");
    stage().tap(spot);
    stage().settle();
    EXPECT_EQ(stored(alarm).enable, 1);
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(isOn("10:30"));
}

TEST_F(AlarmSwitchTest, aFaceThatIsReadFromTheRightHasItsSwitchesOnTheLeft) {
    add(10, 30, true, WEDNESDAY, "Tea");
    openPage();
    EXPECT_GT(Stage::area(switchOf("10:30")).middle().x, 180);
    EXPECT_LT(placeOf("10:30").x, 180);
    elm_config_mirrored_set(EINA_TRUE);
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_LT(Stage::area(switchOf("10:30")).middle().x, 180);
    EXPECT_GT(placeOf("10:30").x, 180);
    elm_config_mirrored_set(EINA_FALSE);
}
