#include <cstdlib>
#include <filesystem>
#include <string>

#include <gtest/gtest.h>

#include "Helper.h"
#include "SoundRecording.h"
#include "device/sound_player.h"

namespace fs = std::filesystem;

namespace {

/** Looks for tones as an application does, which only knows the device's folder. */
class ToneFolder : public testing::Test {
public:
    ~ToneFolder() override { unsetenv("CLOCK_TONE_DIR"); }

protected:
    static bool isThere(const std::string& path) {
        sound_player_h player = nullptr;
        EXPECT_EQ(sound_player_create(&player), SOUND_PLAYER_ERROR_NONE);
        int result = -1;
        standardErrorOf([&] { result = sound_player_set_path(player, path.c_str()); });
        sound_player_destroy(player);
        return result == SOUND_PLAYER_ERROR_NONE;
    }

    static constexpr const char* inFolder = "/opt/usr/share/settings/Ringtones/a.wav";
    TemporaryFolder folder;
    DeviceHost host;
};

} // namespace

TEST_F(ToneFolder, IsThatOfTheResourcesUnlessAnotherOneIsChosen) {
    EXPECT_FALSE(isThere(inFolder));
    writeWave(host.resourceDir() + "/tones/a.wav", evenTone(0.1));
    EXPECT_TRUE(isThere(inFolder));
    setenv("CLOCK_TONE_DIR", "", 1);
    EXPECT_TRUE(isThere(inFolder));
}

TEST_F(ToneFolder, CanBeChosen) {
    writeWave(folder / "mine/a.wav", evenTone(0.1));
    for (const char* ending : {"", "/", "//"}) {
        setenv("CLOCK_TONE_DIR", (folder / "mine" + ending).c_str(), 1);
        EXPECT_TRUE(isThere(inFolder)) << ending;
        EXPECT_TRUE(isThere("/opt/usr/share/settings/Ringtones//a.wav"));
    }
    setenv("CLOCK_TONE_DIR", (folder / "other").c_str(), 1);
    EXPECT_FALSE(isThere(inFolder));
}

TEST_F(ToneFolder, CanBeChosenBesideTheFolderOfWork) {
    const fs::path before = fs::current_path();
    fs::current_path(folder.path());
    writeWave(folder / "mine/a.wav", evenTone(0.1));
    setenv("CLOCK_TONE_DIR", "mine", 1);
    EXPECT_TRUE(isThere(inFolder));
    fs::current_path(before);
}

TEST_F(ToneFolder, HasItsOwnFolders) {
    writeWave(folder / "mine/Calm/a.wav", evenTone(0.1));
    setenv("CLOCK_TONE_DIR", (folder / "mine").c_str(), 1);
    EXPECT_TRUE(isThere("/opt/usr/share/settings/Ringtones/Calm/a.wav"));
}

TEST_F(ToneFolder, PathsThatOnlyLookAlikeAndAllOthersStayAsTheyAre) {
    writeWave(folder / "mine2/a.wav", evenTone(0.1));
    setenv("CLOCK_TONE_DIR", (folder / "mine").c_str(), 1);
    EXPECT_FALSE(isThere("/opt/usr/share/settings/Ringtones2/a.wav"));
    EXPECT_TRUE(isThere(folder / "mine2/a.wav"));
    EXPECT_FALSE(isThere("no-such-tone.wav"));
}
