/**
 * @file
 * @brief The alarm editor's row for the gradually rising volume.
 */
#pragma once

#include "AlarmSwitchItem.h"

/** @brief A switch that lets the volume rise gradually while the alarm rings. */
class CLOCK_UI_EXPORT AlarmIncreaseVolumeItem : public AlarmSwitchItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmIncreaseVolumeItem(ClockAlarmDbData& alarm);
    ~AlarmIncreaseVolumeItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;

private:
    static char* _getIncreaseVolumeItemText(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _getIncreaseVolumeItemIcon(void* data, Evas_Object* genlist,
                                                   const char* part);
    static void _onCheckStateChanged(void* data, Evas_Object* check, void* info);
    void _enableIncreaseVolumeOption();
    void _disableIncreaseVolumeOption();
    void _changeIncreaseVolumeOption();
    void flip() override;
};
