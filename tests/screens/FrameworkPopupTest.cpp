// Popups: how they are built, what closes them, and whom they go with.

#include <algorithm>
#include <functional>
#include <string>
#include <vector>

#include "app_assist/WUiTimer.h"
#include "app_assist/WWindowController.h"
#include "device/eext.h"
#include "screens/FrameworkProbe.h"
#include "support/ScreenTest.h"

using app_assist::WPopupController;
using app_assist::WUiTimer;

namespace {

constexpr double TRANSITION = 1;

class FrameworkPopupTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        page = new ProbePage(trace, "A");
        stage().push(page);
        trace.clear();
    }
    ProbePopup* newPopup(const std::string& name = "P") {
        auto* const popup = new ProbePopup(trace, name);
        popup->setContent([name](Evas_Object* parent) {
            Evas_Object* const label = elm_label_add(parent);
            elm_object_text_set(label, ("content of " + name).c_str());
            return label;
        });
        return popup;
    }
    ProbePopup* attach(const std::string& name = "P") {
        ProbePopup* const popup = newPopup(name);
        page->attachPopup(popup);
        stage().settle();
        return popup;
    }
    long count(const std::string& step) const { return std::ranges::count(trace, step); }

    Trace trace;
    ProbePage* page = nullptr;
};

/** A popup that builds itself and deletes its own view, without the framework's hooks. */
class OwnPopup : public WPopupController {
public:
    explicit OwnPopup(Trace& trace) : probe(trace, "own") {}
    ~OwnPopup() override { probe.note("gone"); }
    Probe probe;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        Evas_Object* const popup = elm_popup_add(parent);
        elm_popup_align_set(popup, 0.5, 0.5);
        elm_object_text_set(popup, "Discard?");
        Evas_Object* const button = elm_button_add(popup);
        elm_object_text_set(button, "Cancel");
        elm_object_part_content_set(popup, "button1", button);
        evas_object_smart_callback_add(button, "clicked", cancelCb, this);
        eext_object_event_callback_add(popup, EEXT_EVENT_BACK, backCb, this);
        evas_object_show(popup);
        return popup;
    }
    void onDestroy() override { probe.note("destroyed"); }

private:
    static void cancelCb(void* data, Evas_Object* /*button*/, void* /*info*/) {
        evas_object_del(static_cast<OwnPopup*>(data)->getEvasObj());
    }
    static void backCb(void* /*data*/, Evas_Object* popup, void* /*info*/) {
        evas_object_del(popup);
    }
};

} // namespace

TEST_F(FrameworkPopupTest, aPopupGoesThroughItsStepsInOrder) {
    ProbePopup* const popup = attach();
    EXPECT_EQ(trace, (Trace{"P create", "P view", "P created"}));
    EXPECT_TRUE(stage().shows("content of P"));
    trace.clear();
    popup->destroy();
    EXPECT_EQ(trace, Trace{});
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"P destroyed", "P view deleted", "P gone"}));
    stage().frames(2);
    EXPECT_FALSE(stage().shows("content of P"));
}

TEST_F(FrameworkPopupTest, aPopupCoversTheWholeFaceAndBelongsToTheWindow) {
    ProbePopup* const popup = attach();
    EXPECT_EQ(elm_object_parent_widget_get(popup->getEvasObj()), stage().window());
    EXPECT_EQ(popup->getWindowController(), &stage().windowController());
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 0) << "the page below takes no touches";
    popup->destroy();
    stage().frames(3);
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 1);
}

TEST_F(FrameworkPopupTest, theHooksRunInOrderWithTheirObjects) {
    auto* const popup = new ProbePopup(trace, "P");
    Evas_Object* made = nullptr;
    popup->setOnAddProperties([&](Evas_Object* object) {
        made = object;
        trace.emplace_back("properties");
    });
    popup->setContent([&](Evas_Object* parent) {
        EXPECT_EQ(parent, made);
        trace.emplace_back("content");
        // Buttons may still be added here.
        popup->addButton("Set", {}, [&](Evas_Object* button) {
            EXPECT_STREQ(elm_object_text_get(button), "Set");
            EXPECT_EQ(elm_object_part_content_get(made, "button1"), button);
            trace.emplace_back("button");
        });
        return elm_label_add(parent);
    });
    page->attachPopup(popup);
    EXPECT_EQ(trace, (Trace{"P create", "P view", "properties", "content", "button", "P created"}));
    EXPECT_EQ(popup->getEvasObj(), made);
}

TEST_F(FrameworkPopupTest, aPopupNeedsNoHooks) {
    page->attachPopup(new ProbePopup(trace, "P"));
    stage().settle();
    stage().backKey();
    stage().frames(2);
    EXPECT_EQ(count("P gone"), 1);
}

TEST_F(FrameworkPopupTest, aContentFunctionMayMakeNothing) {
    auto* const popup = new ProbePopup(trace, "P");
    popup->setContent([](Evas_Object*) -> Evas_Object* { return nullptr; });
    page->attachPopup(popup);
    stage().settle();
    EXPECT_NE(popup->getEvasObj(), nullptr);
}

TEST_F(FrameworkPopupTest, buttonsAppearInTheirOrderAndNoMoreThanThree) {
    ProbePopup* const popup = newPopup();
    for (const char* const text : {"one", "two", "three", "four"}) {
        popup->addButton(text, {});
    }
    expectLog("ProbePopup takes no button \"four\"");
    page->attachPopup(popup);
    for (const auto& [part, text] : std::vector<std::pair<const char*, const char*>>{
             {"button1", "one"}, {"button2", "two"}, {"button3", "three"}}) {
        EXPECT_STREQ(elm_object_text_get(elm_object_part_content_get(popup->getEvasObj(), part)),
                     text);
    }
    popup->addButton("late", {});
    expectLog("ProbePopup takes no button \"late\"");
}

TEST_F(FrameworkPopupTest, aClickRunsItsFunctionAndClosesThePopup) {
    ProbePopup* const popup = newPopup();
    popup->addButton("Cancel", {});
    popup->addButton("Set", [this](bool* keepOpen) {
        EXPECT_FALSE(*keepOpen);
        trace.emplace_back("set");
    });
    page->attachPopup(popup);
    stage().settle();
    trace.clear();
    stage().tapText("Set");
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"set", "P destroyed", "P view deleted", "P gone"}));
}

TEST_F(FrameworkPopupTest, aButtonWithoutFunctionJustCloses) {
    ProbePopup* const popup = newPopup();
    popup->addButton("Cancel", {});
    page->attachPopup(popup);
    stage().settle();
    stage().tapText("Cancel");
    stage().frames(2);
    EXPECT_EQ(count("P gone"), 1);
}

TEST_F(FrameworkPopupTest, aButtonMayKeepThePopupOpen) {
    ProbePopup* const popup = newPopup();
    popup->addButton("Set", [this](bool* keepOpen) {
        *keepOpen = true;
        trace.emplace_back("set");
    });
    page->attachPopup(popup);
    stage().settle();
    stage().tapText("Set");
    stage().tapText("Set");
    EXPECT_EQ(count("set"), 2);
    EXPECT_EQ(count("P gone"), 0);
    EXPECT_TRUE(stage().shows("content of P"));
}

TEST_F(FrameworkPopupTest, theBackKeyDestroysAPopupByDefault) {
    attach();
    stage().backKey();
    stage().frames(2);
    EXPECT_EQ(count("P gone"), 1);
    EXPECT_EQ(count("A asked"), 0) << "popups get the back key first";
    stage().backKey();
    EXPECT_EQ(count("A asked"), 1);
}

TEST_F(FrameworkPopupTest, theBackFunctionDecidesWhetherThePopupGoes) {
    for (const bool goes : {true, false}) {
        ProbePopup* const popup = newPopup();
        popup->setOnBack([this, goes](bool* destroyPopup) {
            EXPECT_TRUE(*destroyPopup);
            *destroyPopup = goes;
            trace.emplace_back("back");
        });
        page->attachPopup(popup);
        stage().settle();
        trace.clear();
        stage().backKey();
        stage().frames(2);
        EXPECT_EQ(count("back"), 1);
        EXPECT_EQ(count("P gone"), goes ? 1 : 0);
        EXPECT_EQ(count("A asked"), 0);
        if (!goes) {
            popup->destroy();
            stage().frames(2);
        }
    }
}

TEST_F(FrameworkPopupTest, aPopupMayCloseWithItsAnimation) {
    ProbePopup* const popup = newPopup();
    popup->setOnAddProperties([popup](Evas_Object* object) {
        evas_object_smart_callback_add(
            object, "dismissed",
            [](void* data, Evas_Object*, void*) {
                evas_object_del(static_cast<ProbePopup*>(data)->getEvasObj());
            },
            popup);
    });
    popup->setOnBack([popup](bool* destroyPopup) {
        *destroyPopup = false;
        elm_popup_dismiss(popup->getEvasObj());
    });
    page->attachPopup(popup);
    stage().settle();
    trace.clear();
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"P view deleted", "P destroyed without view", "P gone"}));
}

TEST_F(FrameworkPopupTest, aPopupThatBuildsItselfIsEndedByTheDeletionOfItsView) {
    for (const bool byBackKey : {true, false}) {
        auto* const popup = new OwnPopup(trace);
        const auto weak = popup->getWeakPtr();
        page->attachPopup(popup);
        stage().settle();
        trace.clear();
        if (byBackKey) {
            stage().backKey();
        } else {
            stage().tapText("Cancel");
        }
        stage().frames(2);
        EXPECT_TRUE(weak.expired());
        EXPECT_EQ(trace, (Trace{"own destroyed", "own gone"}));
        EXPECT_TRUE(stage().shows("A"));
        EXPECT_FALSE(stage().shows("Discard?"));
    }
}

TEST_F(FrameworkPopupTest, noPopupIsRefused) {
    page->attachPopup(nullptr);
    expectLog("ProbePage was given no popup");
}

TEST_F(FrameworkPopupTest, aPopupIsAttachedOnlyOnce) {
    ProbePopup* const popup = attach();
    page->attachPopup(popup);
    expectLog("ProbePopup is attached already");
    stage().naviframe().attachPopup(popup);
    expectLog("ProbePopup is attached already");
    popup->attachPopup(popup);
    expectLog("ProbePopup is attached already");
    EXPECT_EQ(count("P create"), 1);
}

TEST_F(FrameworkPopupTest, aPopupThatCannotBeCreatedIsDeleted) {
    ProbePopup* const popup = newPopup();
    popup->failView = true;
    page->attachPopup(popup);
    expectLog("ProbePopup has no view");
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"P create", "P view", "P gone"}));
}

TEST_F(FrameworkPopupTest, withoutAViewThereIsNothingToShowAPopupOver) {
    auto* const other = new ProbePage(trace, "B");
    other->attachPopup(newPopup());
    expectLog("ProbePage has no view to show ProbePopup over");
    stage().frames(1);
    EXPECT_EQ(trace, Trace{"P gone"});
    other->destroy();
    stage().frames(1);
}

TEST_F(FrameworkPopupTest, aDyingPageTakesNoPopup) {
    page->destroy();
    page->attachPopup(newPopup());
    expectLog("ProbePage has no view to show ProbePopup over");
    stage().frames(1);
    EXPECT_EQ(count("P gone"), 1);
    EXPECT_EQ(count("P create"), 0);
}

TEST_F(FrameworkPopupTest, popupsGoAtOnceWhenTheirPageBeginsToLeave) {
    auto* const top = new ProbePage(trace, "B");
    stage().push(top);
    top->attachPopup(newPopup("P"));
    top->attachPopup(newPopup("Q"));
    stage().settle();
    trace.clear();
    top->popOut();
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"B asked", "P destroyed", "P view deleted", "P gone", "Q destroyed",
                            "Q view deleted", "Q gone"}));
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkPopupTest, popupsStayWhenTheirPageRefusesToLeave) {
    page->letGo = false;
    attach();
    page->popOut();
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("content of P"));
}

TEST_F(FrameworkPopupTest, popupsGoBeforeTheirDestroyedPage) {
    attach();
    trace.clear();
    page->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"P destroyed", "P view deleted", "P gone", "A destroyed",
                            "A view deleted", "A gone"}));
}

TEST_F(FrameworkPopupTest, popupsGoWithAPageWhoseViewOthersDelete) {
    attach();
    trace.clear();
    evas_object_del(page->getEvasObj());
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"A view deleted", "P destroyed", "P view deleted", "P gone",
                            "A destroyed without view", "A gone"}));
}

TEST_F(FrameworkPopupTest, aPopupOverAPopupGoesWithIt) {
    ProbePopup* const below = attach("P");
    below->attachPopup(newPopup("Q"));
    stage().settle();
    EXPECT_TRUE(stage().shows("content of Q"));
    trace.clear();
    stage().backKey();
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"Q destroyed", "Q view deleted", "Q gone"}));
    below->attachPopup(newPopup("R"));
    stage().settle();
    trace.clear();
    below->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"R destroyed", "R view deleted", "R gone", "P destroyed",
                            "P view deleted", "P gone"}));
}

TEST_F(FrameworkPopupTest, aButtonMayTakeThePageAwayWithThePopup) {
    const std::vector<std::function<void(ProbePage*)>> ways = {
        [](ProbePage* top) { top->popOut(); },
        [](ProbePage* top) { top->destroy(); },
        [](ProbePage* top) { evas_object_del(top->getEvasObj()); },
        [this](ProbePage*) { elm_naviframe_item_pop(stage().naviframe().getEvasObj()); },
    };
    for (const bool keep : {false, true}) {
        for (const auto& leave : ways) {
            auto* const top = new ProbePage(trace, "B");
            stage().push(top);
            ProbePopup* const popup = newPopup();
            popup->addButton("Discard", [&leave, top, keep](bool* keepOpen) {
                *keepOpen = keep;
                leave(top);
            });
            top->attachPopup(popup);
            stage().settle();
            trace.clear();
            stage().tapText("Discard");
            stage().advance(TRANSITION);
            EXPECT_EQ(count("P gone"), 1);
            EXPECT_EQ(count("B gone"), 1);
            EXPECT_TRUE(stage().shows("A"));
        }
    }
}

TEST_F(FrameworkPopupTest, aButtonMayDestroyThePopupAndItsView) {
    const std::vector<std::function<void(ProbePopup*)>> ways = {
        [](ProbePopup* popup) { popup->destroy(); },
        [](ProbePopup* popup) { evas_object_del(popup->getEvasObj()); },
        [this](ProbePopup*) { stage().naviframe().destroy(); },
    };
    for (const auto& close : ways) {
        ProbePopup* const popup = newPopup();
        popup->addButton("Close", [&close, popup](bool*) { close(popup); });
        page->attachPopup(popup);
        stage().settle();
        trace.clear();
        stage().tapText("Close");
        stage().frames(2);
        EXPECT_EQ(count("P gone"), 1);
    }
    EXPECT_EQ(count("A gone"), 1) << "with the naviframe";
}

TEST_F(FrameworkPopupTest, aPopupMayEndInAnyOfItsHooks) {
    const std::vector<std::function<void(ProbePopup*)>> hooks = {
        [](ProbePopup* popup) {
            popup->setOnAddProperties([popup](Evas_Object*) { popup->destroy(); });
        },
        [](ProbePopup* popup) {
            popup->setContent([popup](Evas_Object*) -> Evas_Object* {
                popup->destroy();
                return nullptr;
            });
        },
        [](ProbePopup* popup) {
            popup->addButton("B", {}, [popup](Evas_Object*) { popup->destroy(); });
        },
        [](ProbePopup* popup) { popup->probe.on("create", [popup] { popup->destroy(); }); },
        [](ProbePopup* popup) { popup->probe.on("created", [popup] { popup->destroy(); }); },
        [](ProbePopup* popup) {
            popup->probe.on("created", [popup] { evas_object_del(popup->getEvasObj()); });
        },
    };
    for (const auto& hook : hooks) {
        auto* const popup = new ProbePopup(trace, "P");
        hook(popup);
        trace.clear();
        page->attachPopup(popup);
        stage().frames(2);
        takeErrors();
        EXPECT_EQ(count("P gone"), 1);
        EXPECT_EQ(page->isDying(), false);
    }
}

TEST_F(FrameworkPopupTest, aBackFunctionMayTakeThePageAway) {
    auto* const top = new ProbePage(trace, "B");
    stage().push(top);
    ProbePopup* const popup = newPopup();
    popup->setOnBack([top](bool*) { top->popOut(); });
    top->attachPopup(popup);
    stage().settle();
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("P gone"), 1);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkPopupTest, aQuestionMayAttachAPopup) {
    page->letGo = false;
    page->probe.on("asked", [this] {
        ProbePopup* const popup = newPopup();
        popup->addButton("Discard", [this](bool*) { page->destroy(); });
        page->attachPopup(popup);
    });
    stage().backKey();
    stage().settle();
    EXPECT_TRUE(stage().shows("content of P"));
    stage().tapText("Discard");
    stage().advance(TRANSITION);
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(count("A asked"), 1);
}

TEST_F(FrameworkPopupTest, aTimerMayCloseAPopup) {
    ProbePopup* const popup = attach();
    WUiTimer::addTimer(
        1,
        [](void* data) {
            static_cast<ProbePopup*>(data)->destroy();
            return false;
        },
        popup);
    stage().advance(0.9);
    EXPECT_EQ(count("P gone"), 0);
    stage().advance(0.2);
    EXPECT_EQ(count("P gone"), 1);
}

TEST_F(FrameworkPopupTest, aClickOnADyingPopupDoesNothing) {
    ProbePopup* const popup = newPopup();
    Evas_Object* button = nullptr;
    popup->addButton(
        "Set", [this](bool*) { trace.emplace_back("set"); },
        [&](Evas_Object* made) { button = made; });
    page->attachPopup(popup);
    stage().settle();
    popup->destroy();
    evas_object_smart_callback_call(button, "clicked", nullptr);
    EXPECT_EQ(count("set"), 0);
    stage().frames(1);
    EXPECT_EQ(count("P gone"), 1);
}

TEST_F(FrameworkPopupTest, aPopupThatClosedItselfIsForgotten) {
    ProbePopup* const popup = attach();
    const auto weak = popup->getWeakPtr();
    popup->destroy();
    stage().frames(1);
    EXPECT_TRUE(weak.expired());
    page->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("A gone"), 1);
}

TEST_F(FrameworkPopupTest, aDirectlyDeletedPopupLeavesNothingBehind) {
    auto* const popup = new WPopupController;
    popup->setContent([](Evas_Object* parent) {
        Evas_Object* const label = elm_label_add(parent);
        elm_object_text_set(label, "plain");
        return label;
    });
    page->attachPopup(popup);
    stage().settle();
    EXPECT_TRUE(stage().shows("plain"));
    delete popup;
    stage().frames(2);
    EXPECT_FALSE(stage().shows("plain"));
}

TEST_F(FrameworkPopupTest, popupsGoWithTheWindow) {
    attach("P");
    stage().windowController().attachPopup(newPopup("W"));
    stage().naviframe().attachPopup(newPopup("N"));
    stage().settle();
    trace.clear();
    takeStageDown();
    EXPECT_EQ(trace, (Trace{"W destroyed", "W view deleted", "W gone", "N destroyed",
                            "N view deleted", "N gone", "P destroyed", "P view deleted", "P gone",
                            "A destroyed", "A view deleted", "A gone"}));
}
