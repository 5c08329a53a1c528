#include "rules/VolumeLevel.h"

#include <limits>
#include <optional>

#include <gtest/gtest.h>

namespace {

constexpr int LEAST = std::numeric_limits<int>::min();
constexpr int MOST = std::numeric_limits<int>::max();

struct SliderCase {
    double value;
    int level;
    std::optional<double> snap;
};

class VolumeSliderTest : public testing::TestWithParam<SliderCase> {};

TEST_P(VolumeSliderTest, HasALevelAndMaySnap) {
    const SliderCase& slider = GetParam();
    EXPECT_EQ(rules::levelOf(slider.value), slider.level) << slider.value;
    EXPECT_EQ(rules::snapOf(slider.value), slider.snap) << slider.value;
}

INSTANTIATE_TEST_SUITE_P(
    Values, VolumeSliderTest,
    testing::Values(SliderCase{0.0, 0, std::nullopt}, SliderCase{0.0001, 0, 0.0},
                    SliderCase{0.3, 0, 0.0}, SliderCase{0.4999, 0, 0.0},
                    SliderCase{0.5, 1, std::nullopt}, SliderCase{1.0, 1, std::nullopt},
                    SliderCase{1.4999, 1, std::nullopt}, SliderCase{1.5, 2, std::nullopt},
                    SliderCase{7.0, 7, std::nullopt}, SliderCase{13.9, 14, std::nullopt},
                    SliderCase{14.0, 14, std::nullopt}, SliderCase{14.0001, 14, 15.0},
                    SliderCase{14.2, 14, 15.0}, SliderCase{14.4999, 14, 15.0},
                    SliderCase{14.5, 15, std::nullopt}, SliderCase{14.6, 15, std::nullopt},
                    SliderCase{15.0, 15, std::nullopt}));

struct StepCase {
    int level;
    std::optional<int> louder;
    std::optional<int> quieter;
};

class VolumeStepTest : public testing::TestWithParam<StepCase> {};

TEST_P(VolumeStepTest, StopsAtTheEndsOfTheScale) {
    const StepCase& step = GetParam();
    EXPECT_EQ(rules::louderLevel(step.level), step.louder) << step.level;
    EXPECT_EQ(rules::quieterLevel(step.level), step.quieter) << step.level;
}

// Levels out of range come from damaged records; a step brings them nearer or does nothing.
INSTANTIATE_TEST_SUITE_P(
    Levels, VolumeStepTest,
    testing::Values(StepCase{0, 1, std::nullopt}, StepCase{1, 2, 0}, StepCase{7, 8, 6},
                    StepCase{13, 14, 12}, StepCase{14, 15, 13}, StepCase{15, std::nullopt, 14},
                    StepCase{16, std::nullopt, 15}, StepCase{20, std::nullopt, 19},
                    StepCase{MOST, std::nullopt, MOST - 1}, StepCase{-1, 0, std::nullopt},
                    StepCase{LEAST, LEAST + 1, std::nullopt}));

struct StoredCase {
    int level;
    bool replaceable;
};

class VolumeStoredTest : public testing::TestWithParam<StoredCase> {};

TEST_P(VolumeStoredTest, MayBeReplacedWhileItIsWithinTheScale) {
    EXPECT_EQ(rules::mayBeReplaced(GetParam().level), GetParam().replaceable) << GetParam().level;
}

INSTANTIATE_TEST_SUITE_P(Levels, VolumeStoredTest,
                         testing::Values(StoredCase{0, true}, StoredCase{7, true},
                                         StoredCase{15, true}, StoredCase{16, false},
                                         StoredCase{20, false}, StoredCase{-1, false},
                                         StoredCase{MOST, false}, StoredCase{LEAST, false}));

struct IconCase {
    int level;
    int type;
    const char* group;
};

class VolumeIconTest : public testing::TestWithParam<IconCase> {};

TEST_P(VolumeIconTest, ShowsWhatTheAlarmWillDo) {
    const IconCase& icon = GetParam();
    EXPECT_STREQ(rules::volumeIconGroup(icon.level, icon.type), icon.group)
        << icon.level << ' ' << icon.type;
}

INSTANTIATE_TEST_SUITE_P(
    LevelsAndTypes, VolumeIconTest,
    testing::Values(IconCase{0, 0, "volume.mute.bg"}, IconCase{0, 1, "volume.mute.bg"},
                    IconCase{0, 2, "volume.vibrate.bg"}, IconCase{0, 9, "volume.mute.bg"},
                    IconCase{-1, 0, "volume.mute.bg"}, IconCase{-1, 2, "volume.vibrate.bg"},
                    IconCase{1, 0, "volume.normal.bg"}, IconCase{1, 1, "volume.normal.bg"},
                    IconCase{1, 2, "volume.normal.bg"}, IconCase{15, 0, "volume.normal.bg"},
                    IconCase{15, 2, "volume.normal.bg"}, IconCase{20, 2, "volume.normal.bg"}));

} // namespace
