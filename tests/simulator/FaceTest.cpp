// Nothing that matters on the simulator's own pages is cut by the circle.

#include <string>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "AlarmListViewController.h"
#include "QuickPanel.h"
#include "ToastView.h"
#include "VolumeView.h"
#include "WorldClockViewController.h"
#include "clock/ClockStringUtil.h"
#include "support/FaceFixture.h"
#include "support/ScreenTest.h"
#include "support/StoredData.h"

using simulator::AlarmListViewController;
using simulator::QuickPanel;
using simulator::ToastView;
using simulator::VolumeView;
using simulator::WorldClockViewController;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class SimulatorFaceTest : public FaceFixture<ScreenTest> {
protected:
    void SetUp() override {
        FaceFixture::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
    }
    void TearDown() override {
        FaceFixture::TearDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
    }

    Evas_Object* list() { return stage().widgets("Elm_Genlist").front(); }
    static void store(int hour, int minute, const std::string& name, int weekdays, bool on = true) {
        ClockAlarmDbData alarm = alarmAt(hour, minute, weekdays);
        alarm.name = name;
        alarm.enable = on ? 1 : 0;
        storeAlarm(alarm);
    }
};

TEST_P(SimulatorFaceTest, NoAlarms) {
    stage().push(new AlarmListViewController(THEME));
    look("no-alarms");
}

TEST_P(SimulatorFaceTest, SeveralAlarms) {
    store(7, 30, "Gym & <b>tea</b>", 2);
    store(10, 30, "WWWWWWWWWWWWWWWWWWWW", 62);
    store(22, 45, "", 127);
    store(23, 59, "Medicine", 65);
    store(12, 55, "", 0, false);
    store(12, 55, "WWWWWWWWWWWWWWWWWWWW", 62, false);
    stage().push(new AlarmListViewController(THEME));
    lookAtList(list(), "alarms");
    lookAtFocus(6, "alarms-keys");
}

TEST_P(SimulatorFaceTest, AnAlarmIsRemoved) {
    store(22, 45, "WWWWWWWWWWWWWWWWWWWW", 127);
    stage().push(new AlarmListViewController(THEME));
    stage().press(180, 180);
    Stage::advance(0.8);
    stage().release();
    stage().settle();
    ASSERT_EQ(stage().widgets("Elm_Popup").size(), 1U);
    look("alarm-removal");
}

TEST_P(SimulatorFaceTest, NoCities) {
    stage().push(new WorldClockViewController(THEME));
    look("no-cities");
}

TEST_P(SimulatorFaceTest, SeveralCities) {
    storeCity("IDS_CITY_US_HAWAII_HONOLULU", 0);
    storeCity("IDS_CITY_BR_PARAIBA_JOAO_PESSOA", 1);
    storeCity("IDS_CITY_NP_KATHMANDU", 2);
    stage().push(new WorldClockViewController(THEME));
    lookAtList(list(), "cities");
}

TEST_P(SimulatorFaceTest, Toasts) {
    std::string text;
    ClockStringUtil::generateAlertOffsetToastPopupText(6, 23, 59, text);
    ToastView toasts(stage().window(), THEME);
    toasts.post(text);
    Stage::advance(1);
    look("toast");
}

TEST_P(SimulatorFaceTest, TheQuickPanel) {
    QuickPanel panel(stage().window(), THEME, [](bool) {});
    panel.toggle();
    Stage::advance(0.6);
    look("panel");
}

TEST_P(SimulatorFaceTest, TheVolume) {
    VolumeView volume(stage().window(), THEME);
    for (const int level : {0, 7, 15}) {
        volume.show(level);
        Stage::advance(0.5);
        look("volume-" + std::to_string(level));
    }
}

INSTANTIATE_TEST_SUITE_P(Languages, SimulatorFaceTest, FACE_LANGUAGES, languageOf);

} // namespace
