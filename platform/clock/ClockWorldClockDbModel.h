/**
 * @file
 * @brief The world-clock database.
 */
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include <clock/ClockWorldClockDbData.h>
#include <clock/Export.h>

namespace base {
class SqliteDatabase;
}

/**
 * @brief The cities of the world, and those that the user has put into his list. Made on the stack
 * for one operation.
 *
 * The cities come with the application, in the resource "data/world-clock.db". What the user chose
 * is kept in a file of its own, "world-clock-selection.db" in the application's data folder, by the
 * cities' keys: a new version of the application brings new city data and leaves the choice alone.
 * An operation that fails logs the reason at error priority and changes nothing.
 */
class CLOCK_COMMON_EXPORT ClockWorldClockDbModel {
public:
    ClockWorldClockDbModel();
    ~ClockWorldClockDbModel();
    ClockWorldClockDbModel(const ClockWorldClockDbModel&) = delete;
    ClockWorldClockDbModel& operator=(const ClockWorldClockDbModel&) = delete;

    /**
     * @brief Fills a list with every city, in no useful order; it is empty when the city data are
     * missing or damaged.
     * @return False when it is empty, or when the user's choice is missing from it because it
     *         cannot be read.
     */
    bool getWorldClockAllCityList(std::vector<ClockWorldClockDbData>& cities);

    /**
     * @brief Fills a list with the cities of the user's list, by position; of those with one
     * position, the first that was chosen comes first.
     *
     * A city that the city data no longer know stays stored but is not in the list.
     * @return False when the city data or the user's choice cannot be read.
     */
    bool getWorldClockSelectedCityList(std::vector<ClockWorldClockDbData>& cities);

    /**
     * @brief Writes a city's `selected` and `position` back: a selected city is put into the user's
     * list or moved in it, one that is not selected is taken out. The other members are the
     * application's and stay as they are.
     * @return False when there is no such city or the choice cannot be stored.
     */
    bool updateWorldClockDbRecord(const ClockWorldClockDbData& city);

    /**
     * @brief Takes a city out of the user's list, whatever its record says; positions of the others
     * stay as they are.
     * @return False when it is not in the list or the choice cannot be stored.
     */
    bool removeWorldClockDbRecord(const ClockWorldClockDbData& city);

    /** @brief The position behind the last city of the user's list; 0 when that is empty. */
    std::int32_t getWorldClockNextPosition();

private:
    std::unique_ptr<base::SqliteDatabase> _selection;
};
