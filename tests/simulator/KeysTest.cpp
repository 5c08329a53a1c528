// The keys that stand for what happens to a device.

#include "Keys.h"

#include <vector>

#include "EventRecorder.h"
#include "clock/ClockEventListener.h"
#include "device/vconf.h"
#include "support/ScreenTest.h"

using simulator::Keys;

namespace {

constexpr const char* POWER_SAVING = "db/setting/psmode";

class KeysTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        stage();
    }
    static int powerSaving() {
        int mode = -1;
        vconf_get_int(POWER_SAVING, &mode);
        return mode;
    }
    EventRecorder recorder;
};

} // namespace

TEST_F(KeysTest, functionKeysRaiseTheApplicationsEvents) {
    {
        const Keys keys([] {});
        for (const char* key : {"F5", "F6", "F7", "F8", "F9", "F11", "a"})
            stage().key(key);
    }
    stage().key("F5");
    EXPECT_EQ(recorder.events,
              (std::vector{ClockEventListener::PAUSED, ClockEventListener::RESUMED,
                           ClockEventListener::LANGUAGE_CHANGED, ClockEventListener::TIME_CHANGED,
                           ClockEventListener::SETTINGS_CHANGED}));
}

TEST_F(KeysTest, oneKeyMovesTheQuickPanelAndRaisesNothing) {
    int moves = 0;
    const Keys keys([&moves] { ++moves; });
    stage().key("F4");
    EXPECT_EQ(moves, 1);
    EXPECT_TRUE(recorder.events.empty());
}

TEST_F(KeysTest, oneKeySwitchesPowerSavingOverAndTheApplicationComesBack) {
    const Keys keys([] {});
    stage().key("F10");
    EXPECT_EQ(powerSaving(), 2);
    EXPECT_EQ(recorder.events, std::vector{ClockEventListener::RESUMED});
    stage().key("F10");
    EXPECT_EQ(powerSaving(), 0);
    EXPECT_EQ(recorder.events.size(), 2U);
}

TEST_F(KeysTest, anotherPowerSavingModeIsNotTheUltraOne) {
    device().setSetting(POWER_SAVING, 1);
    const Keys keys([] {});
    stage().key("F10");
    EXPECT_EQ(powerSaving(), 2);
}
