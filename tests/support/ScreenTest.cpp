#include "support/ScreenTest.h"

#include <algorithm>
#include <utility>

#include "support/LiveObjects.h"

void ScreenTest::SetUp() {
    device().reset();
    _controllersBefore = liveControllers();
    _timersBefore = liveTimers();
    VirtualClock::setNow("Europe/Berlin", "2026-11-18 09:41:00");
}

void ScreenTest::TearDown() {
    takeStageDown();
    EXPECT_EQ(liveControllers(), _controllersBefore) << "view controllers were left behind";
    EXPECT_EQ(liveTimers(), _timersBefore) << "framework timers were left behind";
    collectErrors();
    for (const std::string& error : _errors) {
        ADD_FAILURE() << "unexpected error line: " << error;
    }
    device().reset();
}

Stage& ScreenTest::stage() {
    if (!_stage) {
        _stage = std::make_unique<Stage>();
    }
    return *_stage;
}

void ScreenTest::takeStageDown() {
    _stage.reset();
}

void ScreenTest::expectLog(const std::string& message) {
    collectErrors();
    const auto found = std::ranges::find(_errors, message);
    if (found == _errors.end()) {
        ADD_FAILURE() << "no error line: " << message;
        return;
    }
    _errors.erase(found);
}

std::vector<std::string> ScreenTest::takeErrors() {
    collectErrors();
    return std::exchange(_errors, {});
}

void ScreenTest::collectErrors() {
    for (std::string& error : device().takeErrors()) {
        _errors.push_back(std::move(error));
    }
}
