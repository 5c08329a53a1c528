/**
 * @file
 * @brief The date popup as a person sees and uses it.
 */
#pragma once

#include <optional>
#include <string>

#include "support/Stage.h"

/** The popup's calendar and buttons, found on the face. */
class DatePopupOnFace {
public:
    explicit DatePopupOnFace(Stage& stage) : _stage(stage) {}

    bool isOpen() const { return !_stage.widgets("Elm_Calendar").empty(); }
    /** Null while the popup is closed. */
    Evas_Object* calendar() const;

    /** Taps a day of the month that the calendar shows. */
    void tapDay(int day);
    /** Taps the arrow to the next or to the previous month, so many times. */
    void turnMonths(int months);
    void tapSet() { tapButton("Set"); }
    void tapCancel() { tapButton("Cancel"); }
    /** Taps a button of the popup; it lies above a title button of that name. */
    void tapButton(const std::string& text);
    /** The button with a text; nothing when the face does not show it. */
    std::optional<FoundText> button(const std::string& text) const;
    bool canSet() const;

    /** The selected day as "2026-11-18"; empty without a calendar. */
    std::string selectedDay() const;
    /** "November 2026" */
    std::string monthText() const { return partText("month_text"); }
    /** The name above the first column. */
    std::string firstWeekday() const { return partText("elm.ch_0.text"); }
    /** Text of a part of the calendar. */
    std::string partText(const std::string& part) const;

private:
    Stage& _stage;
};
