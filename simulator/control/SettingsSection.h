/**
 * @file
 * @brief The panel's settings of the device.
 */
#pragma once

#include <functional>
#include <string>
#include <vector>

#include <Evas.h>

namespace simulator::control {

/** Gets one sentence when a setting was refused, an empty one when it was made. */
using Tell = std::function<void(const std::string& problem)>;

/** @brief Language, region, hours, power saving, motion, volume and network. */
class SettingsSection {
public:
    SettingsSection(Evas_Object* column, const Tell& tell);
    SettingsSection(const SettingsSection&) = delete;
    SettingsSection& operator=(const SettingsSection&) = delete;

    /** @brief Shows the settings as they are now, whoever has changed them. */
    void refresh();

private:
    void addLanguages(Evas_Object* content, const Tell& tell);
    void addTimeForm(Evas_Object* row, const Tell& tell);
    void addOnOff(Evas_Object* row, const char* label, const char* setting, const Tell& tell,
                  int width = 0);
    void addVolume(Evas_Object* content, const Tell& tell);
    void addText(Evas_Object* row, const char* caption, const char* hint, const char* setting,
                 const Tell& tell);

    std::vector<std::function<void()>> _refreshes;
};

} // namespace simulator::control
