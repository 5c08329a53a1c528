/**
 * @file
 * @brief The periods of constant UTC offset of a time zone, from the system's time-zone files.
 */
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace base {

struct TimeZoneFileHeader;
struct YearlyRule;

/**
 * @brief One time zone.
 *
 * ICU carries a copy of the time-zone data that is only as new as ICU itself. An alarm must ring
 * when the C library's clock shows its time, so both read the same files.
 */
class TimeZoneRules {
public:
    /** A stretch of time with one offset. */
    struct Period {
        std::int64_t begin; ///< First instant.
        std::int64_t end;   ///< First instant after it.
        std::int32_t offset;
    };

    /**
     * @brief Looks up a time zone.
     * @param id An id of the time-zone database, or a rule in the form of POSIX's TZ.
     * @return Null when there is no such zone.
     */
    static std::shared_ptr<const TimeZoneRules> find(const std::string& id);

    /** Reads the content of a compiled time-zone file. @return Null when it is damaged. */
    static std::shared_ptr<const TimeZoneRules> fromFile(std::string_view content);
    /** Reads a rule such as "CET-1CEST,M3.5.0,M10.5.0/3". @return Null when it is not one. */
    static std::shared_ptr<const TimeZoneRules> fromRule(std::string_view rule);

    /** The period that holds an instant. */
    Period periodAt(std::int64_t instant) const;

private:
    struct Change {
        std::int64_t instant;
        std::int32_t offset;
    };
    static std::vector<Change> changesOf(const YearlyRule& rule, int firstYear, int lastYear);
    bool readChanges(std::string_view block, const TimeZoneFileHeader& header,
                     std::size_t timeBytes);
    void appendRule(std::string_view rule);

    std::int32_t _firstOffset = 0;
    std::vector<Change> _changes;
    // From here on the changes repeat as the Gregorian calendar does; none = they do not.
    std::int64_t _cycleBegin = 0;
    bool _cyclic = false;
};

} // namespace base
