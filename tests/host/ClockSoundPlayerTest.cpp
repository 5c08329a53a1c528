#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "SoundRecording.h"
#include "clock/ClockAlarmDbData.h"
#include "clock/ClockSoundPlayer.h"

using testing::AllOf;
using testing::HasSubstr;

namespace {

class ClockSoundPlayerTest : public testing::Test {
protected:
    ClockSoundPlayerTest() {
        // Told from each other by their lengths.
        writeWave(tone, evenTone(0.06));
        writeWave(fallback, evenTone(0.10));
    }

    void addDefaultTone() const {
        // What it holds counts, not its name.
        writeWave(host.resourceDir() + "/tones/Alarm_Impatient.ogg", evenTone(0.14));
    }
    std::string begin(const std::string& path, const std::string& fallbackPath, int volume = 15,
                      bool loop = false) {
        return standardErrorOf([&] {
            player.initialize(path, fallbackPath, CLOCK_SOUND_TYPE_PREVIEW, volume, 0, loop, 0);
        });
    }
    /** The length of what is heard until it ends. */
    double heard() const {
        recording.waitFor(0.05);
        iterateFor(0.2);
        return recording.seconds();
    }

    DeviceHost host;
    TemporaryFolder folder;
    const std::string tone = folder / "tone.wav";
    const std::string fallback = folder / "fallback.wav";
    const std::string missing = folder / "missing.wav";
    SoundRecording recording{folder / "recording"};
    ClockSoundPlayer player;
};

} // namespace

TEST_F(ClockSoundPlayerTest, IsHeardWhenItIsInitialized) {
    begin(tone, fallback);
    EXPECT_NEAR(heard(), 0.06, 0.001);
    EXPECT_NEAR(loudness(recording.samples()), loudness(evenTone(0.06)), 0.001);
}

TEST_F(ClockSoundPlayerTest, PlaysTheFallbackWhenThereIsNoTone) {
    EXPECT_THAT(begin(missing, fallback), AllOf(HasSubstr("clock-common"), HasSubstr(missing)));
    EXPECT_NEAR(heard(), 0.10, 0.001);
}

TEST_F(ClockSoundPlayerTest, PlaysTheDefaultToneWhenThereIsNoFallbackEither) {
    addDefaultTone();
    begin(missing, missing);
    EXPECT_NEAR(heard(), 0.14, 0.001);
}

TEST_F(ClockSoundPlayerTest, PlaysTheDefaultToneWhenThereAreNoPathsAtAll) {
    addDefaultTone();
    begin("", "");
    EXPECT_NEAR(heard(), 0.14, 0.001);
}

TEST_F(ClockSoundPlayerTest, StaysSilentAndLogsWhenThereIsNoToneAtAll) {
    EXPECT_THAT(begin(missing, missing), HasSubstr("There is no tone to play"));
    standardErrorOf([&] {
        player.setVolume(3);
        player.start();
        player.stop();
        iterateFor(0.1);
    });
    EXPECT_EQ(recording.seconds(), 0.0);
}

TEST_F(ClockSoundPlayerTest, LogsWhatItPlaysAndWhatFor) {
    const std::string log = standardErrorOf(
        [&] { player.initialize(tone, tone, CLOCK_SOUND_TYPE_RINGING, 9, 42, true, 5); });
    EXPECT_THAT(log, AllOf(HasSubstr(tone), HasSubstr("alarm = 42"), HasSubstr("position = 5"),
                           HasSubstr("volume = 9")));
}

TEST_F(ClockSoundPlayerTest, RepeatsTheToneOnlyWhenAskedTo) {
    begin(tone, tone, 15, true);
    EXPECT_TRUE(recording.waitFor(0.2));
}

TEST_F(ClockSoundPlayerTest, TakesLevelsFromBeyondTheScaleAsItsEnds) {
    begin(tone, tone, -3, true);
    ASSERT_TRUE(recording.waitFor(0.1));
    EXPECT_EQ(loudness(recording.samples()), 0.0);
    player.setVolume(99);
    const double before = recording.seconds();
    ASSERT_TRUE(recording.waitFor(before + 0.2));
    EXPECT_NEAR(loudness(recording.samples(), before + 0.1), loudness(evenTone(0.06)), 0.02);
}

TEST_F(ClockSoundPlayerTest, StopsAndStartsAgain) {
    begin(tone, tone, 15, true);
    ASSERT_TRUE(recording.waitFor(0.05));
    player.stop();
    const double before = recording.seconds();
    iterateFor(0.1);
    EXPECT_EQ(recording.seconds(), before);
    player.start();
    EXPECT_TRUE(recording.waitFor(before + 0.05));
}

TEST_F(ClockSoundPlayerTest, StopsWhenItIsDestroyed) {
    double before = 0.0;
    {
        ClockSoundPlayer shortLived;
        standardErrorOf(
            [&] { shortLived.initialize(tone, tone, CLOCK_SOUND_TYPE_PREVIEW, 15, 0, true, 0); });
        ASSERT_TRUE(recording.waitFor(0.05));
    }
    before = recording.seconds();
    iterateFor(0.1);
    EXPECT_EQ(recording.seconds(), before);
}

TEST_F(ClockSoundPlayerTest, DoesNothingBeforeItIsInitialized) {
    player.setVolume(3);
    player.start();
    player.stop();
    iterateFor(0.05);
    EXPECT_EQ(recording.seconds(), 0.0);
}

TEST_F(ClockSoundPlayerTest, InitializedAgainItPlaysTheNewToneAlone) {
    begin(tone, tone, 15, true);
    ASSERT_TRUE(recording.waitFor(0.05));
    begin(fallback, fallback);
    const double before = recording.seconds();
    EXPECT_NEAR(heard() - before, 0.10, 0.02);
}
