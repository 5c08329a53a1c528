/**
 * @file
 * @brief The popup in which the day of a one-time alarm is chosen.
 */
#pragma once

#include <ctime>
#include <functional>

#include <app_assist/WPopupController.h>
#include <clock/ClockAlarmDbData.h>
#include <clock/ClockEventListener.h>

#include "ClockUiExport.h"

class AlarmRepeatItem;
class AlarmTimePickerItem;

/** @brief A month calendar with Cancel and Set. Days before today cannot be set. */
class CLOCK_UI_EXPORT AlarmDatePopupViewController : public app_assist::WPopupController,
                                                     public ClockEventListener {
public:
    /**
     * All of them must outlive the popup.
     * @param alarm The editor's working record.
     * @param timePicker The row that shows the chosen time and day.
     * @param repeat The row that shows the repeat days, which setting a day clears.
     * @param date The editor's chosen day: where the calendar opens, and where Set writes.
     */
    AlarmDatePopupViewController(ClockAlarmDbData& alarm, AlarmTimePickerItem* timePicker,
                                 AlarmRepeatItem* repeat, struct tm& date);
    ~AlarmDatePopupViewController() override;

    const char* getClassName() const override { return "AlarmDatePopupViewController"; }
    void onEvent(EventType type) override;

    /** @brief Stores a completion function; the popup itself never calls it. */
    void setSelectedCb(const std::function<void()>& selected);

    /** @brief Makes the calendar and adds the buttons. @return Null without a parent. */
    Evas_Object* _createContent(Evas_Object* parent);
    /** @brief Toolkit callback; data is the popup. */
    static void _calendarPopupDateChangedCb(void* data, Evas_Object* calendar, void* info);

protected:
    Evas_Object* onCreateView(Evas_Object* parent, void* param) override;

private:
    void _calendarPopupSetBtnClickedCb();
    void _updateCalendarBtnText();

    std::function<void()> _selected;
    Evas_Object* _calendar = nullptr;
    Evas_Object* _setButton = nullptr;
    Evas_Object* _cancelButton = nullptr;
    AlarmTimePickerItem* _timePicker;
    AlarmRepeatItem* _repeat;
    ClockAlarmDbData& _alarm;
    struct tm& _date;
};
