#include "rules/CityHighlight.h"

#include <array>
#include <cstdio>
#include <cstring>
#include <string_view>

#include <base/Text.h>

namespace rules {

namespace {

constexpr std::size_t MAX_PIECE_BYTES = 511;
constexpr std::size_t MAX_LINE_BYTES = 255;

// Takes texts until one does not fit: of that it takes whole characters, and nothing after it.
class PieceBuilder {
public:
    PieceBuilder& operator<<(std::string_view text) {
        if (_full)
            return *this;
        const auto head = base::cutUtf8(text, MAX_PIECE_BYTES - _piece.size());
        _full = head.size() < text.size();
        _piece += head;
        return *this;
    }

    std::string take() { return std::move(_piece); }

private:
    std::string _piece;
    bool _full = false;
};

std::string openingTag(const TextColour& colour) {
    std::array<char, 64> tag{};
    const auto channel = [](int value) {
        return static_cast<unsigned>(value);
    };
    std::snprintf(tag.data(), tag.size(), "<color=#%02x%02x%02x%02x>", channel(colour.red),
                  channel(colour.green), channel(colour.blue), channel(colour.alpha));
    return tag.data();
}

} // namespace

std::string highlight(const std::string& text, const std::string& keyword,
                      const std::function<TextColour()>& colour) {
    const std::string_view whole = text.c_str();
    const char* match = strcasestr(text.c_str(), keyword.c_str());
    PieceBuilder piece;
    if (!match)
        return (piece << whole).take();
    const auto start = static_cast<std::size_t>(match - text.c_str());
    const auto length = std::strlen(keyword.c_str());
    piece << whole.substr(0, start) << openingTag(colour()) << whole.substr(start, length)
          << "</color>" << whole.substr(start + length);
    return piece.take();
}

std::string cityLine(const std::string& city, const std::string& country, bool cityOnly) {
    return std::string(base::cutUtf8(cityOnly ? city : city + ", " + country, MAX_LINE_BYTES));
}

} // namespace rules
