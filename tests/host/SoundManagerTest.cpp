#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "device/sound_manager.h"
#include "device/vconf.h"

using testing::HasSubstr;

namespace {

class SoundManager : public testing::Test {
protected:
    int alarmLevel() const {
        int level = -1;
        EXPECT_EQ(sound_manager_get_volume(SOUND_TYPE_ALARM, &level), SOUND_MANAGER_ERROR_NONE);
        return level;
    }

    static constexpr const char* alarmKey = "db/private/sound/volume/alarm";
    DeviceHost host;
};

} // namespace

TEST_F(SoundManager, EverySoundTypeHasALevelBeforeAnyoneSetOne) {
    for (const auto type : {SOUND_TYPE_SYSTEM, SOUND_TYPE_NOTIFICATION, SOUND_TYPE_ALARM,
                            SOUND_TYPE_RINGTONE, SOUND_TYPE_MEDIA}) {
        int level = -1;
        EXPECT_EQ(sound_manager_get_volume(type, &level), SOUND_MANAGER_ERROR_NONE);
        EXPECT_GT(level, 0);
        EXPECT_LE(level, 15);
    }
}

TEST_F(SoundManager, TheLevelOfOneSoundTypeIsNotThatOfAnother) {
    int media = -1;
    sound_manager_get_volume(SOUND_TYPE_MEDIA, &media);
    EXPECT_EQ(sound_manager_set_volume(SOUND_TYPE_ALARM, 12), SOUND_MANAGER_ERROR_NONE);
    EXPECT_EQ(alarmLevel(), 12);
    int mediaAfter = -1;
    sound_manager_get_volume(SOUND_TYPE_MEDIA, &mediaAfter);
    EXPECT_EQ(mediaAfter, media);
}

TEST_F(SoundManager, LevelsFromSilentToLoudestAreTakenAndOthersRefused) {
    for (const int level : {0, 1, 14, 15}) {
        EXPECT_EQ(sound_manager_set_volume(SOUND_TYPE_ALARM, level), SOUND_MANAGER_ERROR_NONE);
        EXPECT_EQ(alarmLevel(), level);
    }
    for (const int level : {-1, 16, 1000}) {
        EXPECT_EQ(sound_manager_set_volume(SOUND_TYPE_ALARM, level),
                  SOUND_MANAGER_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(alarmLevel(), 15);
    }
}

TEST_F(SoundManager, UnknownSoundTypesAndNullAreRefused) {
    int level = 42;
    for (const int type : {-1, 5}) {
        EXPECT_EQ(sound_manager_get_volume(static_cast<sound_type_e>(type), &level),
                  SOUND_MANAGER_ERROR_INVALID_PARAMETER);
        EXPECT_EQ(sound_manager_set_volume(static_cast<sound_type_e>(type), 5),
                  SOUND_MANAGER_ERROR_INVALID_PARAMETER);
    }
    EXPECT_EQ(level, 42);
    EXPECT_EQ(sound_manager_get_volume(SOUND_TYPE_ALARM, nullptr),
              SOUND_MANAGER_ERROR_INVALID_PARAMETER);
}

TEST_F(SoundManager, AStoredLevelThatCannotBeOneIsReplacedByTheDefaultAndLogged) {
    const int usual = alarmLevel();
    int level = -1;
    vconf_set_int(alarmKey, 16);
    EXPECT_THAT(standardErrorOf([&] { level = alarmLevel(); }), HasSubstr(alarmKey));
    EXPECT_EQ(level, usual);
    vconf_set_int(alarmKey, -1);
    standardErrorOf([&] { level = alarmLevel(); });
    EXPECT_EQ(level, usual);
    vconf_set_str(alarmKey, "loud");
    EXPECT_THAT(standardErrorOf([&] { level = alarmLevel(); }), HasSubstr(alarmKey));
    EXPECT_EQ(level, usual);
}

TEST_F(SoundManager, ALevelThatCannotBeStoredIsAnError) {
    writeFile(host.dataDir() + "/settings", "in the way");
    standardErrorOf([] {
        EXPECT_EQ(sound_manager_set_volume(SOUND_TYPE_ALARM, 3), SOUND_MANAGER_ERROR_INTERNAL);
    });
}
