// Screens that are open while the clock or the time zone is set.

#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "AlarmEditViewController.h"
#include "AlarmListViewController.h"
#include "EventRecorder.h"
#include "Foreground.h"
#include "SettingEvents.h"
#include "WorldClockViewController.h"
#include "control/DeviceActions.h"
#include "device_settings.h"
#include "support/ScreenTest.h"
#include "support/StoredData.h"

using simulator::AlarmListViewController;
using simulator::WorldClockViewController;
using testing::Contains;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";
constexpr const char* PAST = "Set autoDate and manualDate to 0. Time already passed !!";

std::int32_t midnight(int year, int month, int day) {
    std::tm time{};
    time.tm_year = year - 1900;
    time.tm_mon = month - 1;
    time.tm_mday = day;
    time.tm_isdst = -1;
    return static_cast<std::int32_t>(std::mktime(&time));
}

class ShiftedClockTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
        device().setSetting("db/menu_widget/regionformat", std::string("en_US"));
        simulator::followSettings();
        VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:41:05");
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        for (const std::string& line : takeErrors())
            EXPECT_THAT(quiet, Contains(line));
        ScreenTest::TearDown();
    }

    /** As the device does: its clock shows the new time before anybody is told. */
    void setClock(const std::string& reading) {
        VirtualClock::setNow(_zone, reading);
        device().setSetting(DEVICE_SETTING_CLOCK_SHIFT, ++_shift);
        stage().settle();
    }
    void setZone(const std::string& zone) {
        _zone = zone;
        VirtualClock::setZone(zone);
        device().setSetting(DEVICE_SETTING_TIME_ZONE, zone);
        stage().settle();
    }
    /** An alarm for a time of the 19th. */
    void openEditor(int hour, int minute, bool chosen = false) {
        ClockAlarmDbData alarm{};
        alarm.hour = hour;
        alarm.min = minute;
        alarm.repeatOnce = 1;
        alarm.autoDate = midnight(2026, 11, 19);
        alarm.manualDate = chosen ? alarm.autoDate : 0;
        stage().push(new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, false));
    }
    std::string dateLine() {
        for (const FoundText& found : stage().texts())
            if (found.text.find(" - ") != std::string::npos)
                return found.text;
        return "none";
    }
    std::string face() {
        std::string all;
        for (const FoundText& found : stage().texts())
            all += found.text + "\n";
        return all;
    }

    std::vector<std::string> quiet{"Alarm Name is NULL !!", "Focus is not set for entry !!"};

private:
    std::string _zone = "Europe/Berlin";
    int _shift = 0;
};

} // namespace

TEST_F(ShiftedClockTest, theEditorCountsDaysAnewAndPassesMidnightInTime) {
    openEditor(6, 0);
    ASSERT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    setClock("2026-11-18 23:59:50");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    const std::time_t end = VirtualClock::now() + 11;
    while (VirtualClock::now() < end)
        Stage::frames(1);
    EXPECT_EQ(dateLine(), "Today - Thu, Nov 19") << "the minute is still that of the old clock";
}

TEST_F(ShiftedClockTest, theEditorFollowsAJumpPastTheRingDayAndBack) {
    openEditor(6, 0);
    setClock("2026-11-25 05:00:00");
    EXPECT_EQ(dateLine(), "Today - Wed, Nov 25");
    setClock("2026-11-25 06:00:00");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 26");
    setClock("2026-11-10 05:59:00");
    EXPECT_EQ(dateLine(), "Today - Tue, Nov 10");
}

TEST_F(ShiftedClockTest, aChosenDayThatIsOverBecomesTomorrow) {
    openEditor(6, 0, true);
    setClock("2026-11-18 23:59:50");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    setClock("2026-11-25 05:00:00");
    expectLog(PAST);
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 26");
}

TEST_F(ShiftedClockTest, aLineThatAnotherLanguageHasBroughtIsCountedAnew) {
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 05:00:00");
    stage().push(
        new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true));
    ASSERT_EQ(dateLine(), "none") << "no wheel has turned";
    device().setSetting(DEVICE_SETTING_LANGUAGE, std::string("de"));
    stage().settle();
    ASSERT_EQ(dateLine(), "Today - Wed, Nov 18");
    setClock("2026-11-18 06:00:00");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    setClock("2026-11-18 23:59:50");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    const std::time_t end = VirtualClock::now() + 11;
    while (VirtualClock::now() < end)
        Stage::frames(1);
    EXPECT_EQ(dateLine(), "Today - Thu, Nov 19");
    setZone("Asia/Tokyo");
    EXPECT_EQ(dateLine(), "Tomorrow - Fri, Nov 20") << "it is eight there";
}

TEST_F(ShiftedClockTest, aNewAlarmsLineStaysBlank) {
    stage().push(
        new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, ClockAlarmDbData(), true));
    setClock("2026-11-25 05:00:00");
    setZone("Asia/Tokyo");
    EXPECT_EQ(dateLine(), "none");
}

TEST_F(ShiftedClockTest, aDayThatIsOverInTheBackgroundIsCountedAnewOnTheWayBack) {
    simulator::Foreground foreground(stage().window());
    simulator::setForeground(&foreground);
    openEditor(6, 0);
    foreground.leave(true);
    setZone("Pacific/Honolulu");
    setClock("2026-11-18 23:00:00");
    expectLog(PAST);
    ASSERT_EQ(dateLine(), "Tomorrow - Thu, Nov 19");
    VirtualClock::setNow("Pacific/Honolulu", "2026-11-19 05:00:00");
    foreground.leave(false);
    stage().settle();
    EXPECT_EQ(dateLine(), "Today - Thu, Nov 19");
    simulator::setForeground(nullptr);
}

TEST_F(ShiftedClockTest, theEditorFollowsTheZone) {
    openEditor(10, 0);
    setClock("2026-11-19 09:41:00");
    ASSERT_EQ(dateLine(), "Today - Thu, Nov 19");
    setZone("Asia/Tokyo");
    EXPECT_EQ(dateLine(), "Tomorrow - Fri, Nov 20") << "it is 17:41 there";
    setZone("Pacific/Honolulu");
    EXPECT_EQ(dateLine(), "Tomorrow - Thu, Nov 19") << "it is 22:41 of the day before";
}

TEST_F(ShiftedClockTest, anApplicationInTheBackgroundDoesNotComeBack) {
    simulator::Foreground foreground(stage().window());
    simulator::setForeground(&foreground);
    EventRecorder recorder;
    setClock("2026-11-25 05:00:00");
    EXPECT_THAT(recorder.events,
                ElementsAre(ClockEventListener::RESUMED, ClockEventListener::TIME_CHANGED));
    foreground.leave(true);
    recorder.events.clear();
    setZone("Asia/Tokyo");
    EXPECT_THAT(recorder.events, ElementsAre(ClockEventListener::TIME_CHANGED));
    simulator::setForeground(nullptr);
}

TEST_F(ShiftedClockTest, eachSettingRaisesItsEvent) {
    EventRecorder recorder;
    device().setSetting(DEVICE_SETTING_LANGUAGE, std::string("de"));
    device().setSetting(DEVICE_SETTING_TIME_FORM, 1);
    device().setSetting(DEVICE_SETTING_REGION, std::string("de_DE"));
    EXPECT_THAT(recorder.events, ElementsAre(ClockEventListener::LANGUAGE_CHANGED,
                                             ClockEventListener::SETTINGS_CHANGED,
                                             ClockEventListener::SETTINGS_CHANGED));
}

TEST_F(ShiftedClockTest, aSettingThatCannotBeWatchedIsToldOf) {
    device().fail("vconf_notify_key_changed");
    simulator::followSettings();
    expectLog("Changes of db/setting/time_zone go unnoticed");
    EXPECT_EQ(takeErrors().size(), 4U);
}

TEST_F(ShiftedClockTest, theWorldClockFollowsTheClockTheZoneAndTheNewMinute) {
    storeCity("IDS_CITY_NP_KATHMANDU");
    stage().push(new WorldClockViewController(THEME));
    ASSERT_THAT(face(), HasSubstr("14:26")) << "four hours and three quarters on";
    setClock("2026-11-18 23:59:50");
    EXPECT_THAT(face(), HasSubstr("04:44"));
    EXPECT_THAT(face(), HasSubstr("Tomorrow"));
    const std::time_t end = VirtualClock::now() + 11;
    while (VirtualClock::now() < end)
        Stage::frames(1);
    EXPECT_THAT(face(), HasSubstr("04:45")) << "the minute is still that of the old clock";
    EXPECT_THAT(face(), testing::Not(HasSubstr("Tomorrow")));
    setZone("America/New_York");
    EXPECT_THAT(face(), HasSubstr("04:45"));
    EXPECT_THAT(face(), HasSubstr("Tomorrow")) << "it is the day before here";
}

TEST_F(ShiftedClockTest, theAlarmListIsDrawnAnew) {
    ClockAlarmDbData alarm = alarmAt(6, 0);
    alarm.autoDate = midnight(2026, 11, 19);
    storeAlarm(alarm);
    stage().push(new AlarmListViewController(THEME));
    Evas_Object* before = stage().widgets("Elm_Genlist").front();
    setClock("2026-11-19 09:41:00");
    Evas_Object* later = stage().widgets("Elm_Genlist").front();
    EXPECT_NE(before, later) << "the list is the old one";
    setZone("Asia/Tokyo");
    EXPECT_NE(stage().widgets("Elm_Genlist").front(), later);
    EXPECT_THAT(face(), HasSubstr("06:00"));
}
