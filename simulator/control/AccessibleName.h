/**
 * @file
 * @brief What assistive tools call a widget.
 */
#pragma once

#include <string>

#include <Evas.h>

namespace simulator::control {

void setAccessibleName(Evas_Object* widget, const std::string& name);
std::string accessibleName(const Evas_Object* widget);

} // namespace simulator::control
