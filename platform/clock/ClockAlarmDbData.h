/**
 * @file
 * @brief The alarm record.
 */
#pragma once

#include <cstdint>
#include <string>

#include <clock/Export.h>

/** Alert types: the values of ClockAlarmDbData::type. */
enum ClockAlarmType : std::int32_t {
    CLOCK_ALARM_TYPE_SOUND = 0,
    CLOCK_ALARM_TYPE_VIBRATION = 1,
    CLOCK_ALARM_TYPE_VIBRATION_AND_SOUND = 2,
};

/** The tone of an alarm that has no other. */
inline constexpr const char* CLOCK_ALARM_DEFAULT_TONE =
    "/opt/usr/share/settings/Ringtones/Alarm_Impatient.ogg";

/** Every weekday: the full set of ClockAlarmDbData::repeatWeekly. */
inline constexpr std::int32_t CLOCK_ALARM_EVERY_DAY = 127;

/**
 * @brief One alarm: a plain value, copied whole.
 *
 * Times are epoch seconds. Dates are epoch seconds of a local midnight, 0 meaning none.
 */
struct ClockAlarmDbData {
    // Left uninitialised on purpose: it belongs to whoever stored it and is only carried along.
    std::int32_t leading;            ///< Carried along by copies.
    std::int32_t id = -1;            ///< Id in the alarm database; also the notification's tag.
    std::int32_t alarmMgrId = -1;    ///< Id of the schedule at the alarm server.
    std::int32_t enable = 0;         ///< 1 = switched on.
    std::int32_t alarmTime = 0;      ///< hour:min on the day of saving, in the record's time zone.
    std::int32_t alarmTimeBase = 0;  ///< Same value as alarmTime.
    std::int32_t createTime = 0;     ///< Time of the last save.
    std::int32_t updateTime = 0;     ///< Same value as createTime.
    std::int32_t autoDate = 0;       ///< Day on which a one-time alarm rings.
    std::int32_t manualDate = 0;     ///< Day that the user picked, 0 = not picked.
    std::int32_t hour = 6;           ///< 0 to 23.
    std::int32_t min = 0;            ///< 0 to 59.
    std::string name;                ///< Label; empty = none.
    std::string timeZone;            ///< Time-zone id at the last save.
    std::int32_t repeatOnce = 1;     ///< 1 = one-time, 0 = repeats weekly.
    std::int32_t repeatWeekly = 0;   ///< Bit 0 Sunday to bit 6 Saturday; 0 = no repeat.
    std::int32_t snooze = 1;         ///< 1 = snooze on.
    std::int32_t snoozeDuration = 5; ///< Minutes between rings.
    std::int32_t snoozeRepeat = 3;   ///< Number of snoozes.
    std::int32_t snoozeCount = 0;    ///< Snoozes used so far; 0 after every save.
    std::int32_t type = CLOCK_ALARM_TYPE_SOUND;       ///< A #ClockAlarmType value.
    std::string soundPath = CLOCK_ALARM_DEFAULT_TONE; ///< Absolute path of the tone file.
    std::int32_t volume = 0;                          ///< Level 0 to 15 of the alarm sound type.
    std::int32_t trailing = 0;                        ///< Carried along by copies.
    std::int32_t increaseVolume = 0;                  ///< 1 = the volume rises gradually.
    std::int32_t tonePosition = 0; ///< Place of the tone in the tone picker's list.
};
