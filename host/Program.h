/**
 * @file
 * @brief The programs behind application ids, and starting them.
 */
#pragma once

#include <string>

#include <sys/types.h>

namespace host {

/** Descriptor under which a started application finds the way back to its caller. */
inline constexpr int CHANNEL_DESCRIPTOR = 3;
/** Environment variable that tells a program that it has such a descriptor. */
inline constexpr const char* CHANNEL_VARIABLE = "CLOCK_APPLICATION_CHANNEL";

/**
 * @brief The program of an application: the executable file of that name in CLOCK_APPLICATION_DIR,
 * else in the folder libexec/clock-ui that belongs to this library.
 * @return Empty when there is none.
 */
std::string programOf(const std::string& appId);

/** A program that was started, and this end of the channel to it. */
struct Program {
    pid_t process = -1;
    int channel = -1; ///< Non-blocking, closed on exec.
};

/**
 * @brief Starts a program with the folders of this device, and with no open file of this process
 * besides the standard ones and the channel.
 * @return 0, or an errno.
 */
int startProgram(const std::string& path, Program& program);

} // namespace host
