/**
 * @file
 * @brief What the toolkit complains about.
 */
#pragma once

#include <array>
#include <cstdarg>
#include <cstddef>
#include <cstdio>
#include <string>
#include <vector>

#include <Eina.h>

/** Keeps the toolkit's error lines while it lives. */
class ToolkitErrors {
public:
    ToolkitErrors() { eina_log_print_cb_set(logCb, this); }
    ~ToolkitErrors() { eina_log_print_cb_set(eina_log_print_cb_stderr, nullptr); }
    ToolkitErrors(const ToolkitErrors&) = delete;
    ToolkitErrors& operator=(const ToolkitErrors&) = delete;
    const std::vector<std::string>& lines() const { return _lines; }
    std::size_t count() const { return _lines.size(); }

private:
    static void logCb(const Eina_Log_Domain* /*domain*/, Eina_Log_Level level, const char* /*file*/,
                      const char* function, int /*line*/, const char* format, void* data,
                      va_list arguments) {
        if (level > EINA_LOG_LEVEL_ERR)
            return;
        std::array<char, 256> text{};
        std::vsnprintf(text.data(), text.size(), format, arguments);
        static_cast<ToolkitErrors*>(data)->_lines.push_back(std::string(function) + ": " +
                                                            text.data());
    }
    std::vector<std::string> _lines;
};
