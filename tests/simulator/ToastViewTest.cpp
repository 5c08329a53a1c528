// Toasts on the face.

#include "ToastView.h"

#include <string>

#include <gmock/gmock.h>

#include "ButtonBelow.h"
#include "support/LiveLanguage.h"
#include "support/ScreenTest.h"
#include "support/TextFaults.h"

using simulator::ToastView;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

class ToastViewTest : public ScreenTest {
protected:
    bool shows(const std::string& text) { return stage().shows(text); }
    /** Whether the first letter of a toast of one line stands before, that is right of, its last.
     */
    bool runsToTheLeft(const std::string& text) {
        const auto found = stage().findText(text);
        if (!found) {
            ADD_FAILURE() << text << " is not shown";
            return false;
        }
        Evas_Textblock_Cursor* cursor = evas_object_textblock_cursor_new(found->object);
        const auto place = [cursor] {
            int x = 0;
            evas_textblock_cursor_char_geometry_get(cursor, &x, nullptr, nullptr, nullptr);
            return x;
        };
        evas_textblock_cursor_paragraph_first(cursor);
        const int first = place();
        evas_textblock_cursor_line_char_last(cursor);
        const int last = place();
        evas_textblock_cursor_free(cursor);
        return first > last;
    }
};

constexpr const char* ARABIC = "Oslo مدينة";
constexpr const char* ENGLISH = "يوغا is set";

} // namespace

TEST_F(ToastViewTest, aToastShowsAndGoesAgain) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("Tea & <b>biscuits</b>");
    Stage::advance(1);
    EXPECT_TRUE(shows("Tea & <b>biscuits</b>"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Tea & <b>biscuits</b>"));
}

TEST_F(ToastViewTest, aSecondToastWaitsForTheFirst) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("First");
    toasts.post("Second");
    Stage::advance(1);
    EXPECT_TRUE(shows("First"));
    EXPECT_FALSE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("First"));
    EXPECT_TRUE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Second"));
}

TEST_F(ToastViewTest, theSameTextAgainDoesNotWait) {
    ToastView toasts(stage().window(), THEME);
    for (int times = 0; times < 5; ++times)
        toasts.post("First");
    toasts.post("Second");
    toasts.post("Second");
    Stage::advance(4);
    EXPECT_TRUE(shows("Second"));
    Stage::advance(3);
    EXPECT_FALSE(shows("Second"));
    toasts.post("Second");
    Stage::advance(1);
    EXPECT_TRUE(shows("Second")) << "a toast that has gone may come again";
}

TEST_F(ToastViewTest, aLongToastStaysInsideTheCircle) {
    ToastView toasts(stage().window(), THEME);
    toasts.post("An alarm is already set for 10:45 PM. Existing alarm updated.");
    Stage::advance(1);
    bool found = false;
    for (const FoundText& text : stage().texts()) {
        found = true;
        EXPECT_TRUE(text.area.insideCircle()) << text.area.x << " " << text.area.y << " "
                                              << text.area.width << " " << text.area.height;
    }
    EXPECT_TRUE(found);
}

TEST_F(ToastViewTest, aToastLetsInputThrough) {
    ToastView toasts(stage().window(), THEME);
    const ButtonBelow button(stage().window());
    toasts.post("Above the button");
    Stage::advance(1);
    stage().tap(180, 280);
    EXPECT_EQ(button.clicks(), 1);
}

TEST_F(ToastViewTest, aViewThatGoesWithAToastLeavesNothingBehind) {
    {
        ToastView toasts(stage().window(), THEME);
        toasts.post("First");
        toasts.post("Second");
    }
    Stage::advance(5);
    EXPECT_FALSE(shows("Second"));
}

TEST_F(ToastViewTest, aThemeWithoutAToastIsLogged) {
    const ToastView toasts(stage().window(), "/nowhere.edj");
    expectLog("'/nowhere.edj' has no toast");
}

TEST_F(ToastViewTest, aToastRunsAsItsLanguageWhateverItsFirstLettersAre) {
    LiveLanguage language;
    language.choose("ar");
    ToastView toasts(stage().window(), THEME);
    toasts.post(ARABIC);
    Stage::advance(1);
    EXPECT_TRUE(runsToTheLeft(ARABIC));
    stage().screenshot("toast-right-to-left");
    Stage::advance(3);
    language.choose("en");
    toasts.post(ENGLISH);
    Stage::advance(1);
    EXPECT_FALSE(runsToTheLeft(ENGLISH));
}

TEST_F(ToastViewTest, aToastStaysAsItWasPostedWhileTheLanguageChanges) {
    LiveLanguage language;
    language.choose("ar");
    ToastView toasts(stage().window(), THEME);
    toasts.post(ARABIC);
    toasts.post("Rome مدينة");
    Stage::advance(1);
    language.choose("en");
    toasts.post(ENGLISH);
    stage().settle(1);
    EXPECT_TRUE(runsToTheLeft(ARABIC));
    EXPECT_THAT(faultsOf(stage().texts()), testing::IsEmpty());
    stage().screenshot("toast-right-to-left-in-english");
    Stage::advance(2);
    EXPECT_TRUE(runsToTheLeft("Rome مدينة")) << "it waited";
    Stage::advance(3);
    EXPECT_FALSE(runsToTheLeft(ENGLISH));
    EXPECT_THAT(faultsOf(stage().texts()), testing::IsEmpty());
}
