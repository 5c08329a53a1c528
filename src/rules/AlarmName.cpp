#include "rules/AlarmName.h"

namespace rules {

std::string withoutLeadingBlanks(std::string_view label) {
    const auto first = label.find_first_not_of(' ');
    return first == std::string_view::npos ? "" : std::string(label.substr(first));
}

} // namespace rules
