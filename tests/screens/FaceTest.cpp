// Nothing that matters is cut by the circle: every screen, in languages that differ most.

#include <cmath>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <clock/ClockText.h>

#include "TonePage.h"
#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "support/FaceFixture.h"

namespace {

class EditorFaceTest : public FaceFixture<EditorFixture> {};

TEST_P(EditorFaceTest, TheEditor) {
    createAlarm();
    lookAtList(genlist(), "editor");
}

TEST_P(EditorFaceTest, WhatKeysReach) {
    createAlarm();
    lookAtFocus(13, "editor-keys");
}

TEST_P(EditorFaceTest, AnAlarmWithADateAndANameOfWideLetters) {
    ClockAlarmDbData alarm = storedAlarm(10, 30);
    alarm.name = "WWWWWWWWWWWWWWWWWWWW";
    alarm.repeatWeekly = 0;
    alarm.repeatOnce = 1;
    alarm.autoDate = alarm.manualDate = static_cast<std::int32_t>(at("2026-12-24 00:00:00"));
    editAlarm(alarm);
    lookAtList(genlist(), "edited");
}

TEST_P(EditorFaceTest, TheRepeatScreen) {
    createAlarm();
    stage().tapRow(elm_genlist_nth_item_get(genlist(), 1));
    stage().settle();
    const auto lists = stage().widgets("Elm_Genlist");
    ASSERT_EQ(lists.size(), 1U);
    lookAtList(lists.front(), "repeat");
}

TEST_P(EditorFaceTest, TheTypePopup) {
    createAlarm();
    stage().tapRow(elm_genlist_nth_item_get(genlist(), 2));
    stage().settle();
    lookAtList(stage().widgets("Elm_Genlist").back(), "type");
}

TEST_P(EditorFaceTest, TheDatePopup) {
    createAlarm();
    stage().tapPart(timePickerRow().getCalendarObj(), "date.button");
    stage().settle();
    ASSERT_FALSE(stage().widgets("Elm_Calendar").empty());
    look("date");
    lookAtFocus(5, "date-keys");
}

TEST_P(EditorFaceTest, TheDiscardPopup) {
    createAlarm();
    pick(7, 30);
    stage().backKey();
    stage().settle();
    ASSERT_TRUE(stage().shows(clockText("IDS_CLD_HEADER_DISCARD_CHANGES_ABB")));
    look("discard");
    lookAtFocus(2, "discard-keys");
}

INSTANTIATE_TEST_SUITE_P(Languages, EditorFaceTest, FACE_LANGUAGES, languageOf);

class CitiesFaceTest : public FaceFixture<CityPickerFixture> {
protected:
    void SetUp() override {
        FaceFixture::SetUp();
        openPicker();
    }
};

TEST_P(CitiesFaceTest, AllCities) {
    look("cities-top");
    for (const double share : {0.31, 0.5, 0.77}) {
        const auto all = items();
        elm_genlist_item_show(
            all.at(static_cast<std::size_t>(share * static_cast<double>(all.size()))),
            ELM_GENLIST_ITEM_SCROLLTO_MIDDLE);
        stage().settle();
        look("cities-" + std::to_string(std::lround(100 * share)));
    }
    elm_genlist_item_show(elm_genlist_last_item_get(genlist()), ELM_GENLIST_ITEM_SCROLLTO_IN);
    stage().settle();
    look("cities-end");
}

TEST_P(CitiesFaceTest, WhatKeysReach) {
    lookAtFocus(6, "cities-keys");
}

TEST_P(CitiesFaceTest, AFingerOnTheIndex) {
    const bool mirrored = elm_config_mirrored_get() != EINA_FALSE;
    stage().press(mirrored ? Stage::SIZE - 338 : 338, 200);
    stage().settle();
    look("cities-index");
    stage().release();
}

TEST_P(CitiesFaceTest, NothingIsFound) {
    search("qqxx");
    stage().settle();
    look("cities-typed");
    stage().key("Return");
    stage().settle();
    look("cities-nothing");
}

INSTANTIATE_TEST_SUITE_P(Languages, CitiesFaceTest, FACE_LANGUAGES, languageOf);

/** The page of the device's tone picker, an application of its own. */
class TonesFaceTest : public FaceFixture<ScreenTest> {
protected:
    void TearDown() override {
        takeStageDown();
        page.reset();
        FaceFixture::TearDown();
    }
    void open(std::vector<tone_picker::Tone> tones, int marked) {
        page = std::make_unique<tone_picker::TonePage>(
            std::move(tones), marked,
            tone_picker::TonePage::Actions{.marked = [](int) {},
                                           .done = [](int) {},
                                           .cancelled =
                                               [] {
                                               }});
        page->show(stage().window());
        stage().settle();
    }

    std::unique_ptr<tone_picker::TonePage> page;
};

TEST_P(TonesFaceTest, SeveralTones) {
    open({{"a.ogg", "Bells"},
          {"b.ogg", "WWWWWWWWWWWWWWWWWWWWWWWWWW"},
          {"c.ogg", "Chimes at noon"},
          {"d.ogg", "\u0623\u062c\u0631\u0627\u0633"},
          {"e.ogg", "Digital"},
          {"f.ogg", "Xylophone"}},
         1);
    const auto lists = stage().widgets("Elm_Genlist");
    ASSERT_EQ(lists.size(), 1U);
    lookAtList(lists.front(), "tones");
    lookAtFocus(5, "tones-keys");
}

TEST_P(TonesFaceTest, NoTones) {
    open({}, -1);
    look("no-tones");
}

INSTANTIATE_TEST_SUITE_P(Languages, TonesFaceTest, FACE_LANGUAGES, languageOf);

} // namespace
