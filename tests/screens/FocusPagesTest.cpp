// The date popup and the city picker without a finger.

#include <gtest/gtest.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "support/FocusWalk.h"

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

class FocusCityTest : public CityPickerFixture, public testing::WithParamInterface<Hand> {
protected:
    void TearDown() override {
        takeErrors();
        CityPickerFixture::TearDown();
    }
    FocusWalk walk() { return {stage(), GetParam()}; }
    /** Keys begin at the first thing, the bezel in the middle of the face. */
    int wayToTheTop() const { return GetParam() == Hand::Keys ? 1 : -1; }
    /** Goes on until something of a type has the focus. */
    bool goToType(const std::string& type) {
        for (int i = 0; i < 10; ++i) {
            if (!ringed(stage()).empty() && theRinged(stage()).type == type)
                return true;
            wayToTheTop() > 0 ? walk().next() : walk().previous();
        }
        return false;
    }
    /** The city whose row is in the middle of the list has the focus. */
    std::string focusedCity() {
        const Ringed row = theRinged(stage());
        EXPECT_EQ(row.type, "Elm_Genlist");
        walk().expectVisible(row);
        return row.name;
    }
};

INSTANTIATE_TEST_SUITE_P(Hands, FocusCityTest, testing::Values(Hand::Keys, Hand::Bezel),
                         [](const auto& info) { return nameOf(info.param); });

TEST_P(FocusCityTest, EverythingIsReachedInTheOrderOfReading) {
    worldOf({"IDS_CITY_NP_KATHMANDU", "IDS_CITY_SG_SINGAPORE"});
    openPicker();
    fill();
    walk().next();
    const auto names = walk().everything();
    ASSERT_EQ(names.size(), 5U);
    EXPECT_EQ(names.at(0), "Cancel");
    EXPECT_EQ(names.at(2), "Current location");
    EXPECT_EQ(names.at(3), "Kathmandu, Nepal");
    EXPECT_EQ(names.at(4), "Singapore");
}

TEST_P(FocusCityTest, TheIndexLeadsToAnHourWhoseCityIsTaken) {
    openPicker();
    fill();
    walk().next();
    ASSERT_TRUE(goToType("Elm_Index"));
    walk().expectVisible(theRinged(stage()));
    walk().press();
    for (int i = 0; i < 4; ++i)
        walk().turn();
    stage().screenshot("focus-city-index-" + nameOf(GetParam()));
    const std::string firstCity = firstCityOf(hours().at(3));
    walk().press();
    walk().next();
    const std::string city = focusedCity();
    stage().screenshot("focus-city-hour-" + nameOf(GetParam()));
    walk().press();
    ASSERT_EQ(returned.size(), 1U) << city;
    EXPECT_EQ(returned.front().city, firstCity);
    EXPECT_FALSE(isOpen());
}

TEST_P(FocusCityTest, TheLocationButtonIsPressed) {
    openPicker();
    fill();
    walk().next();
    ASSERT_TRUE(walk().goTo("Current location", wayToTheTop()));
    walk().expectVisible(theRinged(stage()));
    walk().press();
    EXPECT_FALSE(stage().findText("Current location")) << "it has no text";
    EXPECT_TRUE(isOpen());
}

TEST_P(FocusCityTest, ACityIsSearchedAndTaken) {
    openPicker();
    fill();
    walk().next();
    ASSERT_TRUE(goToType("Elm_Layout"));
    walk().expectVisible(theRinged(stage()));
    // The bezel passes over a field until it is pressed.
    if (GetParam() == Hand::Bezel)
        walk().press();
    EXPECT_TRUE(elm_object_focus_get(entry())) << "one can type";
    stage().type("kathm");
    stage().settle();
    while (theRinged(stage()).type != "Elm_Genlist" && !HasFailure())
        walk().next();
    EXPECT_EQ(focusedCity(), "Kathmandu, Nepal");
    stage().screenshot("focus-city-found-" + nameOf(GetParam()));
    walk().press();
    ASSERT_EQ(returned.size(), 1U);
    EXPECT_EQ(returned.front().city, "IDS_CITY_NP_KATHMANDU");
}

TEST_P(FocusCityTest, TheSearchIsEmptiedByItsButton) {
    openPicker();
    fill();
    search("kathm");
    walk().next();
    ASSERT_TRUE(walk().goTo("Clear", wayToTheTop()));
    walk().expectVisible(theRinged(stage()));
    walk().press();
    EXPECT_STREQ(elm_entry_entry_get(entry()), "");
}

TEST_P(FocusCityTest, CancelIsPressed) {
    openPicker();
    fill();
    walk().next();
    ASSERT_TRUE(walk().goTo("Cancel", -1));
    walk().press();
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(returned.empty());
}

} // namespace
