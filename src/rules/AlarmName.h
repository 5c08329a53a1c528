// The label of an alarm.
#pragma once

#include <string>
#include <string_view>

namespace rules {

// Drops the blanks before a label; blanks after it and other white space belong to it.
std::string withoutLeadingBlanks(std::string_view label);

} // namespace rules
