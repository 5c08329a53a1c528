#include "clock/ClockEventListener.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

std::vector<std::string> calls;

class Listener : public ClockEventListener {
public:
    explicit Listener(std::string name, std::function<void(EventType)> reaction = {})
        : _name(std::move(name)), _reaction(std::move(reaction)) {}

    void onEvent(EventType type) override {
        calls.push_back(_name + std::to_string(type));
        // A copy: the reaction may delete this object.
        if (const auto reaction = _reaction)
            reaction(type);
    }

private:
    std::string _name;
    std::function<void(EventType)> _reaction;
};

class ClockEventListenerTest : public testing::Test {
protected:
    void SetUp() override { calls.clear(); }
};

TEST_F(ClockEventListenerTest, EventsHaveFixedValues) {
    EXPECT_EQ(ClockEventListener::SETTINGS_CHANGED, 0);
    EXPECT_EQ(ClockEventListener::TIME_CHANGED, 3);
    EXPECT_EQ(ClockEventListener::LANGUAGE_CHANGED, 4);
    EXPECT_EQ(ClockEventListener::PAUSED, 6);
    EXPECT_EQ(ClockEventListener::RESUMED, 7);
}

TEST_F(ClockEventListenerTest, EveryLiveListenerHearsAnEventInOrder) {
    const Listener a("a");
    { const Listener gone("x"); }
    const Listener b("b");
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_THAT(calls, ElementsAre("a7", "b7"));
}

TEST_F(ClockEventListenerTest, WithoutListenersNothingHappens) {
    ClockEventListener::raise(ClockEventListener::PAUSED);
    EXPECT_THAT(calls, IsEmpty());
}

TEST_F(ClockEventListenerTest, AListenerMayDeleteItself) {
    std::unique_ptr<Listener> self;
    self = std::make_unique<Listener>("s", [&](auto) { self.reset(); });
    const Listener after("b");
    ClockEventListener::raise(ClockEventListener::PAUSED);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_THAT(calls, ElementsAre("s6", "b6", "b7"));
}

TEST_F(ClockEventListenerTest, AListenerMayDeleteEarlierAndLaterOnes) {
    auto before = std::make_unique<Listener>("a");
    std::unique_ptr<Listener> after;
    const Listener deleter("d", [&](auto) {
        before.reset();
        after.reset();
    });
    after = std::make_unique<Listener>("z");
    const Listener last("l");
    ClockEventListener::raise(ClockEventListener::PAUSED);
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_THAT(calls, ElementsAre("a6", "d6", "l6", "d7", "l7"));
}

TEST_F(ClockEventListenerTest, AListenerMadeDuringAnEventHearsTheNextOne) {
    std::vector<std::unique_ptr<Listener>> made;
    const Listener maker("m", [&](auto) {
        // Many, so that the list of listeners has to grow while it is walked.
        for (int i = 0; made.size() < 100; ++i)
            made.push_back(std::make_unique<Listener>("n"));
    });
    ClockEventListener::raise(ClockEventListener::PAUSED);
    EXPECT_THAT(calls, ElementsAre("m6"));
    ClockEventListener::raise(ClockEventListener::RESUMED);
    EXPECT_EQ(calls.size(), 102U);
}

TEST_F(ClockEventListenerTest, AnEventMayRaiseAnother) {
    std::unique_ptr<Listener> victim;
    const Listener outer("o", [&](ClockEventListener::EventType type) {
        if (type == ClockEventListener::LANGUAGE_CHANGED)
            ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
        else
            victim.reset();
    });
    victim = std::make_unique<Listener>("v");
    const Listener last("l");
    ClockEventListener::raise(ClockEventListener::LANGUAGE_CHANGED);
    EXPECT_THAT(calls, ElementsAre("o4", "o0", "l0", "l4"));
}

} // namespace
