/**
 * @file
 * @brief The alarm editor's row for the weekly repeat.
 */
#pragma once

#include <functional>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>

#include "ClockUiExport.h"

/** @brief A row that summarises the repeat days; tapping it opens the repeat screen. */
class CLOCK_UI_EXPORT AlarmRepeatItem : public app_assist::WGenlistItem {
public:
    /** @param alarm The editor's working record; must outlive the row. */
    explicit AlarmRepeatItem(ClockAlarmDbData& alarm);
    ~AlarmRepeatItem() override;

    Elm_Genlist_Item_Class* getItemClassNew() override;
    void onSelect(Elm_Object_Item* item) override;

    /** @brief Sets what a tap does. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

private:
    static char* _getRepeatWeeklyItemText(void* data, Evas_Object* genlist, const char* part);

    std::function<void()> _selected;
    ClockAlarmDbData& _alarm;
};
