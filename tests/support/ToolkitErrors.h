/**
 * @file
 * @brief What the toolkit complains about.
 */
#pragma once

#include <cstdarg>

#include <Eina.h>

/** Counts what the toolkit complains about while it lives. */
class ToolkitErrors {
public:
    ToolkitErrors() { eina_log_print_cb_set(logCb, this); }
    ~ToolkitErrors() { eina_log_print_cb_set(eina_log_print_cb_stderr, nullptr); }
    ToolkitErrors(const ToolkitErrors&) = delete;
    ToolkitErrors& operator=(const ToolkitErrors&) = delete;
    int count() const { return _count; }

private:
    static void logCb(const Eina_Log_Domain* /*domain*/, Eina_Log_Level level, const char* /*file*/,
                      const char* /*function*/, int /*line*/, const char* /*format*/, void* data,
                      va_list /*arguments*/) {
        if (level <= EINA_LOG_LEVEL_ERR) {
            ++static_cast<ToolkitErrors*>(data)->_count;
        }
    }
    int _count = 0;
};
