#include "screens/DatePopupFixture.h"

#include <ctime>

#include <gtest/gtest.h>

Evas_Object* DatePopupOnFace::calendar() const {
    const auto calendars = _stage.widgets("Elm_Calendar");
    return calendars.empty() ? nullptr : calendars.back();
}

void DatePopupOnFace::tapDay(int day) {
    const std::string wanted = std::to_string(day);
    for (const FoundText& found : _stage.texts()) {
        if (found.widget == calendar() && found.text == wanted) {
            _stage.tap(found.area.middle());
            _stage.settle();
            return;
        }
    }
    ADD_FAILURE() << "the calendar shows no day " << day;
}

void DatePopupOnFace::turnMonths(int months) {
    for (int i = 0; i < std::abs(months); ++i) {
        const char* part = months > 0 ? "elm,calendar,button,right" : "elm,calendar,button,left";
        _stage.tap(elm_layout_content_get(calendar(), part));
        _stage.settle();
    }
}

void DatePopupOnFace::tapButton(const std::string& text) {
    if (const auto found = button(text))
        _stage.tap(found->area.middle());
    else
        ADD_FAILURE() << "the popup has no button \"" << text << "\"";
    _stage.settle();
}

std::optional<FoundText> DatePopupOnFace::button(const std::string& text) const {
    std::optional<FoundText> lowest;
    for (const FoundText& found : _stage.texts())
        if (found.text == text)
            lowest = found;
    return lowest;
}

bool DatePopupOnFace::canSet() const {
    const auto found = button("Set");
    return found && !elm_object_disabled_get(found->widget);
}

std::string DatePopupOnFace::selectedDay() const {
    std::tm day{};
    if (!calendar() || !elm_calendar_selected_time_get(calendar(), &day))
        return "";
    char text[16];
    std::strftime(text, sizeof text, "%Y-%m-%d", &day);
    return text;
}

std::string DatePopupOnFace::partText(const std::string& part) const {
    const char* text =
        calendar() ? edje_object_part_text_get(elm_layout_edje_get(calendar()), part.c_str())
                   : nullptr;
    return text ? text : "";
}
