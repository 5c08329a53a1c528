// The editor's way to the tone picker and back.

#include <algorithm>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/dlog.h>

#include "AlarmSnoozeItem.h"
#include "AlarmToneItem.h"
#include "AlarmTypeItem.h"
#include "AlarmVolumeItem.h"
#include "screens/EditorFixture.h"
#include "screens/TestCatalogue.h"
#include "support/AppControlFake.h"
#include "support/ToneFake.h"

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

const std::string BELLS = "/opt/usr/share/settings/Ringtones/Bells.ogg";
const std::string CHIMES = "/opt/usr/share/settings/Ringtones/Chimes.ogg";

template <class RowClass>
RowClass* rowIn(Evas_Object* genlist) {
    for (Elm_Object_Item* item = elm_genlist_first_item_get(genlist); item;
         item = elm_genlist_item_next_get(item)) {
        if (auto* found = dynamic_cast<RowClass*>(
                static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(item))))
            return found;
    }
    return nullptr;
}

class TonePickerTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        tones::add(BELLS);
        tones::add(CHIMES, "Chimes at noon");
    }
    void TearDown() override {
        EXPECT_EQ(applications::unreleased(), expectedUnreleased);
        EditorFixture::TearDown();
    }

    AlarmToneItem* toneRow() { return rowIn<AlarmToneItem>(genlist()); }

    void tapTone() {
        stage().tapRow(toneRow()->getElmObjectItem());
        stage().settle();
    }
    /** Opens an editor and its picker. */
    void openPicker() {
        createAlarm();
        tapTone();
    }
    void chooseType(const std::string& label) {
        stage().tapRow(rowIn<AlarmTypeItem>(genlist())->getElmObjectItem());
        stage().settle();
        stage().tapText(label);
        stage().settle();
    }
    void enterPowerSaving(int mode) {
        device().setSetting("db/setting/psmode", mode);
        ClockEventListener::raise(ClockEventListener::RESUMED);
        stage().settle();
    }

    /** The tone that the row names. */
    std::string shownTone() {
        Elm_Object_Item* const item = toneRow()->getElmObjectItem();
        stage().showRow(item);
        for (const Row& shown : Stage::rows(genlist())) {
            if (shown.item == item && shown.texts.size() == 2)
                return shown.texts.back();
        }
        return "(none)";
    }
    /** Presses Done and reads what was stored. */
    ClockAlarmDbData saved() {
        tapDone();
        const auto alarms = storedAlarms();
        EXPECT_THAT(alarms, SizeIs(1));
        return alarms.empty() ? ClockAlarmDbData{} : alarms.front();
    }

    static std::vector<std::string> requestCalls() {
        std::vector<std::string> calls = device().calls();
        std::erase_if(calls, [](const std::string& call) {
            return !call.starts_with("app_control_") &&
                   !call.starts_with("sound_manager_set_volume_changed_cb");
        });
        return calls;
    }

    bool standsBetweenVolumeAndSnooze() {
        Elm_Object_Item* const item = toneRow()->getElmObjectItem();
        return rowIn<AlarmVolumeItem>(genlist())->getElmObjectItem() ==
                   elm_genlist_item_prev_get(item) &&
               rowIn<AlarmSnoozeItem>(genlist())->getElmObjectItem() ==
                   elm_genlist_item_next_get(item);
    }

    static auto dropped() {
        return std::ranges::count_if(device().log(), [](const DeviceLogLine& line) {
            return line.priority == DLOG_WARN && line.text == "The editor has gone, nothing to do";
        });
    }

    std::size_t expectedUnreleased = 0;
};

const std::vector<std::string> REQUEST = {
    "app_control_create()",
    R"(app_control_set_app_id(app_control 1, "com.vendra.setting.sound-tone-list"))",
    R"(app_control_add_extra_data(app_control 1, "caller", "alarm_setting"))",
    R"(app_control_add_extra_data(app_control 1, "silent", "silent none"))",
    R"(app_control_add_extra_data(app_control 1, "path", "/opt/usr/share/settings/Ringtones"))",
    R"(app_control_add_extra_data(app_control 1, "marked_mode", "/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg"))",
    "app_control_set_launch_mode(app_control 1, APP_CONTROL_LAUNCH_MODE_GROUP)",
    "app_control_send_launch_request(app_control 1, callback)",
    "app_control_destroy(app_control 1)",
    "sound_manager_set_volume_changed_cb()",
};

// Asking.

TEST_F(TonePickerTest, ATapSendsTheRequestStepByStep) {
    createAlarm();
    device().clearCalls();
    tapTone();
    EXPECT_EQ(requestCalls(), REQUEST);
    ASSERT_THAT(applications::requests(), SizeIs(1));
    EXPECT_EQ(applications::requests().front().data, &editor());
    EXPECT_EQ(applications::requests().front().operation, "");
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(TonePickerTest, NothingIsAskedBeforeATap) {
    createAlarm();
    EXPECT_THAT(requestCalls(), IsEmpty());
}

TEST_F(TonePickerTest, ThePickerMarksTheToneOfTheRecord) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.soundPath = BELLS;
    editAlarm(alarm);
    tapTone();
    EXPECT_EQ(applications::requests().back().extras.at("marked_mode"), BELLS);
    applications::answer({{"result", CHIMES}, {"position", "2"}});
    tapTone();
    ASSERT_THAT(applications::requests(), SizeIs(2));
    EXPECT_EQ(applications::requests().back().extras.at("marked_mode"), CHIMES);
}

TEST_F(TonePickerTest, AMissingToneIsNotAskedFor) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.soundPath = "/opt/usr/share/settings/Ringtones/Gone.ogg";
    editAlarm(alarm);
    tapTone();
    expectLog("There is no Tone File !! Set default Tone File(Alarm_Impatient)");
    EXPECT_EQ(applications::requests().back().extras.at("marked_mode"), CLOCK_ALARM_DEFAULT_TONE);
}

TEST_F(TonePickerTest, TheLaunchModeIsNotExamined) {
    device().fail("app_control_set_launch_mode", APP_CONTROL_ERROR_IO);
    createAlarm();
    device().clearCalls();
    tapTone();
    EXPECT_EQ(requestCalls(), REQUEST);
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(TonePickerTest, UnheardVolumeChangesAreLoggedAndThePickerStands) {
    device().fail("sound_manager_set_volume_changed_cb");
    createAlarm();
    device().clearCalls();
    tapTone();
    EXPECT_EQ(requestCalls(), REQUEST);
    EXPECT_THAT(errorLines(), ElementsAre("Failed to register volume change callback"));
    applications::answer({{"result", BELLS}, {"position", "1"}});
    EXPECT_EQ(shownTone(), "Bells");
}

struct FailingStep {
    const char* function;
    int result;
    const char* message;
    std::size_t calls; ///< Steps that are tried, the failing one included.
};

class TonePickerFailure : public TonePickerTest, public testing::WithParamInterface<FailingStep> {};

TEST_P(TonePickerFailure, EndsTheRequestThere) {
    const FailingStep& step = GetParam();
    createAlarm();
    device().clearCalls();
    device().onCall(step.function, [&step] {
        if (requestCalls().size() == step.calls)
            device().failOnce(step.function, step.result);
    });
    tapTone();
    EXPECT_THAT(errorLines(), ElementsAre(step.message));
    EXPECT_EQ(requestCalls(),
              std::vector<std::string>(REQUEST.begin(),
                                       REQUEST.begin() + static_cast<std::ptrdiff_t>(step.calls)));
    EXPECT_THAT(applications::requests(), IsEmpty());
    expectedUnreleased = step.calls == 1 ? 0 : 1;
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
}

INSTANTIATE_TEST_SUITE_P(
    Steps, TonePickerFailure,
    testing::Values(FailingStep{"app_control_create", APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                "app_control_create failed(ret = fffffff4)", 1},
                    FailingStep{"app_control_set_app_id", APP_CONTROL_ERROR_INVALID_PARAMETER,
                                "app_control_set_app_id failed(ret = ffffffea)", 2},
                    FailingStep{"app_control_add_extra_data", APP_CONTROL_ERROR_IO,
                                "app_control_add_extra_data failed(ret = fffffffb)", 3},
                    FailingStep{"app_control_add_extra_data", APP_CONTROL_ERROR_OUT_OF_MEMORY,
                                "app_control_add_extra_data failed(ret = fffffff4)", 4},
                    FailingStep{"app_control_add_extra_data", APP_CONTROL_ERROR_IO,
                                "app_control_add_extra_data failed(ret = fffffffb)", 5},
                    FailingStep{"app_control_add_extra_data", 0x2a,
                                "app_control_add_extra_data failed(ret = 2a)", 6},
                    FailingStep{"app_control_send_launch_request", APP_CONTROL_ERROR_APP_NOT_FOUND,
                                "app_control_send_launch_request failed(ret = fffffffe)", 8}));

TEST_F(TonePickerTest, AFailedRequestMayBeTriedAgain) {
    device().failOnce("app_control_send_launch_request", APP_CONTROL_ERROR_APP_NOT_FOUND);
    openPicker();
    expectLog("app_control_send_launch_request failed(ret = fffffffe)");
    expectedUnreleased = 1;
    tapTone();
    ASSERT_THAT(applications::requests(), SizeIs(1));
    applications::answer({{"result", BELLS}, {"position", "1"}});
    EXPECT_EQ(shownTone(), "Bells");
}

// The answer.

TEST_F(TonePickerTest, TheAnswerIsShownAndSaved) {
    openPicker();
    applications::answer({{"result", BELLS}, {"position", "12"}});
    EXPECT_EQ(shownTone(), "Bells");
    const ClockAlarmDbData alarm = saved();
    EXPECT_EQ(alarm.soundPath, BELLS);
    EXPECT_EQ(alarm.tonePosition, 12);
}

TEST_F(TonePickerTest, TheRowIsDrawnAgainAtOnce) {
    openPicker();
    ASSERT_TRUE(stage().shows("Alarm_Impatient"));
    applications::answer({{"result", CHIMES}, {"position", "1"}});
    stage().settle();
    EXPECT_TRUE(stage().shows("Chimes at noon"));
    EXPECT_FALSE(stage().shows("Alarm_Impatient"));
}

TEST_F(TonePickerTest, OnlyTheTextsOfAnAnswerDecide) {
    openPicker();
    applications::answer({{"result", BELLS}, {"position", "1"}}, APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(shownTone(), "Bells");
    tapTone();
    applications::answer({{"result", CHIMES}, {"position", "2"}}, APP_CONTROL_RESULT_FAILED);
    EXPECT_EQ(shownTone(), "Chimes at noon");
}

TEST_F(TonePickerTest, ACancelledPickerWithoutTextsChangesNothing) {
    openPicker();
    applications::answer({}, APP_CONTROL_RESULT_CANCELED);
    EXPECT_THAT(errorLines(), ElementsAre("app_control_get_extra_data failed(ret = ffffff82)"));
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    tapCancel();
    EXPECT_FALSE(isOpen()) << "nothing to discard";
}

TEST_F(TonePickerTest, AToneThatCannotBeReadChangesNothing) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.tonePosition = 5;
    editAlarm(alarm);
    tapTone();
    applications::failExtra("result", APP_CONTROL_ERROR_IO);
    applications::answer({{"result", BELLS}, {"position", "12"}});
    EXPECT_THAT(errorLines(), ElementsAre("app_control_get_extra_data failed(ret = fffffffb)"));
    EXPECT_THAT(device().callsTo("app_control_get_extra_data"),
                ElementsAre(R"(app_control_get_extra_data(reply, "result"))"));
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    EXPECT_EQ(saved().tonePosition, 5);
}

TEST_F(TonePickerTest, AnAnswerWithoutATextForTheToneChangesNothing) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.tonePosition = 5;
    editAlarm(alarm);
    tapTone();
    applications::answer({{"result", std::nullopt}, {"position", "12"}});
    EXPECT_THAT(errorLines(), ElementsAre("app_control_get_extra_data(result) is NULL !!"));
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    EXPECT_EQ(saved().tonePosition, 5);
}

TEST_F(TonePickerTest, AnEmptyToneBecomesTheDefaultTone) {
    openPicker();
    applications::answer({{"result", ""}, {"position", "12"}});
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    expectLog("There is no Tone File !! Set default Tone File(Alarm_Impatient)");
    EXPECT_EQ(saved().soundPath, CLOCK_ALARM_DEFAULT_TONE);
}

TEST_F(TonePickerTest, APositionThatCannotBeReadStaysAsItWas) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.tonePosition = 5;
    editAlarm(alarm);
    tapTone();
    applications::failExtra("position", APP_CONTROL_ERROR_IO);
    applications::answer({{"result", BELLS}, {"position", "12"}});
    EXPECT_THAT(errorLines(), ElementsAre("Failed to get position(ret = fffffffb)"));
    EXPECT_EQ(shownTone(), "Bells");
    EXPECT_EQ(saved().tonePosition, 5);
}

TEST_F(TonePickerTest, AnAnswerWithoutAPositionHasTheFirst) {
    using Extras = applications::Extras;
    for (const Extras& extras :
         {Extras{{"result", BELLS}, {"position", std::nullopt}}, Extras{{"result", BELLS}}}) {
        ClockAlarmDbData alarm = storedAlarm(7, 0);
        alarm.tonePosition = 5;
        editAlarm(alarm);
        tapTone();
        applications::answer(extras);
        EXPECT_THAT(errorLines(),
                    ElementsAre("Position value from tone select app control is null"));
        EXPECT_EQ(shownTone(), "Bells");
        tapDone();
        EXPECT_EQ(storedAlarms().front().tonePosition, 0);
        EXPECT_EQ(storedAlarms().front().soundPath, BELLS);
    }
}

struct PositionCase {
    const char* text;
    std::int32_t position;
};

class TonePickerPosition : public TonePickerTest,
                           public testing::WithParamInterface<PositionCase> {};

TEST_P(TonePickerPosition, IsReadAsANumber) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.tonePosition = 5;
    editAlarm(alarm);
    tapTone();
    applications::answer({{"result", BELLS}, {"position", GetParam().text}});
    EXPECT_EQ(saved().tonePosition, GetParam().position);
}

INSTANTIATE_TEST_SUITE_P(Texts, TonePickerPosition,
                         testing::Values(PositionCase{"12", 12}, PositionCase{"abc", 0},
                                         PositionCase{"", 0}, PositionCase{"-3", -3},
                                         PositionCase{" 12", 12}, PositionCase{"0x10", 0},
                                         PositionCase{"99999999999999999999",
                                                      std::numeric_limits<std::int32_t>::max()}));

TEST_F(TonePickerTest, AnotherToneIsAChange) {
    openPicker();
    applications::answer({{"result", BELLS}, {"position", "1"}});
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
}

TEST_F(TonePickerTest, TheSameToneIsNoChange) {
    openPicker();
    applications::answer({{"result", CLOCK_ALARM_DEFAULT_TONE}, {"position", "9"}});
    tapCancel();
    EXPECT_FALSE(isOpen());
}

TEST_F(TonePickerTest, ShowingAMissingToneIsAChange) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.soundPath = "/opt/usr/share/settings/Ringtones/Gone.ogg";
    editAlarm(alarm);
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    expectLog("There is no Tone File !! Set default Tone File(Alarm_Impatient)");
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
}

// Answers at odd times.

TEST_F(TonePickerTest, AnAnswerWhileTheAlarmVibratesIsKept) {
    openPicker();
    chooseType("Vibration");
    ASSERT_EQ(toneRow(), nullptr);
    applications::answer({{"result", BELLS}, {"position", "3"}});
    stage().settle();
    EXPECT_EQ(toneRow(), nullptr);
    chooseType("Sound");
    EXPECT_EQ(shownTone(), "Bells");
    EXPECT_EQ(saved().tonePosition, 3);
}

TEST_F(TonePickerTest, AnAnswerWhilePowerIsSavedIsKept) {
    openPicker();
    enterPowerSaving(2);
    ASSERT_EQ(toneRow(), nullptr);
    applications::answer({{"result", BELLS}, {"position", "3"}});
    enterPowerSaving(0);
    ASSERT_NE(toneRow(), nullptr);
    EXPECT_EQ(shownTone(), "Bells");
    enterPowerSaving(2);
    EXPECT_EQ(saved().soundPath, BELLS);
}

TEST_F(TonePickerTest, AnAnswerAfterTheListHasDiedIsHarmless) {
    openPicker();
    evas_object_del(genlist());
    applications::answer({{"result", BELLS}, {"position", "3"}});
    stage().settle();
    EXPECT_FALSE(isOpen());
}

TEST_F(TonePickerTest, AnAnswerAfterTheEditorHasGoneIsDropped) {
    openPicker();
    tapCancel();
    ASSERT_FALSE(isOpen());
    device().clearCalls();
    applications::answer({{"result", BELLS}, {"position", "3"}});
    EXPECT_EQ(dropped(), 1);
    // Nor does one that nobody waits for any more.
    applications::answer({{"result", BELLS}, {"position", "3"}});
    EXPECT_EQ(dropped(), 2);
    EXPECT_THAT(requestCalls(), IsEmpty());
    EXPECT_THAT(storedAlarms(), IsEmpty());
}

TEST_F(TonePickerTest, AnAnswerForAnEarlierEditorDoesNotReachTheNext) {
    openPicker();
    const applications::Request asked = applications::requests().back();
    tapCancel();
    createAlarm();
    // Usually the new one lies where the old one has been.
    applications::answer(asked, {{"result", BELLS}, {"position", "3"}});
    EXPECT_EQ(dropped(), 1);
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    tapTone();
    applications::answer({{"result", CHIMES}, {"position", "4"}});
    EXPECT_EQ(shownTone(), "Chimes at noon");
}

TEST_F(TonePickerTest, APickerThatNeverAnswersDoesNotSpoilTheNextEditor) {
    openPicker();
    tapCancel();
    openPicker();
    applications::answer({{"result", BELLS}, {"position", "3"}});
    EXPECT_EQ(shownTone(), "Bells");
}

TEST_F(TonePickerTest, TheLastOfTwoAnswersCounts) {
    openPicker();
    tapTone();
    ASSERT_THAT(applications::requests(), SizeIs(2));
    applications::answer(applications::requests().front(), {{"result", BELLS}, {"position", "1"}});
    EXPECT_EQ(shownTone(), "Bells");
    applications::answer({{"result", CHIMES}, {"position", "2"}});
    EXPECT_EQ(shownTone(), "Chimes at noon");
    EXPECT_EQ(saved().tonePosition, 2);
}

TEST_F(TonePickerTest, AnAnswerWithoutAnEditorIsLogged) {
    AlarmEditViewController::_onRingToneAppReplyCb(nullptr, nullptr, APP_CONTROL_RESULT_SUCCEEDED,
                                                   nullptr);
    expectLog("Data is NULL !!");
    EXPECT_THAT(requestCalls(), IsEmpty());
}

TEST_F(TonePickerTest, AnAnswerWithoutAReplyIsLogged) {
    openPicker();
    AlarmEditViewController::_onRingToneAppReplyCb(nullptr, nullptr, APP_CONTROL_RESULT_SUCCEEDED,
                                                   &editor());
    EXPECT_THAT(errorLines(), ElementsAre("app_control_get_extra_data failed(ret = ffffffea)"));
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
}

// When there is a tone row at all.

TEST_F(TonePickerTest, AnAlarmWithSoundHasTheRowBelowTheVolume) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    for (const int type : {0, 2}) {
        alarm.type = type;
        editAlarm(alarm);
        ASSERT_NE(toneRow(), nullptr);
        EXPECT_TRUE(standsBetweenVolumeAndSnooze());
    }
    chooseType("Vibration");
    EXPECT_EQ(toneRow(), nullptr);
    chooseType("Sound");
    ASSERT_NE(toneRow(), nullptr);
    EXPECT_TRUE(standsBetweenVolumeAndSnooze());
}

TEST_F(TonePickerTest, UltraPowerSavingTakesTheRowAway) {
    for (const int mode : {0, 1, 3, -2}) {
        device().setSetting("db/setting/psmode", mode);
        createAlarm();
        EXPECT_NE(toneRow(), nullptr) << mode;
    }
    device().setSetting("db/setting/psmode", 2);
    createAlarm();
    EXPECT_EQ(toneRow(), nullptr);
    EXPECT_EQ(elm_genlist_items_count(genlist()), 7U);
}

TEST_F(TonePickerTest, AnUnreadablePowerSavingModeKeepsTheRow) {
    device().setSetting("db/setting/psmode", "two");
    createAlarm();
    EXPECT_NE(toneRow(), nullptr);
    EXPECT_TRUE(device().logged(DLOG_INFO, "Current PS mode value = 0"));
}

TEST_F(TonePickerTest, ComingBackMatchesTheRowToThePowerSavingMode) {
    createAlarm();
    enterPowerSaving(2);
    EXPECT_EQ(toneRow(), nullptr);
    enterPowerSaving(2);
    EXPECT_EQ(toneRow(), nullptr);
    enterPowerSaving(1);
    ASSERT_NE(toneRow(), nullptr);
    EXPECT_TRUE(standsBetweenVolumeAndSnooze());
    const AlarmToneItem* const row = toneRow();
    enterPowerSaving(0);
    EXPECT_EQ(toneRow(), row) << "a row that is there stays";
    EXPECT_EQ(elm_genlist_items_count(genlist()), 8U);
}

TEST_F(TonePickerTest, ChoosingATypeWhilePowerIsSavedBringsNoToneRow) {
    createAlarm();
    device().setSetting("db/setting/psmode", 2);
    chooseType("Vibration");
    chooseType("Sound");
    EXPECT_EQ(toneRow(), nullptr);
    EXPECT_EQ(elm_genlist_items_count(genlist()), 7U);
    enterPowerSaving(0);
    ASSERT_NE(toneRow(), nullptr);
    tapTone();
    EXPECT_THAT(applications::requests(), SizeIs(1));
}

TEST_F(TonePickerTest, AVibratingAlarmGetsNoToneRowByComingBack) {
    ClockAlarmDbData alarm = storedAlarm(7, 0);
    alarm.type = CLOCK_ALARM_TYPE_VIBRATION;
    editAlarm(alarm);
    errorLines();
    enterPowerSaving(2);
    enterPowerSaving(0);
    EXPECT_EQ(toneRow(), nullptr);
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
}

TEST_F(TonePickerTest, AnotherLanguageReachesTheRow) {
    createAlarm();
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    const TestCatalogue german{{"IDS_CLOCK_TMBODY_ALARM_TONE", "Weckton"}};
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    stage().settle();
    EXPECT_TRUE(stage().shows("Weckton"));
    EXPECT_FALSE(stage().shows("Alarm tone"));
}

TEST_F(TonePickerTest, PictureOfTheRow) {
    createAlarm();
    EXPECT_EQ(shownTone(), "Alarm_Impatient");
    stage().screenshot("editor-tone");
}

TEST_F(TonePickerTest, PictureOfALongTitle) {
    tones::add(BELLS, "The bells of the old town hall on a quiet Sunday & <more>");
    openPicker();
    applications::answer({{"result", BELLS}, {"position", "1"}});
    shownTone();
    stage().screenshot("editor-tone-long");
}

} // namespace
