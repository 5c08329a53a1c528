// The first line of a city's row.
#pragma once

#include <functional>
#include <string>

namespace rules {

struct TextColour {
    int red = 0;
    int green = 0;
    int blue = 0;
    int alpha = 0;
};

// The text with the keyword's first occurrence coloured, whatever its case, in at most 511 bytes.
// The text is not escaped. The colour is asked for only where there is an occurrence.
std::string highlight(const std::string& text, const std::string& keyword,
                      const std::function<TextColour()>& colour);

// "<city>, <country>", or the city alone, in at most 255 bytes.
std::string cityLine(const std::string& city, const std::string& country, bool cityOnly);

} // namespace rules
