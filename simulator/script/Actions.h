/**
 * @file
 * @brief What the commands do. Each returns an empty text, or one sentence why it was not done.
 */
#pragma once

#include <string>

#include "Commands.h"
#include "ScriptRun.h"

namespace simulator::actions {

// Fingers.
std::string checkTap(const Arguments& arguments);
std::string tap(ScriptRun& run, const Arguments& arguments);
std::string checkHold(const Arguments& arguments);
std::string hold(ScriptRun& run, const Arguments& arguments);
std::string checkDrag(const Arguments& arguments);
std::string drag(ScriptRun& run, const Arguments& arguments);
std::string flick(ScriptRun& run, const Arguments& arguments);
std::string checkText(const Arguments& arguments);
std::string scrollTo(ScriptRun& run, const Arguments& arguments);
std::string checkTurn(const Arguments& arguments);
std::string turn(ScriptRun& run, const Arguments& arguments);
std::string checkTime(const Arguments& arguments);
std::string time(ScriptRun& run, const Arguments& arguments);

// Keys and the bezel.
std::string type(ScriptRun& run, const Arguments& arguments);
std::string checkKey(const Arguments& arguments);
std::string key(ScriptRun& run, const Arguments& arguments);
std::string press(ScriptRun& run, const Arguments& arguments);
std::string release(ScriptRun& run, const Arguments& arguments);
std::string checkBezel(const Arguments& arguments);
std::string bezel(ScriptRun& run, const Arguments& arguments);
std::string bezelPress(ScriptRun& run, const Arguments& arguments);

// The device.
std::string set(ScriptRun& run, const Arguments& arguments);
std::string get(ScriptRun& run, const Arguments& arguments);
std::string expectSetting(ScriptRun& run, const Arguments& arguments);
std::string checkQuickPanel(const Arguments& arguments);
std::string quickPanel(ScriptRun& run, const Arguments& arguments);
std::string background(ScriptRun& run, const Arguments& arguments);
std::string foreground(ScriptRun& run, const Arguments& arguments);

// Waiting and looking.
std::string checkWait(const Arguments& arguments);
std::string wait(ScriptRun& run, const Arguments& arguments);
std::string expect(ScriptRun& run, const Arguments& arguments);
std::string expectNot(ScriptRun& run, const Arguments& arguments);
std::string texts(ScriptRun& run, const Arguments& arguments);
std::string checkScreenshot(const Arguments& arguments);
std::string screenshot(ScriptRun& run, const Arguments& arguments);
std::string checkRecord(const Arguments& arguments);
std::string record(ScriptRun& run, const Arguments& arguments);

} // namespace simulator::actions
