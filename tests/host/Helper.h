/**
 * @file
 * @brief Another process for tests, and what tests of the desktop's services share.
 */
#pragma once

#include <functional>
#include <string>
#include <vector>

#include <sys/types.h>

/** Does what the words of a command say; runs in the helper process. @return Its exit code. */
int runHelper(const std::vector<std::string>& words);

/** Starts a process that runs a helper command. */
pid_t startHelper(const std::vector<std::string>& words);

/** Waits for a process to end. @return Its exit code, or -1 when a signal ended it. */
int waitFor(pid_t process);

/** Runs the main loop until a condition holds. @return False when it did not within the time. */
bool iterateUntil(const std::function<bool()>& condition, double seconds = 5.0);

/** Runs the main loop for a while. */
void iterateFor(double seconds);

/** What is written to standard error while an action runs. */
std::string standardErrorOf(const std::function<void()>& action);

/**
 * @brief The same, going on with the main loop until the log has a line with a text: what other
 * threads report comes when they get to it.
 */
std::string standardErrorUntil(const std::string& text, const std::function<void()>& action);

/** An empty folder that is removed with everything in it. */
class TemporaryFolder {
public:
    TemporaryFolder();
    ~TemporaryFolder();
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;

    const std::string& path() const { return _path; }
    std::string operator/(const std::string& name) const { return _path + "/" + name; }

private:
    std::string _path;
};

/** The device in folders of its own, for as long as the object lives. */
class DeviceHost {
public:
    DeviceHost();
    ~DeviceHost();
    DeviceHost(const DeviceHost&) = delete;
    DeviceHost& operator=(const DeviceHost&) = delete;

    std::string dataDir() const { return _folder / "data"; }
    std::string runtimeDir() const { return _folder / "run"; }
    std::string resourceDir() const { return _folder / "resources"; }

private:
    void setVariable(const char* name, const std::string& value);

    TemporaryFolder _folder;
    std::vector<std::pair<const char*, std::string>> _earlier;
};

/** Writes a file, creating the folders above it. */
void writeFile(const std::string& path, const std::string& contents);

/** The contents of a file, empty when it cannot be read. */
std::string readFile(const std::string& path);
