/**
 * @file
 * @brief What the wearer is told when an alarm has been set.
 */
#pragma once

#include <clock/ClockAlarmDbData.h>
#include <clock/Export.h>

/** @brief Posts a toast that tells how long from now the alarm will ring. */
CLOCK_COMMON_EXPORT void postTimeToRing(const ClockAlarmDbData& alarm);
