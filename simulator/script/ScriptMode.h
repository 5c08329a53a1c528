/**
 * @file
 * @brief clock-sim --script and clock-sim --command.
 */
#pragma once

#include "../Options.h"

namespace simulator {

/**
 * @brief Runs a script on a watch of its own.
 * @param runWatch Runs the watch in the process that is made for it.
 * @return The process's exit status.
 */
int runScript(const Options& options, int (*runWatch)(const Options& options));

/** @brief Sends commands to the watch that runs already. @return The process's exit status. */
int sendCommands(const Options& options);

} // namespace simulator
