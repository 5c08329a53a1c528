// Framework timers.

#include <cmath>
#include <limits>

#include "app_assist/WUiTimer.h"
#include "support/LiveObjects.h"
#include "support/ScreenTest.h"

using app_assist::WUiTimer;
using app_assist::WWeakPtr;

namespace {

class FrameworkTimerTest : public ScreenTest {};

} // namespace

TEST_F(FrameworkTimerTest, aTimerFiresAtEachInterval) {
    int fired = 0;
    const auto timer = WUiTimer::addTimer(
        0.2,
        [](void* data) {
            ++*static_cast<int*>(data);
            return true;
        },
        &fired);
    VirtualClock::advance(0.19);
    EXPECT_EQ(fired, 0);
    VirtualClock::advance(0.03);
    EXPECT_EQ(fired, 1);
    VirtualClock::advance(0.8);
    EXPECT_EQ(fired, 5);
    EXPECT_FALSE(timer.expired());
    WUiTimer::destroy(timer);
}

TEST_F(FrameworkTimerTest, aTimerEndsWhenItsFunctionSaysSo) {
    int fired = 0;
    const auto timer = WUiTimer::addTimer(
        0.5,
        [&](void* data) {
            EXPECT_EQ(data, &fired);
            return ++fired < 2;
        },
        &fired);
    VirtualClock::advance(0.6);
    EXPECT_FALSE(timer.expired());
    VirtualClock::advance(5);
    EXPECT_EQ(fired, 2);
    EXPECT_TRUE(timer.expired());
    EXPECT_EQ(liveTimers(), 0);
}

TEST_F(FrameworkTimerTest, aDestroyedTimerNeverFires) {
    int fired = 0;
    const auto timer = WUiTimer::addTimer(
        0.5,
        [&](void*) {
            ++fired;
            return true;
        },
        nullptr);
    WUiTimer::destroy(timer);
    EXPECT_TRUE(timer.expired());
    WUiTimer::destroy(timer);
    WUiTimer::destroy({});
    VirtualClock::advance(2);
    EXPECT_EQ(fired, 0);
}

TEST_F(FrameworkTimerTest, aTimerMayBeDestroyedFromItsOwnFunction) {
    for (const bool goOn : {true, false}) {
        int fired = 0;
        WWeakPtr<WUiTimer> timer;
        // The capture proves that the function lives while it runs.
        timer = WUiTimer::addTimer(
            0.5,
            [&, big = std::string(100, 'x')](void*) {
                WUiTimer::destroy(timer);
                EXPECT_TRUE(timer.expired());
                WUiTimer::destroy(timer);
                ++fired;
                return big.size() == 100 && goOn;
            },
            nullptr);
        VirtualClock::advance(2);
        EXPECT_EQ(fired, 1);
        EXPECT_EQ(liveTimers(), 0);
    }
}

TEST_F(FrameworkTimerTest, aTimerMayReplaceItselfFromItsOwnFunction) {
    int fired = 0;
    WWeakPtr<WUiTimer> timer;
    timer = WUiTimer::addTimer(
        1,
        [&](void*) {
            WUiTimer::destroy(timer);
            timer = WUiTimer::addTimer(
                60,
                [&](void*) {
                    ++fired;
                    return true;
                },
                nullptr);
            return true;
        },
        nullptr);
    VirtualClock::advance(60);
    EXPECT_EQ(fired, 0);
    VirtualClock::advance(1.1);
    EXPECT_EQ(fired, 1);
    WUiTimer::destroy(timer);
}

TEST_F(FrameworkTimerTest, aTimerMayDestroyAnother) {
    int fired = 0;
    const auto other = WUiTimer::addTimer(
        0.5,
        [&](void*) {
            ++fired;
            return true;
        },
        nullptr);
    WUiTimer::addTimer(
        0.5,
        [&](void*) {
            WUiTimer::destroy(other);
            return false;
        },
        nullptr);
    VirtualClock::advance(3);
    EXPECT_LE(fired, 1);
    EXPECT_TRUE(other.expired());
}

TEST_F(FrameworkTimerTest, badArgumentsGiveNoTimer) {
    const auto nothing = [](void*) {
        return true;
    };
    for (const double interval : {0.0, -1.0, std::numeric_limits<double>::quiet_NaN(),
                                  std::numeric_limits<double>::infinity()}) {
        EXPECT_TRUE(WUiTimer::addTimer(interval, nothing, nullptr).expired()) << interval;
        const auto errors = takeErrors();
        ASSERT_EQ(errors.size(), 1U);
        EXPECT_EQ(errors[0].find("A timer needs a function and an interval above 0"), 0U);
    }
    EXPECT_TRUE(WUiTimer::addTimer(1, {}, nullptr).expired());
    EXPECT_EQ(takeErrors().size(), 1U);
    EXPECT_EQ(liveTimers(), 0);
}

TEST_F(FrameworkTimerTest, timersFollowTimeAndNotTheWallClock) {
    int fired = 0;
    const auto timer = WUiTimer::addTimer(
        10,
        [&](void*) {
            ++fired;
            return true;
        },
        nullptr);
    VirtualClock::jump(100);
    VirtualClock::advance(1);
    EXPECT_EQ(fired, 0);
    VirtualClock::jump(-200);
    VirtualClock::advance(9.1);
    EXPECT_EQ(fired, 1);
    WUiTimer::destroy(timer);
}
