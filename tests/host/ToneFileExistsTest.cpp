#include <cstdlib>

#include <Ecore_File.h>
#include <gtest/gtest.h>

#include "Helper.h"

namespace {

class ToneFileExists : public testing::Test {
public:
    ~ToneFileExists() override { unsetenv("CLOCK_TONE_DIR"); }

protected:
    ToneFileExists() {
        setenv("CLOCK_TONE_DIR", folder.path().c_str(), 1);
        writeFile(folder / "Bells.ogg", "sound");
    }

    DeviceHost host;
    TemporaryFolder folder;
};

} // namespace

TEST_F(ToneFileExists, TheDevicesTonesAreLookedForInTheToneFolder) {
    EXPECT_TRUE(ecore_file_exists("/opt/usr/share/settings/Ringtones/Bells.ogg"));
    EXPECT_TRUE(ecore_file_exists("/opt/usr/share/settings/Ringtones"));
    EXPECT_FALSE(ecore_file_exists("/opt/usr/share/settings/Ringtones/Gone.ogg"));
}

TEST_F(ToneFileExists, OtherFilesAreLookedForWhereTheyAre) {
    EXPECT_TRUE(ecore_file_exists((folder / "Bells.ogg").c_str()));
    EXPECT_TRUE(ecore_file_exists("/"));
    EXPECT_FALSE(ecore_file_exists((folder / "Gone.ogg").c_str()));
    EXPECT_FALSE(ecore_file_exists("/opt/usr/share/settings/Ringtones2/Bells.ogg"));
    EXPECT_FALSE(ecore_file_exists(""));
    EXPECT_FALSE(ecore_file_exists(nullptr));
}
