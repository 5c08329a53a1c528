/**
 * @file
 * @brief The other applications of a test's device: nothing starts, requests wait for the test.
 *
 *     ... tap what asks for another application ...
 *     EXPECT_EQ(applications::requests().back().extras.at("caller"), "alarm_setting");
 *     applications::answer({{"result", "/tones/Bells.ogg"}, {"position", "3"}});
 *     applications::answer({{"result", std::nullopt}});     // a key that reads as no text
 *     applications::failExtra("position", APP_CONTROL_ERROR_IO);
 */
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include <device/app_control.h>

namespace applications {

/** Texts by their keys. */
using Extras = std::map<std::string, std::optional<std::string>>;

/** A request that was sent. */
struct Request {
    std::string application;
    std::string operation;
    app_control_launch_mode_e mode = APP_CONTROL_LAUNCH_MODE_SINGLE;
    Extras extras;
    app_control_reply_cb callback = nullptr;
    void* data = nullptr;
};

/** A reply that the code under test has given to a request. */
struct Reply {
    Extras extras;
    app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED;
};

/** Every request that was sent, the oldest first. */
const std::vector<Request>& requests();
/** Answers the newest request, as often as it is called. */
void answer(const Extras& extras, app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED);
/** Answers a request. */
void answer(const Request& request, const Extras& extras,
            app_control_result_e result = APP_CONTROL_RESULT_SUCCEEDED);
/** Makes the text of a key unreadable. */
void failExtra(const std::string& key, int result);
/** Every reply that was given, the oldest first. */
const std::vector<Reply>& replies();
/** Number of requests and replies that were made and not destroyed. */
std::size_t unreleased();
/** Forgets everything; part of DeviceFake::reset(). */
void reset();

} // namespace applications
