/**
 * @file
 * @brief Log lines in the house's form, for every library and the applications.
 *
 * A source file defines LOG_TAG before it includes this header.
 */
#pragma once

#include <string_view>

#include <device/dlog.h>

namespace base {

/** The file name of a path, as log lines show it. */
constexpr const char* fileName(const char* path) {
    const std::string_view view(path);
    const auto slash = view.rfind('/');
    return slash == std::string_view::npos ? path : path + slash + 1;
}

} // namespace base

#define BASE_LOG(priority, before, after, format, ...)                                             \
    static_cast<void>(__dlog_print(LOG_ID_MAIN, priority, LOG_TAG,                                 \
                                   "%s: %s(%d) > " before format after, base::fileName(__FILE__),  \
                                   __func__, __LINE__ __VA_OPT__(, ) __VA_ARGS__))

/** A failure, or a step that developers must see. */
#define LOG_ERROR(format, ...)                                                                     \
    BASE_LOG(DLOG_ERROR, "\033[0;31m* Critical * ", "\033[0;m", format __VA_OPT__(, ) __VA_ARGS__)

/** Something odd that the system copes with. */
#define LOG_WARNING(format, ...)                                                                   \
    BASE_LOG(DLOG_WARN, "\033[0;35m", "\033[0;m", format __VA_OPT__(, ) __VA_ARGS__)

/** What the system does. */
#define LOG_INFO(format, ...)                                                                      \
    BASE_LOG(DLOG_INFO, "\033[0;32m", "\033[0;m", format __VA_OPT__(, ) __VA_ARGS__)
