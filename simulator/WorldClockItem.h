/**
 * @file
 * @brief One city of the world clock.
 */
#pragma once

#include <functional>
#include <string>

#include "ListRow.h"
#include "clock/ClockWorldClockDbData.h"

namespace simulator {

/** @brief A row with the time in a city as it is whenever the row is drawn. */
class WorldClockItem : public ListRow {
public:
    /** Receives the city that a person has tapped or held. */
    using SelectedFunction = std::function<void(const ClockWorldClockDbData& city)>;

    WorldClockItem(ClockWorldClockDbData city, bool twelveHour, SelectedFunction selected);

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;
    void onHold() override;

private:
    static char* _textGetCb(void* data, Evas_Object* genlist, const char* part);
    std::string aboutMarkup() const;

    ClockWorldClockDbData _city;
    bool _twelveHour;
    SelectedFunction _selected;
};

} // namespace simulator
