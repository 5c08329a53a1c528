/**
 * @file
 * @brief A main loop that does not sleep.
 */
#pragma once

/** What a stretch of the main loop's life was made of. */
struct LoopActivity {
    int timeouts = 0; ///< Times that a timer ended the loop's sleep.
    int events = 0;   ///< Times that something from outside did.
};

/**
 * @brief Runs the toolkit's main loop for some seconds of its own time.
 *
 * Whenever it wants to sleep, the clocks are put forward instead.
 */
LoopActivity runLoop(double seconds);
