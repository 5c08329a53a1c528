#include "LogLines.h"

#include <array>
#include <ctime>
#include <string_view>

#include "base/Text.h"

namespace simulator {

std::string messageOfLine(const std::string& line) {
    // "File.cpp: function(12) > text"
    const auto arrow = line.find(" > ");
    if (arrow == std::string::npos || arrow == 0 || line[arrow - 1] != ')' ||
        line.find(": ") > arrow)
        return line;
    std::string text = line.substr(arrow + 3);
    static constexpr std::string_view MARK = "* Critical * ";
    return text.starts_with(MARK) ? text.substr(MARK.size()) : text;
}

void LogLines::add(int priority, const std::string& tag, const std::string& message) {
    std::array<char, 16> time{};
    const std::time_t now = std::time(nullptr);
    std::tm local{};
    localtime_r(&now, &local);
    std::strftime(time.data(), time.size(), "%H:%M:%S", &local);
    std::array<char, LONGEST> text{};
    base::copyUtf8(text.data(), text.size(), messageOfLine(message));
    const std::scoped_lock lock(_mutex);
    _lines.push_back({priority, time.data(), tag, text.data()});
    if (_lines.size() > MOST)
        _lines.pop_front();
    ++_count;
}

std::vector<LogLine> LogLines::lines() const {
    const std::scoped_lock lock(_mutex);
    return {_lines.begin(), _lines.end()};
}

std::size_t LogLines::count() const {
    const std::scoped_lock lock(_mutex);
    return _count;
}

} // namespace simulator
