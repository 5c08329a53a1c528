#include "ClockSection.h"

#include <array>
#include <cstdio>
#include <cstdlib>
#include <ctime>

#include <Elementary.h>

#include "ClockShift.h"
#include "ControlWidgets.h"
#include "DeviceSettings.h"
#include "base/CivilTime.h"

namespace simulator::control {
namespace {

constexpr double TOLD_SECONDS = 6;
constexpr int READOUT_HEIGHT = 68;
constexpr int SET_WIDTH = 56;
constexpr int MINUTE = 60;
constexpr int HOUR = 60 * MINUTE;
constexpr int DAY = 24 * HOUR;

template <typename... Values>
std::string format(const char* form, Values... values) {
    std::array<char, 128> text{};
    std::snprintf(text.data(), text.size(), form, values...);
    return text.data();
}

std::string dateText(const base::CivilDate& date) {
    static constexpr std::array<const char*, 7> DAYS{"Sun", "Mon", "Tue", "Wed",
                                                     "Thu", "Fri", "Sat"};
    static constexpr std::array<const char*, 12> MONTHS{"Jan", "Feb", "Mar", "Apr", "May", "Jun",
                                                        "Jul", "Aug", "Sep", "Oct", "Nov", "Dec"};
    return format("%s %d %s %d", DAYS.at(static_cast<std::size_t>(base::weekdayOf(date))), date.day,
                  MONTHS.at(static_cast<std::size_t>(date.month) - 1), date.year);
}

std::string zoneText(const std::string& zone, std::int64_t now) {
    const int minutes = base::utcOffset(now, zone) / MINUTE;
    return zone + format(" · UTC%s%d:%02d", minutes < 0 ? "−" : "+", std::abs(minutes) / 60,
                         std::abs(minutes) % 60);
}

std::string shiftText(int shift) {
    if (shift == 0)
        return "Real time";
    const int size = std::abs(shift);
    const std::string days = size < DAY ? "" : format("%d d ", size / DAY);
    return days + format("%02d:%02d:%02d %s real time", size % DAY / HOUR, size % HOUR / MINUTE,
                         size % MINUTE, shift > 0 ? "ahead of" : "behind");
}

void addJump(Evas_Object* row, const char* label, const char* name, const Tell& tell,
             const std::function<std::string()>& value) {
    onEvent(addButton(row, label, name), "clicked",
            [tell, value] { tell(setDevice("clock", value())); });
}

/** A value that lies some seconds from what the clock shows. */
std::string stepped(int seconds) {
    const int shift = std::atoi(deviceSetting("clock").c_str()) + seconds;
    return shift == 0 ? "real" : format("%+d", shift);
}

} // namespace

Readout::Readout(Evas_Object* column) : _layout(elm_layout_add(column)) {
    elm_layout_theme_set(_layout, "simulator", "control", "readout");
    evas_object_name_set(_layout, "Readout");
    // It is in English, whichever way the face is read.
    elm_object_mirrored_automatic_set(_layout, EINA_FALSE);
    elm_object_mirrored_set(_layout, EINA_FALSE);
    place(addRow(column, READOUT_HEIGHT), _layout);
    refresh();
}

void Readout::refresh() {
    const auto now = static_cast<std::int64_t>(std::time(nullptr));
    const std::string zone = base::currentTimeZone();
    const auto shown = base::toCivil(now, zone);
    const int shift = std::atoi(deviceSetting("clock").c_str());
    const auto show = [this](const char* part, const std::string& text) {
        elm_object_part_text_set(_layout, part, text.c_str());
    };
    show("readout.time", format("%02d:%02d:%02d", shown.hour, shown.minute, shown.second));
    show("readout.date", dateText(shown.date));
    show("readout.zone", zoneText(zone, now));
    if (_problem.empty() || ecore_loop_time_get() > _problemEnd) {
        show("readout.message", shiftText(shift));
        elm_object_signal_emit(_layout, shift == 0 ? "readout,real" : "readout,shifted",
                               "simulator");
    }
}

void Readout::tell(const std::string& problem) {
    _problem = problem;
    _problemEnd = ecore_loop_time_get() + TOLD_SECONDS;
    refresh();
    if (problem.empty())
        return;
    elm_object_part_text_set(_layout, "readout.message", problem.c_str());
    elm_object_signal_emit(_layout, "readout,problem", "simulator");
}

void Readout::pulse() {
    elm_object_signal_emit(_layout, "readout,pulse", "simulator");
}

ClockSection::ClockSection(Evas_Object* column, const Tell& tell) {
    Evas_Object* content = addSection(column, "CLOCK");
    Evas_Object* row = addRow(content);
    addCaption(row, "Set to");
    Evas_Object* field = addField(row, "2026-12-31 23:59:50", "Date and time");
    const Action set = [tell, field] {
        tell(setDevice("clock", textOf(field)));
    };
    onEvent(field, "activated", set);
    Evas_Object* button = addButton(row, "Set", "Set the clock", SET, SET_WIDTH);
    onEvent(button, "clicked", set);

    row = addRow(content);
    addJump(row, "−1 h", "One hour back", tell, [] { return stepped(-HOUR); });
    addJump(row, "+1 h", "One hour on", tell, [] { return stepped(HOUR); });
    addJump(row, "Midnight", "Before midnight", tell,
            [] { return std::string("before-midnight"); });
    addJump(row, "DST", "Before the daylight-saving change", tell,
            [] { return std::string("before-dst"); });
    addJump(row, "Real", "Back to the real time", tell, [] { return std::string("real"); });

    row = addRow(content);
    addCaption(row, "Zone");
    _zone = std::make_unique<ZoneField>(
        row, [tell](const std::string& zone) { tell(setDevice("time-zone", zone)); });
    refresh();
}

void ClockSection::refresh() {
    _zone->show(deviceSetting("time-zone"));
}

} // namespace simulator::control
