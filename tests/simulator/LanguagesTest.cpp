// The simulator's own pages in every language, and while the language changes.

#include <algorithm>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>

#include "AlarmListViewController.h"
#include "QuickPanel.h"
#include "ToastView.h"
#include "WorldClockViewController.h"
#include "base/Text.h"
#include "clock/ClockStringUtil.h"
#include "clock/ClockText.h"
#include "clock/ClockWorldClockDbModel.h"
#include "support/FaceInk.h"
#include "support/LiveLanguage.h"
#include "support/ScreenTest.h"
#include "support/StoredData.h"
#include "support/TextFaults.h"

using testing::IsEmpty;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

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
    /** Puts the cities with the longest names into the list. */
    static void selectLongestCities(std::size_t count) {
        std::vector<ClockWorldClockDbData> all;
        ClockWorldClockDbModel().getWorldClockAllCityList(all);
        std::ranges::sort(all, std::ranges::greater(), [](const ClockWorldClockDbData& city) {
            return std::string_view(clockText(city.city.c_str())).size();
        });
        ASSERT_GE(all.size(), count);
        for (std::size_t place = 0; place < count; ++place)
            storeCity(all[place].city, static_cast<int>(place) + 1);
    }
    static std::vector<std::string> longToasts() {
        const auto format = [](const char* id, const std::vector<base::FormatArgument>& arguments) {
            return base::formatTranslation(clockText(id), arguments);
        };
        std::string span;
        ClockStringUtil::generateAlertOffsetToastPopupText(6, 23, 59, span);
        return {
            span,
            format("IDS_CLOCK_TPOP_ALARM_ALREADY_SET_FOR_PS_EXISTING_ALARM_UPDATED", {"10:45 PM"}),
            format("IDS_CLOCK_TPOP_CANT_SAVE_MORE_THAN_PD_CHARACTERS", {20}),
            format("IDS_CLOCK_TPOP_CANT_ENTER_MORE_THAN_PD_CHARACTERS", {20}),
            clockText("IDS_CLOCK_TPOP_CANT_SET_ALARMS_FOR_TIME_IN_PAST_TOMORROWS_DATE_SET"),
            clockText("IDS_CLOCK_POP_LOCATION_SERVICES_NOT_AVAILABLE"),
            format("IDS_CLOCK_BODY_PS_ALREADY_EXISTS", {"San Fernando del Valle de Catamarca"})};
    }
    void take(const std::string& name) { stage().screenshot("simulator-" + GetParam() + name); }
    bool shows(const char* id) { return stage().shows(clockText(id)); }

private:
    std::optional<LiveLanguage> _language;
};

TEST_P(LanguagesTest, TheListOfAlarmsFollowsAndFits) {
    storeAlarm(alarmAt(7, 30, 126));
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

TEST_P(LanguagesTest, TheWorldClockHasRoomForTheLongestNames) {
    choose();
    selectLongestCities(3);
    stage().push(new simulator::WorldClockViewController(THEME));
    const auto lists = stage().widgets("Elm_Genlist");
    ASSERT_THAT(lists, testing::SizeIs(1));
    for (Elm_Object_Item* row = elm_genlist_first_item_get(lists.front()); row;
         row = elm_genlist_item_next_get(row)) {
        stage().showRow(row);
        stage().settle();
        EXPECT_THAT(faults(), IsEmpty());
    }
    take("-long-cities");
}

TEST_P(LanguagesTest, EveryToastFits) {
    choose();
    simulator::ToastView toasts(stage().window(), THEME);
    for (const std::string& text : longToasts()) {
        toasts.post(text);
        Stage::advance(1);
        ASSERT_TRUE(stage().shows(text)) << text;
        EXPECT_THAT(faultsOf(stage().texts()), IsEmpty());
        for (const Ink& line : inkOf(stage().canvas()))
            EXPECT_TRUE(!line.isText || line.area.reach() <= Stage::SIZE / 2.0) << text;
        take("-toast");
        Stage::advance(3);
    }
}

TEST_P(LanguagesTest, AToastStaysAsItWasPosted) {
    simulator::ToastView toasts(stage().window(), THEME);
    toasts.post("Alarm set.");
    Stage::advance(1);
    choose();
    EXPECT_TRUE(stage().shows("Alarm set."));
    EXPECT_THAT(faultsOf(stage().texts()), IsEmpty());
    Stage::advance(3);
    EXPECT_FALSE(stage().shows("Alarm set."));
    toasts.post(clockText("IDS_CLOCK_TPOP_ALARM_SET"));
    Stage::advance(1);
    EXPECT_TRUE(shows("IDS_CLOCK_TPOP_ALARM_SET"));
    EXPECT_THAT(faultsOf(stage().texts()), IsEmpty());
}

TEST_P(LanguagesTest, TheQuestionBeforeACityGoesFollowsAndFits) {
    selectLongestCities(1);
    stage().push(new simulator::WorldClockViewController(THEME));
    for (const FoundText& found : stage().texts()) {
        if (found.text.find("GMT") != std::string::npos) {
            stage().tap(found.area.middle());
            stage().settle();
            break;
        }
    }
    ASSERT_TRUE(stage().shows("Remove"));
    choose();
    take("-remove");
    EXPECT_TRUE(shows("IDS_COM_SK_REMOVE"));
    EXPECT_TRUE(shows("IDS_COM_SK_CANCEL"));
    EXPECT_TRUE(shows("IDS_WCL_POP_REMOVE_CITY_FROM_LIST"));
    std::vector<ClockWorldClockDbData> selected;
    ClockWorldClockDbModel().getWorldClockSelectedCityList(selected);
    ASSERT_THAT(selected, testing::SizeIs(1));
    EXPECT_TRUE(shows(selected.front().city.c_str()));
    EXPECT_THAT(faults(), IsEmpty());
    stage().backKey();
    stage().settle();
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

INSTANTIATE_TEST_SUITE_P(Language, LanguagesTest, testing::ValuesIn(catalogueLanguages()),
                         [](const auto& language) { return language.param; });

} // namespace
