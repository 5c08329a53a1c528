// Pages on a naviframe: their life, their ways out, and the back key.

#include <algorithm>
#include <functional>
#include <string>

#include <gmock/gmock.h>

#include "app_assist/WUiTimer.h"
#include "app_assist/WWindowController.h"
#include "clock/ClockEventListener.h"
#include "screens/FrameworkProbe.h"
#include "support/ScreenTest.h"
#include "support/ToolkitErrors.h"

using app_assist::WNaviframeController;
using app_assist::WUiTimer;

namespace {

/** Time enough for a page to come or go. */
constexpr double TRANSITION = 1;

class FrameworkPageTest : public ScreenTest {
protected:
    ProbePage* push(const std::string& name) {
        auto* const page = new ProbePage(trace, name);
        stage().push(page);
        return page;
    }
    WNaviframeController& naviframe() { return stage().naviframe(); }
    unsigned items() {
        Eina_List* const list = elm_naviframe_items_get(naviframe().getEvasObj());
        const unsigned count = eina_list_count(list);
        eina_list_free(list);
        return count;
    }
    long count(const std::string& step) const { return std::ranges::count(trace, step); }

    Trace trace;
};

} // namespace

TEST_F(FrameworkPageTest, aPageGoesThroughItsStepsInOrder) {
    push("A");
    EXPECT_EQ(trace, (Trace{"A create", "A view", "A created", "A container", "A push", "A content",
                            "A pushed", "A top"}));
    trace.clear();
    takeStageDown();
    EXPECT_EQ(trace, (Trace{"A destroyed", "A view deleted", "A gone"}));
}

TEST_F(FrameworkPageTest, aPageLearnsWhereItIs) {
    ProbePage* const page = push("A");
    EXPECT_EQ(page->container, &naviframe());
    EXPECT_EQ(page->getNaviframeController(), &naviframe());
    EXPECT_EQ(page->parent, naviframe().getEvasObj());
    EXPECT_EQ(page->content, page->getEvasObj());
    EXPECT_EQ(page->itemWhenPushed, page->getNaviItem());
    EXPECT_EQ(page->getNaviItem(), elm_naviframe_top_item_get(naviframe().getEvasObj()));
    EXPECT_EQ(elm_object_item_content_get(page->getNaviItem()), page->getEvasObj());
    EXPECT_EQ(page->getWindowController(), &stage().windowController());
    EXPECT_EQ(naviframe().getTop(), page);
}

TEST_F(FrameworkPageTest, aPageThatIsNotPushedIsNowhere) {
    auto* const page = new ProbePage(trace, "A");
    EXPECT_EQ(page->getNaviItem(), nullptr);
    EXPECT_EQ(page->getNaviframeController(), nullptr);
    EXPECT_EQ(page->getWindowController(), nullptr);
    EXPECT_EQ(page->getEvasObj(), nullptr);
    page->popOut();
    EXPECT_EQ(trace, Trace{});
    page->destroy();
    EXPECT_TRUE(page->isDying());
    VirtualClock::frames(1);
    EXPECT_EQ(trace, Trace{"A gone"});
}

TEST_F(FrameworkPageTest, thePageOnTopIsSeenAndTouched) {
    push("A");
    push("B");
    EXPECT_TRUE(stage().shows("B"));
    EXPECT_FALSE(stage().shows("A"));
    stage().tapText("B");
    EXPECT_EQ(count("B clicked"), 1);
    EXPECT_EQ(count("A clicked"), 0);
}

TEST_F(FrameworkPageTest, aPageMayBeCreatedBeforeItIsPushed) {
    auto* const page = new ProbePage(trace, "A");
    int param = 0;
    ASSERT_TRUE(page->create(naviframe().getEvasObj(), &param));
    EXPECT_EQ(page->param, &param);
    stage().push(page);
    EXPECT_EQ(count("A create"), 1);
    EXPECT_EQ(naviframe().getTop(), page);
}

TEST_F(FrameworkPageTest, noPageIsRefused) {
    naviframe().push(nullptr);
    expectLog("Page is NULL");
    EXPECT_EQ(naviframe().getTop(), nullptr);
}

TEST_F(FrameworkPageTest, aPageIsPushedOnlyOnce) {
    ProbePage* const page = push("A");
    Elm_Object_Item* const item = page->getNaviItem();
    naviframe().push(page);
    expectLog("ProbePage is on a naviframe already");
    EXPECT_EQ(page->getNaviItem(), item);
    EXPECT_EQ(items(), 1U);
}

TEST_F(FrameworkPageTest, aPageThatCannotBeCreatedIsDeleted) {
    auto* const page = new ProbePage(trace, "A");
    page->failCreate = true;
    stage().push(page);
    expectLog("ProbePage gave up in onCreate");
    expectLog("ProbePage cannot be pushed");
    EXPECT_EQ(trace, (Trace{"A create", "A gone"}));
    EXPECT_EQ(naviframe().getTop(), nullptr);
}

TEST_F(FrameworkPageTest, aPageWithoutViewIsDeleted) {
    auto* const page = new ProbePage(trace, "A");
    page->failView = true;
    stage().push(page);
    expectLog("ProbePage has no view");
    expectLog("ProbePage cannot be pushed");
    EXPECT_EQ(trace, (Trace{"A create", "A view", "A gone"}));
}

TEST_F(FrameworkPageTest, aPageWhosePushFailsIsDeleted) {
    push("A");
    trace.clear();
    auto* const page = new ProbePage(trace, "B");
    page->failPush = true;
    stage().push(page);
    expectLog("ProbePage cannot be pushed");
    EXPECT_EQ(trace, (Trace{"B create", "B view", "B created", "B container", "B push",
                            "B destroyed", "B view deleted", "B gone"}));
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aNaviframeThatIsDyingTakesNoPage) {
    auto* const page = new ProbePage(trace, "A");
    naviframe().destroy();
    naviframe().push(page);
    expectLog("ProbePage cannot be pushed");
    stage().frames(2);
    EXPECT_EQ(trace, Trace{"A gone"});
}

TEST_F(FrameworkPageTest, aPageThatAgreesLeavesWithItsViewToTheEnd) {
    push("A");
    ProbePage* const page = push("B");
    trace.clear();
    const auto weak = page->getWeakPtr();
    page->popOut();
    EXPECT_EQ(trace, Trace{"B asked"});
    stage().frames(3);
    EXPECT_EQ(trace, Trace{"B asked"}) << "it is still sliding out";
    EXPECT_FALSE(weak.expired());
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone", "A top"}));
    EXPECT_TRUE(weak.expired());
    EXPECT_TRUE(stage().shows("A"));
    EXPECT_FALSE(stage().shows("B"));
}

TEST_F(FrameworkPageTest, aPageThatRefusesStays) {
    push("A");
    ProbePage* const page = push("B");
    page->letGo = false;
    trace.clear();
    page->popOut();
    stage().backKey();
    elm_naviframe_item_pop(naviframe().getEvasObj());
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B asked", "B asked", "B asked"}));
    EXPECT_EQ(naviframe().getTop(), page);
    EXPECT_TRUE(stage().shows("B"));
    page->letGo = true;
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkPageTest, eachWayOutAsksThePageOnce) {
    push("A");
    const std::vector<std::function<void(ProbePage*)>> ways = {
        [](ProbePage* page) { page->popOut(); },
        [this](ProbePage*) { stage().backKey(); },
        [this](ProbePage*) { elm_naviframe_item_pop(naviframe().getEvasObj()); },
    };
    for (const auto& leave : ways) {
        ProbePage* const page = push("B");
        trace.clear();
        leave(page);
        stage().advance(TRANSITION);
        EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone", "A top"}));
    }
}

TEST_F(FrameworkPageTest, leavingTwiceIsLeavingOnce) {
    push("A");
    ProbePage* const page = push("B");
    trace.clear();
    page->popOut();
    page->popOut();
    stage().frames(2);
    page->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone", "A top"}));
}

TEST_F(FrameworkPageTest, leavingFromInsideTheQuestionChangesNothing) {
    push("A");
    ProbePage* const page = push("B");
    page->letGo = false;
    page->probe.on("asked", [page] { page->popOut(); });
    page->probe.on("asked", [this] { elm_naviframe_item_pop(naviframe().getEvasObj()); });
    trace.clear();
    page->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, Trace{"B asked"});
    EXPECT_EQ(naviframe().getTop(), page);
}

TEST_F(FrameworkPageTest, destroyingFromInsideTheQuestionDestroysWhateverTheAnswer) {
    push("A");
    for (const bool answer : {true, false}) {
        ProbePage* const page = push("B");
        page->letGo = answer;
        page->probe.on("asked", [page] { page->destroy(); });
        trace.clear();
        stage().backKey();
        stage().advance(TRANSITION);
        EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone", "A top"}));
        EXPECT_TRUE(stage().shows("A"));
    }
}

TEST_F(FrameworkPageTest, destroyAsksNobodyAndIsDoneWithTheTurn) {
    push("A");
    ProbePage* const page = push("B");
    page->letGo = false;
    trace.clear();
    page->destroy();
    EXPECT_TRUE(page->isDying());
    EXPECT_NE(page->getEvasObj(), nullptr);
    EXPECT_EQ(trace, Trace{});
    page->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"B destroyed", "B view deleted", "B gone", "A top"}));
    stage().frames(1);
    EXPECT_TRUE(stage().shows("A"));
    EXPECT_FALSE(stage().shows("B"));
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 1);
}

TEST_F(FrameworkPageTest, destroyMayFollowLeavingAndLeavingMayFollowDestroy) {
    push("A");
    ProbePage* page = push("B");
    trace.clear();
    page->popOut();
    stage().frames(4);
    page->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone", "A top"}));
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("A"));

    page = push("B");
    trace.clear();
    page->destroy();
    page->popOut();
    elm_naviframe_item_pop(naviframe().getEvasObj());
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B asked"), 0);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, destroyingAPageThatSlidesOutConfusesNotTheToolkit) {
    push("A");
    ProbePage* const page = push("B");
    const ToolkitErrors errors;
    page->popOut();
    stage().frames(4);
    page->destroy();
    stage().advance(TRANSITION);
    takeStageDown();
    EXPECT_THAT(errors.lines(), testing::IsEmpty());
}

TEST_F(FrameworkPageTest, allPagesMayBeDestroyedInOneTurn) {
    for (const bool fromTheTop : {true, false}) {
        ProbePage* const bottom = push("A");
        ProbePage* const top = push("B");
        trace.clear();
        const ToolkitErrors errors;
        (fromTheTop ? top : bottom)->destroy();
        (fromTheTop ? bottom : top)->destroy();
        stage().advance(TRANSITION);
        EXPECT_EQ(count("A gone"), 1);
        EXPECT_EQ(count("B gone"), 1);
        EXPECT_THAT(errors.lines(), testing::IsEmpty());
    }
    EXPECT_EQ(items(), 0U);
    push("C");
    EXPECT_TRUE(stage().shows("C"));
}

TEST_F(FrameworkPageTest, aPageMayLeaveFromItsOwnButton) {
    push("A");
    ProbePage* page = push("B");
    page->probe.on("clicked", [page] { page->popOut(); });
    stage().tapText("B");
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B gone"), 1);

    page = push("C");
    page->probe.on("clicked", [page] { page->destroy(); });
    stage().tapText("C");
    stage().advance(TRANSITION);
    EXPECT_EQ(count("C gone"), 1);
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, theLastPageMayLeaveFromItsTitleButton) {
    ProbePage* const page = push("A");
    Evas_Object* const button = elm_button_add(naviframe().getEvasObj());
    elm_object_text_set(button, "Cancel");
    evas_object_smart_callback_add(
        button, "clicked",
        [](void* data, Evas_Object*, void*) { static_cast<ProbePage*>(data)->popOut(); }, page);
    elm_object_item_part_content_set(page->getNaviItem(), "prev_btn", button);
    stage().settle();
    stage().tapText("Cancel");
    stage().advance(TRANSITION);
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(naviframe().getTop(), nullptr);
}

TEST_F(FrameworkPageTest, aPageMayLeaveFromATimer) {
    push("A");
    ProbePage* const page = push("B");
    WUiTimer::addTimer(
        0.5,
        [](void* data) {
            static_cast<ProbePage*>(data)->popOut();
            return false;
        },
        page);
    stage().advance(0.6 + TRANSITION);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aPageMayBeDestroyedInEachOfItsSteps) {
    push("A");
    for (const std::string step :
         {"create", "view", "created", "container", "push", "content", "pushed", "top"}) {
        auto* const page = new ProbePage(trace, "B");
        page->probe.on(step, [page] { page->destroy(); });
        trace.clear();
        stage().push(page);
        stage().advance(TRANSITION);
        takeErrors();
        EXPECT_EQ(count("B gone"), 1) << step;
        EXPECT_TRUE(stage().shows("A")) << step;
    }
}

TEST_F(FrameworkPageTest, aPageMayLeaveAsSoonAsItIsOnTheNaviframe) {
    push("A");
    for (const std::string step : {"content", "pushed", "top"}) {
        auto* const page = new ProbePage(trace, "B");
        page->probe.on(step, [page] { page->popOut(); });
        trace.clear();
        stage().push(page);
        stage().advance(TRANSITION);
        EXPECT_EQ(count("B asked"), 1) << step;
        EXPECT_EQ(count("B gone"), 1) << step;
        EXPECT_TRUE(stage().shows("A")) << step;
    }
}

TEST_F(FrameworkPageTest, aPageLeavesWhileItIsStillComing) {
    push("A");
    auto* const page = new ProbePage(trace, "B");
    naviframe().push(page);
    stage().frames(4);
    page->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B asked"), 1);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_TRUE(stage().shows("A"));
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 1) << "the page below takes touches again";
}

TEST_F(FrameworkPageTest, aPageIsDestroyedWhileItIsStillComing) {
    push("A");
    auto* const page = new ProbePage(trace, "B");
    naviframe().push(page);
    stage().frames(4);
    page->destroy();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B asked"), 0);
    EXPECT_EQ(count("B gone"), 1);
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 1);
}

TEST_F(FrameworkPageTest, thePageBelowIsDestroyedWhileTheOneOnTopComesOrGoes) {
    for (const bool coming : {true, false}) {
        push("A");
        ProbePage* const below = push("B");
        auto* const top = new ProbePage(trace, "C");
        naviframe().push(top);
        if (!coming) {
            stage().advance(TRANSITION);
            top->popOut();
        }
        stage().frames(4);
        trace.clear();
        below->destroy();
        stage().advance(TRANSITION);
        EXPECT_EQ(count("B gone"), 1);
        EXPECT_EQ(count("C gone"), coming ? 0 : 1);
        EXPECT_TRUE(stage().shows(coming ? "C" : "A"));
        if (coming) {
            top->destroy();
            stage().advance(TRANSITION);
        }
        stage().tapText("A");
        EXPECT_EQ(count("A clicked"), 1);
    }
}

TEST_F(FrameworkPageTest, titleButtonsOfADestroyedPageGoBeforeThePage) {
    for (const bool sliding : {false, true}) {
        push("A");
        ProbePage* const page = push("B");
        Evas_Object* const button = elm_button_add(naviframe().getEvasObj());
        evas_object_event_callback_add(
            button, EVAS_CALLBACK_DEL,
            [](void* data, Evas*, Evas_Object*, void*) {
                static_cast<ProbePage*>(data)->probe.note("button deleted");
            },
            page);
        elm_object_item_part_content_set(page->getNaviItem(), "prev_btn", button);
        stage().settle();
        if (sliding) {
            page->popOut();
            stage().frames(3);
        }
        trace.clear();
        page->destroy();
        stage().frames(1);
        EXPECT_EQ(trace,
                  (Trace{"B destroyed", "B button deleted", "B view deleted", "B gone", "A top"}));
        stage().advance(TRANSITION);
    }
}

TEST_F(FrameworkPageTest, twoPagesLeaveAtTheSameTime) {
    push("A");
    push("B");
    push("C");
    trace.clear();
    stage().backKey();
    stage().frames(2);
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(count("C asked"), 1);
    EXPECT_EQ(count("B asked"), 1);
    EXPECT_EQ(count("C gone"), 1);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_EQ(count("B top"), 0) << "it was leaving already";
    EXPECT_EQ(count("A top"), 1);
    EXPECT_TRUE(stage().shows("A"));
    stage().tapText("A");
    EXPECT_EQ(count("A clicked"), 1);
}

TEST_F(FrameworkPageTest, aPageComesWhileAnotherLeaves) {
    push("A");
    ProbePage* const leaving = push("B");
    leaving->popOut();
    stage().frames(2);
    ProbePage* const coming = push("C");
    stage().advance(TRANSITION);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_EQ(naviframe().getTop(), coming);
    EXPECT_TRUE(stage().shows("C"));
    coming->popOut();
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aPageBelowTheTopLeavesUnseen) {
    push("A");
    ProbePage* const below = push("B");
    ProbePage* const top = push("C");
    trace.clear();
    below->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B asked", "B destroyed", "B view deleted", "B gone"}));
    EXPECT_EQ(naviframe().getTop(), top);
    EXPECT_TRUE(stage().shows("C"));
    top->popOut();
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aPageBelowTheTopMayRefuse) {
    ProbePage* const below = push("A");
    push("B");
    below->letGo = false;
    trace.clear();
    below->popOut();
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, Trace{"A asked"});
    EXPECT_NE(below->getNaviItem(), nullptr);
}

TEST_F(FrameworkPageTest, aPageWhoseViewIsDeletedByOthersGoesToo) {
    push("A");
    ProbePage* const page = push("B");
    trace.clear();
    evas_object_del(page->getEvasObj());
    EXPECT_TRUE(page->isDying());
    EXPECT_EQ(page->getEvasObj(), nullptr);
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B view deleted", "B destroyed without view", "B gone", "A top"}));
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aPageWhoseItemIsDeletedByOthersGoesToo) {
    push("A");
    ProbePage* const page = push("B");
    trace.clear();
    elm_object_item_del(page->getNaviItem());
    EXPECT_EQ(page->getNaviItem(), nullptr);
    stage().advance(TRANSITION);
    EXPECT_EQ(trace, (Trace{"B destroyed", "B view deleted", "B gone", "A top"}));
    EXPECT_TRUE(stage().shows("A"));
}

TEST_F(FrameworkPageTest, aDirectlyDeletedPageLeavesNothingBehind) {
    push("A");
    ProbePage* const page = push("B");
    page->forgetView();
    trace.clear();
    delete page;
    EXPECT_EQ(trace, (Trace{"B gone", "A top"}));
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("A"));
    EXPECT_EQ(items(), 1U);
}

TEST_F(FrameworkPageTest, theBackKeyReachesThePageOnTopOnly) {
    ProbePage* const bottom = push("A");
    ProbePage* const top = push("B");
    bottom->letGo = false;
    top->letGo = false;
    trace.clear();
    stage().backKey();
    EXPECT_EQ(trace, Trace{"B asked"});
    stage().key("Left");
    EXPECT_EQ(trace, Trace{"B asked"});
}

TEST_F(FrameworkPageTest, theBackKeyWithoutAPageDoesNothing) {
    stage().backKey();
    EXPECT_EQ(naviframe().getTop(), nullptr);
}

TEST_F(FrameworkPageTest, onceTheLastPageHasGoneTheNaviframeTells) {
    int empty = 0;
    naviframe().setOnEmpty([] { FAIL() << "it was replaced"; });
    naviframe().setOnEmpty([&] {
        ++empty;
        trace.emplace_back("empty");
    });
    push("A");
    push("B");
    trace.clear();
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(empty, 0);
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_EQ(empty, 1);
    EXPECT_EQ(trace.back(), "empty");
    EXPECT_EQ(*(trace.end() - 2), "A gone");
}

TEST_F(FrameworkPageTest, anEmptyNaviframeMayBeFilledAgain) {
    naviframe().setOnEmpty([this] { naviframe().push(new ProbePage(trace, "B")); });
    push("A");
    stage().backKey();
    stage().advance(TRANSITION);
    EXPECT_TRUE(stage().shows("B"));
}

TEST_F(FrameworkPageTest, takingTheWindowDownIsNoEmptyNaviframe) {
    naviframe().setOnEmpty([] { FAIL() << "the window went"; });
    push("A");
    push("B");
    takeStageDown();
    EXPECT_EQ(count("A gone"), 1);
}

TEST_F(FrameworkPageTest, destroyingTheNaviframeTakesThePagesFromTheTop) {
    push("A");
    push("B");
    trace.clear();
    naviframe().destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"B destroyed", "B view deleted", "B gone", "A destroyed",
                            "A view deleted", "A gone"}));
}

TEST_F(FrameworkPageTest, aNaviframeDeletedByOthersTakesItsPagesAlong) {
    push("A");
    push("B");
    trace.clear();
    evas_object_del(naviframe().getEvasObj());
    stage().frames(2);
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkPageTest, aPageMayDestroyTheNaviframeUnderIt) {
    push("A");
    ProbePage* const page = push("B");
    page->probe.on("clicked", [this] { naviframe().destroy(); });
    stage().tapText("B");
    stage().frames(2);
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkPageTest, aPageMayPushAnotherFromAnyOfItsEvents) {
    push("A");
    ProbePage* const page = push("B");
    page->probe.on("destroyed", [this] { naviframe().push(new ProbePage(trace, "C")); });
    page->popOut();
    stage().advance(2 * TRANSITION);
    EXPECT_EQ(count("B gone"), 1);
    EXPECT_TRUE(stage().shows("C"));
}

TEST_F(FrameworkPageTest, aMoreButtonGoesToItsPart) {
    ProbePage* const page = push("A");
    Evas_Object* const button = elm_button_add(naviframe().getEvasObj());
    int clicks = 0;
    page->onSetMoreButton(
        button, [](void* data, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &clicks);
    evas_object_smart_callback_call(button, "clicked", nullptr);
    EXPECT_EQ(clicks, 1);
    page->onSetMoreButton(nullptr, nullptr, nullptr);
    expectLog("ProbePage has no button or is not on a naviframe");
}

TEST_F(FrameworkPageTest, anApplicationEventReachesEveryLiveScreen) {
    class ListeningPage : public ProbePage, public ClockEventListener {
    public:
        using ProbePage::ProbePage;
        void onEvent(EventType type) override { probe.note("event " + std::to_string(type)); }
    };
    auto* const bottom = new ListeningPage(trace, "A");
    auto* const top = new ListeningPage(trace, "B");
    stage().push(bottom);
    stage().push(top);
    trace.clear();
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    EXPECT_EQ(trace, (Trace{"A event 4", "B event 4"}));
    top->popOut();
    stage().advance(TRANSITION);
    trace.clear();
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_EQ(trace, Trace{"A event 7"});
    bottom->probe.on("event 6", [bottom] { bottom->destroy(); });
    ClockEventListener::raise(ClockEventListener::PAUSED);
    stage().frames(2);
    EXPECT_EQ(count("A gone"), 1);
}
