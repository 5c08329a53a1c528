/**
 * @file
 * @brief Counts the framework's living objects, so that a test can tell what was left behind.
 */
#pragma once

/** Number of living view controllers. */
int liveControllers();
/** Number of living framework timers. */
int liveTimers();
