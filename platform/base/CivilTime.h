/**
 * @file
 * @brief Civil (wall clock) time and instants, with the time zones of the C library.
 *
 * All arithmetic is done in 64 bits, for the years -9999 to 9999; instants outside count as the
 * nearest one inside. Changes of offset are known until 2037, where the time-zone files end. Where
 * a function takes a time zone, an unknown one counts as the current one.
 */
#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace base {

/** A calendar date of the proleptic Gregorian calendar. */
struct CivilDate {
    int year = 0;
    int month = 0; ///< 1 to 12.
    int day = 0;   ///< 1 to 31.

    bool operator==(const CivilDate&) const = default;
};

/** A wall clock reading. */
struct CivilTime {
    CivilDate date;
    int hour = 0;   ///< 0 to 23.
    int minute = 0; ///< 0 to 59.
    int second = 0; ///< 0 to 59.

    bool operator==(const CivilTime&) const = default;
};

/**
 * @brief The id of the process's time zone, from TZ or the system's setting.
 * @return An id of the time-zone database; "UTC" when TZ is something else, a POSIX rule for
 * example.
 */
std::string currentTimeZone();

/** @brief Whether a text names a time zone. */
bool isTimeZone(const std::string& timeZone);

/** @brief Seconds that a time zone's clocks are ahead of UTC at an instant. */
int utcOffset(std::int64_t instant, const std::string& timeZone);

/**
 * @brief When a time zone's clocks are next put forward or back, strictly after an instant.
 * @return Epoch seconds, or nothing when no change is known.
 */
std::optional<std::int64_t> nextOffsetChange(std::int64_t after, const std::string& timeZone);

/** @brief The wall clock reading of an instant (epoch seconds) in a time zone. */
CivilTime toCivil(std::int64_t instant, const std::string& timeZone);

/**
 * @brief The instant at which a wall clock shows a reading.
 *
 * A reading skipped by a daylight-saving change gives the first instant after the gap; one that
 * occurs twice gives the first occurrence.
 */
std::int64_t toInstant(const CivilTime& civil, const std::string& timeZone);

/** @brief The date that lies a number of days (possibly negative) after another one. */
CivilDate addDays(const CivilDate& date, int days);

/** @brief The weekday of a date: 0 Sunday to 6 Saturday. */
int weekdayOf(const CivilDate& date);

/** When an alarm rings, as civil time. */
struct RingRule {
    int hour = 0;
    int minute = 0;
    int weekdays = 0;              ///< Bit 0 Sunday to bit 6 Saturday; 0 = rings once.
    std::optional<CivilDate> date; ///< Day of a one-time alarm; none = the next time it comes.
};

/**
 * @brief The first ring that lies strictly after `now`.
 * @return Epoch seconds, or nothing when a one-time alarm's day is over.
 */
std::optional<std::int64_t> nextRing(const RingRule& rule, std::int64_t now,
                                     const std::string& timeZone);

} // namespace base
