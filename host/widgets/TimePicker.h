/**
 * @file
 * @brief The time picker: two or three wheels behind the toolkit's date-time functions.
 */
#pragma once

#include <array>
#include <ctime>
#include <memory>
#include <string>
#include <vector>

#include <Elementary.h>

#include "TimeTexts.h"
#include "TimeWheel.h"

namespace host {

/**
 * @brief Hours and minutes of a broken-down time, turned by a person.
 *
 * With 12 hours the hour wheel does not change the half day: turning from 11 to 12 AM gives
 * midnight. The half-day wheel has two values and does not wrap.
 */
class TimePicker {
public:
    /** @return The widget, which owns its picker; null when the theme has none. */
    static Evas_Object* create(Evas_Object* parent, const char* style);
    /** The picker of a widget that create() made; null for any other object. */
    static TimePicker* of(const Evas_Object* object);

    TimePicker(const TimePicker&) = delete;
    TimePicker& operator=(const TimePicker&) = delete;
    ~TimePicker();

    /** @return False, with nothing changed, for an hour or minute that no clock shows. */
    bool setTime(const std::tm& time);
    const std::tm& time() const { return _time; }
    /** @param format strftime() form; %I, %l or %p mean 12 hours. */
    void setFormat(const char* format);
    /** In force; never null. */
    const char* format() const;
    void setLocale(const char* locale, bool is24Hours);
    bool is24Hours() const { return _is24Hours; }
    /** Its wheels from left to right. */
    std::vector<TimeWheel*> wheels() const;
    const TimeWheel* hourWheel() const { return _hour.get(); }
    const TimeWheel* minuteWheel() const { return _minute.get(); }
    /** Hidden with 24 hours. */
    const TimeWheel* halfWheel() const { return _half.get(); }

private:
    explicit TimePicker(Evas_Object* object);
    bool addWheels();
    static void _themeChangedCb(void* data, Evas_Object* object, void* info);
    static void _deletedCb(void* data, Evas* canvas, Evas_Object* object, void* info);
    void setForm(bool is24Hours);
    /** Gives the wheels the values of the form and the locale. */
    void fillWheels();
    void placeHalf();
    void showTime();
    void turned();
    bool moveFocus(const TimeWheel* from, int direction) const;

    Evas_Object* _object;
    std::unique_ptr<TimeWheel> _hour;
    std::unique_ptr<TimeWheel> _minute;
    std::unique_ptr<TimeWheel> _half;
    TimeTexts _texts;
    std::tm _time{};
    std::string _format;
    bool _is24Hours = true;
    bool _halfFirst = false;
};

} // namespace host
