// Nothing that matters on the simulator's own pages is cut by the circle.

#include <cmath>
#include <memory>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "AlarmListViewController.h"
#include "QuickPanel.h"
#include "ToastView.h"
#include "VolumeView.h"
#include "WorldClockViewController.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockStringUtil.h"
#include "clock/ClockWorldClockDbModel.h"
#include "screens/TestCatalogue.h"
#include "support/FaceInk.h"
#include "support/ScreenTest.h"

using simulator::AlarmListViewController;
using simulator::QuickPanel;
using simulator::ToastView;
using simulator::VolumeView;
using simulator::WorldClockViewController;
using testing::IsEmpty;

namespace {

constexpr double RADIUS = 180;
/** What is fainter than this is on its way out. */
constexpr double FAINT = 0.08;
const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

std::vector<std::string> cutByCircle(const Evas* canvas) {
    std::vector<std::string> cut;
    for (const Ink& ink : inkOf(canvas)) {
        if (ink.opacity >= FAINT && ink.area.reach() > RADIUS)
            cut.push_back(ink.what + " reaches " + std::to_string(ink.area.reach()) + " from " +
                          std::to_string(ink.area.x) + ", " + std::to_string(ink.area.y));
    }
    return cut;
}

class SimulatorFaceTest : public ScreenTest, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
        _language = std::make_unique<CatalogueLanguage>(GetParam());
        elm_config_mirrored_set(std::string(GetParam()) == "ar" ? EINA_TRUE : EINA_FALSE);
        device().setSetting("db/menu_widget/regionformat_time1224", 1);
    }
    void TearDown() override {
        takeStageDown();
        elm_config_mirrored_set(EINA_FALSE);
        _language.reset();
        elm_theme_extension_del(nullptr, THEME.c_str());
        ScreenTest::TearDown();
    }

    void look(const std::string& name) {
        EXPECT_THAT(cutByCircle(stage().canvas()), IsEmpty()) << name;
        stage().screenshot(std::string("face-") + GetParam() + "-" + name);
    }
    void lookAtList(const std::string& name) {
        Evas_Object* const list = stage().widgets("Elm_Genlist").front();
        int height = 0;
        int shown = 0;
        elm_scroller_child_size_get(list, nullptr, &height);
        elm_scroller_region_get(list, nullptr, nullptr, nullptr, &shown);
        const int steps = 8;
        for (int step = 0; step <= steps; ++step) {
            elm_scroller_region_show(list, 0, (height - shown) * step / steps, 1, shown);
            stage().settle();
            look(name + "-" + std::to_string(step));
        }
    }
    static void store(int hour, int minute, const std::string& name, int weekdays) {
        ClockAlarmDbData alarm;
        alarm.leading = 0;
        alarm.hour = hour;
        alarm.min = minute;
        alarm.name = name;
        alarm.enable = 1;
        alarm.repeatWeekly = weekdays;
        alarm.repeatOnce = 0;
        ClockAlarmDbModel model;
        alarm.id = model.reserveAlarmId();
        ASSERT_TRUE(model.insertAlarmData(alarm));
    }

private:
    std::unique_ptr<CatalogueLanguage> _language;
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
    stage().push(new AlarmListViewController(THEME));
    lookAtList("alarms");
}

TEST_P(SimulatorFaceTest, NoCities) {
    stage().push(new WorldClockViewController(THEME));
    look("no-cities");
}

TEST_P(SimulatorFaceTest, SeveralCities) {
    std::vector<ClockWorldClockDbData> all;
    ClockWorldClockDbModel().getWorldClockAllCityList(all);
    int position = 0;
    for (ClockWorldClockDbData& city : all) {
        if (city.city == "IDS_CITY_NP_KATHMANDU" || city.city == "IDS_CITY_US_HAWAII_HONOLULU" ||
            city.city == "IDS_CITY_BR_PARAIBA_JOAO_PESSOA") {
            city.selected = 1;
            city.position = position++;
            ASSERT_TRUE(ClockWorldClockDbModel().updateWorldClockDbRecord(city));
        }
    }
    ASSERT_GT(position, 1);
    stage().push(new WorldClockViewController(THEME));
    lookAtList("cities");
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

INSTANTIATE_TEST_SUITE_P(Languages, SimulatorFaceTest,
                         testing::Values("en", "de", "ar", "hi", "ja"),
                         [](const auto& language) { return std::string(language.param); });

} // namespace
