/**
 * @file
 * @brief How often the main loop of this process turns.
 */
#pragma once

namespace host {

/** Counts of main loop turns since countTurns(). */
struct Turns {
    int all = 0;
    int busy = 0; ///< The loop had more to do at once, and did not sleep.
    int own = 0;  ///< Times that it did something for those who use the face from outside.
};

/** @brief Counts from now on; needs to be called once in a process. */
void countTurns();
/** @brief Notes that the loop turns for one who uses the face from outside. */
void noteOwnTurn();
/** @brief The counts so far. */
Turns turnsSoFar();

} // namespace host
