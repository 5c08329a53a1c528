/**
 * @file
 * @brief The screen on which the weekdays of an alarm are chosen.
 */
#pragma once

#include <array>
#include <functional>

#include <app_assist/WContentViewController.h>
#include <clock/ClockAlarmDbData.h>
#include <clock/ClockEventListener.h>

#include "ClockUiExport.h"

class AlarmRepeatViewItem;

/**
 * @brief Eight check rows, every day first and then Sunday to Saturday.
 *
 * Every toggle is written into the record at once; leaving keeps it.
 */
class CLOCK_UI_EXPORT AlarmRepeatViewController : public app_assist::WContentViewController,
                                                  public ClockEventListener {
public:
    /** @param alarm The editor's working record; must outlive the screen. */
    explicit AlarmRepeatViewController(ClockAlarmDbData& alarm);
    ~AlarmRepeatViewController() override;

    const char* getClassName() const override { return "AlarmRepeatViewController"; }
    void onPushed(Elm_Object_Item* naviItem) override;
    void onEvent(EventType type) override;

    /** @brief Sets what runs after every toggle. Replaces the earlier function. */
    void setSelectedCb(const std::function<void()>& selected);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    void _createRepeatViewItems(Evas_Object* genlist);
    void _onRepeatViewItemSelectedCb(int index);

    std::function<void()> _selected;
    // Owned by the genlist.
    std::array<AlarmRepeatViewItem*, 8> _rows{};
    ClockAlarmDbData& _alarm;
    Evas_Object* _genlist = nullptr;
};
