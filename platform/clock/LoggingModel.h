/**
 * @file
 * @brief The usage log.
 */
#pragma once

#include <clock/Export.h>

/** Application id of the clock's usage events. */
inline constexpr const char* CLOCK_APPLICATION_ID = "com.vendra.clock";

/**
 * @brief Records which choices people make. One object for the process, made on first use.
 *
 * Events are kept in the application's data folder, the newest 10 000 of them.
 */
class CLOCK_COMMON_EXPORT LoggingModel {
public:
    static LoggingModel& getInstance();

    /**
     * @brief Records one usage event.
     * @param applicationId For example CLOCK_APPLICATION_ID.
     * @param feature For example "CK08".
     * @param detail For example "Name entered".
     * @param extra More about it; null = nothing.
     */
    void insertLog(const char* applicationId, const char* feature, const char* detail,
                   const char* extra);

    LoggingModel(const LoggingModel&) = delete;
    LoggingModel& operator=(const LoggingModel&) = delete;

private:
    LoggingModel() = default;
    ~LoggingModel() = default;
    /** Prepares the store; runs right after the object was made. */
    static void init();
};
