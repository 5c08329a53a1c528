#include "SettingsSection.h"

#include <array>
#include <cmath>
#include <cstdlib>

#include <Elementary.h>

#include "ControlWidgets.h"
#include "DeviceSettings.h"
#include "Languages.h"

namespace simulator::control {
namespace {

constexpr int COLUMNS = 4;
/** The longest name stands in the third column. */
constexpr std::array<int, COLUMNS> COLUMN_WIDTHS{0, 0, 112, 0};
constexpr int POWER_SAVING_WIDTH = 104;
constexpr int NONE = -1;
constexpr int NUMBER_WIDTH = 22;
constexpr double LOUDEST = 15;

int languageIndex() {
    const Language* language = languageOf(deviceSetting("language"));
    return language == nullptr ? NONE : static_cast<int>(language - LANGUAGES.data());
}

/** Shows the value of a choice that nobody has touched. */
void showChoice(Evas_Object* group, int value) {
    if (elm_radio_value_get(group) != value)
        elm_radio_value_set(group, value);
}

} // namespace

SettingsSection::SettingsSection(Evas_Object* column, const Tell& tell) {
    Evas_Object* content = addSection(column, "DEVICE");
    addLanguages(content, tell);
    Evas_Object* row = addRow(content);
    addTimeForm(row, tell);
    addOnOff(row, "Power saving", "power-saving", tell, POWER_SAVING_WIDTH);
    addOnOff(row, "Motion", "motion", tell);
    row = addRow(content);
    addText(row, "Region", "de_DE", "region", tell);
    addText(row, "Network", "26201", "network", tell);
    addVolume(content, tell);
    refresh();
}

void SettingsSection::refresh() {
    for (const auto& one : _refreshes)
        one();
}

void SettingsSection::addLanguages(Evas_Object* content, const Tell& tell) {
    Evas_Object* group = nullptr;
    Evas_Object* row = nullptr;
    for (std::size_t i = 0; i < LANGUAGES.size(); ++i) {
        if (i % COLUMNS == 0)
            row = addRow(content);
        const Language& language = LANGUAGES.at(i);
        Evas_Object* radio = addRadio(row, language.name, std::string("Language ") + language.name,
                                      group, static_cast<int>(i), COLUMN_WIDTHS.at(i % COLUMNS));
        onEvent(radio, "changed",
                [tell, &language] { tell(setDevice("language", language.code)); });
        if (group == nullptr)
            group = radio;
    }
    // The last row is as wide as the others.
    for (std::size_t i = LANGUAGES.size(); i % COLUMNS != 0; ++i)
        place(row, elm_box_add(row), COLUMN_WIDTHS.at(i % COLUMNS));
    _refreshes.emplace_back([group] { showChoice(group, languageIndex()); });
}

void SettingsSection::addTimeForm(Evas_Object* row, const Tell& tell) {
    Evas_Object* group = nullptr;
    for (const char* form : {"12", "24"}) {
        Evas_Object* radio = addRadio(row, (std::string(form) + " hours").c_str(),
                                      std::string(form) + " hours", group, std::atoi(form));
        onEvent(radio, "changed", [tell, form] { tell(setDevice("time-form", form)); });
        if (group == nullptr)
            group = radio;
    }
    _refreshes.emplace_back(
        [group] { showChoice(group, std::atoi(deviceSetting("time-form").c_str())); });
}

void SettingsSection::addOnOff(Evas_Object* row, const char* label, const char* setting,
                               const Tell& tell, int width) {
    Evas_Object* check = addSwitch(row, label, label, width);
    onEvent(check, "changed", [tell, check, setting] {
        tell(setDevice(setting, elm_check_state_get(check) != EINA_FALSE ? "on" : "off"));
    });
    _refreshes.emplace_back([check, setting] {
        const Eina_Bool on = deviceSetting(setting) == "on" ? EINA_TRUE : EINA_FALSE;
        if (elm_check_state_get(check) != on)
            elm_check_state_set(check, on);
    });
}

void SettingsSection::addVolume(Evas_Object* content, const Tell& tell) {
    Evas_Object* row = addRow(content);
    addCaption(row, "Volume");
    Evas_Object* slider = elm_slider_add(row);
    prepare(slider, "Alarm volume");
    elm_object_style_set(slider, PLAIN);
    elm_slider_min_max_set(slider, 0, LOUDEST);
    elm_slider_step_set(slider, 1 / LOUDEST);
    elm_slider_indicator_show_set(slider, EINA_FALSE);
    place(row, slider);
    Evas_Object* number = elm_layout_add(row);
    elm_layout_theme_set(number, "simulator", "control", "number");
    place(row, number, NUMBER_WIDTH);
    onEvent(slider, "changed", [tell, slider] {
        tell(setDevice("volume", std::to_string(std::lround(elm_slider_value_get(slider)))));
    });
    _refreshes.emplace_back([slider, number] {
        const std::string level = deviceSetting("volume");
        elm_object_part_text_set(number, "number.text", level.c_str());
        // Between two levels the knob is in somebody's hand.
        if (std::lround(elm_slider_value_get(slider)) != std::atoi(level.c_str()))
            elm_slider_value_set(slider, std::atoi(level.c_str()));
    });
}

void SettingsSection::addText(Evas_Object* row, const char* caption, const char* hint,
                              const char* setting, const Tell& tell) {
    addCaption(row, caption);
    Evas_Object* field = addField(row, hint, caption);
    onEvent(field, "activated",
            [tell, field, setting] { tell(setDevice(setting, textOf(field))); });
    _refreshes.emplace_back([field, setting] { showText(field, deviceSetting(setting)); });
}

} // namespace simulator::control
