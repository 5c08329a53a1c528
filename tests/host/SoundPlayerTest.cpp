#include <chrono>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <string>

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include "Helper.h"
#include "SoundRecording.h"
#include "device/sound_player.h"

namespace fs = std::filesystem;

using testing::AllOf;
using testing::HasSubstr;
using testing::Not;

namespace {

constexpr const char* BUILT_TONES = CLOCK_RESOURCE_DIR "/tones";
// Longer than a sound card that works needs, shorter than a person notices.
constexpr double AT_ONCE = 0.3;

/** A player that ends with the test. */
class Player {
public:
    Player() { EXPECT_EQ(sound_player_create(&_player), SOUND_PLAYER_ERROR_NONE); }
    ~Player() { sound_player_destroy(_player); }
    Player(const Player&) = delete;
    Player& operator=(const Player&) = delete;

    operator sound_player_h() const { return _player; }

private:
    sound_player_h _player = nullptr;
};

double secondsOf(const std::function<void()>& action) {
    const auto before = std::chrono::steady_clock::now();
    action();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - before).count();
}

class SoundPlayer : public testing::Test {
protected:
    std::string tone(double seconds) const {
        writeWave(folder / "tone.wav", evenTone(seconds));
        return folder / "tone.wav";
    }
    /** A tone with a silence after it: each time that it begins can be counted. */
    std::string knock(double seconds) const {
        Samples samples = evenTone(0.04);
        const Samples rest = silence(seconds - 0.04);
        samples.insert(samples.end(), rest.begin(), rest.end());
        writeWave(folder / "knock.wav", samples);
        return folder / "knock.wav";
    }
    static void choose(sound_player_h player, const std::string& path) {
        ASSERT_EQ(sound_player_set_path(player, path.c_str()), SOUND_PLAYER_ERROR_NONE);
    }
    /** What is logged while a file is played that cannot be. */
    static std::string logOfPlaying(const std::string& path) {
        const Player player;
        return standardErrorUntil("cannot be played", [&] {
            EXPECT_EQ(sound_player_set_path(player, path.c_str()), SOUND_PLAYER_ERROR_NONE);
            EXPECT_EQ(sound_player_start(player), SOUND_PLAYER_ERROR_NONE);
        });
    }

    TemporaryFolder folder;
    DeviceHost host;
};

class RecordedSoundPlayer : public SoundPlayer {
protected:
    SoundRecording recording{folder / "recording"};
    Player player;
};

} // namespace

TEST_F(RecordedSoundPlayer, PlaysAFileAsItWasRecorded) {
    choose(player, tone(0.15));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.15));
    EXPECT_EQ(recording.samples(), evenTone(0.15));
}

TEST_F(RecordedSoundPlayer, IsLouderAtEachHigherLevelAndSilentAtZero) {
    choose(player, tone(0.06));
    const double asRecorded = loudness(evenTone(0.06));
    for (const int level : {0, 4, 8, 12, 15}) {
        const double before = recording.seconds();
        sound_player_set_level(player, level);
        sound_player_start(player);
        ASSERT_TRUE(recording.waitFor(before + 0.06));
        sound_player_stop(player);
        EXPECT_NEAR(loudness(recording.samples(), before), asRecorded * std::pow(level / 15.0, 3),
                    0.0005)
            << "level " << level;
    }
}

TEST_F(RecordedSoundPlayer, ANewLevelIsHeardAtOnceAndWithoutAGap) {
    choose(player, tone(0.5));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.1));
    const double loudPart = recording.seconds();
    sound_player_set_level(player, 8);
    ASSERT_TRUE(recording.waitFor(loudPart + 0.2));
    const Samples samples = recording.samples();
    const double asRecorded = loudness(evenTone(0.1));
    EXPECT_NEAR(loudness(samples, 0.0, loudPart), asRecorded, 0.01);
    EXPECT_NEAR(loudness(samples, loudPart + 0.1, loudPart + 0.2),
                asRecorded * std::pow(8 / 15.0, 3), 0.005);
    EXPECT_EQ(beginnings(samples), 1);
}

TEST_F(RecordedSoundPlayer, TheLevelIsAlsoTakenBeforeAFileIsChosen) {
    sound_player_set_level(player, 0);
    choose(player, tone(0.05));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.05));
    EXPECT_EQ(loudness(recording.samples()), 0.0);
}

TEST_F(RecordedSoundPlayer, StartingWhatPlaysLetsItGoOn) {
    choose(player, knock(0.3));
    sound_player_start(player);
    for (const double moment : {0.05, 0.1, 0.2}) {
        ASSERT_TRUE(recording.waitFor(moment));
        sound_player_start(player);
    }
    ASSERT_TRUE(recording.waitFor(0.3));
    iterateFor(0.05);
    EXPECT_NEAR(recording.seconds(), 0.3, 0.001);
    EXPECT_EQ(beginnings(recording.samples()), 1);
}

TEST_F(RecordedSoundPlayer, StartingWhatHasEndedPlaysFromTheBeginning) {
    choose(player, knock(0.1));
    for (int times = 1; times <= 3; ++times) {
        sound_player_start(player);
        ASSERT_TRUE(recording.waitFor(0.1 * times - 0.001));
        iterateFor(0.05);
        EXPECT_EQ(beginnings(recording.samples()), times);
    }
}

TEST_F(RecordedSoundPlayer, StartingWhatWasStoppedPlaysFromTheBeginning) {
    choose(player, knock(0.5));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.1));
    sound_player_stop(player);
    const double before = recording.seconds();
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(before + 0.1));
    EXPECT_EQ(beginnings(recording.samples()), 2);
}

TEST_F(RecordedSoundPlayer, ALoopBeginsAgainUntilItIsEnded) {
    choose(player, knock(0.1));
    sound_player_set_loop(player, 1);
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.32));
    EXPECT_EQ(beginnings(recording.samples()), 4);
    sound_player_set_loop(player, 0);
    iterateFor(0.2);
    EXPECT_NEAR(recording.seconds(), 0.4, 0.001);
}

TEST_F(RecordedSoundPlayer, ASoundOfEachFormatIsRepeated) {
    for (const char* format : {"wav", "flac", "mp3", "ogg"}) {
        const std::string file = folder / ("short." + std::string(format));
        ASSERT_EQ(std::system(("sox -n -r 44100 -c 1 " + file + " synth 0.1 sine 441").c_str()), 0);
        choose(player, file);
        sound_player_set_loop(player, 1);
        const double before = recording.seconds();
        sound_player_start(player);
        ASSERT_TRUE(recording.waitFor(before + 0.3)) << format;
        sound_player_stop(player);
    }
}

TEST_F(RecordedSoundPlayer, NothingIsHeardAfterStop) {
    choose(player, tone(0.5));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.05));
    sound_player_stop(player);
    const double heard = recording.seconds();
    iterateFor(0.15);
    EXPECT_EQ(recording.seconds(), heard);
}

TEST_F(RecordedSoundPlayer, NothingIsHeardOfAStartThatIsStoppedAtOnce) {
    choose(player, tone(0.5));
    sound_player_start(player);
    sound_player_stop(player);
    const double heard = recording.seconds();
    iterateFor(0.15);
    EXPECT_EQ(recording.seconds(), heard);
}

TEST_F(RecordedSoundPlayer, NothingIsHeardAfterStopWhereverInItsStartItComes) {
    choose(player, tone(0.5));
    for (int round = 0; round < 60; ++round) {
        sound_player_start(player);
        usleep(static_cast<useconds_t>(round) * 50);
        sound_player_stop(player);
        const double heard = recording.seconds();
        usleep(3000);
        ASSERT_EQ(recording.seconds(), heard) << "round " << round;
    }
}

TEST_F(RecordedSoundPlayer, ChoosingAnotherFileStops) {
    choose(player, tone(0.5));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.05));
    choose(player, knock(0.1));
    const double heard = recording.seconds();
    iterateFor(0.1);
    EXPECT_EQ(recording.seconds(), heard);
    sound_player_start(player);
    EXPECT_TRUE(recording.waitFor(heard + 0.1));
}

TEST_F(SoundPlayer, NothingIsHeardAfterItIsDestroyed) {
    const SoundRecording recording(folder / "recording");
    sound_player_h player = nullptr;
    sound_player_create(&player);
    choose(player, tone(0.5));
    sound_player_start(player);
    ASSERT_TRUE(recording.waitFor(0.05));
    EXPECT_EQ(sound_player_destroy(player), SOUND_PLAYER_ERROR_NONE);
    const double heard = recording.seconds();
    iterateFor(0.15);
    EXPECT_EQ(recording.seconds(), heard);
}

TEST_F(SoundPlayer, SeveralPlayersPlayAtTheSameTime) {
    const SoundRecording recording(folder / "recording");
    const Player one;
    const Player two;
    choose(one, tone(0.1));
    choose(two, tone(0.1));
    sound_player_start(one);
    sound_player_start(two);
    EXPECT_TRUE(recording.waitFor(0.2));
}

TEST_F(RecordedSoundPlayer, EveryBuiltToneIsHeard) {
    int tones = 0;
    for (const auto& file : fs::directory_iterator(BUILT_TONES)) {
        choose(player, file.path());
        const double before = recording.seconds();
        sound_player_start(player);
        ASSERT_TRUE(recording.waitFor(before + 0.1)) << file.path();
        sound_player_stop(player);
        EXPECT_GT(loudness(recording.samples(), before), 0.02) << file.path();
        ++tones;
    }
    EXPECT_GE(tones, 5);
}

TEST_F(RecordedSoundPlayer, AToneOfTheDeviceIsFoundInTheToneFolder) {
    setenv("CLOCK_TONE_DIR", BUILT_TONES, 1);
    choose(player, "/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg");
    unsetenv("CLOCK_TONE_DIR");
    sound_player_start(player);
    EXPECT_TRUE(recording.waitFor(0.05));
}

TEST_F(SoundPlayer, RefusesNullAndLevelsThatThereAreNot) {
    constexpr int INVALID = SOUND_PLAYER_ERROR_INVALID_PARAMETER;
    const Player player;
    EXPECT_EQ(sound_player_create(nullptr), INVALID);
    EXPECT_EQ(sound_player_set_path(nullptr, "/"), INVALID);
    EXPECT_EQ(sound_player_set_path(player, nullptr), INVALID);
    EXPECT_EQ(sound_player_set_level(nullptr, 7), INVALID);
    EXPECT_EQ(sound_player_set_level(player, -1), INVALID);
    EXPECT_EQ(sound_player_set_level(player, 16), INVALID);
    EXPECT_EQ(sound_player_set_loop(nullptr, 1), INVALID);
    EXPECT_EQ(sound_player_start(nullptr), INVALID);
    EXPECT_EQ(sound_player_stop(nullptr), INVALID);
    EXPECT_EQ(sound_player_destroy(nullptr), INVALID);
}

TEST_F(SoundPlayer, RefusesAPathWhereNoFileIsWithoutWaitingForOne) {
    const Player player;
    const std::string pipe = folder / "pipe.ogg";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_EQ(sound_player_start(player), SOUND_PLAYER_ERROR_FILE);
    for (const std::string& path : {std::string(), folder / "none.ogg", folder.path(), pipe})
        standardErrorOf([&] {
            EXPECT_EQ(sound_player_set_path(player, path.c_str()), SOUND_PLAYER_ERROR_FILE) << path;
        });
    EXPECT_EQ(sound_player_start(player), SOUND_PLAYER_ERROR_FILE);
}

TEST_F(SoundPlayer, AFileThatIsNoSoundIsALogLineAndSilence) {
    const SoundRecording recording(folder / "recording");
    writeFile(folder / "text.ogg", "This is not the sound of anything.\n");
    writeFile(folder / "empty.mp3", "");
    writeFile(folder / "picture.ogg", readFile(CLOCK_RESOURCE_DIR "/edje/device.edj"));
    for (const char* name : {"text.ogg", "empty.mp3", "picture.ogg"})
        EXPECT_THAT(logOfPlaying(folder / name),
                    AllOf(HasSubstr(name), HasSubstr("cannot be played")));
    EXPECT_EQ(recording.seconds(), 0.0);
}

TEST_F(SoundPlayer, ADamagedFileNeitherCrashesNorGoesOnForEver) {
    const SoundRecording recording(folder / "recording");
    std::string damaged = readFile(std::string(BUILT_TONES) + "/Alarm_Impatient.ogg");
    for (std::size_t at = 4500; at < damaged.size(); at += 97)
        damaged[at] = static_cast<char>(at);
    writeFile(folder / "damaged.ogg", damaged);
    const Player player;
    choose(player, folder / "damaged.ogg");
    sound_player_set_loop(player, 1);
    standardErrorOf([&] {
        sound_player_start(player);
        iterateFor(0.2);
        EXPECT_LT(secondsOf([&] { sound_player_stop(player); }), AT_ONCE);
    });
}

TEST_F(SoundPlayer, AFileThatHasGoneIsALogLineAndAnotherOneCanBePlayed) {
    const SoundRecording recording(folder / "recording");
    const Player player;
    choose(player, knock(0.1));
    fs::remove(folder / "knock.wav");
    EXPECT_THAT(standardErrorUntil("cannot be played", [&] { sound_player_start(player); }),
                HasSubstr("cannot be played"));
    choose(player, tone(0.05));
    sound_player_start(player);
    EXPECT_TRUE(recording.waitFor(0.05));
}

TEST_F(SoundPlayer, ALoopWithoutSoundInItDoesNotSpin) {
    const SoundRecording recording(folder / "recording");
    writeWave(folder / "nothing.wav", silence(0.005));
    const Player player;
    choose(player, folder / "nothing.wav");
    sound_player_set_loop(player, 1);
    EXPECT_THAT(standardErrorUntil("too short", [&] { sound_player_start(player); }),
                HasSubstr("too short"));
    EXPECT_LT(recording.seconds(), 0.02);
}

TEST_F(SoundPlayer, ASinkThatCannotBeMadeIsALogLine) {
    const std::string path = tone(0.1);
    for (const char* sink : {"there-is-no-such-sink", "fakesink !", "audiotestsrc", "! !"}) {
        const AudioSink chosen(sink);
        EXPECT_THAT(logOfPlaying(path), HasSubstr("cannot be played")) << sink;
    }
}

TEST_F(SoundPlayer, ASinkThatFailsIsALogLine) {
    const AudioSink chosen("filesink location=/there/is/no/such/folder");
    EXPECT_THAT(logOfPlaying(tone(0.1)), HasSubstr("cannot be played"));
}

TEST_F(SoundPlayer, ASinkThatHangsDoesNotHoldUpTheCaller) {
    // A pipe that nobody reads cannot be opened for writing.
    const std::string pipe = folder / "pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    const AudioSink chosen(("filesink location=" + pipe).c_str());
    sound_player_h player = nullptr;
    sound_player_create(&player);
    choose(player, tone(0.1));
    const std::string log = standardErrorOf([&] {
        EXPECT_LT(secondsOf([&] { sound_player_start(player); }), 0.05);
        // Long enough for a busy machine to load the plugins and to come to the pipe.
        iterateFor(1.0);
        EXPECT_LT(secondsOf([&] { sound_player_set_level(player, 3); }), 0.05);
        EXPECT_LT(secondsOf([&] { sound_player_stop(player); }), AT_ONCE);
        EXPECT_LT(secondsOf([&] { sound_player_destroy(player); }), AT_ONCE);
        // The thread that was left behind ends as soon as the pipe opens.
        close(open(pipe.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
        iterateFor(0.1);
    });
    EXPECT_THAT(log, HasSubstr("does not end in time"));
}

TEST_F(SoundPlayer, AMachineWithoutASoundCardPlaysSilently) {
    const AudioSink none(nullptr);
    const Player player;
    choose(player, tone(0.3));
    sound_player_set_loop(player, 1);
    const std::string log = standardErrorOf([&] {
        EXPECT_LT(secondsOf([&] { sound_player_start(player); }), 0.05);
        iterateFor(0.2);
        EXPECT_LT(secondsOf([&] { sound_player_stop(player); }), AT_ONCE);
    });
    EXPECT_THAT(log, Not(HasSubstr("does not end in time")));
}
