/**
 * @file
 * @brief One alarm of the alarm list.
 */
#pragma once

#include <cstdint>
#include <functional>
#include <string>

#include "ListRow.h"
#include "LiveWidgets.h"
#include "clock/ClockAlarmDbData.h"

namespace simulator {

/** What a person can do with a row of the alarm list. Each gets the alarm's id. */
struct AlarmRowActions {
    std::function<void(int id)> tapped;
    std::function<void(int id)> held;
    std::function<void(int id, bool on)> switched;
};

/** How a row of the alarm list is drawn. */
struct AlarmRowLook {
    bool twelveHour = false;
    std::string next; ///< How far away its ring is; only of the alarm that rings next.

    bool operator==(const AlarmRowLook&) const = default;
};

/** @brief A row with an alarm's time, label and days, and a switch. */
class AlarmListItem : public ListRow {
public:
    AlarmListItem(ClockAlarmDbData alarm, AlarmRowLook look, AlarmRowActions actions);

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;
    void onHold() override;

    /** @brief Shows the alarm as it is now; a switch that stands otherwise moves there. */
    void show(const ClockAlarmDbData& alarm, const AlarmRowLook& look);

private:
    static char* _textGetCb(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _contentGetCb(void* data, Evas_Object* genlist, const char* part);
    static Eina_Bool _stateGetCb(void* data, Evas_Object* genlist, const char* part);
    static void _switchedCb(void* data, Evas_Object* check, void* info);
    Evas_Object* createSwitch(Evas_Object* genlist);
    std::string textOf(const std::string& part) const;
    std::string aboutMarkup() const;
    /** Whether it is going to ring: one whose day is over is as good as switched off. */
    bool isOn() const;

    ClockAlarmDbData _alarm;
    AlarmRowLook _look;
    AlarmRowActions _actions;
    LiveWidgets _switches;
};

} // namespace simulator
