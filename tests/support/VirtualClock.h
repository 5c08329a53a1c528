/**
 * @file
 * @brief Time that moves only when a test says so.
 *
 * The test executable defines libc's clock functions, so the toolkit's timers, animators and the
 * code under test see the same time. While it is on, run the main loop with frames() and advance():
 * ecore_main_loop_begin() would wait for ever.
 */
#pragma once

#include <ctime>
#include <string>

class VirtualClock {
public:
    /** Seconds that one frame takes. */
    static constexpr double FRAME = 1.0 / 60;

    /** Stops the real time; before the first window. */
    static void start();

    /**
     * @brief Sets the time zone of the process and the wall clock.
     * @param civilTime "2026-11-18 09:41:00", local time; ends the process if it is malformed.
     */
    static void setNow(const std::string& zone, const std::string& civilTime);
    /** Sets the wall clock alone. */
    static void setNow(std::time_t now);
    /** Sets the time zone alone. */
    static void setZone(const std::string& zone);
    static std::time_t now();

    /** Moves the wall clock by some seconds without letting time pass, as setting the clock does.
     */
    static void jump(double seconds);

    /** Lets time pass in frames of 1/60 s. */
    static void advance(double seconds);
    /** Runs some frames. */
    static void frames(int count);
    /** Seconds since start(). */
    static double elapsed();

private:
    static void frame(double seconds);
};
