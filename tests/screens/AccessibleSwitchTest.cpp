// What a screen reader is told of an open screen once another language has been chosen.

#include <string>

#include <Elementary.h>
#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "screens/ToneFixture.h"
#include "support/ReadingSwitch.h"

namespace {

class AccessibleSwitchTest : public ReadingSwitch<EditorFixture> {
protected:
    void showRow(int place) {
        stage().showRow(elm_genlist_nth_item_get(genlist(), static_cast<unsigned>(place)));
        stage().settle();
    }
    void tapRow(int place) {
        createAlarm();
        stage().tapRow(elm_genlist_nth_item_get(genlist(), static_cast<unsigned>(place)));
        stage().settle();
    }
};

INSTANTIATE_TEST_SUITE_P(Languages, AccessibleSwitchTest, languageChanges(),
                         [](const auto& info) { return info.param.name; });

TEST_P(AccessibleSwitchTest, TheEditorsWheelsAndRows) {
    device().setSetting("db/menu_widget/regionformat_time1224", 1);
    expectTheSame([this] {
        createAlarm();
        pick(18, 25);
    });
}

TEST_P(AccessibleSwitchTest, TheEditorsSliderAndSwitches) {
    expectTheSame([this] {
        createAlarm();
        showRow(5);
    });
}

TEST_P(AccessibleSwitchTest, TheEditorsField) {
    expectTheSame([this] {
        createAlarm();
        showRow(7);
    });
}

TEST_P(AccessibleSwitchTest, TheRepeatScreen) {
    expectTheSame([this] { tapRow(1); });
}

TEST_P(AccessibleSwitchTest, TheTypePopup) {
    expectTheSame([this] { tapRow(2); });
}

TEST_P(AccessibleSwitchTest, TheDatePopup) {
    expectTheSame([this] {
        createAlarm();
        stage().tap(timePickerRow().getCalendarObj());
        stage().settle();
    });
}

TEST_P(AccessibleSwitchTest, TheDiscardPopup) {
    expectTheSame([this] {
        tapRow(5);
        stage().backKey();
        stage().settle();
    });
}

class AccessibleCitySwitchTest : public ReadingSwitch<CityPickerFixture> {
protected:
    void SetUp() override {
        ReadingSwitch::SetUp();
        worldOf({"IDS_CITY_DE_MUNICH", "IDS_CITY_JP_TOKYO", "IDS_CITY_IN_NEW_DELHI",
                 "IDS_CITY_EG_CAIRO", "IDS_CITY_CN_BEIJING"});
    }
};

INSTANTIATE_TEST_SUITE_P(Languages, AccessibleCitySwitchTest, languageChanges(),
                         [](const auto& info) { return info.param.name; });

TEST_P(AccessibleCitySwitchTest, TheCityPickersRowsButtonsAndField) {
    expectTheSame([this] {
        openPicker();
        fill();
    });
}

TEST_P(AccessibleCitySwitchTest, RowsThatAreOutOfSight) {
    expectTheSame([this] {
        openPicker();
        fill();
        stage().showRow(items().back());
    });
}

TEST_P(AccessibleCitySwitchTest, ASearchThatFindsNothing) {
    expectTheSame([this] {
        openPicker();
        search("qqxx");
        stage().key("Return");
    });
}

class AccessibleToneSwitchTest : public ReadingSwitch<ToneFixture> {};

INSTANTIATE_TEST_SUITE_P(Languages, AccessibleToneSwitchTest, languageChanges(),
                         [](const auto& info) { return info.param.name; });

TEST_P(AccessibleToneSwitchTest, TheTonePickersRowsAndButtons) {
    expectTheSame([this] {
        closeTones();
        openTones({"Bells", "Rain"}, 1);
    });
}

TEST_P(AccessibleToneSwitchTest, TheTonePickerWithoutAMark) {
    expectTheSame([this] {
        closeTones();
        openTones({"Bells"}, -1);
    });
}

TEST_P(AccessibleToneSwitchTest, TheWordsThatThereAreNoTones) {
    expectTheSame([this] {
        closeTones();
        openTones({}, -1);
    });
}

} // namespace
