/**
 * @file
 * @brief Requests that only the program itself knows.
 */
#pragma once

#include "FaceAgent.h"

namespace host {

/** @brief Lets the program answer. */
Words askProgram(const Words& words);

/** The path of the folder that holds every simulated device's. */
std::string devicesFolder();

} // namespace host
