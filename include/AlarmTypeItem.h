/**
 * @file
 * @brief The alarm editor's row for the alert type.
 */
#pragma once

#include <functional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"

/** @brief A row that names the alert type; tapping it opens the alert type popup. */
class CLOCK_UI_EXPORT AlarmTypeItem : public app_assist::WGenlistItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmTypeItem(ClockAlarmDbData& alarm);
    ~AlarmTypeItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;

    /** @brief Sets what a tap does. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

private:
    static char* _getTypeItemText(void* data, Evas_Object* genlist, const char* part);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
};
