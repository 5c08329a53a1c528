/**
 * @file
 * @brief One radio row of the alert type popup.
 */
#pragma once

#include <functional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

/** @brief An alert type with a radio button; tapping it writes the type into the record. */
class CLOCK_UI_EXPORT AlarmTypePopupViewItem : public app_assist::WGenlistItem {
public:
    /**
     * @param alarm The editor's working record; must outlive the row.
     * @param index The alert type, a #ClockAlarmType value.
     */
    AlarmTypePopupViewItem(ClockAlarmDbData& alarm, int index);
    ~AlarmTypePopupViewItem() override;

    Elm_Genlist_Item_Class* getItemClassStatic() override;
    void onSelect(Elm_Object_Item* item) override;

    /** @brief Sets what runs after the type was written. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

private:
    static char* _getTypePopupViewItemText(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _getTypePopupViewItemIcon(void* data, Evas_Object* genlist,
                                                  const char* part);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
    LiveWidgets _radios;
    int _index;
};
