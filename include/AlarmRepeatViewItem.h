/**
 * @file
 * @brief One check row of the repeat screen.
 */
#pragma once

#include <functional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

/** @brief A weekday, or every day, with a check. */
class CLOCK_UI_EXPORT AlarmRepeatViewItem : public app_assist::WGenlistItem {
public:
    /**
     * @param alarm The editor's working record; must outlive the row.
     * @param index 0 every day, 1 Sunday to 7 Saturday.
     */
    AlarmRepeatViewItem(ClockAlarmDbData& alarm, int index);
    ~AlarmRepeatViewItem() override;

    Elm_Genlist_Item_Class* getItemClassStatic() override;
    void onSelect(Elm_Object_Item* item) override;

    /** @brief Sets what a tap does. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

    /** @brief The row's check; null while the row is not realised. */
    Evas_Object* getCheckBoxObj() const { return _checks.newest(); }

private:
    static char* _getRepeatViewItemText(void* data, Evas_Object* genlist, const char* part);
    static Evas_Object* _getRepeatViewItemIcon(void* data, Evas_Object* genlist, const char* part);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
    LiveWidgets _checks;
    int _index;
};
