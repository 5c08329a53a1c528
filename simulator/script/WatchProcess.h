/**
 * @file
 * @brief A watch in a process of its own, which ends with this one.
 */
#pragma once

#include <string>

#include <sys/types.h>

#include "../Options.h"

namespace simulator {

/** Started by the constructor. Nothing of the toolkit may be up before. */
class WatchProcess {
public:
    WatchProcess(const Options& options, int (*runWatch)(const Options& options));
    /** Ends the watch as closing its window does. */
    ~WatchProcess();
    WatchProcess(const WatchProcess&) = delete;
    WatchProcess& operator=(const WatchProcess&) = delete;

    /** @return Where its applications listen; empty when it ended instead. */
    std::string waitForFolder() const;
    /** Ends the watch. @return Its exit status; that of a shell for one that was killed. */
    int end();

private:
    int _channel = -1;
    pid_t _process = -1;
};

} // namespace simulator
