/**
 * @file
 * @brief One alarm of the alarm list.
 */
#pragma once

#include <functional>
#include <string>

#include "app_assist/WGenlistItem.h"
#include "clock/ClockAlarmDbData.h"

namespace simulator {

/** @brief A row with an alarm's time, label and days. */
class AlarmListItem : public app_assist::WGenlistItem {
public:
    /** Receives the id of the alarm that a person has tapped. */
    using SelectedFunction = std::function<void(int id)>;

    AlarmListItem(ClockAlarmDbData alarm, bool twelveHour, SelectedFunction selected);

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;

private:
    static char* _textGetCb(void* data, Evas_Object* genlist, const char* part);
    static Eina_Bool _stateGetCb(void* data, Evas_Object* genlist, const char* part);
    std::string aboutMarkup() const;

    ClockAlarmDbData _alarm;
    bool _twelveHour;
    SelectedFunction _selected;
};

} // namespace simulator
