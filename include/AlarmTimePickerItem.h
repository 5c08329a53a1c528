/**
 * @file
 * @brief The editor's row with the time wheels and the day of ringing.
 */
#pragma once

#include <ctime>
#include <functional>
#include <string>

#include <app_assist/WGenlistItem.h>
#include <clock/ClockAlarmDbData.h>
#include <device/vconf.h>

#include "ClockUiExport.h"
#include "LiveWidgets.h"

/**
 * @brief Time wheels, and under them a strip with the day of ringing and the date button.
 *
 * Every turn of a wheel writes the alarm's time at once and, unless the alarm has repeat days or a
 * picked date, the day on which it will ring.
 */
class CLOCK_UI_EXPORT AlarmTimePickerItem : public app_assist::WGenlistItem {
public:
    /**
     * @param alarm The editor's working record; outlives the row.
     * @param date The editor's chosen day; the row writes the day that it computes into it.
     */
    AlarmTimePickerItem(ClockAlarmDbData& alarm, std::tm& date);
    ~AlarmTimePickerItem() override;

    /** @brief A new item class of the style "edit.theme.time". */
    Elm_Genlist_Item_Class* getItemClassNew() override;
    /** @brief Names the row for screen readers. */
    void onSetElmObjectItem(Elm_Object_Item* item) override;

    /**
     * @brief Sets what the date button does. Replaces the earlier function.
     *
     * A click without one throws std::bad_function_call.
     */
    void setDateBtnSelectedCb(const std::function<void()>& selected);

    /** @brief Brings the strip up to date after the day or the language may have changed. */
    void updateDateText();

    /** @brief The strip's text, also while the list has taken the strip away; may be empty. */
    std::string getDateText() const;
    /** @brief Writes the strip's text, or that of the next strip while there is none. */
    void setDateText(const std::string& text);

    /** @brief Lets the list's next update of the row make its content anew. */
    void renewContent();

    /** @brief The time wheels; null while the row has none. */
    Evas_Object* getDateTimeObj() const { return _datetimes.newest(); }
    /** @brief The strip, with the text part "date.text"; null while the row has none. */
    Evas_Object* getCalendarObj() const { return _calendars.newest(); }

    /** @name Toolkit and device callbacks; data is the row unless told otherwise.
     *  @{ */
    static Evas_Object* _getTimePickerItemContent(void* data, Evas_Object* genlist,
                                                  const char* part);
    /** @param old The content that the list took away when it put the row aside; may be null. */
    static Evas_Object* _keepTimePickerItemContent(void* data, Evas_Object* genlist,
                                                   const char* part, Evas_Object* old);
    static void _datetimeChangedCb(void* data, Evas_Object* datetime, void* info);
    static void _dateBtnClickedCb(void* data, Evas_Object* button, void* info);
    /** @brief Gives the wheels the form that the settings ask for. */
    static void _datetimePickerRegionFormatSet(Evas_Object* datetime);
    /** @param data The wheels. Those that have died in the meantime are recognised. */
    static void _datetimeFormatChangedCb(keynode_t* node, void* data);
    /** @} */

private:
    static void _calendarDeletedCb(void* data, Evas* evas, Evas_Object* calendar, void* info);
    Evas_Object* createTimePicker(Evas_Object* genlist);
    Evas_Object* createCalendar(Evas_Object* genlist);
    Evas_Object* createDateButton(Evas_Object* calendar);
    void showDate(Evas_Object* calendar);
    void nameRow();
    std::string ringDateText();
    std::string repairedDateText();

    std::function<void()> _dateBtnSelected;
    ClockAlarmDbData& _alarm;
    LiveWidgets _datetimes;
    LiveWidgets _calendars;
    LiveWidgets _dateButtons;
    std::tm& _date;
    /** What the strip told when the list took it away. */
    std::string _lastDateText;
};
