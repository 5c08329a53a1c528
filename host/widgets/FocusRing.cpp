#include "FocusRing.h"

#include <ctime>
#include <string>

#include "CalendarDays.h"
#include "Index.h"
#include "ThemeNames.h"

namespace host {

namespace {

constexpr int DAYS_DRAWN = 42;

void emit(const FocusThing& thing, const char* signal, const char* source) {
    if (thing.kind == FocusKind::Row)
        elm_object_item_signal_emit(thing.item, signal, source);
    else
        elm_object_signal_emit(thing.object, signal, source);
}

/** The ground of a field to search with belongs to what is around it. */
Evas_Object* groundOf(const FocusThing& thing) {
    Evas_Object* around =
        thing.kind == FocusKind::Field ? elm_object_parent_widget_get(thing.object) : nullptr;
    return around && !thing.list ? around : nullptr;
}

/** Where the calendar draws its selected day. */
int placeOfSelectedDay(const Evas_Object* calendar) {
    std::tm day{};
    elm_calendar_selected_time_get(calendar, &day);
    return cellOfDay(day, day.tm_mday,
                     static_cast<int>(elm_calendar_first_day_of_week_get(calendar)));
}

void ringDay(Evas_Object* calendar) {
    const int selected = placeOfSelectedDay(calendar);
    for (int place = 0; place < DAYS_DRAWN; ++place) {
        const std::string day = "cit_" + std::to_string(place);
        elm_object_signal_emit(calendar,
                               (day + (place == selected ? ",focused" : ",unfocused")).c_str(),
                               theme::TOOLKIT_SOURCE);
    }
}

} // namespace

void showRing(const FocusThing& thing, bool turning) {
    emit(thing, theme::SIGNAL_RING_SHOW, theme::TOOLKIT_SOURCE);
    if (canTurn(thing.kind))
        emit(thing, turning ? theme::SIGNAL_TURNING : theme::SIGNAL_RESTING, theme::SIGNAL_SOURCE);
    if (Evas_Object* ground = groundOf(thing))
        elm_object_signal_emit(ground, theme::SIGNAL_RING_SHOW, theme::TOOLKIT_SOURCE);
    if (thing.kind == FocusKind::Calendar)
        ringDay(thing.object);
    if (thing.kind == FocusKind::Index)
        edje_object_part_text_set(elm_layout_edje_get(thing.object), theme::PART_INDEX_SAID,
                                  indexText(thing.object).c_str());
}

void hideRing(const FocusThing& thing) {
    if (canTurn(thing.kind))
        emit(thing, theme::SIGNAL_RESTING, theme::SIGNAL_SOURCE);
    emit(thing, theme::SIGNAL_RING_HIDE, theme::TOOLKIT_SOURCE);
    if (Evas_Object* ground = groundOf(thing))
        elm_object_signal_emit(ground, theme::SIGNAL_RING_HIDE, theme::TOOLKIT_SOURCE);
}

} // namespace host
