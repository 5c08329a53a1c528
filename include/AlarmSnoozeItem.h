/**
 * @file
 * @brief The alarm editor's row for snoozing.
 */
#pragma once

#include "AlarmSwitchItem.h"

/** @brief A switch that lets a ringing alarm be put off, with how often and how long. */
class CLOCK_UI_EXPORT AlarmSnoozeItem : public AlarmSwitchItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmSnoozeItem(ClockAlarmDbData& alarm);
    ~AlarmSnoozeItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;

private:
    static char* _getSnoozeItemText(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _getSnoozeItemIcon(void* data, Evas_Object* genlist, const char* part);
    static void _onCheckStateChanged(void* data, Evas_Object* check, void* info);
    void _enableSnoozeOption();
    void _disableSnoozeOption();
    void _changeSnoozeOption();
    void flip() override;
};
