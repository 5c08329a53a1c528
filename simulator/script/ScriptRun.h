/**
 * @file
 * @brief What the commands of a running script share.
 */
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "Device.h"
#include "VisibleTexts.h"

namespace simulator {

/** How long the face may take to stand still before a command that reads it. */
inline constexpr double STILL_SECONDS = 15;

/** A place on the face in pixels. */
struct Place {
    int x = 0;
    int y = 0;
};

/** Hands and eyes of a script. Every function returns an empty text, or why it was not done. */
class ScriptRun {
public:
    explicit ScriptRun(Device& device) : _device(device) {}
    ScriptRun(const ScriptRun&) = delete;
    ScriptRun& operator=(const ScriptRun&) = delete;

    Device& device() { return _device; }

    std::string press(Place place, int button = 1);
    std::string move(Place place);
    std::string release(Place place, int button = 1);
    /** Touches a place for a while. */
    std::string touch(Place place, double seconds, int button = 1);
    /** Moves the finger within some time, and lets go after a rest. */
    std::string drag(Place from, Place to, double seconds, double rest);
    std::string key(const std::string& name, const std::string& text, bool down);

    /** The texts that can be seen now. */
    std::string readTexts(std::vector<VisibleText>& texts);
    /** The texts once the face stands still. */
    std::string readTextsWhenStill(std::vector<VisibleText>& texts);
    /** The text that is meant in the language that is shown: "@IDS_..." names a message. */
    std::string meantText(const std::string& argument, std::string& text);
    /** Finds a text once the face stands still. */
    std::string find(const std::string& argument, VisibleText& found);

private:
    Device& _device;
};

} // namespace simulator
