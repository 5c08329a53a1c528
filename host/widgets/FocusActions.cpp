#include "FocusActions.h"

#include <ctime>

#include "Accessible.h"
#include "Index.h"
#include "ThemeNames.h"
#include "TimeWheel.h"

namespace host {

namespace {

/** As the theme tells of a finger: some widgets listen to the press, others to the click. */
void pressButton(Evas_Object* button) {
    for (const char* signal :
         {"elm,action,press", "elm,action,unpress", "elm,anim,activate", "elm,action,check,toggle"})
        elm_object_signal_emit(button, signal, theme::TOOLKIT_SOURCE);
    // The toolkit hears this one last: whoever is told may delete the button.
    elm_object_signal_emit(button, "elm,action,click", theme::TOOLKIT_SOURCE);
}

void turnSlider(Evas_Object* slider, int steps) {
    double least = 0;
    double most = 0;
    elm_slider_min_max_get(slider, &least, &most);
    const double level = elm_slider_value_get(slider);
    const double next = levelAfterTurn(level, least, most, elm_slider_step_get(slider), steps);
    if (next == level)
        return;
    elm_slider_value_set(slider, next);
    evas_object_smart_callback_call(slider, "changed", nullptr);
}

void turnCalendar(Evas_Object* calendar, int days) {
    std::tm selected{};
    std::tm displayed{};
    int firstYear = 0;
    int lastYear = 0;
    if (!elm_calendar_selected_time_get(calendar, &selected) ||
        !elm_calendar_displayed_time_get(calendar, &displayed))
        return;
    std::tm next = dayAfterTurn(selected, displayed, days);
    elm_calendar_min_max_year_get(calendar, &firstYear, &lastYear);
    constexpr int YEAR_ZERO = 1900;
    const int year = next.tm_year + YEAR_ZERO;
    if (year < firstYear || (lastYear > 0 && year > lastYear))
        return;
    elm_calendar_selected_time_set(calendar, &next);
    evas_object_smart_calculate(calendar);
    evas_object_smart_callback_call(calendar, "changed", nullptr);
}

} // namespace

void activate(const FocusThing& thing) {
    if (thing.kind == FocusKind::Row)
        elm_genlist_item_selected_set(thing.item, EINA_TRUE);
    else
        pressButton(thing.object);
}

void hold(const FocusThing& row) {
    evas_object_smart_callback_call(row.list, "longpressed", row.item);
}

void turn(const FocusThing& thing, int steps) {
    if (TimeWheel* wheel = TimeWheel::of(thing.object))
        wheel->step(steps);
    else if (thing.kind == FocusKind::Slider)
        turnSlider(thing.object, steps);
    else if (thing.kind == FocusKind::Calendar)
        turnCalendar(thing.object, steps);
    else if (thing.kind == FocusKind::Index)
        turnIndex(thing.object, steps);
}

void dropToolkitFocus(const Evas_Object* window, Evas_Object* taker) {
    if (taker)
        focusSilently(taker);
    else if (Evas_Object* focused = elm_object_focused_object_get(window))
        elm_object_focus_set(focused, EINA_FALSE);
}

void giveToolkitFocus(const FocusThing& thing) {
    elm_object_focus_set(thing.object, EINA_TRUE);
}

} // namespace host
