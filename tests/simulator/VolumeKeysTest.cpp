// What the system does with volume keys, and with the keys that stand in for them.

#include "VolumeKeys.h"

#include <string>
#include <vector>

#include <Ecore_Input.h>

#include "device/eext.h"
#include "device/sound_manager.h"
#include "support/ScreenTest.h"

using simulator::VolumeKeys;

namespace {

constexpr const char* RAISE = "XF86AudioRaiseVolume";
constexpr const char* LOWER = "XF86AudioLowerVolume";

/** What an application that has taken the keys gets to see. */
class KeyRecorder {
public:
    KeyRecorder()
        : _down(ecore_event_handler_add(ECORE_EVENT_KEY_DOWN, record, this)),
          _up(ecore_event_handler_add(ECORE_EVENT_KEY_UP, record, this)) {}
    ~KeyRecorder() {
        ecore_event_handler_del(_down);
        ecore_event_handler_del(_up);
    }
    KeyRecorder(const KeyRecorder&) = delete;
    KeyRecorder& operator=(const KeyRecorder&) = delete;

    std::vector<std::string> keys;

private:
    static Eina_Bool record(void* data, int type, void* info) {
        const auto* event = static_cast<const Ecore_Event_Key*>(info);
        static_cast<KeyRecorder*>(data)->keys.push_back(
            std::string(type == ECORE_EVENT_KEY_DOWN ? "down " : "up ") + event->keyname);
        return ECORE_CALLBACK_DONE;
    }
    Ecore_Event_Handler* _down;
    Ecore_Event_Handler* _up;
};

class VolumeKeysTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        stage();
        device().setVolume(SOUND_TYPE_ALARM, 7);
    }
    int level() { return device().volume(SOUND_TYPE_ALARM); }
    /** A keyboard repeats a key that is held, and lets go of it once. */
    void hold(const char* key, double seconds) {
        const double start = ecore_loop_time_get();
        while (ecore_loop_time_get() - start < seconds)
            stage().keyDown(key);
        stage().keyUp(key);
        Stage::advance(0.1);
    }
    void grab(const char* key) { eext_window_key_grab(stage().window(), key); }

    std::vector<int> shown;
    VolumeKeys keys{[this](int level) {
        shown.push_back(level);
    }};
};

} // namespace

TEST_F(VolumeKeysTest, aKeyThatNobodyHasTakenStepsTheAlarmsLevel) {
    stage().key(RAISE);
    EXPECT_EQ(level(), 8);
    stage().key(LOWER);
    stage().key(LOWER);
    EXPECT_EQ(level(), 6);
    EXPECT_EQ(shown, (std::vector{8, 7, 6}));
}

TEST_F(VolumeKeysTest, otherSoundsKeepTheirLevel) {
    device().setVolume(SOUND_TYPE_MEDIA, 4);
    stage().key(RAISE);
    EXPECT_EQ(device().volume(SOUND_TYPE_MEDIA), 4);
}

TEST_F(VolumeKeysTest, theLevelEndsAtItsLimitsAndIsShownThere) {
    device().setVolume(SOUND_TYPE_ALARM, 15);
    stage().key(RAISE);
    EXPECT_EQ(level(), 15);
    device().setVolume(SOUND_TYPE_ALARM, 0);
    stage().key(LOWER);
    EXPECT_EQ(level(), 0);
    EXPECT_EQ(shown, (std::vector{15, 0}));
}

TEST_F(VolumeKeysTest, aHeldKeyStepsFiveTimesASecond) {
    hold(RAISE, 1.0);
    EXPECT_GE(level(), 7 + 5);
    EXPECT_LE(level(), 7 + 6);
}

TEST_F(VolumeKeysTest, eachPressCountsHoweverFast) {
    for (int press = 0; press < 4; ++press)
        stage().key(LOWER);
    EXPECT_EQ(level(), 3);
}

TEST_F(VolumeKeysTest, theSystemStaysOutOfAKeyThatAWindowHasTaken) {
    grab(RAISE);
    stage().key(RAISE);
    EXPECT_EQ(level(), 7);
    EXPECT_TRUE(shown.empty());
    stage().key(LOWER);
    EXPECT_EQ(level(), 6);
    eext_window_key_ungrab(stage().window(), RAISE);
    stage().key(RAISE);
    EXPECT_EQ(level(), 7);
}

TEST_F(VolumeKeysTest, functionKeysBecomeVolumeKeysForEverybody) {
    grab(RAISE);
    const KeyRecorder recorder;
    stage().keyDown("F3");
    stage().keyUp("F3");
    stage().keyDown("F2");
    stage().keyUp("F2");
    Stage::advance(0.1);
    EXPECT_EQ(recorder.keys,
              (std::vector<std::string>{"down XF86AudioRaiseVolume", "up XF86AudioRaiseVolume",
                                        "down XF86AudioLowerVolume", "up XF86AudioLowerVolume"}));
    EXPECT_EQ(level(), 6) << "the raise key is taken, the lower key is not";
}

TEST_F(VolumeKeysTest, aHeldFunctionKeyRepeats) {
    hold("F3", 1.0);
    EXPECT_GE(level(), 7 + 5);
    EXPECT_LE(level(), 7 + 6);
}

TEST_F(VolumeKeysTest, otherKeysAreLeftAlone) {
    stage().key("a");
    stage().key("F1");
    EXPECT_EQ(level(), 7);
    EXPECT_TRUE(shown.empty());
}
