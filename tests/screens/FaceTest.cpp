// Nothing that matters is cut by the circle: every screen, in languages that differ most.

#include <cmath>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <clock/ClockText.h>

#include "screens/CityPickerFixture.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/FaceInk.h"

using testing::IsEmpty;

namespace {

constexpr double RADIUS = 180;
/** What is fainter than this is on its way out. */
constexpr double FAINT = 0.08;
constexpr const char* HOURS_KEY = "db/menu_widget/regionformat_time1224";

std::string describe(const Ink& ink) {
    const auto number = [](double value) {
        return std::to_string(std::lround(value));
    };
    return ink.what + " at " + number(ink.area.x) + ", " + number(ink.area.y) + ", " +
           number(ink.area.width) + " x " + number(ink.area.height) + ", seen " +
           std::to_string(ink.opacity) + ", reaches " + number(ink.area.reach());
}

/** What the circle cuts, of all that can be seen. */
std::vector<std::string> cutByCircle(const Evas* canvas) {
    std::vector<std::string> cut;
    for (const Ink& ink : inkOf(canvas)) {
        if (ink.opacity >= FAINT && ink.area.reach() > RADIUS)
            cut.push_back(describe(ink));
    }
    return cut;
}

std::string nameOf(const testing::TestParamInfo<const char*>& language) {
    return language.param;
}

const auto LANGUAGES = testing::Values("en", "de", "ar", "hi", "ja");

/** A language with its direction. */
class Speaking {
public:
    explicit Speaking(const std::string& code) : _catalogue(code) {
        elm_config_mirrored_set(code == "ar" ? EINA_TRUE : EINA_FALSE);
    }
    ~Speaking() { elm_config_mirrored_set(EINA_FALSE); }
    Speaking(const Speaking&) = delete;
    Speaking& operator=(const Speaking&) = delete;

private:
    CatalogueLanguage _catalogue;
};

class EditorFaceTest : public EditorFixture, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        _language = std::make_unique<Speaking>(GetParam());
        device().setSetting(HOURS_KEY, 1);
    }
    void TearDown() override {
        EditorFixture::TearDown();
        _language.reset();
    }
    /** Looks at the face as it is. */
    void look(const std::string& name) {
        EXPECT_THAT(cutByCircle(stage().canvas()), IsEmpty()) << name;
        stage().screenshot(std::string("face-") + GetParam() + "-" + name);
    }
    /** Looks at a list at its upper end, wherever it may come to rest, and at its lower end. */
    void lookAtList(Evas_Object* list, const std::string& name) {
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

private:
    std::unique_ptr<Speaking> _language;
};

TEST_P(EditorFaceTest, TheEditor) {
    createAlarm();
    lookAtList(genlist(), "editor");
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
}

TEST_P(EditorFaceTest, TheDiscardPopup) {
    createAlarm();
    pick(7, 30);
    stage().backKey();
    stage().settle();
    ASSERT_TRUE(stage().shows(clockText("IDS_CLD_HEADER_DISCARD_CHANGES_ABB")));
    look("discard");
}

INSTANTIATE_TEST_SUITE_P(Languages, EditorFaceTest, LANGUAGES, nameOf);

class CitiesFaceTest : public CityPickerFixture, public testing::WithParamInterface<const char*> {
protected:
    void SetUp() override {
        CityPickerFixture::SetUp();
        _language = std::make_unique<Speaking>(GetParam());
        openPicker();
        fill();
    }
    void TearDown() override {
        CityPickerFixture::TearDown();
        _language.reset();
    }
    void look(const std::string& name) {
        EXPECT_THAT(cutByCircle(stage().canvas()), IsEmpty()) << name;
        stage().screenshot(std::string("face-") + GetParam() + "-" + name);
    }

private:
    std::unique_ptr<Speaking> _language;
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

TEST_P(CitiesFaceTest, AFingerOnTheIndex) {
    stage().press(338, 200);
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

INSTANTIATE_TEST_SUITE_P(Languages, CitiesFaceTest, LANGUAGES, nameOf);

} // namespace
