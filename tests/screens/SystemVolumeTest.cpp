// What the alarm editor has to do with the system's volume and power saving, and when its preview
// ends.

#include <string>
#include <variant>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <device/dlog.h>

#include "AlarmIncreaseVolumeItem.h"
#include "AlarmSnoozeItem.h"
#include "AlarmToneItem.h"
#include "screens/VolumeFixture.h"

using testing::IsEmpty;
using testing::SizeIs;

namespace {

constexpr const char* POWER_SAVING = "db/setting/psmode";

/** The number of info lines that read so. */
int infoLines(const std::string& text) {
    int count = 0;
    for (const DeviceLogLine& line : device().log()) {
        if (line.priority == DLOG_INFO && line.text == text)
            ++count;
    }
    return count;
}

void raiseEvent(int event) {
    ClockEventListener::raise(static_cast<ClockEventListener::EventType>(event));
}

class SystemVolumeTest : public VolumeFixture {
protected:
    /** Goes to the tone picker; the editor follows the system's volume from now on. */
    void openTonePicker() {
        editor()._onRingToneViewSelectedCb();
        stage().settle();
        ASSERT_TRUE(soundDevice().tellsVolumes());
    }
};

// At the start.

TEST_F(SystemVolumeTest, TheEditorSetsTheSystemsVolumeToTheAlarms) {
    createAlarm();
    EXPECT_EQ(device().volume(SOUND_TYPE_ALARM), 7);
    EXPECT_EQ(shown(), 7);
}

TEST_F(SystemVolumeTest, AVolumeThatCannotBeSetIsLoggedAndIgnored) {
    device().fail("sound_manager_set_volume", SOUND_MANAGER_ERROR_INTERNAL);
    createAlarm();
    expectLog("Failed to set alarm session volume(volume = 7)");
    EXPECT_EQ(shown(), 7);
}

TEST_F(SystemVolumeTest, ChangesOfTheAlarmAreNotWrittenToTheSystem) {
    openWith(7);
    device().clearCalls();
    stage().key(RAISE);
    hand().drag(slider(), 12);
    EXPECT_THAT(device().callsTo("sound_manager_set_volume"), IsEmpty());
}

// Following the system while the tone picker is open.

TEST_F(SystemVolumeTest, NobodyFollowsTheSystemUntilTheTonePickerOpens) {
    openWith(7);
    EXPECT_FALSE(soundDevice().tellsVolumes());
    openTonePicker();
    raiseEvent(7);
    EXPECT_FALSE(soundDevice().tellsVolumes());
}

TEST_F(SystemVolumeTest, TheAlarmsVolumeFollowsTheSystems) {
    openWith(7);
    openTonePicker();
    for (const unsigned level : {4U, 15U, 0U, 3U}) {
        soundDevice().changeVolume(SOUND_TYPE_ALARM, level);
        EXPECT_EQ(shown(), level);
    }
    EXPECT_EQ(infoLines("Sound manager volume changed [Type=2, Volume=4]"), 1);
    EXPECT_EQ(previewsBegun(), 0U) << "nothing is played";
    EXPECT_EQ(savedLevel(), 3);
}

TEST_F(SystemVolumeTest, TheIconStaysAsItWas) {
    openWith(7);
    openTonePicker();
    device().clearCalls();
    soundDevice().changeVolume(SOUND_TYPE_ALARM, 0);
    EXPECT_EQ(iconGroupOf(slider()), "volume.normal.bg");
    EXPECT_THAT(device().callsTo("app_resource_manager_get"), IsEmpty());
}

TEST_F(SystemVolumeTest, OtherVolumesAreNoneOfItsBusiness) {
    openWith(7);
    openTonePicker();
    soundDevice().changeVolume(SOUND_TYPE_MEDIA, 2);
    soundDevice().changeVolume(SOUND_TYPE_RINGTONE, 2);
    EXPECT_EQ(shown(), 7);
    EXPECT_EQ(infoLines("Sound manager volume changed [Type=4, Volume=2]"), 1);
    EXPECT_EQ(infoLines("Sound manager volume changed [Type=3, Volume=2]"), 1);
    EXPECT_EQ(infoLines("Changed volume type is not alarm. Ignore callback"), 2);
    EXPECT_EQ(savedLevel(), 7);
}

TEST_F(SystemVolumeTest, ALevelAboveTheScaleIsStoredAndLogged) {
    openWith(7);
    openTonePicker();
    soundDevice().changeVolume(SOUND_TYPE_ALARM, 20);
    expectLog("volume in not valid(20), return");
    EXPECT_EQ(shown(), 15) << "as far as the slider goes";
    stage().key(RAISE);
    EXPECT_EQ(savedLevel(), 20);
}

TEST_F(SystemVolumeTest, AVibratingAlarmFollowsWithoutASlider) {
    openWith(7, 1);
    AlarmEditViewController::_soundManagerVolumeChangedCb(SOUND_TYPE_ALARM, 4, &editor());
    EXPECT_THAT(errorLines(), IsEmpty());
    chooseType("Sound");
    EXPECT_EQ(shown(), 4);
}

TEST_F(SystemVolumeTest, ComingBackEndsTheFollowing) {
    openWith(7);
    openTonePicker();
    raiseEvent(7);
    soundDevice().changeVolume(SOUND_TYPE_ALARM, 3);
    EXPECT_EQ(shown(), 7);
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(SystemVolumeTest, ComingBackEndsItEachTimeWhetherItFollowsOrNot) {
    openWith(7);
    raiseEvent(7);
    raiseEvent(7);
    EXPECT_THAT(device().callsTo("sound_manager_unset_volume_changed_cb"), SizeIs(2));
    device().fail("sound_manager_unset_volume_changed_cb", SOUND_MANAGER_ERROR_INTERNAL);
    raiseEvent(7);
    expectLog("Failed to unset sound manager volume change callback");
}

TEST_F(SystemVolumeTest, AVolumeThatCannotBeFollowedIsLogged) {
    openWith(7);
    device().fail("sound_manager_set_volume_changed_cb", SOUND_MANAGER_ERROR_INTERNAL);
    editor()._onRingToneViewSelectedCb();
    expectLog("Failed to register volume change callback");
    EXPECT_FALSE(soundDevice().tellsVolumes());
}

TEST_F(SystemVolumeTest, ANotificationForAnEditorThatHasGoneIsDropped) {
    openWith(7);
    openTonePicker();
    AlarmEditViewController* const gone = &editor();
    tapCancel();
    ASSERT_FALSE(isOpen());
    soundDevice().changeVolume(SOUND_TYPE_ALARM, 3);
    EXPECT_TRUE(device().logged(DLOG_WARN, "The editor has gone, nothing to do"));
    AlarmEditViewController::_soundManagerVolumeChangedCb(SOUND_TYPE_ALARM, 20, gone);
    EXPECT_THAT(errorLines(), IsEmpty());
    ASSERT_EQ(storedAlarms().size(), 1U);
    EXPECT_EQ(storedAlarms().front().volume, 5) << "as it was stored";
}

TEST_F(SystemVolumeTest, ANotificationWithoutAnEditorIsLogged) {
    AlarmEditViewController::_soundManagerVolumeChangedCb(SOUND_TYPE_ALARM, 3, nullptr);
    expectLog("Data is NULL !!");
}

// The end of the preview.

class PreviewTest : public SystemVolumeTest {
protected:
    void SetUp() override {
        SystemVolumeTest::SetUp();
        openWith(7);
        begin();
    }
    void begin() {
        stage().key(RAISE);
        ASSERT_THAT(soundDevice().players(), SizeIs(1));
    }
    static bool plays() { return !soundDevice().players().empty(); }
};

TEST_F(PreviewTest, ScrollingTheListEndsIt) {
    stage().showRow(volumeRow()->getElmObjectItem());
    ASSERT_TRUE(plays()) << "a list that moves by itself does not end it";
    const auto text = stage().findText("Alarm type");
    ASSERT_TRUE(text);
    const Spot spot = text->area.middle();
    stage().drag(spot.x, spot.y, 0, -50);
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, ScrollingAListWithoutVolumeIsHarmless) {
    chooseType("Vibration");
    evas_object_smart_callback_call(genlist(), "scroll,drag,start", nullptr);
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(PreviewTest, MovingTheSliderDoesNotEndIt) {
    hand().drag(slider(), 12);
    EXPECT_TRUE(plays());
    EXPECT_EQ(previewsBegun(), 1U);
}

TEST_F(PreviewTest, LeavingTheSliderForTheNameEndsIt) {
    hand().drag(slider(), 12);
    ASSERT_TRUE(elm_object_focus_get(volumeRow()->getSliderObj()));
    typeName("X");
    EXPECT_FALSE(plays());
    errorLines();
}

TEST_F(PreviewTest, TheSnoozeRowEndsIt) {
    tapRow<AlarmSnoozeItem>();
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, TheIncreaseVolumeRowEndsIt) {
    tapRow<AlarmIncreaseVolumeItem>();
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, GoingToTheBackgroundEndsIt) {
    raiseEvent(6);
    EXPECT_FALSE(plays());
    begin();
    for (const int event : {3, 4, 7})
        raiseEvent(event);
    EXPECT_TRUE(plays()) << "the other events do not";
}

TEST_F(PreviewTest, AskingToLeaveEndsIt) {
    tapCancel();
    EXPECT_TRUE(asksToDiscard());
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, DoneEndsIt) {
    tapDone();
    EXPECT_FALSE(isOpen());
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, ChoosingVibrationEndsIt) {
    chooseType("Vibration");
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, TheEditorsEndEndsIt) {
    editor().destroy();
    stage().settle();
    EXPECT_FALSE(plays());
}

TEST_F(PreviewTest, AnotherTypeWithSoundKeepsItAndChangesTheIcon) {
    for (int i = 0; i < 8; ++i)
        stage().key(LOWER);
    EXPECT_EQ(iconGroupOf(slider()), "volume.mute.bg");
    chooseType("Vibration and sound");
    EXPECT_EQ(iconGroupOf(slider()), "volume.vibrate.bg");
    Evas_Object* const icon = elm_object_part_content_get(slider(), "elm.swallow.icon");
    Evas_Aspect_Control control{};
    int width = 0;
    int height = 0;
    evas_object_size_hint_aspect_get(icon, &control, &width, &height);
    EXPECT_EQ(control, EVAS_ASPECT_CONTROL_VERTICAL);
    EXPECT_EQ(width, height);
    chooseType("Sound");
    EXPECT_EQ(iconGroupOf(slider()), "volume.mute.bg");
}

TEST_F(PreviewTest, WithoutThemeTheIconOfAnotherTypeIsLogged) {
    device().fail("app_resource_manager_get");
    editor()._onTypePopupViewSelectedCb();
    expectLog("path is NULL !!");
    EXPECT_EQ(iconGroupOf(slider()), "");
}

// Power saving.

class PowerSavingTest : public SystemVolumeTest {
protected:
    bool offersTone() { return rowOf<AlarmToneItem>() != nullptr; }
    /** True when the tone row has its place. */
    bool toneFollowsVolume() {
        const auto* tone = rowOf<AlarmToneItem>();
        return tone && elm_genlist_item_prev_get(tone->getElmObjectItem()) ==
                           volumeRow()->getElmObjectItem();
    }
};

TEST_F(PowerSavingTest, OnlyUltraPowerSavingTakesTheToneAway) {
    const std::vector<DeviceSetting> settings = {0, 1, 2, 3, -1, std::string("2")};
    for (const DeviceSetting& setting : settings) {
        device().setSetting(POWER_SAVING, setting);
        openWith(7);
        EXPECT_EQ(offersTone(), setting != DeviceSetting(2));
        if (const int* mode = std::get_if<int>(&setting)) {
            EXPECT_EQ(infoLines("Current PS mode value = " + std::to_string(*mode)), 1);
        }
        errorLines();
    }
}

TEST_F(PowerSavingTest, AnUnknownModeIsNoPowerSaving) {
    openWith(7);
    EXPECT_TRUE(offersTone());
    EXPECT_TRUE(toneFollowsVolume());
    EXPECT_EQ(infoLines("Current PS mode value = 0"), 1);
}

TEST_F(PowerSavingTest, ComingBackBringsTheToneRowInLine) {
    openWith(7);
    for (int i = 0; i < 2; ++i) {
        device().setSetting(POWER_SAVING, 2);
        EXPECT_TRUE(offersTone()) << "only coming back counts";
        raiseEvent(7);
        EXPECT_FALSE(offersTone());
        EXPECT_NE(volumeRow(), nullptr);
        raiseEvent(7);
        EXPECT_FALSE(offersTone());
        device().setSetting(POWER_SAVING, 1);
        raiseEvent(7);
        EXPECT_TRUE(toneFollowsVolume());
        raiseEvent(7);
        EXPECT_TRUE(toneFollowsVolume());
        EXPECT_EQ(elm_genlist_items_count(genlist()), 8U);
    }
    EXPECT_THAT(errorLines(), IsEmpty());
}

TEST_F(PowerSavingTest, AVibratingAlarmGetsNoToneRow) {
    openWith(7, 1);
    device().clearCalls();
    raiseEvent(7);
    EXPECT_FALSE(offersTone());
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    device().setSetting(POWER_SAVING, 2);
    raiseEvent(7);
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    errorLines();
}

TEST_F(PowerSavingTest, ChoosingSoundRespectsIt) {
    openWith(7, 1);
    device().setSetting(POWER_SAVING, 2);
    chooseType("Sound");
    EXPECT_FALSE(offersTone());
    EXPECT_EQ(elm_genlist_items_count(genlist()), 7U);
    chooseType("Vibration");
    EXPECT_EQ(elm_genlist_items_count(genlist()), 5U);
    device().setSetting(POWER_SAVING, 0);
    chooseType("Vibration and sound");
    EXPECT_TRUE(toneFollowsVolume());
    errorLines();
}

} // namespace
