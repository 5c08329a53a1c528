/**
 * @file
 * @brief Time zones by what a person types of their names.
 */
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace simulator {

/**
 * @brief The time zones that contain a text, whatever its case; a space also means "_".
 * @param most At most so many; those whose city begins with the text come first.
 * @return Names that base::isTimeZone() knows; none for an empty text.
 */
std::vector<std::string> zonesMatching(const std::string& text, std::size_t most);

} // namespace simulator
