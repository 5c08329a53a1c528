// Controllers in general, the window, and the end of everything.

#include <algorithm>
#include <memory>
#include <string>

#include <Ecore_Evas.h>

#include "app_assist/WWindowController.h"
#include "screens/FrameworkProbe.h"
#include "support/LiveObjects.h"
#include "support/ScreenTest.h"

using app_assist::WNaviframeController;
using app_assist::WViewController;
using app_assist::WWeakPtr;
using app_assist::WWindowController;

namespace {

/** A plain controller with a rectangle, or with nothing, for its view. */
class PlainController : public WViewController {
public:
    PlainController(Trace& trace, const std::string& name) : probe(trace, name) {}
    ~PlainController() override { probe.note("gone"); }
    Probe probe;
    bool withView = true;

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* /*param*/) override {
        probe.note("view");
        return withView ? evas_object_rectangle_add(evas_object_evas_get(parent)) : nullptr;
    }
    void onDestroy() override { probe.note("destroyed"); }
};

class FrameworkWindowTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        stage();
    }
    long count(const std::string& step) const { return std::ranges::count(trace, step); }
    Trace trace;
};

} // namespace

TEST_F(FrameworkWindowTest, aWindowHasItsSizeAndItsName) {
    WWindowController window("clock", 360, 300);
    EXPECT_EQ(window.getEvasObj(), nullptr);
    ASSERT_TRUE(window.create(nullptr, nullptr));
    VirtualClock::frames(2);
    const Area area = Stage::area(window.getEvasObj());
    EXPECT_EQ(area.width, 360);
    EXPECT_EQ(area.height, 300);
    EXPECT_STREQ(elm_win_title_get(window.getEvasObj()), "clock");
    EXPECT_TRUE(evas_object_visible_get(window.getEvasObj()));
    EXPECT_EQ(window.getWindowController(), &window);
}

TEST_F(FrameworkWindowTest, aControllerIsCreatedOnlyOnce) {
    PlainController controller(trace, "C");
    ASSERT_TRUE(controller.create(stage().window(), nullptr));
    Evas_Object* const view = controller.getEvasObj();
    EXPECT_FALSE(controller.create(stage().window(), nullptr));
    expectLog("WViewController is created already, or dying");
    EXPECT_EQ(controller.getEvasObj(), view);
    EXPECT_EQ(trace, Trace{"C view"});
}

TEST_F(FrameworkWindowTest, aControllerThatDiesIsNotCreated) {
    auto* const controller = new PlainController(trace, "C");
    controller->destroy();
    EXPECT_FALSE(controller->create(stage().window(), nullptr));
    expectLog("WViewController is created already, or dying");
    stage().frames(1);
    EXPECT_EQ(trace, Trace{"C gone"});
}

TEST_F(FrameworkWindowTest, withoutAViewCreationFails) {
    PlainController controller(trace, "C");
    controller.withView = false;
    EXPECT_FALSE(controller.create(stage().window(), nullptr));
    expectLog("WViewController has no view");
    EXPECT_EQ(controller.getEvasObj(), nullptr);
    WViewController base;
    EXPECT_FALSE(base.create(stage().window(), nullptr));
    expectLog("WViewController has no view");
}

TEST_F(FrameworkWindowTest, aControllerOnTheStackCleansUp) {
    Evas_Object* view = nullptr;
    int deleted = 0;
    {
        PlainController controller(trace, "C");
        controller.create(stage().window(), nullptr);
        view = controller.getEvasObj();
        evas_object_event_callback_add(
            view, EVAS_CALLBACK_DEL,
            [](void* data, Evas*, Evas_Object*, void*) { ++*static_cast<int*>(data); }, &deleted);
    }
    EXPECT_EQ(deleted, 1);
    stage().frames(2);
    EXPECT_EQ(trace, (Trace{"C view", "C gone"}));
}

TEST_F(FrameworkWindowTest, aWeakPointerExpiresWithItsController) {
    auto* const controller = new PlainController(trace, "C");
    WWeakPtr<WViewController> weak = controller->getWeakPtr();
    const WWeakPtr<WViewController> copy = weak;
    EXPECT_EQ(weak.get(), controller);
    EXPECT_TRUE(copy);
    EXPECT_EQ(copy->getEvasObj(), nullptr);
    weak.reset();
    EXPECT_TRUE(weak.expired());
    EXPECT_FALSE(copy.expired());
    controller->destroy();
    EXPECT_FALSE(copy.expired()) << "until the end of the turn";
    stage().frames(1);
    EXPECT_TRUE(copy.expired());
    EXPECT_EQ(copy.get(), nullptr);
    EXPECT_FALSE(copy);
    EXPECT_TRUE(WWeakPtr<WViewController>().expired());
}

TEST_F(FrameworkWindowTest, theEndComesWithTheTurnAndOnce) {
    auto* const controller = new PlainController(trace, "C");
    controller->create(stage().window(), nullptr);
    controller->probe.on("destroyed", [controller] { controller->destroy(); });
    controller->destroy();
    controller->destroy();
    EXPECT_TRUE(controller->isDying());
    EXPECT_NE(controller->getEvasObj(), nullptr);
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"C view", "C destroyed", "C gone"}));
}

TEST_F(FrameworkWindowTest, whatDiesDuringTheEndOfAnotherEndsInTheSameTurn) {
    auto* const one = new PlainController(trace, "1");
    auto* const other = new PlainController(trace, "2");
    one->probe.on("gone", [other] { other->destroy(); });
    one->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"1 gone", "2 gone"}));
}

TEST_F(FrameworkWindowTest, aWaitingControllerMayBeDeletedByAnother) {
    auto* const one = new PlainController(trace, "1");
    auto* const other = new PlainController(trace, "2");
    one->probe.on("gone", [other] { delete other; });
    one->destroy();
    other->destroy();
    stage().frames(1);
    EXPECT_EQ(trace, (Trace{"1 gone", "2 gone"}));
}

TEST_F(FrameworkWindowTest, theBaseControllerFillsTheWindow) {
    stage().frames(2);
    const Area area = Stage::area(stage().naviframe().getEvasObj());
    EXPECT_EQ(area.width, Stage::SIZE);
    EXPECT_EQ(area.height, Stage::SIZE);
    EXPECT_EQ(stage().windowController().getBaseController(), &stage().naviframe());
    EXPECT_EQ(stage().naviframe().getWindowController(), &stage().windowController());
}

TEST_F(FrameworkWindowTest, aNewBaseControllerReplacesTheOldOne) {
    auto* const page = new ProbePage(trace, "A");
    stage().push(page);
    trace.clear();
    auto* const base = new PlainController(trace, "C");
    stage().windowController().setBaseController(base);
    stage().frames(1);
    EXPECT_EQ(stage().windowController().getBaseController(), base);
    EXPECT_EQ(trace, (Trace{"C view", "A destroyed", "A view deleted", "A gone"}));
    stage().frames(1);
    EXPECT_EQ(Stage::area(base->getEvasObj()).width, Stage::SIZE);
}

TEST_F(FrameworkWindowTest, aWindowRefusesABaseThatIsNoneOrTaken) {
    WWindowController& window = stage().windowController();
    window.setBaseController(nullptr);
    expectLog("A window needs a controller that nobody else owns");
    window.setBaseController(&stage().naviframe());
    expectLog("A window needs a controller that nobody else owns");
    window.setBaseController(&window);
    expectLog("A window needs a controller that nobody else owns");
    EXPECT_EQ(window.getBaseController(), &stage().naviframe());
}

TEST_F(FrameworkWindowTest, aBaseThatCannotBeCreatedIsDeleted) {
    auto* const base = new PlainController(trace, "C");
    base->withView = false;
    stage().windowController().setBaseController(base);
    expectLog("WViewController has no view");
    expectLog("WViewController cannot fill the window");
    stage().frames(1);
    EXPECT_EQ(count("C gone"), 1);
    EXPECT_EQ(stage().windowController().getBaseController(), nullptr);
}

TEST_F(FrameworkWindowTest, aWindowWithoutWindowTakesNoBase) {
    WWindowController window("never created", 360, 360);
    window.setBaseController(new PlainController(trace, "C"));
    expectLog("WViewController cannot fill the window");
    VirtualClock::frames(1);
    EXPECT_EQ(trace, Trace{"C gone"});
}

TEST_F(FrameworkWindowTest, deletingTheWindowTakesEverythingDownInOrderAndAtOnce) {
    auto window = std::make_unique<WWindowController>("clock", 360, 360);
    window->create(nullptr, nullptr);
    auto* const naviframe = new WNaviframeController;
    window->setBaseController(naviframe);
    auto* const bottom = new ProbePage(trace, "A");
    auto* const top = new ProbePage(trace, "B");
    naviframe->push(bottom);
    naviframe->push(top);
    top->attachPopup(new ProbePopup(trace, "P"));
    VirtualClock::advance(1);
    trace.clear();
    window.reset();
    EXPECT_EQ(trace,
              (Trace{"P destroyed", "P view deleted", "P gone", "B destroyed", "B view deleted",
                     "B gone", "A destroyed", "A view deleted", "A gone"}));
    VirtualClock::frames(2);
}

TEST_F(FrameworkWindowTest, deletingTheWindowEndsWhatWaitsForItsEnd) {
    auto* const page = new ProbePage(trace, "A");
    auto* const leaving = new ProbePage(trace, "B");
    auto* const dying = new ProbePage(trace, "C");
    auto* const nowhere = new PlainController(trace, "D");
    stage().push(page);
    stage().push(dying);
    stage().push(leaving);
    leaving->popOut();
    stage().frames(3);
    auto* const popup = new ProbePopup(trace, "P");
    page->attachPopup(popup);
    trace.clear();
    popup->destroy();
    dying->destroy();
    nowhere->destroy();
    const int controllers = liveControllers();
    EXPECT_GE(controllers, 7);
    takeStageDown();
    for (const char* const name : {"A", "B", "C", "D", "P"}) {
        EXPECT_EQ(count(std::string(name) + " gone"), 1) << name;
    }
    EXPECT_EQ(count("B destroyed"), 1);
    EXPECT_EQ(count("C destroyed"), 1);
}

TEST_F(FrameworkWindowTest, whatWaitsForItsEndDoesNotNeedAnotherTurnAfterTheWindow) {
    auto window = std::make_unique<WWindowController>("clock", 360, 360);
    window->create(nullptr, nullptr);
    auto* const old = new PlainController(trace, "C");
    window->setBaseController(old);
    window->setBaseController(new PlainController(trace, "D"));
    (new PlainController(trace, "E"))->destroy();
    trace.clear();
    window.reset();
    EXPECT_EQ(count("C gone"), 1);
    EXPECT_EQ(count("D gone"), 1);
    EXPECT_EQ(count("E gone"), 1);
}

TEST_F(FrameworkWindowTest, aWindowDeletedByTheToolkitTakesEverythingAlong) {
    auto* const page = new ProbePage(trace, "A");
    stage().push(page);
    page->attachPopup(new ProbePopup(trace, "P"));
    stage().settle();
    trace.clear();
    WWindowController& window = stage().windowController();
    evas_object_del(window.getEvasObj());
    VirtualClock::frames(3);
    EXPECT_EQ(window.getEvasObj(), nullptr);
    EXPECT_TRUE(window.isDying());
    EXPECT_EQ(count("P gone"), 1);
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(window.getBaseController(), nullptr);
}

TEST_F(FrameworkWindowTest, aDestroyedWindowStaysTheApplicationsOwn) {
    auto* const page = new ProbePage(trace, "A");
    stage().push(page);
    trace.clear();
    WWindowController& window = stage().windowController();
    window.destroy();
    VirtualClock::frames(2);
    EXPECT_EQ(trace, (Trace{"A destroyed", "A view deleted", "A gone"}));
    EXPECT_EQ(window.getEvasObj(), nullptr);
}

TEST_F(FrameworkWindowTest, theWindowGoesWhileAPageIsComing) {
    auto* const page = new ProbePage(trace, "A");
    stage().push(page);
    stage().naviframe().push(new ProbePage(trace, "B"));
    stage().frames(3);
    takeStageDown();
    EXPECT_EQ(count("A gone"), 1);
    EXPECT_EQ(count("B gone"), 1);
}

TEST_F(FrameworkWindowTest, oneWindowsPagesDoNotKnowAnotherWindow) {
    WWindowController other("other", 100, 100);
    other.create(nullptr, nullptr);
    auto* const base = new PlainController(trace, "C");
    other.setBaseController(base);
    auto* const page = new ProbePage(trace, "A");
    stage().push(page);
    EXPECT_EQ(base->getWindowController(), &other);
    EXPECT_EQ(page->getWindowController(), &stage().windowController());
}
