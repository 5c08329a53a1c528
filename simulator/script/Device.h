/**
 * @file
 * @brief The running watch, as a script uses it.
 */
#pragma once

#include <string>
#include <vector>

namespace simulator {

/** Words of a request. */
using Request = std::vector<std::string>;

/** What was answered. */
struct Reply {
    std::string problem; ///< One sentence why not; empty when it was done.
    std::vector<std::string> values;
};

/** A device whose applications can be used from outside. */
class Device {
public:
    Device() = default;
    virtual ~Device() = default;
    Device(const Device&) = delete;
    Device& operator=(const Device&) = delete;

    /** Asks the application that a person sees. */
    virtual Reply askFront(const Request& request) = 0;
    /** Asks the watch itself, whatever is in front. */
    virtual Reply askWatch(const Request& request) = 0;
    /**
     * @brief Waits until nothing moves and no application is about to come or go.
     * @return Empty, or what still moves.
     */
    virtual std::string waitStill(double seconds) = 0;
    /** Where the watch's applications listen. */
    virtual const std::string& folder() const = 0;
    /** Lets time pass. */
    virtual void sleep(double seconds) = 0;
    /** Seconds since any time in the past. */
    virtual double now() = 0;
};

} // namespace simulator
