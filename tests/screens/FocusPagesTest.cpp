// The other pages and popups by keys alone.

#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "support/Ring.h"

namespace {

class FocusDateTest : public EditorFixture {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    void openCalendar() {
        createAlarm();
        for (int i = 0; i < 12 && ringedName(stage()) != "DATE"; ++i)
            stage().keySettled("Tab");
        stage().keySettled("Return");
    }
    /** "2026-11-18", as the calendar has it. */
    std::string day() {
        std::tm day{};
        const auto calendars = stage().widgets("Calendar");
        if (calendars.empty() || !elm_calendar_selected_time_get(calendars.front(), &day))
            return "";
        char text[16];
        std::strftime(text, sizeof text, "%Y-%m-%d", &day);
        return text;
    }
    bool goToDays() {
        for (int i = 0; i < 8; ++i) {
            stage().keySettled("Tab");
            const auto found = ringed(stage());
            if (!found.empty() && found.front().type.find("Calendar") != std::string::npos)
                return true;
        }
        return false;
    }
};

TEST_F(FocusDateTest, ArrowsMoveByDaysAndWeeks) {
    openCalendar();
    const std::string today = day();
    ASSERT_TRUE(goToDays());
    stage().screenshot("focus-calendar");
    stage().keySettled("Right");
    stage().keySettled("Down");
    stage().keySettled("Left");
    stage().keySettled("Up");
    EXPECT_EQ(day(), today);
    stage().keySettled("Down");
    EXPECT_NE(day(), today);
}

TEST_F(FocusDateTest, TheBezelTurnsDaysAndPressesSet) {
    openCalendar();
    ASSERT_TRUE(goToDays());
    const std::string before = day();
    stage().pressBezel();
    stage().bezel(20);
    EXPECT_NE(day().substr(0, 7), before.substr(0, 7)) << "on to the next month";
    stage().pressBezel();
    stage().bezel(2);
    EXPECT_EQ(ringedName(stage()), "Set");
    stage().pressBezel();
    EXPECT_TRUE(stage().widgets("Calendar").empty());
    EXPECT_EQ(ringedName(stage()), "DATE") << "the focus returns";
}

class FocusCityTest : public CityPickerFixture {
protected:
    void TearDown() override {
        takeErrors();
        CityPickerFixture::TearDown();
    }
};

TEST_F(FocusCityTest, ACityIsFoundAndTakenByTheKeyboard) {
    openPicker();
    std::vector<std::string> names;
    for (int i = 0; i < 5; ++i) {
        stage().keySettled("Tab");
        names.push_back(theRinged(stage()).type);
    }
    stage().screenshot("focus-city-row");
    EXPECT_EQ(names, (std::vector<std::string>{"Elm_Button", "Elm_Layout", "Elm_Button",
                                               "Elm_Index", "Elm_Genlist"}));
    for (int i = 0; i < 3; ++i)
        stage().keySettled("ISO_Left_Tab");
    stage().type("ka");
    stage().settle();
    for (int i = 0; i < 4 && theRinged(stage()).type != "Elm_Genlist"; ++i)
        stage().keySettled("Tab");
    const std::string city = ringedName(stage());
    EXPECT_NE(city.find("Ka"), std::string::npos) << city;
    stage().screenshot("focus-city-found");
}

} // namespace
