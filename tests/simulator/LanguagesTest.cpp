// The simulator's own pages in every language, and while the language changes.

#include <algorithm>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "AlarmListViewController.h"
#include "QuickPanel.h"
#include "WorldClockViewController.h"
#include "clock/ClockAlarmDbModel.h"
#include "clock/ClockText.h"
#include "support/LiveLanguage.h"
#include "support/ScreenTest.h"
#include "support/TextFaults.h"

using testing::IsEmpty;

namespace {

namespace fs = std::filesystem;

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

std::vector<std::string> languages() {
    std::vector<std::string> names;
    for (const auto& file : fs::directory_iterator(CLOCK_SOURCE_DIR "/po"))
        if (file.path().extension() == ".po")
            names.push_back(file.path().stem());
    std::sort(names.begin(), names.end());
    return names;
}

class LanguagesTest : public ScreenTest, public testing::WithParamInterface<std::string> {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
        _language.emplace();
    }
    void TearDown() override {
        takeStageDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        ScreenTest::TearDown();
        _language.reset();
    }
    static void storeAlarm() {
        ClockAlarmDbData alarm{};
        alarm.hour = 7;
        alarm.min = 30;
        alarm.enable = 1;
        alarm.repeatWeekly = 126;
        ClockAlarmDbModel().insertAlarmData(alarm);
    }
    /** A title may slide. */
    std::vector<std::string> faults() {
        auto texts = stage().texts();
        std::erase_if(texts, [](const FoundText& found) { return found.area.y < 36; });
        return faultsOf(texts);
    }
    void choose() {
        _language->choose(GetParam());
        EXPECT_TRUE(stage().settle(10));
    }
    void take(const std::string& name) { stage().screenshot("simulator-" + GetParam() + name); }
    bool shows(const char* id) { return stage().shows(clockText(id)); }

private:
    std::optional<LiveLanguage> _language;
};

TEST_P(LanguagesTest, TheListOfAlarmsFollowsAndFits) {
    storeAlarm();
    stage().push(new simulator::AlarmListViewController(THEME));
    choose();
    take("-alarms");
    EXPECT_TRUE(shows("IDS_COM_BODY_CREATE"));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(LanguagesTest, TheWorldClockFollowsAndFits) {
    stage().push(new simulator::WorldClockViewController(THEME));
    choose();
    take("-world-clock");
    EXPECT_TRUE(shows("IDS_WCL_OPT_ADDCITY"));
    EXPECT_THAT(faults(), IsEmpty());
}

TEST_P(LanguagesTest, TheQuickPanelFollowsAndFits) {
    simulator::QuickPanel panel(stage().window(), THEME, [](bool) {});
    panel.toggle();
    stage().settle();
    choose();
    take("-panel");
    EXPECT_TRUE(shows("IDS_QP_HEADER_ALARM_VOLUME"));
    EXPECT_THAT(faults(), IsEmpty());
    panel.toggle();
}

INSTANTIATE_TEST_SUITE_P(Language, LanguagesTest, testing::ValuesIn(languages()),
                         [](const auto& language) { return language.param; });

} // namespace
