#include <ctime>
#include <string>

#include <gtest/gtest.h>

#include "support/ScreenTest.h"

namespace {

/** A calendar in its popup. Today is 18 November 2026. */
class CalendarLookTest : public ScreenTest {
protected:
    void show(int year, int month, int day) {
        Evas_Object* popup = elm_popup_add(stage().window());
        elm_object_style_set(popup, "theme,bg");
        elm_object_part_text_set(popup, "title,text", "Set date");
        calendar = elm_calendar_add(popup);
        std::tm shown{};
        shown.tm_year = year - 1900;
        shown.tm_mon = month - 1;
        shown.tm_mday = day;
        elm_calendar_selected_time_set(calendar, &shown);
        // 1 November 2026 is a Sunday.
        std::tm sunday{};
        sunday.tm_year = 126;
        sunday.tm_mon = 10;
        sunday.tm_mday = 1;
        elm_calendar_mark_add(calendar, "holiday", &sunday, ELM_CALENDAR_WEEKLY);
        evas_object_show(calendar);
        elm_object_content_set(popup, calendar);
        for (const char* part : {"button1", "button2"}) {
            Evas_Object* button = elm_button_add(popup);
            elm_object_style_set(button, "popup");
            elm_object_text_set(button, part == std::string("button1") ? "Cancel" : "Set");
            elm_object_part_content_set(popup, part, button);
            evas_object_show(button);
        }
        evas_object_show(popup);
        stage().settle();
    }
    std::string selected() const {
        std::tm day{};
        elm_calendar_selected_time_get(calendar, &day);
        char text[16];
        std::strftime(text, sizeof(text), "%Y-%m-%d", &day);
        return text;
    }
    Area part(const std::string& name) const {
        Area whole = Stage::area(calendar);
        Area area;
        edje_object_part_geometry_get(elm_layout_edje_get(calendar), name.c_str(), &area.x, &area.y,
                                      &area.width, &area.height);
        area.x += whole.x;
        area.y += whole.y;
        return area;
    }
    Area monthButton(const char* side) const {
        return Stage::area(elm_layout_content_get(calendar, side));
    }
    void tapMonth(const char* side) {
        stage().tap(monthButton(side).middle());
        stage().settle();
    }
    /** Pixels of an area whose red, or whose blue, stands out. */
    int redPixels(const Area& area) { return count(area, 16, 0); }
    int bluePixels(const Area& area) { return count(area, 0, 16); }

    static constexpr const char* BEFORE = "elm,calendar,button,left";
    static constexpr const char* AFTER = "elm,calendar,button,right";
    Evas_Object* calendar = nullptr;

private:
    int count(const Area& area, unsigned strong, unsigned weak) {
        int found = 0;
        for (int y = area.y; y < area.y + area.height; ++y) {
            for (int x = area.x; x < area.x + area.width; ++x) {
                const unsigned color = stage().pixel(x, y);
                if (((color >> strong) & 0xff) > ((color >> weak) & 0xff) + 60) {
                    ++found;
                }
            }
        }
        return found;
    }
};

TEST_F(CalendarLookTest, AMonthOfSixWeeksLiesInsideTheCircle) {
    show(2027, 5, 18);
    ASSERT_TRUE(stage().shows("May 2027"));
    const auto texts = stage().texts();
    EXPECT_EQ(texts.size(), 1U + 1U + 7U + 42U + 2U);
    for (const FoundText& text : texts) {
        EXPECT_TRUE(text.area.insideCircle())
            << text.text << " at " << text.area.x << ", " << text.area.y;
    }
}

TEST_F(CalendarLookTest, ItsButtonsAreLargeEnoughForAFinger) {
    show(2026, 11, 24);
    for (const Area& button :
         {monthButton(BEFORE), monthButton(AFTER), Stage::area(stage().findText("Cancel")->widget),
          Stage::area(stage().findText("Set")->widget)}) {
        EXPECT_GE(button.width, 48);
        EXPECT_GE(button.height, 48);
        EXPECT_TRUE(button.insideCircle())
            << button.x << ", " << button.y << ", " << button.width << " x " << button.height;
    }
}

TEST_F(CalendarLookTest, ATapChoosesADay) {
    show(2026, 11, 24);
    EXPECT_GT(bluePixels(part("cit_23_event")), 300);
    stage().tapText("12");
    stage().settle();
    EXPECT_EQ(selected(), "2026-11-12");
    EXPECT_GT(bluePixels(part("cit_11_event")), 300);
    EXPECT_EQ(bluePixels(part("cit_23_event")), 0);
}

TEST_F(CalendarLookTest, EachCellTakesTheTouchOverItsNumber) {
    show(2026, 11, 24);
    for (const int day : {1, 7, 22, 28, 30}) {
        stage().tap(part("cit_" + std::to_string(day - 1) + "_event").middle());
        stage().settle();
        EXPECT_EQ(selected(), "2026-11-" + std::string(day < 10 ? "0" : "") + std::to_string(day));
    }
}

TEST_F(CalendarLookTest, ArrowsTurnTheMonth) {
    show(2026, 11, 24);
    tapMonth(AFTER);
    EXPECT_TRUE(stage().shows("December 2026"));
    tapMonth(BEFORE);
    tapMonth(BEFORE);
    EXPECT_TRUE(stage().shows("October 2026"));
}

TEST_F(CalendarLookTest, TodayIsOutlined) {
    show(2026, 11, 24);
    const int ring = bluePixels(part("cit_17_event"));
    EXPECT_GT(ring, 60);
    EXPECT_LT(ring, 300);
    tapMonth(AFTER);
    EXPECT_EQ(bluePixels(part("cit_17_event")), 0);
}

TEST_F(CalendarLookTest, HolidaysStandOutAlsoInOtherMonths) {
    show(2026, 11, 24);
    for (const int cell : {0, 7, 14, 21, 28}) {
        EXPECT_GT(redPixels(part("cit_" + std::to_string(cell) + "_event")), 5) << cell;
    }
    EXPECT_EQ(redPixels(part("cit_1_event")), 0);
    tapMonth(AFTER);
    EXPECT_GT(redPixels(part("cit_7_event")), 5);
    EXPECT_EQ(redPixels(part("cit_8_event")), 0);
}

TEST_F(CalendarLookTest, ADisabledCalendarStays) {
    show(2026, 11, 24);
    const int bright = bluePixels(part("cit_23_event"));
    elm_object_disabled_set(calendar, EINA_TRUE);
    stage().settle();
    EXPECT_LT(bluePixels(part("cit_23_event")), bright);
    stage().tapText("12");
    tapMonth(AFTER);
    EXPECT_EQ(selected(), "2026-11-24");
    EXPECT_TRUE(stage().shows("November 2026"));
}

TEST_F(CalendarLookTest, AMirroredFaceReadsFromTheRight) {
    elm_config_mirrored_set(EINA_TRUE);
    show(2026, 11, 24);
    EXPECT_GT(stage().findText("Sun")->area.x, stage().findText("Sat")->area.x);
    EXPECT_LT(monthButton(AFTER).x, monthButton(BEFORE).x);
    tapMonth(AFTER);
    EXPECT_TRUE(stage().shows("December 2026"));
    takeStageDown();
    elm_config_mirrored_set(EINA_FALSE);
}

} // namespace
