// What a screen reader is told of each screen. The tree is walked as the toolkit shows it on the
// bus.

#include <algorithm>
#include <memory>

#include <gmock/gmock.h>

#include "TonePage.h"
#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "support/FocusWalk.h"
#include "support/ScreenReader.h"

namespace {

using Lines = std::vector<std::string>;
using testing::Contains;
using testing::ElementsAre;
using testing::Not;
using testing::StartsWith;

/** The page on top, with its title's buttons. */
Evas_Object* topPage(Evas_Object* pages) {
    Elm_Object_Item* top = elm_naviframe_top_item_get(pages);
    return elm_object_parent_widget_get(elm_object_item_content_get(top));
}

/** The nearest popup; null when there is none. */
Evas_Object* popup(const Stage& stage) {
    const auto popups = stage.widgets("Popup");
    return popups.empty() ? nullptr : popups.back();
}

class AccessibleTest : public EditorFixture {
protected:
    void TearDown() override {
        takeErrors();
        EditorFixture::TearDown();
    }
    Evas_Object* page() { return topPage(stage().naviframe().getEvasObj()); }
    Evas_Object* popup() { return ::popup(stage()); }
    bool press(Evas_Object* root, const std::string& role, const std::string& name) {
        const bool pressed = ScreenReader::press(root, role, name);
        stage().settle();
        return pressed;
    }
    /** The names of the rows that have the focus. */
    Lines focused() {
        Lines names;
        for (const ReadThing& thing : ScreenReader::things(page()))
            if (thing.role == "list item" && thing.focused)
                names.push_back(thing.name);
        return names;
    }
    /** Opens the editor and presses a row by what it begins with. */
    void open(const std::string& row) {
        createAlarm();
        pick(7, 30);
        stage().settle();
        const auto things = ScreenReader::things(page());
        const auto found = std::find_if(things.begin(), things.end(), [&](const ReadThing& thing) {
            return thing.role == "list item" && thing.name.starts_with(row);
        });
        ASSERT_NE(found, things.end()) << row;
        EXPECT_TRUE(press(page(), "list item", found->name));
    }

    ScreenReader reader;
};

const Lines EDITOR_ROWS = {
    "list item | 07:30",
    "list item | Repeat weekly, Never",
    "list item | Alarm type, Sound",
    "list item | Alarm volume",
    "list item | Alarm tone, Alarm_Impatient",
    "list item | Snooze, Sound the alarm 3 times at 5-minute intervals.",
    "list item | Increase volume, Increase the alarm volume for the first 60 seconds.",
    "list item | Alarm name"};

TEST_F(AccessibleTest, TheEditorIsReadFromItsTop) {
    createAlarm();
    pick(7, 30);
    stage().settle();
    Lines wanted = EDITOR_ROWS;
    for (const char* line : {"spin button | hour, 07", "spin button | minute, 30",
                             "push button | DATE", "push button | Cancel", "push button | Done"})
        wanted.emplace_back(line);
    EXPECT_EQ(ScreenReader::lines(page()), wanted);
}

TEST_F(AccessibleTest, TheVolumeTellsItsValue) {
    createAlarm();
    stage().showRow(elm_genlist_nth_item_get(genlist(), 3));
    const Lines lines = ScreenReader::lines(page());
    EXPECT_THAT(lines, Contains("list item | Alarm volume"));
    EXPECT_THAT(lines, Contains("slider | Alarm volume, 7 / 15"));
}

TEST_F(AccessibleTest, TheEditorIsReadFromItsEnd) {
    createAlarm();
    pick(7, 30);
    stage().showRow(nameRow().getElmObjectItem());
    const Lines lines = ScreenReader::lines(page());
    EXPECT_THAT(lines, Contains("entry | Alarm name"));
    EXPECT_THAT(lines, Contains("check box | Increase volume, Increase the alarm volume for the "
                                "first 60 seconds."));
    EXPECT_THAT(lines, Contains("list item | 07:30")) << "also out of sight";
}

TEST_F(AccessibleTest, WhatIsInARowIsNeverCalledAsAnotherRow) {
    createAlarm();
    for (Elm_Object_Item* row = elm_genlist_first_item_get(genlist()); row;
         row = elm_genlist_item_next_get(row)) {
        stage().showRow(row);
        for (const ReadThing& thing : ScreenReader::things(page())) {
            if (thing.role == "check box") {
                EXPECT_TRUE(thing.name.starts_with("Snooze, ") ||
                            thing.name.starts_with("Increase volume, "))
                    << thing.name;
            }
            if (thing.role == "entry") {
                EXPECT_EQ(thing.name, "Alarm name");
            }
        }
    }
}

TEST_F(AccessibleTest, AWheelTellsItsNewValue) {
    createAlarm();
    pick(7, 30);
    pick(8, 5);
    EXPECT_THAT(ScreenReader::lines(page()), Contains("spin button | hour, 08"));
    EXPECT_THAT(ScreenReader::lines(page()), Contains("spin button | minute, 05"));
}

TEST_F(AccessibleTest, ASwitchIsTurnedByPressingItsRow) {
    open("Increase volume");
    stage().showRow(nameRow().getElmObjectItem());
    const Lines lines = ScreenReader::lines(page());
    EXPECT_THAT(lines, Contains("list item | Increase volume, Increase the alarm volume for the "
                                "first 60 seconds. | checked"));
    EXPECT_THAT(lines, Contains("check box | Increase volume, Increase the alarm volume for the "
                                "first 60 seconds. | checked"));
}

TEST_F(AccessibleTest, ARowThatKeysHaveReachedHasTheFocus) {
    createAlarm();
    FocusWalk walk(stage(), Hand::Keys);
    ASSERT_TRUE(walk.goTo("Alarm type"));
    EXPECT_THAT(focused(), ElementsAre("Alarm type, Sound"));
    walk.next();
    EXPECT_THAT(focused(), Not(Contains("Alarm type, Sound")));
}

TEST_F(AccessibleTest, OnlyWhatKeysHaveReachedIsAnnounced) {
    createAlarm();
    pick(7, 30);
    FocusWalk walk(stage(), Hand::Keys);
    ASSERT_TRUE(walk.goTo("DATE"));
    reader.takeFocusTold();
    stage().key("Tab");
    EXPECT_THAT(reader.takeFocusTold(), ElementsAre("list item | Repeat weekly, Never"));
    stage().key("Tab");
    EXPECT_THAT(reader.takeFocusTold(), ElementsAre("list item | Alarm type, Sound"));
}

TEST_F(AccessibleTest, AFieldThatComesIntoSightIsAnnouncedByItsRow) {
    open("Alarm type");
    EXPECT_TRUE(press(popup(), "list item", "Vibration"));
    FocusWalk walk(stage(), Hand::Keys);
    ASSERT_TRUE(walk.goTo("Snooze"));
    stage().settle();
    reader.takeFocusTold();
    stage().key("Tab");
    EXPECT_THAT(reader.takeFocusTold(), Contains("entry | Alarm name"));
}

TEST_F(AccessibleTest, WhereTheFocusComesBackToIsAnnounced) {
    createAlarm();
    pick(7, 30);
    FocusWalk walk(stage(), Hand::Keys);
    ASSERT_TRUE(walk.goTo("Alarm type"));
    walk.press();
    ASSERT_TRUE(walk.goTo("Vibration"));
    reader.takeFocusTold();
    walk.press();
    stage().settle();
    EXPECT_THAT(reader.takeFocusTold(), Contains("list item | Alarm type, Vibration"));
    EXPECT_THAT(focused(), ElementsAre("Alarm type, Vibration"));
}

TEST_F(AccessibleTest, ARowThatAReaderPressesHasTheFocusAndKeysGoOnFromThere) {
    open("Alarm type");
    EXPECT_TRUE(press(popup(), "list item", "Vibration"));
    EXPECT_THAT(reader.takeFocusTold(), Contains("list item | Alarm type, Vibration"));
    EXPECT_THAT(focused(), ElementsAre("Alarm type, Vibration"));
    stage().key("Tab");
    stage().settle();
    EXPECT_THAT(focused(), ElementsAre(StartsWith("Snooze, ")));
}

TEST_F(AccessibleTest, TheRepeatScreenIsRead) {
    open("Repeat weekly");
    EXPECT_EQ(
        ScreenReader::lines(page()),
        (Lines{"list item | Every day", "list item | Every Sunday", "list item | Every Monday",
               "list item | Every Tuesday", "list item | Every Wednesday",
               "list item | Every Thursday", "list item | Every Friday",
               "list item | Every Saturday", "check box | Every day", "check box | Every Sunday",
               "check box | Every Monday", "check box | Every Tuesday", "push button | Back"}));
}

TEST_F(AccessibleTest, ADayIsChosenByPressingItsRow) {
    open("Repeat weekly");
    EXPECT_TRUE(press(page(), "list item", "Every Monday"));
    EXPECT_TRUE(press(page(), "list item", "Every Saturday")) << "which is out of sight";
    EXPECT_THAT(ScreenReader::lines(page()), Contains("list item | Every Monday | checked"));
    EXPECT_THAT(ScreenReader::lines(page()), Contains("check box | Every Monday | checked"));
    EXPECT_TRUE(press(page(), "push button", "Back"));
    EXPECT_THAT(ScreenReader::lines(page()), Contains("list item | Repeat weekly, Mon Sat "));
}

TEST_F(AccessibleTest, TheTypePopupIsReadByItsTitle) {
    open("Alarm type");
    EXPECT_EQ(ScreenReader::lines(popup()),
              (Lines{"dialog | Type", "list item | Sound | checked", "list item | Vibration",
                     "list item | Vibration and sound", "radio button | Sound | checked",
                     "radio button | Vibration", "radio button | Vibration and sound"}));
    EXPECT_TRUE(press(popup(), "list item", "Vibration"));
    EXPECT_EQ(popup(), nullptr);
    EXPECT_THAT(ScreenReader::lines(page()), Contains("list item | Alarm type, Vibration"));
}

TEST_F(AccessibleTest, BelowAPopupNoRowIsPressed) {
    open("Alarm type");
    EXPECT_FALSE(press(page(), "list item", "Repeat weekly, Never"));
    EXPECT_THAT(ScreenReader::lines(popup()), Contains("dialog | Type"));
}

TEST_F(AccessibleTest, TheDatePopupIsReadByItsTitle) {
    createAlarm();
    EXPECT_TRUE(press(page(), "push button", "DATE"));
    EXPECT_EQ(ScreenReader::lines(popup()),
              (Lines{"dialog | Set date", "calendar | Wednesday, November 18, 2026",
                     "push button | Previous month", "push button | Next month",
                     "push button | Cancel", "push button | Set"}));
    FocusWalk walk(stage(), Hand::Keys);
    ASSERT_TRUE(walk.goTo("Next month"));
    walk.next();
    stage().keySettled("Left");
    EXPECT_THAT(ScreenReader::lines(popup()), Contains("push button | Set | disabled"));
    EXPECT_THAT(ScreenReader::lines(popup()),
                Contains(StartsWith("calendar | Tuesday, November 17, 2026")));
}

TEST_F(AccessibleTest, TheDiscardPopupIsReadByItsTitle) {
    open("Snooze");
    EXPECT_TRUE(press(page(), "push button", "Cancel"));
    EXPECT_EQ(ScreenReader::lines(popup()),
              (Lines{"dialog | Discard changes", "label | All changes will be discarded.",
                     "push button | Cancel", "push button | Discard"}));
    EXPECT_TRUE(press(popup(), "push button", "Discard"));
    EXPECT_FALSE(isOpen());
}

TEST_F(AccessibleTest, TheTonePickerIsRead) {
    int chosen = -1;
    tone_picker::TonePage tones({{"a.wav", "Bells"}, {"b.wav", "Rain"}}, 0,
                                {.marked = [](int) {},
                                 .done = [&](int position) { chosen = position; },
                                 .cancelled =
                                     [] {
                                     }});
    tones.show(stage().window());
    stage().settle();
    Evas_Object* shown = topPage(stage().widgets("Naviframe").back());
    EXPECT_EQ(
        ScreenReader::lines(shown),
        (Lines{"list item | Bells | checked", "list item | Rain", "radio button | Bells | checked",
               "radio button | Rain", "push button | Cancel", "push button | Done"}));
    EXPECT_TRUE(press(shown, "list item", "Rain"));
    EXPECT_THAT(ScreenReader::lines(shown), Contains("list item | Rain | checked"));
    EXPECT_TRUE(press(shown, "push button", "Done"));
    EXPECT_EQ(chosen, 1);
    takeStageDown();
}

TEST_F(AccessibleTest, WithoutAMarkedToneDoneIsDisabled) {
    tone_picker::TonePage tones({{"a.wav", "Bells"}}, -1, {});
    tones.show(stage().window());
    stage().settle();
    EXPECT_THAT(ScreenReader::lines(topPage(stage().widgets("Naviframe").back())),
                ElementsAre("list item | Bells", "radio button | Bells", "push button | Cancel",
                            "push button | Done | disabled"));
    takeStageDown();
}

class AccessibleCityTest : public CityPickerFixture {
protected:
    Evas_Object* page() { return topPage(stage().naviframe().getEvasObj()); }

    ScreenReader reader;
};

TEST_F(AccessibleCityTest, TheCityPickerIsRead) {
    worldOf({"IDS_CITY_NP_KATHMANDU", "IDS_CITY_SG_SINGAPORE"});
    openPicker();
    fill();
    EXPECT_EQ(ScreenReader::lines(page()),
              (Lines{"list item | Kathmandu, Nepal, GMT+05:45", "list item | Singapore, GMT+08:00",
                     "entry | Search", "push button | Current location", "push button | Cancel"}));
    EXPECT_TRUE(ScreenReader::press(page(), "list item", "Singapore, GMT+08:00"));
    stage().settle();
    ASSERT_EQ(returned.size(), 1U);
    EXPECT_EQ(returned.front().city, "IDS_CITY_SG_SINGAPORE");
}

TEST_F(AccessibleCityTest, EveryCityHasANameAlsoOutOfSight) {
    openPicker();
    fill();
    std::size_t rows = 0;
    for (const ReadThing& thing : ScreenReader::things(page())) {
        EXPECT_NE(thing.name, "") << thing.role;
        rows += thing.role == "list item" ? 1 : 0;
    }
    EXPECT_EQ(rows, items().size());
}

TEST_F(AccessibleCityTest, TheIndexTellsWhereItWasTurnedTo) {
    openPicker();
    fill();
    EXPECT_THAT(ScreenReader::lines(page()), Contains("scroll bar | GMT"));
    FocusWalk walk(stage(), Hand::Bezel);
    walk.next();
    while (theRinged(stage()).type != "Elm_Index" && !HasFailure())
        walk.previous();
    walk.press();
    walk.turn();
    const std::string first = hours().front();
    EXPECT_THAT(ScreenReader::lines(page()), Contains(StartsWith("scroll bar | GMT, " + first)));
    walk.turn();
    EXPECT_THAT(ScreenReader::lines(page()),
                Contains(StartsWith("scroll bar | GMT, " + hours().at(1))));
}

TEST_F(AccessibleCityTest, TheClearButtonIsReadWhileThereIsText) {
    openPicker();
    fill();
    EXPECT_THAT(ScreenReader::lines(page()), Not(Contains("push button | Clear")));
    search("kat");
    EXPECT_THAT(ScreenReader::lines(page()), Contains("push button | Clear"));
}

} // namespace
