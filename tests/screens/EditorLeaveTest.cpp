#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/LiveObjects.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr auto CLOCK = ALARM_EDIT_VIEW_CALLER_CLOCK;
constexpr auto OTHER_APPLICATION = ALARM_EDIT_VIEW_CALLER_OTHER_APPLICATION;

enum class Way { Cancel, BackKey, PopOut };

void PrintTo(Way way, std::ostream* out) {
    *out << (way == Way::Cancel ? "Cancel" : way == Way::BackKey ? "back key" : "popOut");
}

class EditorLeaveTest : public EditorFixture {
protected:
    void open(AlarmEditViewCallerType caller = CLOCK) {
        openEditor(ClockAlarmDbData(), true, caller);
    }

    /** Opens the editor and changes something. */
    void openChanged(AlarmEditViewCallerType caller = CLOCK) {
        open(caller);
        pick(17, 45);
    }

    void leave(Way way) {
        if (way == Way::Cancel)
            tapCancel();
        else if (way == Way::BackKey)
            stage().backKey();
        else
            editor().popOut();
        stage().settle();
    }
};

class EditorWayTest : public EditorLeaveTest, public testing::WithParamInterface<Way> {};

INSTANTIATE_TEST_SUITE_P(Ways, EditorWayTest,
                         testing::Values(Way::Cancel, Way::BackKey, Way::PopOut));

TEST_P(EditorWayTest, AnUnchangedEditorGoesWithoutAQuestion) {
    open();
    leave(GetParam());
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(stage().shows("Plain page"));
    EXPECT_EQ(exitRequests(), 0);
    EXPECT_THAT(storedAlarms(), IsEmpty());
}

TEST_P(EditorWayTest, AChangedEditorAsksAndStays) {
    openChanged();
    leave(GetParam());
    EXPECT_TRUE(isOpen());
    EXPECT_TRUE(asksToDiscard());
    EXPECT_EQ(exitRequests(), 0);
}

TEST_P(EditorWayTest, OpenedByAnotherApplicationAnUnchangedEditorEndsThisOne) {
    open(OTHER_APPLICATION);
    leave(GetParam());
    EXPECT_EQ(exitRequests(), 1);
    EXPECT_TRUE(isOpen());
    EXPECT_FALSE(asksToDiscard());
}

TEST_P(EditorWayTest, OpenedByAnotherApplicationAChangedEditorAsks) {
    openChanged(OTHER_APPLICATION);
    leave(GetParam());
    EXPECT_EQ(exitRequests(), 0);
    EXPECT_TRUE(asksToDiscard());
    tapQuestion("Discard");
    EXPECT_EQ(exitRequests(), 1);
    EXPECT_THAT(storedAlarms(), IsEmpty());
}

TEST_P(EditorWayTest, AnUnknownCallerIsAnErrorAndEndsTheApplication) {
    for (const int caller : {2, -1}) {
        openChanged(static_cast<AlarmEditViewCallerType>(caller));
        leave(GetParam());
        EXPECT_THAT(errorLines(), ElementsAre("_callerType is ERROR !! Please check it"));
        EXPECT_EQ(exitRequests(), 1);
        EXPECT_TRUE(isOpen());
        EXPECT_FALSE(asksToDiscard());
        forgetExitRequests();
    }
}

TEST_F(EditorLeaveTest, DoneLeavesWithoutAQuestion) {
    openChanged();
    tapDone();
    EXPECT_FALSE(isOpen());
    EXPECT_TRUE(stage().shows("Plain page"));
    EXPECT_EQ(storedAlarms().size(), 1U);
}

TEST_F(EditorLeaveTest, OpenedByAnotherApplicationDoneEndsThisOne) {
    openChanged(OTHER_APPLICATION);
    tapDone();
    EXPECT_EQ(exitRequests(), 1);
    EXPECT_FALSE(asksToDiscard());
    EXPECT_EQ(storedAlarms().size(), 1U);
}

TEST_F(EditorLeaveTest, ATimeThatWasTurnedBackIsNoChange) {
    open();
    pick(7, 0);
    pick(6, 0);
    tapCancel();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorLeaveTest, ATypedNameAloneIsNoChangeOfTheRecord) {
    open();
    typeName("Gym");
    tapCancel();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorLeaveTest, CancelOfTheQuestionKeepsTheEdits) {
    openChanged();
    typeName("Gym");
    leave(Way::BackKey);
    ASSERT_TRUE(asksToDiscard());
    tapQuestion("Cancel");
    stage().settle();
    EXPECT_FALSE(asksToDiscard());
    EXPECT_TRUE(isOpen());
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms()[0].hour, 17);
    EXPECT_EQ(storedAlarms()[0].name, "Gym");
}

TEST_F(EditorLeaveTest, TheBackKeyClosesTheQuestionAndKeepsTheEdits) {
    openChanged();
    leave(Way::BackKey);
    ASSERT_TRUE(asksToDiscard());
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(asksToDiscard());
    EXPECT_TRUE(isOpen());
    tapDone();
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms()[0].hour, 17);
}

TEST_F(EditorLeaveTest, DiscardLeavesWithoutSaving) {
    const ClockAlarmDbData alarm = storedAlarm(7, 0);
    editAlarm(alarm);
    pick(8, 30);
    leave(Way::Cancel);
    tapQuestion("Discard");
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(asksToDiscard());
    EXPECT_TRUE(stage().shows("Plain page"));
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms()[0].hour, 7);
    EXPECT_THAT(device().toasts(), IsEmpty());
    EXPECT_THAT(usageEvents(), IsEmpty());
}

TEST_F(EditorLeaveTest, TheQuestionComesAgainAsOftenAsNeeded) {
    openChanged();
    for (int i = 0; i < 3; ++i) {
        leave(Way::BackKey);
        ASSERT_TRUE(asksToDiscard());
        stage().backKey();
        stage().settle();
        ASSERT_FALSE(asksToDiscard());
    }
    leave(Way::Cancel);
    tapQuestion("Discard");
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(EditorLeaveTest, AskingToLeaveWhileTheQuestionIsOpenAsksOnce) {
    openChanged();
    leave(Way::PopOut);
    const int controllers = liveControllers();
    leave(Way::PopOut);
    leave(Way::PopOut);
    EXPECT_EQ(liveControllers(), controllers);
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(asksToDiscard());
    EXPECT_TRUE(isOpen());
}

TEST_F(EditorLeaveTest, AQuestionThatJustClosedCanBeAskedAtOnce) {
    openChanged();
    leave(Way::PopOut);
    stage().keyDown("XF86Back");
    stage().keyUp("XF86Back");
    editor().popOut();
    stage().settle();
    EXPECT_TRUE(asksToDiscard());
}

TEST_F(EditorLeaveTest, TheQuestionGivesTheFocusToCancel) {
    openChanged();
    typeName("x");
    editor().onPop();
    EXPECT_FALSE(elm_object_focus_get(nameRow().getNameEntryObj()));
    stage().settle();
}

TEST_F(EditorLeaveTest, DestroyLeavesWithoutAQuestionAndTakesThePopupDown) {
    openChanged();
    leave(Way::PopOut);
    ASSERT_TRUE(asksToDiscard());
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(asksToDiscard());
}

TEST_F(EditorLeaveTest, TheWindowCanGoWhileTheQuestionIsOpen) {
    openChanged();
    leave(Way::PopOut);
    takeStageDown();
    EXPECT_FALSE(isOpen());
}

} // namespace
