// What moves, what it ends in, and that it ends there at once when motion is off.

#include <device_host.h>

#include <gtest/gtest.h>

#include "screens/EditorFixture.h"
#include "support/FaceInk.h"

namespace {

constexpr const char* MOTION = "db/setting/motion";
constexpr const char* POWER_SAVING = "db/setting/psmode";
constexpr int ULTRA = 2;

class MotionTest : public EditorFixture {
protected:
    void SetUp() override {
        EditorFixture::SetUp();
        // Each test has a fresh device, which has to be watched anew.
        ASSERT_EQ(device_host_init_toolkit(), 0);
    }
    void TearDown() override {
        device().setSetting(MOTION, 1);
        device().setSetting(POWER_SAVING, 0);
        EditorFixture::TearDown();
    }
    void setMotion(bool on) { device().setSetting(MOTION, on ? 1 : 0); }

    /** How many frames are drawn until the face stands. */
    int framesToRest() {
        const int before = stage().renderedFrames();
        EXPECT_TRUE(stage().settle());
        return stage().renderedFrames() - before;
    }
    /** How the face looks at rest, as one number. */
    std::size_t look() {
        stage().settle();
        std::size_t sum = 0;
        for (int y = 0; y < Stage::SIZE; y += 3) {
            for (int x = 0; x < Stage::SIZE; x += 60)
                sum = sum * 31 + stage().pixel(x + y % 60, y);
        }
        return sum;
    }
    Evas_Object* addSwitch() {
        Evas_Object* check = elm_check_add(stage().window());
        elm_object_style_set(check, "on&off");
        evas_object_geometry_set(check, 150, 156, 60, 48);
        evas_object_show(check);
        stage().settle();
        return check;
    }
    static int knob(Evas_Object* check) {
        int x = 0;
        edje_object_part_geometry_get(elm_layout_edje_get(check), "knob", &x, nullptr, nullptr,
                                      nullptr);
        return x;
    }
};

TEST_F(MotionTest, ASwitchSlidesOrJumpsToTheSameEnd) {
    Evas_Object* check = addSwitch();
    const int off = knob(check);
    stage().tap(180, 180);
    Stage::frames(2);
    const int sliding = knob(check);
    stage().settle();
    const int on = knob(check);
    EXPECT_GT(sliding, off);
    EXPECT_LT(sliding, on);

    setMotion(false);
    stage().tap(180, 180);
    Stage::frames(2);
    EXPECT_EQ(knob(check), off);
    EXPECT_FALSE(elm_check_state_get(check));
}

TEST_F(MotionTest, ASettingIsFollowedLive) {
    Evas_Object* check = addSwitch();
    const int off = knob(check);
    setMotion(false);
    setMotion(true);
    stage().tap(180, 180);
    Stage::frames(2);
    const int sliding = knob(check);
    stage().settle();
    EXPECT_GT(sliding, off);
    EXPECT_LT(sliding, knob(check));
}

TEST_F(MotionTest, UltraPowerSavingMovesNothing) {
    Evas_Object* check = addSwitch();
    device().setSetting(POWER_SAVING, ULTRA);
    stage().tap(180, 180);
    Stage::frames(2);
    const int on = knob(check);
    stage().settle();
    EXPECT_EQ(knob(check), on);
    device().setSetting(POWER_SAVING, 0);
    stage().tap(180, 180);
    Stage::frames(2);
    const int sliding = knob(check);
    stage().settle();
    EXPECT_GT(sliding, knob(check));
}

TEST_F(MotionTest, AListScrollsOrJumpsToWhatItBringsIn) {
    createAlarm();
    const auto scrolled = [this] {
        int y = 0;
        elm_scroller_region_get(genlist(), nullptr, &y, nullptr, nullptr);
        return y;
    };
    constexpr int FAR = 240;
    elm_scroller_region_bring_in(genlist(), 0, FAR, Stage::SIZE, Stage::SIZE);
    Stage::frames(3);
    EXPECT_GT(scrolled(), 0);
    EXPECT_LT(scrolled(), FAR);
    stage().settle();
    EXPECT_EQ(scrolled(), FAR);
    setMotion(false);
    elm_scroller_region_bring_in(genlist(), 0, 0, Stage::SIZE, Stage::SIZE);
    Stage::frames(3);
    EXPECT_EQ(scrolled(), 0);
}

TEST_F(MotionTest, APageComesAndGoesWithAndWithoutMotion) {
    createAlarm();
    std::size_t repeat[2] = {};
    std::size_t editor[2] = {};
    int frames[2] = {};
    for (const bool on : {true, false}) {
        setMotion(on);
        stage().tapRow(elm_genlist_nth_item_get(genlist(), 1));
        frames[on] = framesToRest();
        ASSERT_TRUE(stage().shows("Every day"));
        repeat[on] = look();
        stage().backKey();
        stage().settle();
        ASSERT_TRUE(stage().shows("Repeat weekly"));
        ASSERT_FALSE(stage().shows("Every day"));
        editor[on] = look();
    }
    EXPECT_EQ(repeat[0], repeat[1]);
    EXPECT_EQ(editor[0], editor[1]);
    EXPECT_GT(frames[1], 8);
    EXPECT_LE(frames[0], 4);
}

TEST_F(MotionTest, APopupRisesAndFallsWithAndWithoutMotion) {
    createAlarm();
    pick(7, 30);
    std::size_t asked[2] = {};
    for (const bool on : {true, false}) {
        setMotion(on);
        stage().backKey();
        const int frames = framesToRest();
        EXPECT_TRUE(on ? frames > 8 : frames <= 4) << frames;
        ASSERT_TRUE(asksToDiscard());
        asked[on] = look();
        stage().backKey();
        stage().settle();
        ASSERT_FALSE(asksToDiscard());
    }
    EXPECT_EQ(asked[0], asked[1]);
    EXPECT_TRUE(isOpen());
}

TEST_F(MotionTest, AChoiceClosesItsPopupWithoutMotionToo) {
    createAlarm();
    setMotion(false);
    stage().tapRow(elm_genlist_nth_item_get(genlist(), 2));
    stage().settle();
    ASSERT_TRUE(stage().shows("Vibration and sound"));
    stage().tapText("Vibration");
    stage().settle();
    EXPECT_FALSE(stage().shows("Vibration and sound"));
    EXPECT_TRUE(stage().shows("Vibration"));
}

TEST_F(MotionTest, AWheelStandsAtOnceWithoutMotion) {
    createAlarm();
    std::tm time{};
    setMotion(false);
    // A touch of the value below the middle takes it.
    stage().tap(122, 214);
    EXPECT_LE(framesToRest(), 4);
    elm_datetime_value_get(picker(), &time);
    EXPECT_EQ(time.tm_hour, 7);
    setMotion(true);
    stage().tap(122, 214);
    EXPECT_GT(framesToRest(), 6);
    elm_datetime_value_get(picker(), &time);
    EXPECT_EQ(time.tm_hour, 8);
}

TEST_F(MotionTest, AFlickedWheelWithoutMotionEndsOnAValue) {
    createAlarm();
    setMotion(false);
    stage().flick(122, 200, 0, -90);
    EXPECT_LE(framesToRest(), 4);
    std::tm time{};
    elm_datetime_value_get(picker(), &time);
    const double middle = [this, &time] {
        const auto text =
            stage().findText((time.tm_hour < 10 ? "0" : "") + std::to_string(time.tm_hour));
        return text ? text->area.middle().y : 0;
    }();
    EXPECT_NEAR(middle, 160, 3);
    EXPECT_NE(time.tm_hour, 6);
}

} // namespace
