/**
 * @file
 * @brief The last lines of the log, from every thread.
 */
#pragma once

#include <cstddef>
#include <deque>
#include <mutex>
#include <string>
#include <vector>

namespace simulator {

struct LogLine {
    int priority = 0; ///< A log_priority.
    std::string time; ///< On the device's clock, "14:05:09".
    std::string tag;
    std::string text;
};

/** @brief Keeps lines; the oldest go. */
class LogLines {
public:
    static constexpr std::size_t MOST = 300;
    /** In bytes; the rest of a longer line is left out. */
    static constexpr std::size_t LONGEST = 400;

    /** @brief Adds a line as it was logged. From any thread. */
    void add(int priority, const std::string& tag, const std::string& message);
    std::vector<LogLine> lines() const;
    /** @brief How many lines have ever come. */
    std::size_t count() const;

private:
    mutable std::mutex _mutex;
    std::deque<LogLine> _lines;
    std::size_t _count = 0;
};

/** @brief What a log line says, without where in the sources it says so. */
std::string messageOfLine(const std::string& line);

} // namespace simulator
