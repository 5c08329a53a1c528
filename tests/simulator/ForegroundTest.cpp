// Another application in front of the clock, and the way back.

#include "Foreground.h"

#include <cstdlib>
#include <optional>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_X.h>

#include "EventRecorder.h"
#include "clock/ClockEventListener.h"
#include "support/ScreenTest.h"

using simulator::Foreground;

namespace {

using Events = std::vector<ClockEventListener::EventType>;
constexpr auto PAUSED = ClockEventListener::PAUSED;
constexpr auto RESUMED = ClockEventListener::RESUMED;

class ForegroundTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        // Without a display there is no such event; the window has the number 0 then.
        if (ECORE_X_EVENT_WINDOW_VISIBILITY_CHANGE == 0)
            ECORE_X_EVENT_WINDOW_VISIBILITY_CHANGE = ecore_event_type_new();
        stage();
        foreground.emplace(stage().window());
    }
    void TearDown() override {
        foreground.reset();
        ScreenTest::TearDown();
    }
    void focus(bool has) {
        ecore_evas_focus_set(ecore_evas_ecore_evas_get(stage().canvas()),
                             has ? EINA_TRUE : EINA_FALSE);
        Stage::frames(2);
    }
    static void cover(bool fully, Ecore_X_Window window = 0) {
        auto* event = static_cast<Ecore_X_Event_Window_Visibility_Change*>(
            calloc(1, sizeof(Ecore_X_Event_Window_Visibility_Change)));
        event->win = window;
        event->fully_obscured = fully ? 1 : 0;
        ecore_event_add(ECORE_X_EVENT_WINDOW_VISIBILITY_CHANGE, event, nullptr, nullptr);
        Stage::frames(2);
    }

    EventRecorder recorder;
    std::optional<Foreground> foreground;
};

} // namespace

TEST_F(ForegroundTest, nothingHappensAtTheStart) {
    focus(true);
    cover(false);
    EXPECT_TRUE(recorder.events.empty());
}

TEST_F(ForegroundTest, aWindowManagerTellsByTheFocus) {
    focus(false);
    EXPECT_EQ(recorder.events, Events{PAUSED});
    focus(true);
    EXPECT_EQ(recorder.events, (Events{PAUSED, RESUMED}));
}

TEST_F(ForegroundTest, withoutAWindowManagerTheOtherWindowCoversThisOne) {
    cover(true);
    EXPECT_EQ(recorder.events, Events{PAUSED});
    cover(false);
    EXPECT_EQ(recorder.events, (Events{PAUSED, RESUMED}));
}

TEST_F(ForegroundTest, bothTogetherPauseAndResumeOnce) {
    cover(true);
    focus(false);
    EXPECT_EQ(recorder.events, Events{PAUSED});
    cover(false);
    EXPECT_EQ(recorder.events, Events{PAUSED}) << "still without the focus";
    focus(true);
    EXPECT_EQ(recorder.events, (Events{PAUSED, RESUMED}));
}

TEST_F(ForegroundTest, anotherWindowOfTheProcessDoesNotCount) {
    cover(true, 4711);
    EXPECT_TRUE(recorder.events.empty());
}

TEST_F(ForegroundTest, onceItHasGoneNothingIsRaised) {
    foreground.reset();
    focus(false);
    focus(true);
    cover(true);
    EXPECT_TRUE(recorder.events.empty());
}

TEST_F(ForegroundTest, theCompanionsFocusIsThatOfTheApplication) {
    Evas_Object* companion = elm_win_add(nullptr, "companion", ELM_WIN_BASIC);
    evas_object_resize(companion, 100, 100);
    evas_object_show(companion);
    const auto focusCompanion = [companion](bool has) {
        evas_object_smart_callback_call(companion, has ? "focus,in" : "focus,out", nullptr);
    };
    foreground->setCompanion(companion);
    focus(true);
    focus(false);
    focusCompanion(true);
    Stage::advance(1);
    EXPECT_TRUE(recorder.events.empty()) << "the panel is not another application";
    focusCompanion(false);
    Stage::advance(1);
    EXPECT_EQ(recorder.events, Events{PAUSED});
    focusCompanion(true);
    EXPECT_EQ(recorder.events, (Events{PAUSED, RESUMED}));
    foreground->setCompanion(nullptr);
    evas_object_del(companion);
    focus(true);
    focus(false);
    EXPECT_EQ(recorder.events, (Events{PAUSED, RESUMED, PAUSED})) << "alone again";
}

TEST_F(ForegroundTest, aCompanionThatIsNoneAnyMoreIsNotListenedTo) {
    const auto addWindow = [](const char* name) {
        Evas_Object* window = elm_win_add(nullptr, name, ELM_WIN_BASIC);
        evas_object_resize(window, 100, 100);
        evas_object_show(window);
        return window;
    };
    const auto loseFocus = [](Evas_Object* window) {
        evas_object_smart_callback_call(window, "focus,out", nullptr);
        Stage::advance(1);
    };
    Evas_Object* first = addWindow("first");
    Evas_Object* second = addWindow("second");
    foreground->setCompanion(first);
    foreground->setCompanion(second);
    loseFocus(first);
    EXPECT_TRUE(recorder.events.empty()) << "it has been replaced";
    foreground.reset();
    loseFocus(second);
    EXPECT_TRUE(recorder.events.empty()) << "nobody is there to hear it";
    evas_object_del(first);
    evas_object_del(second);
}

TEST_F(ForegroundTest, whoIsCalledBackBetweenTwoWindowsStays) {
    Evas_Object* companion = elm_win_add(nullptr, "companion", ELM_WIN_BASIC);
    evas_object_show(companion);
    foreground->setCompanion(companion);
    focus(true);
    focus(false);
    foreground->leave(false);
    Stage::advance(1);
    EXPECT_TRUE(recorder.events.empty());
    foreground->setCompanion(nullptr);
    evas_object_del(companion);
}
