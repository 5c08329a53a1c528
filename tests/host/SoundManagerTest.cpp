#include <filesystem>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "device/sound_manager.h"
#include "device/vconf.h"
#include "device_host.h"

namespace fs = std::filesystem;

using testing::HasSubstr;

namespace {

class SoundManager : public testing::Test {
protected:
    int alarmLevel() const {
        int level = -1;
        EXPECT_EQ(sound_manager_get_volume(SOUND_TYPE_ALARM, &level), SOUND_MANAGER_ERROR_NONE);
        return level;
    }

    /** The name of the one file among the settings. */
    std::string levelFile() const {
        return fs::directory_iterator(host.dataDir() + "/settings")->path().filename();
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

namespace {

/** What was told, in order. */
struct Told {
    std::vector<std::pair<sound_type_e, unsigned int>> changes;
    std::function<void()> then;
};

void toldCb(sound_type_e type, unsigned int volume, void* data) {
    auto* told = static_cast<Told*>(data);
    told->changes.emplace_back(type, volume);
    if (told->then)
        told->then();
}

class SoundManagerChanges : public SoundManager {
public:
    ~SoundManagerChanges() override { sound_manager_unset_volume_changed_cb(); }

protected:
    void listen() {
        ASSERT_EQ(sound_manager_set_volume_changed_cb(toldCb, &told), SOUND_MANAGER_ERROR_NONE);
    }
    bool isTold(std::size_t count = 1) {
        return iterateUntil([&] { return told.changes.size() >= count; }, 2.0);
    }

    using Changes = std::vector<std::pair<sound_type_e, unsigned int>>;
    Told told;
};

} // namespace

TEST_F(SoundManagerChanges, AreToldOnTheMainLoopForEverySoundType) {
    listen();
    Changes expected;
    for (const auto type : {SOUND_TYPE_SYSTEM, SOUND_TYPE_NOTIFICATION, SOUND_TYPE_ALARM,
                            SOUND_TYPE_RINGTONE, SOUND_TYPE_MEDIA}) {
        sound_manager_set_volume(type, 11);
        EXPECT_EQ(told.changes, expected);
        expected.emplace_back(type, 11U);
        ASSERT_TRUE(isTold(expected.size()));
        EXPECT_EQ(told.changes, expected);
    }
}

TEST_F(SoundManagerChanges, OfAnotherProcessAreTold) {
    listen();
    ASSERT_EQ(waitFor(startHelper({"set-int", alarmKey, "3"})), 0);
    ASSERT_TRUE(isTold());
    EXPECT_EQ(told.changes, (Changes{{SOUND_TYPE_ALARM, 3U}}));
}

TEST_F(SoundManagerChanges, AreToldOnceAndNotWhenTheLevelIsWhatItWas) {
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    ASSERT_TRUE(isTold());
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    // Written anew: a file that changes need not hold another level.
    writeFile(host.dataDir() + "/settings/" + levelFile(), "int 12\n");
    iterateFor(0.05);
    EXPECT_EQ(told.changes.size(), 1U);
}

TEST_F(SoundManagerChanges, BackToTheDefaultAreToldWhenTheSettingGoesOrBreaks) {
    const auto usual = static_cast<unsigned int>(alarmLevel());
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    listen();
    fs::remove(host.dataDir() + "/settings/" + levelFile());
    ASSERT_TRUE(isTold());
    EXPECT_EQ(told.changes.back().second, usual);
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    ASSERT_TRUE(isTold(2));
    standardErrorOf([&] {
        vconf_set_str(alarmKey, "loud");
        EXPECT_TRUE(isTold(3));
    });
    EXPECT_EQ(told.changes.back().second, usual);
}

TEST_F(SoundManagerChanges, ThatCameBeforeTheListenerAreNotTold) {
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    listen();
    iterateFor(0.05);
    EXPECT_TRUE(told.changes.empty());
}

TEST_F(SoundManagerChanges, AreNotToldAnyMoreAfterTheListenerIsUnset) {
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    EXPECT_EQ(sound_manager_unset_volume_changed_cb(), SOUND_MANAGER_ERROR_NONE);
    EXPECT_EQ(sound_manager_unset_volume_changed_cb(), SOUND_MANAGER_ERROR_NONE);
    iterateFor(0.05);
    EXPECT_TRUE(told.changes.empty());
}

TEST_F(SoundManagerChanges, AreToldToTheLastListenerAlone) {
    Told second;
    listen();
    sound_manager_set_volume_changed_cb(toldCb, &second);
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    ASSERT_TRUE(iterateUntil([&] { return !second.changes.empty(); }));
    iterateFor(0.05);
    EXPECT_EQ(second.changes.size(), 1U);
    EXPECT_TRUE(told.changes.empty());
}

TEST_F(SoundManagerChanges, AreToldAgainToAListenerThatComesBack) {
    listen();
    sound_manager_unset_volume_changed_cb();
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    ASSERT_TRUE(isTold());
    iterateFor(0.05);
    EXPECT_EQ(told.changes.size(), 1U);
}

TEST_F(SoundManagerChanges, TheListenerMayEndTheListeningWhileItIsTold) {
    told.then = [] {
        sound_manager_unset_volume_changed_cb();
    };
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    sound_manager_set_volume(SOUND_TYPE_MEDIA, 12);
    ASSERT_TRUE(isTold());
    iterateFor(0.05);
    EXPECT_EQ(told.changes.size(), 1U);
}

TEST_F(SoundManagerChanges, TheListenerMayListenAnewOrChangeALevelWhileItIsTold) {
    told.then = [this] {
        listen();
        sound_manager_set_volume(SOUND_TYPE_ALARM, 13);
    };
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    ASSERT_TRUE(isTold());
    iterateFor(0.05);
    EXPECT_EQ(told.changes.front(), std::make_pair(SOUND_TYPE_ALARM, 12U));
}

TEST_F(SoundManagerChanges, AreNotToldAfterTheDeviceHasEnded) {
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 12);
    told.then = [] {
        ADD_FAILURE();
    };
    device_host_shutdown();
    iterateFor(0.05);
    EXPECT_TRUE(told.changes.empty());
    // The next start knows nothing of it.
    ASSERT_EQ(device_host_init(nullptr, nullptr, 0), 0);
    sound_manager_set_volume(SOUND_TYPE_ALARM, 13);
    iterateFor(0.05);
    EXPECT_TRUE(told.changes.empty());
}

TEST_F(SoundManagerChanges, AreToldAfterTheDeviceWasStartedAgain) {
    listen();
    device_host_shutdown();
    ASSERT_EQ(device_host_init(nullptr, nullptr, 0), 0);
    listen();
    sound_manager_set_volume(SOUND_TYPE_ALARM, 13);
    EXPECT_TRUE(isTold());
}

TEST_F(SoundManagerChanges, RefuseNobodyAndAFolderThatCannotBeWatched) {
    EXPECT_EQ(sound_manager_set_volume_changed_cb(nullptr, nullptr),
              SOUND_MANAGER_ERROR_INVALID_PARAMETER);
    writeFile(host.dataDir() + "/settings", "in the way");
    standardErrorOf([&] {
        EXPECT_EQ(sound_manager_set_volume_changed_cb(toldCb, &told), SOUND_MANAGER_ERROR_INTERNAL);
    });
}
