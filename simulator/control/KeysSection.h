/**
 * @file
 * @brief The panel's keys and what else a person does to a watch.
 */
#pragma once

#include <memory>
#include <vector>

#include <Evas.h>

#include "ControlActions.h"
#include "HoldKey.h"

namespace simulator::control {

/** @brief Hardware keys, the bezel, the quick panel, background and foreground. */
class KeysSection {
public:
    KeysSection(Evas_Object* column, const ControlActions& actions);
    KeysSection(const KeysSection&) = delete;
    KeysSection& operator=(const KeysSection&) = delete;

private:
    void addHeld(Evas_Object* row, const char* label, const char* name, const char* key,
                 const ControlActions& actions);

    std::vector<std::unique_ptr<HoldKey>> _keys;
};

} // namespace simulator::control
