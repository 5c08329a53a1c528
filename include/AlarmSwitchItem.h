/**
 * @file
 * @brief What the editor's rows with an on/off switch have in common.
 */
#pragma once

#include <cstdint>
#include <functional>
#include <string>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

/** @brief A title, an explanation and a switch over one field of the record. */
class CLOCK_UI_EXPORT AlarmSwitchItem : public app_assist::WGenlistItem {
public:
    ~AlarmSwitchItem() override;

    /** @brief A tap on the row: calls the function, unselects the row and flips the option. */
    void onSelect(Elm_Object_Item* item) override;

    /**
     * @brief Sets what runs once for every flip by a person: before it when the row is tapped,
     * after it when the switch is. Replaces the earlier function.
     */
    void setSelectedCb(const std::function<void()>& selected);

protected:
    /**
     * @param alarm The editor's working record; must outlive the row.
     * @param option The field that is switched: 1 on, 0 off.
     */
    AlarmSwitchItem(ClockAlarmDbData& alarm, std::int32_t ClockAlarmDbData::*option);

    /** @brief Flips the option. */
    virtual void flip() = 0;

    const ClockAlarmDbData& alarm() const { return _alarm; }
    /** @brief A new item class of the rows' common style. */
    static Elm_Genlist_Item_Class* newItemClass(Elm_Gen_Item_Text_Get_Cb text,
                                                Elm_Gen_Item_Content_Get_Cb content);
    /** @brief Makes the switch, in the record's state. */
    Evas_Object* createSwitch(Evas_Object* genlist, Evas_Smart_Cb changed, const char* title,
                              const std::string& explanation);
    /** @brief Writes the option and turns the switch, with its animation. */
    void setOption(bool on);
    /** @brief Whether the switch, not the record, is on. */
    bool isSwitchOn() const;
    /** @brief Writes the state that a person gave the switch, then calls the function. */
    void switchTurned(const Evas_Object* check);

private:
    ClockAlarmDbData& _alarm;
    std::function<void()> _selected;
    LiveWidgets _checks;
    std::int32_t ClockAlarmDbData::*_option;
};
