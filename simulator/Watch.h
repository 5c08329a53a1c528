/**
 * @file
 * @brief The watch: device, window and clock application.
 */
#pragma once

#include "Options.h"

namespace simulator {

/** @brief Runs the watch until it is closed. @return The process's exit status. */
int runWatch(const Options& options);

} // namespace simulator
