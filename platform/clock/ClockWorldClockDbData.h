/**
 * @file
 * @brief The city record.
 */
#pragma once

#include <cstdint>
#include <string>

#include <clock/Export.h>

/** @brief One city of the world clock: a plain value, copied whole. */
struct ClockWorldClockDbData {
    std::int32_t index = 0;    ///< Unique key; the same after the city data were built again.
    std::int32_t selected = 0; ///< Non-zero when the city is in the user's list.
    std::int32_t position = 0; ///< Place in the user's list; 0 when it is not there.
    std::string city;          ///< Message identifier of the city's name, at most 63 bytes.
    std::string country;       ///< Message identifier of the country's name, at most 63 bytes.
    /** Offset when the record was read: "GMT", a sign, two digits, a colon, two digits. */
    std::string timezone;
    std::string tzPath;        ///< Time-zone path, for example "Europe/Berlin".
    std::string searchKeyword; ///< Text to highlight in the name; belongs to who shows the record.
    std::string mcc; ///< The country's mobile codes, three digits each, separated by single spaces.
    std::string extraInfo; ///< Not used.
    bool cityOnly = false; ///< The name is shown without the country: city and country are one.
};
