/**
 * @file
 * @brief Alarms and cities for tests to find.
 */
#pragma once

#include <string>

#include <clock/ClockAlarmDbData.h>
#include <clock/ClockWorldClockDbData.h>

/** An alarm that is on, for weekdays or else for the next time that Berlin's clocks show its time.
 */
ClockAlarmDbData alarmAt(int hour, int minute, int weekdays = 0);

/** Stores an alarm without a schedule. @return The alarm with its new id. */
ClockAlarmDbData storeAlarm(ClockAlarmDbData alarm);

/** A city of the data, by its message identifier. */
ClockWorldClockDbData cityOf(const std::string& id);

/** Stores a city as chosen. */
void storeCity(const std::string& id, int position = 0);
