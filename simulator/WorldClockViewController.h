/**
 * @file
 * @brief The clock application's second page.
 */
#pragma once

#include <string>
#include <vector>

#include "ListPage.h"
#include "clock/ClockWorldClockDbData.h"

namespace simulator {

/** @brief The cities that the user has chosen, with the times there. */
class WorldClockViewController : public ListPage {
public:
    /** @param theme Path of the simulator's theme. */
    explicit WorldClockViewController(std::string theme);
    ~WorldClockViewController() override;

    const char* getClassName() const override;

    /** @brief Opens the city picker; only while this page is on top. */
    void addCity();

protected:
    Elm_Object_Item* appendRows() override;
    void onAddTapped() override { addCity(); }
    void onOtherTapped() override;

private:
    /** Asks whether a city is to leave the list. */
    void askToRemove(const ClockWorldClockDbData& city);
    void remove(const ClockWorldClockDbData& city);

    static constexpr int NONE = -1; ///< No city's key.
    std::vector<ClockWorldClockDbData> _cities;
    int _shownKey = NONE; ///< The city that the next refresh brings into view.
};

} // namespace simulator
