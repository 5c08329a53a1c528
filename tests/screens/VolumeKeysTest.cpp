// The hardware's volume keys in the alarm editor, and the quick panel that borrows them.

#include <functional>
#include <set>
#include <string>
#include <vector>

#include <device_host.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/eext.h>

#include "AlarmTypeItem.h"
#include "screens/VolumeFixture.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

constexpr const char* REGISTERED = "Volume key event handler already registered.";

class VolumeKeysTest : public VolumeFixture {
protected:
    static bool keysTaken() {
        return device_host_key_is_grabbed(RAISE) == 1 && device_host_key_is_grabbed(LOWER) == 1 &&
               soundDevice().grabbedKeys() == std::set<std::string>{RAISE, LOWER};
    }
    static bool keysFree() {
        return device_host_key_is_grabbed(RAISE) == 0 && device_host_key_is_grabbed(LOWER) == 0 &&
               soundDevice().grabbedKeys().empty();
    }

    static Eina_Bool press(AlarmEditViewController* editor, const char* name) {
        Ecore_Event_Key event{};
        event.keyname = name;
        return AlarmEditViewController::_volumeKeyDownCb(editor, ECORE_EVENT_KEY_DOWN, &event);
    }
};

// Taking the keys.

TEST_F(VolumeKeysTest, TheEditorTakesTheKeysOfItsWindow) {
    EXPECT_TRUE(keysFree());
    createAlarm();
    EXPECT_TRUE(keysTaken());
    EXPECT_THAT(device().callsTo("eext_window_key_grab"),
                ElementsAre(R"(eext_window_key_grab(elm_win, "XF86AudioRaiseVolume"))",
                            R"(eext_window_key_grab(elm_win, "XF86AudioLowerVolume"))"));
}

TEST_F(VolumeKeysTest, LeavingGivesTheKeysBack) {
    const std::vector<std::function<void()>> ways = {
        [this] {
            tapCancel();
            tapQuestion("Discard");
        },
        [this] { tapDone(); },
        [this] { editor().destroy(); },
        [this] { evas_object_del(genlist()); },
    };
    for (const auto& leave : ways) {
        createAlarm();
        EXPECT_TRUE(keysTaken());
        LastKeyHandler last;
        stage().keyDown(RAISE);
        EXPECT_EQ(last.pressed, 0);
        leave();
        stage().settle();
        ASSERT_FALSE(isOpen());
        EXPECT_TRUE(keysFree());
        device().clearCalls();
        Stage::advance(1);
        EXPECT_THAT(device().calls(), IsEmpty()) << "the key that is still held does nothing";
        stage().keyUp(RAISE);
        stage().key(RAISE);
        EXPECT_EQ(last.pressed, 1);
        EXPECT_EQ(last.released, 2);
        EXPECT_THAT(device().calls(), IsEmpty());
        errorLines();
    }
}

TEST_F(VolumeKeysTest, TheWindowMayGoWhileAKeyIsHeld) {
    createAlarm();
    stage().keyDown(RAISE);
    takeStageDown();
    EXPECT_FALSE(isOpen());
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
    EXPECT_EQ(device_host_key_is_grabbed(LOWER), 0);
    Stage::advance(1);
}

TEST_F(VolumeKeysTest, TakingThemTwiceIsRefused) {
    openWith(7);
    editor()._registerVolumeKeyGrab();
    expectLog(REGISTERED);
    EXPECT_THAT(device().callsTo("eext_window_key_grab"), IsEmpty());
    stage().key(RAISE);
    EXPECT_EQ(shown(), 8) << "one handler, one step";
}

TEST_F(VolumeKeysTest, GivingThemBackTwiceIsHarmless) {
    openWith(7);
    editor()._unregisterVolumeKeyGrab();
    EXPECT_THAT(device().callsTo("eext_window_key_ungrab"),
                ElementsAre(R"(eext_window_key_ungrab(elm_win, "XF86AudioRaiseVolume"))",
                            R"(eext_window_key_ungrab(elm_win, "XF86AudioLowerVolume"))"));
    editor()._unregisterVolumeKeyGrab();
    EXPECT_TRUE(keysFree());
    EXPECT_THAT(errorLines(), IsEmpty());
}

// Steps.

TEST_F(VolumeKeysTest, EachPressIsOneStep) {
    openWith(7);
    stage().key(RAISE);
    EXPECT_EQ(shown(), 8);
    stage().key(RAISE);
    EXPECT_EQ(shown(), 9);
    stage().key(LOWER);
    EXPECT_EQ(shown(), 8);
    EXPECT_EQ(previewsBegun(), 1U);
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
    EXPECT_EQ(savedLevel(), 8);
}

TEST_F(VolumeKeysTest, TheStepsEndWithTheScale) {
    openWith(14);
    for (int i = 0; i < 3; ++i)
        stage().key(RAISE);
    EXPECT_EQ(shown(), 15);
    for (int i = 0; i < 20; ++i)
        stage().key(LOWER);
    EXPECT_EQ(shown(), 0);
    EXPECT_EQ(iconGroupOf(slider()), "volume.mute.bg");
    EXPECT_EQ(savedLevel(), 0);
}

TEST_F(VolumeKeysTest, TheKeysWorkWhileTheRowIsOutOfView) {
    openWith(7);
    stage().showRow(nameRow().getElmObjectItem());
    stage().key(RAISE);
    EXPECT_EQ(shown(), 8);
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
    EXPECT_EQ(savedLevel(), 8);
}

TEST_F(VolumeKeysTest, TheKeysWorkBeforeTheRowWasScrolledTo) {
    createAlarm();
    stage().key(RAISE);
    EXPECT_EQ(shown(), 8);
    EXPECT_THAT(soundDevice().players(), SizeIs(1));
}

TEST_F(VolumeKeysTest, AKeyPressIsAChangeOfTheAlarm) {
    openWith(7);
    stage().key(RAISE);
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
    errorLines();
}

// Holding a key.

TEST_F(VolumeKeysTest, AHeldKeyStepsEveryFifthOfASecond) {
    openWith(7);
    stage().keyDown(RAISE);
    EXPECT_EQ(shown(), 8) << "at once";
    Stage::advance(0.17);
    EXPECT_EQ(shown(), 8);
    Stage::advance(0.05);
    EXPECT_EQ(shown(), 9);
    Stage::advance(0.6);
    EXPECT_EQ(shown(), 12);
    stage().keyUp(RAISE);
    Stage::advance(1);
    EXPECT_EQ(shown(), 12);
}

TEST_F(VolumeKeysTest, AHeldLowerKeyStepsDown) {
    openWith(7);
    stage().keyDown(LOWER);
    Stage::advance(0.42);
    EXPECT_EQ(shown(), 4);
    stage().keyUp(LOWER);
    Stage::advance(1);
    EXPECT_EQ(shown(), 4);
}

TEST_F(VolumeKeysTest, HoldingTheRaiseKeyFromThirteenEndsAtFifteen) {
    openWith(13);
    stage().keyDown(RAISE);
    EXPECT_EQ(shown(), 14);
    Stage::advance(0.22);
    EXPECT_EQ(shown(), 15);
    device().clearCalls();
    Stage::advance(2);
    EXPECT_EQ(shown(), 15);
    EXPECT_THAT(device().callsTo("sound_player_set_level"), IsEmpty());
    // The timer has gone on: it takes up what another key leaves.
    stage().keyDown(LOWER);
    EXPECT_EQ(shown(), 14);
    Stage::advance(0.22);
    EXPECT_EQ(shown(), 15);
    stage().keyUp(RAISE);
    Stage::advance(1);
    stage().key(LOWER);
    Stage::advance(1);
    EXPECT_EQ(shown(), 14);
}

TEST_F(VolumeKeysTest, RepeatedPressesOfAHeldKeyEachAddAStepButNoTimer) {
    openWith(2);
    for (int i = 0; i < 4; ++i)
        stage().keyDown(RAISE);
    EXPECT_EQ(shown(), 6);
    Stage::advance(0.22);
    EXPECT_EQ(shown(), 7) << "one timer only";
    stage().keyUp(RAISE);
}

TEST_F(VolumeKeysTest, TheOtherKeyStepsButDoesNotTurnTheRepetition) {
    openWith(7);
    stage().keyDown(RAISE);
    EXPECT_EQ(shown(), 8);
    stage().keyDown(LOWER);
    EXPECT_EQ(shown(), 7);
    Stage::advance(0.4);
    EXPECT_EQ(shown(), 9);
    stage().keyUp(LOWER);
    Stage::advance(1);
    EXPECT_EQ(shown(), 9) << "the release of either key ends it";
}

TEST_F(VolumeKeysTest, TheReleaseOfAnyKeyEndsTheRepetition) {
    openWith(7);
    stage().keyDown(RAISE);
    stage().keyUp("a");
    Stage::advance(1);
    EXPECT_EQ(shown(), 8);
}

TEST_F(VolumeKeysTest, AnotherKeyBeginsNoRepetition) {
    openWith(7);
    stage().keyDown("Up");
    Stage::advance(1);
    EXPECT_EQ(shown(), 7);
    stage().keyUp("Up");
}

// An alarm that vibrates.

TEST_F(VolumeKeysTest, AVibratingAlarmSwallowsTheKeys) {
    openWith(7, 1);
    LastKeyHandler last;
    stage().keyDown(RAISE);
    Stage::advance(1);
    stage().keyUp(RAISE);
    stage().key(LOWER);
    EXPECT_EQ(last.pressed, 0);
    EXPECT_EQ(last.released, 0);
    EXPECT_THAT(device().callsTo("sound_player_create"), IsEmpty());
    EXPECT_EQ(savedLevel(), 7);
    errorLines();
}

TEST_F(VolumeKeysTest, ChoosingVibrationEndsTheRepetitionUntilTheKeyIsReleased) {
    openWith(2);
    tapRow<AlarmTypeItem>();
    stage().keyDown(RAISE);
    stage().tapText("Vibration");
    stage().settle();
    const int calls = static_cast<int>(device().calls().size());
    Stage::advance(1);
    EXPECT_EQ(static_cast<int>(device().calls().size()), calls);
    chooseType("Sound");
    const double level = shown();
    stage().keyDown(RAISE);
    EXPECT_EQ(shown(), level + 1) << "the press itself counts";
    Stage::advance(1);
    EXPECT_EQ(shown(), level + 1) << "but the key was never released";
    stage().keyUp(RAISE);
    stage().keyDown(RAISE);
    Stage::advance(0.22);
    EXPECT_EQ(shown(), level + 3);
    stage().keyUp(RAISE);
}

TEST_F(VolumeKeysTest, TheQuickPanelForgetsARepetitionThatVibrationEnded) {
    openWith(2);
    tapRow<AlarmTypeItem>();
    stage().keyDown(RAISE);
    stage().tapText("Vibration");
    stage().settle();
    quickPanel(true);
    stage().keyUp(RAISE);
    quickPanel(false);
    chooseType("Sound");
    const double level = shown();
    stage().keyDown(RAISE);
    Stage::advance(0.22);
    EXPECT_EQ(shown(), level + 2);
    stage().keyUp(RAISE);
    errorLines();
}

// Other keys.

TEST_F(VolumeKeysTest, NoLaterHandlerSeesAnyKey) {
    openWith(7);
    LastKeyHandler last;
    for (const char* key : {RAISE, LOWER, "a", "Return"})
        stage().key(key);
    EXPECT_EQ(last.pressed, 0);
    EXPECT_EQ(last.released, 0);
    quickPanel(true);
    stage().key("a");
    EXPECT_EQ(last.pressed, 1);
    EXPECT_EQ(last.released, 1);
}

TEST_F(VolumeKeysTest, ANameCanStillBeTyped) {
    openWith(7);
    typeName("X");
    quickPanel(true);
    quickPanel(false);
    stage().type("Y");
    stage().settle();
    EXPECT_EQ(nameRow().getTypedName(), "OldXY");
    errorLines();
}

TEST_F(VolumeKeysTest, TheBackKeyStillLeaves) {
    for (const bool afterPanel : {false, true}) {
        createAlarm();
        if (afterPanel) {
            quickPanel(true);
            quickPanel(false);
        }
        EXPECT_TRUE(keysTaken());
        stage().backKey();
        stage().settle();
        EXPECT_FALSE(isOpen()) << afterPanel;
    }
}

// Callbacks alone.

TEST_F(VolumeKeysTest, WithoutAnEditorTheCallbacksLog) {
    EXPECT_EQ(press(nullptr, RAISE), ECORE_CALLBACK_DONE);
    expectLog("Data is null");
    EXPECT_EQ(AlarmEditViewController::_volumeKeyUpCb(nullptr, ECORE_EVENT_KEY_UP, nullptr),
              ECORE_CALLBACK_DONE);
    expectLog("Data is null");
    EXPECT_EQ(AlarmEditViewController::_volumeIncreaseLongPressTimerCb(nullptr),
              ECORE_CALLBACK_CANCEL);
    expectLog("Data is NULL !!");
    EXPECT_EQ(AlarmEditViewController::_volumeDecreaseLongPressTimerCb(nullptr),
              ECORE_CALLBACK_CANCEL);
    expectLog("Data is NULL !!");
    EXPECT_EQ(AlarmEditViewController::_quickPanelStateChangedCb(nullptr, 0, nullptr),
              ECORE_CALLBACK_PASS_ON);
    expectLog("Data is NULL !!");
}

TEST_F(VolumeKeysTest, WithoutAnEventOrAKeyNameTheCallbacksLog) {
    openWith(7);
    EXPECT_EQ(AlarmEditViewController::_volumeKeyDownCb(&editor(), ECORE_EVENT_KEY_DOWN, nullptr),
              ECORE_CALLBACK_DONE);
    expectLog("Event is null");
    EXPECT_EQ(press(&editor(), nullptr), ECORE_CALLBACK_DONE);
    expectLog("Key Event is null");
    EXPECT_EQ(press(&editor(), "a"), ECORE_CALLBACK_DONE);
    EXPECT_EQ(AlarmEditViewController::_quickPanelStateChangedCb(&editor(), 0, nullptr),
              ECORE_CALLBACK_PASS_ON);
    expectLog("Data is NULL !!");
    EXPECT_EQ(shown(), 7);
}

TEST_F(VolumeKeysTest, AVibratingAlarmDoesNotLookAtTheEvent) {
    openWith(7, 1);
    EXPECT_EQ(AlarmEditViewController::_volumeKeyDownCb(&editor(), ECORE_EVENT_KEY_DOWN, nullptr),
              ECORE_CALLBACK_DONE);
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(VolumeKeysTest, TheTimersSayWhetherTheyGoOn) {
    openWith(7);
    EXPECT_EQ(AlarmEditViewController::_volumeIncreaseLongPressTimerCb(&editor()),
              ECORE_CALLBACK_RENEW);
    EXPECT_EQ(shown(), 8);
    EXPECT_EQ(AlarmEditViewController::_volumeDecreaseLongPressTimerCb(&editor()),
              ECORE_CALLBACK_RENEW);
    EXPECT_EQ(shown(), 7);
    chooseType("Vibration");
    EXPECT_EQ(AlarmEditViewController::_volumeIncreaseLongPressTimerCb(&editor()),
              ECORE_CALLBACK_CANCEL);
    EXPECT_EQ(AlarmEditViewController::_volumeDecreaseLongPressTimerCb(&editor()),
              ECORE_CALLBACK_CANCEL);
}

// The quick panel.

class QuickPanelTest : public VolumeKeysTest {};

TEST_F(QuickPanelTest, OpeningItGivesTheKeysBackAndClosingItTakesThem) {
    openWith(7);
    for (int i = 0; i < 3; ++i) {
        quickPanel(true);
        EXPECT_TRUE(keysFree());
        stage().key(RAISE);
        quickPanel(false);
        EXPECT_TRUE(keysTaken());
    }
    EXPECT_THAT(errorLines(), IsEmpty());
    EXPECT_EQ(previewsBegun(), 0U);
}

TEST_F(QuickPanelTest, ClosingItTwiceLeavesTheKeysAsTheyAre) {
    openWith(7);
    for (const bool open : {true, false, true, false})
        quickPanel(open);
    EXPECT_THAT(errorLines(), IsEmpty());
    quickPanel(false);
    expectLog(REGISTERED);
    EXPECT_TRUE(keysTaken());
    device().setVolume(SOUND_TYPE_ALARM, 4);
    quickPanel(false);
    expectLog(REGISTERED);
    EXPECT_EQ(shown(), 4) << "the level is read all the same";
    stage().key(RAISE);
    EXPECT_EQ(shown(), 5);
}

TEST_F(QuickPanelTest, OpeningItTwiceIsHarmless) {
    openWith(7);
    quickPanel(true);
    quickPanel(true);
    EXPECT_TRUE(keysFree());
    EXPECT_THAT(errorLines(), IsEmpty());
    quickPanel(false);
    EXPECT_TRUE(keysTaken());
}

TEST_F(QuickPanelTest, OpeningItEndsTheRepetition) {
    openWith(2);
    stage().keyDown(RAISE);
    quickPanel(true);
    Stage::advance(1);
    EXPECT_EQ(shown(), 3);
}

TEST_F(QuickPanelTest, ClosingItReadsTheLevelThatWasSetThere) {
    openWith(7);
    quickPanel(true);
    device().setVolume(SOUND_TYPE_ALARM, 3);
    EXPECT_EQ(shown(), 7);
    device().clearCalls();
    quickPanel(false);
    EXPECT_EQ(shown(), 3);
    EXPECT_THAT(device().callsTo("sound_manager_get_volume"),
                ElementsAre("sound_manager_get_volume(SOUND_TYPE_ALARM)"));
    EXPECT_EQ(previewsBegun(), 0U);
    EXPECT_EQ(savedLevel(), 3);
}

TEST_F(QuickPanelTest, TheIconKeepsShowingTheLevelBefore) {
    openWith(7);
    device().setVolume(SOUND_TYPE_ALARM, 0);
    quickPanel(false);
    expectLog(REGISTERED);
    EXPECT_EQ(shown(), 0);
    EXPECT_EQ(iconGroupOf(slider()), "volume.normal.bg");
}

TEST_F(QuickPanelTest, ALevelThatCannotBeReadChangesNothing) {
    openWith(7);
    quickPanel(true);
    device().fail("sound_manager_get_volume", SOUND_MANAGER_ERROR_INTERNAL);
    quickPanel(false);
    expectLog("Failed to get recovery alarm volume");
    EXPECT_EQ(shown(), 7);
    EXPECT_TRUE(keysTaken());
    device().succeed("sound_manager_get_volume");
    EXPECT_EQ(savedLevel(), 7);
}

TEST_F(QuickPanelTest, AVibratingAlarmReadsNoLevel) {
    openWith(7, 1);
    quickPanel(true);
    EXPECT_TRUE(keysFree());
    quickPanel(false);
    EXPECT_TRUE(keysTaken());
    EXPECT_THAT(device().callsTo("sound_manager_get_volume"), IsEmpty());
    errorLines();
}

TEST_F(QuickPanelTest, OtherMessagesAreNotForTheEditor) {
    openWith(7);
    device().setVolume(SOUND_TYPE_ALARM, 3);
    clientMessage(4711, ECORE_X_ATOM_E_ILLUME_QUICKPANEL_ON);
    EXPECT_TRUE(keysTaken());
    clientMessage(4711, ECORE_X_ATOM_E_ILLUME_QUICKPANEL_OFF);
    EXPECT_EQ(shown(), 7);
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(QuickPanelTest, AnyOtherStateCountsAsOpen) {
    openWith(7);
    clientMessage(ECORE_X_ATOM_E_ILLUME_QUICKPANEL_STATE, 4711);
    EXPECT_TRUE(keysFree());
}

TEST_F(QuickPanelTest, EverybodyElseHearsOfItToo) {
    openWith(7);
    int heard = 0;
    Ecore_Event_Handler* other = ecore_event_handler_add(
        ECORE_X_EVENT_CLIENT_MESSAGE,
        [](void* data, int, void*) -> Eina_Bool {
            ++*static_cast<int*>(data);
            return ECORE_CALLBACK_PASS_ON;
        },
        &heard);
    quickPanel(true);
    quickPanel(false);
    clientMessage(4711, 1);
    EXPECT_EQ(heard, 3);
    ecore_event_handler_del(other);
}

TEST_F(QuickPanelTest, ItMayOpenAndCloseAfterTheEditorHasGone) {
    openWith(7);
    quickPanel(true);
    tapCancel();
    ASSERT_FALSE(isOpen());
    device().clearCalls();
    quickPanel(true);
    quickPanel(false);
    EXPECT_THAT(device().calls(), IsEmpty());
    EXPECT_TRUE(keysFree());
}

TEST_F(QuickPanelTest, TheEditorMayGoWhileItIsOpen) {
    openWith(7);
    quickPanel(true);
    editor().destroy();
    stage().settle();
    EXPECT_TRUE(keysFree());
    EXPECT_THAT(errorLines(), IsEmpty());
}

// What the desktop makes of it.

TEST_F(VolumeKeysTest, TheBackKeyComesBeforeAHandlerThatKeepsEveryKey) {
    const auto keep = [](void*, int, void*) -> Eina_Bool {
        return ECORE_CALLBACK_DONE;
    };
    // Before there is anything that listens to the back key.
    Ecore_Event_Handler* down = ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, keep, nullptr);
    Ecore_Event_Handler* up = ecore_event_handler_add(ECORE_EVENT_KEY_UP, keep, nullptr);
    createAlarm();
    stage().backKey();
    stage().settle();
    EXPECT_FALSE(isOpen());
    ecore_event_handler_del(down);
    ecore_event_handler_del(up);
}

class WindowKeyTest : public ScreenTest {};

TEST_F(WindowKeyTest, AKeyIsTakenUntilItIsGivenBack) {
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
    EXPECT_TRUE(eext_window_key_grab(stage().window(), RAISE));
    EXPECT_TRUE(eext_window_key_grab(stage().window(), RAISE)) << "it has it";
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 1);
    EXPECT_EQ(device_host_key_is_grabbed(LOWER), 0);
    EXPECT_FALSE(eext_window_key_ungrab(stage().window(), LOWER));
    EXPECT_TRUE(eext_window_key_ungrab(stage().window(), RAISE));
    EXPECT_FALSE(eext_window_key_ungrab(stage().window(), RAISE)) << "it was grabbed once";
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
}

TEST_F(WindowKeyTest, AKeyIsTakenWhileAnyWindowHasIt) {
    Evas_Object* other = elm_win_util_standard_add("other", "other");
    EXPECT_TRUE(eext_window_key_grab(stage().window(), RAISE));
    EXPECT_TRUE(eext_window_key_grab(other, RAISE));
    EXPECT_TRUE(eext_window_key_ungrab(stage().window(), RAISE));
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 1);
    evas_object_del(other);
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
}

TEST_F(WindowKeyTest, TheKeysOfAWindowGoWithIt) {
    Evas_Object* other = elm_win_util_standard_add("other", "other");
    eext_window_key_grab(other, RAISE);
    eext_window_key_grab(other, LOWER);
    eext_window_key_ungrab(other, RAISE);
    evas_object_del(other);
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
    EXPECT_EQ(device_host_key_is_grabbed(LOWER), 0);
}

TEST_F(WindowKeyTest, WithoutAWindowOrAKeyNothingIsTaken) {
    constexpr const char* ERROR = "A window and the name of a key are needed";
    Evas_Object* rectangle = evas_object_rectangle_add(stage().canvas());
    for (Evas_Object* object : {static_cast<Evas_Object*>(nullptr), rectangle}) {
        EXPECT_FALSE(eext_window_key_grab(object, RAISE));
        expectLog(ERROR);
    }
    EXPECT_FALSE(eext_window_key_grab(stage().window(), nullptr));
    expectLog(ERROR);
    EXPECT_FALSE(eext_window_key_grab(stage().window(), ""));
    expectLog(ERROR);
    EXPECT_FALSE(eext_window_key_ungrab(nullptr, RAISE));
    expectLog(ERROR);
    EXPECT_FALSE(eext_window_key_ungrab(stage().window(), nullptr));
    expectLog(ERROR);
    EXPECT_EQ(device_host_key_is_grabbed(RAISE), 0);
    EXPECT_EQ(device_host_key_is_grabbed(nullptr), 0);
}

} // namespace
