#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Helper.h"
#include "device/feedback.h"
#include "device_host.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

class Feedback : public testing::Test {
protected:
    void SetUp() override { device_host_set_haptic_callback(collect, &felt); }
    void TearDown() override { device_host_set_haptic_callback(nullptr, nullptr); }

    std::string play(int pattern) {
        return standardErrorOf(
            [&] { result = feedback_play(static_cast<feedback_pattern_e>(pattern)); });
    }

    std::vector<int> felt;
    int result = 1;

private:
    static void collect(int pattern, void* data) {
        static_cast<std::vector<int>*>(data)->push_back(pattern);
    }
};

} // namespace

TEST_F(Feedback, ATapReachesWhoShowsItAndTheLog) {
    EXPECT_EQ(feedback_initialize(), FEEDBACK_ERROR_NONE);
    EXPECT_THAT(play(FEEDBACK_PATTERN_TAP), HasSubstr("Haptic tap"));
    EXPECT_EQ(result, FEEDBACK_ERROR_NONE);
    EXPECT_THAT(felt, ElementsAre(0));
}

TEST_F(Feedback, ATapIsLoggedWhenNobodyShowsIt) {
    EXPECT_EQ(feedback_initialize(), FEEDBACK_ERROR_NONE);
    device_host_set_haptic_callback(nullptr, nullptr);
    EXPECT_THAT(play(FEEDBACK_PATTERN_TAP), HasSubstr("Haptic tap"));
    EXPECT_THAT(felt, IsEmpty());
}

TEST_F(Feedback, AnUnknownPatternIsAnErrorAndFeltByNobody) {
    EXPECT_EQ(feedback_initialize(), FEEDBACK_ERROR_NONE);
    EXPECT_THAT(play(7), HasSubstr("There is no pattern 7"));
    EXPECT_EQ(result, FEEDBACK_ERROR_INVALID_PARAMETER);
    EXPECT_THAT(felt, IsEmpty());
}

TEST_F(Feedback, NothingIsPlayedAfterTheDeviceHasEnded) {
    EXPECT_EQ(feedback_initialize(), FEEDBACK_ERROR_NONE);
    { const DeviceHost host; }
    EXPECT_THAT(play(FEEDBACK_PATTERN_TAP), HasSubstr("not initialized"));
    EXPECT_EQ(result, FEEDBACK_ERROR_NOT_INITIALIZED);
    EXPECT_EQ(feedback_initialize(), FEEDBACK_ERROR_NONE);
    play(FEEDBACK_PATTERN_TAP);
    EXPECT_THAT(felt, IsEmpty());
}
