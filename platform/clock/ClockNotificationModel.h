/**
 * @file
 * @brief Posted notifications of alarms.
 */
#pragma once

#include <string>

#include <clock/Export.h>

/** The notifications that ringing and missed alarms leave behind. */
class CLOCK_COMMON_EXPORT ClockNotificationModel {
public:
    /** @brief Removes the notification of the alarm whose id, in decimal, is the tag. */
    static void removeAlarmNotificationByTag(const std::string& tag);
};
