/**
 * @file
 * @brief What the control panel can do to a device besides changing settings.
 */
#pragma once

#include <functional>
#include <string>

namespace simulator {

/** Each is called on the main loop and may be empty. */
struct ControlActions {
    /** Presses (true) or releases a key by its name, for example "XF86Back". */
    std::function<void(const std::string& key, bool down)> key;
    /** Turns the bezel by one detent; 1 = clockwise, -1 = back. */
    std::function<void(int direction)> bezel;
    /** Presses the bezel. */
    std::function<void()> bezelPress;
    std::function<void()> quickPanel;
    /** Sends the application to the background (true) or brings it back. */
    std::function<void(bool background)> background;
};

} // namespace simulator
