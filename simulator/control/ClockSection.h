/**
 * @file
 * @brief The panel's clock: what it shows, and setting it.
 */
#pragma once

#include <memory>
#include <string>

#include <Evas.h>

#include "SettingsSection.h"
#include "ZoneField.h"

namespace simulator::control {

/** @brief The device's time, large, with what last went wrong and a lamp for haptic taps. */
class Readout {
public:
    explicit Readout(Evas_Object* column);
    Readout(const Readout&) = delete;
    Readout& operator=(const Readout&) = delete;

    void refresh();
    /** @brief Shows a sentence for some seconds; an empty one ends it. */
    void tell(const std::string& problem);
    void pulse();

private:
    Evas_Object* _layout;
    std::string _problem;
    double _problemEnd = 0; ///< In the main loop's time.
};

/** @brief Setting the clock and the time zone. */
class ClockSection {
public:
    ClockSection(Evas_Object* column, const Tell& tell);
    ClockSection(const ClockSection&) = delete;
    ClockSection& operator=(const ClockSection&) = delete;

    void refresh();

private:
    std::unique_ptr<ZoneField> _zone;
};

} // namespace simulator::control
