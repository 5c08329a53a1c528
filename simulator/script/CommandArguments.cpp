#include "CommandArguments.h"

#include <charconv>

namespace simulator {

std::optional<int> wholeNumber(const std::string& text) {
    int number = 0;
    const char* end = text.data() + text.size();
    const auto [last, problem] = std::from_chars(text.data(), end, number);
    if (problem != std::errc() || last != end)
        return std::nullopt;
    return number;
}

std::optional<double> secondsIn(const std::string& text) {
    constexpr double MOST = 600;
    double number = 0;
    const char* end = text.data() + text.size();
    const auto [last, problem] =
        std::from_chars(text.data(), end, number, std::chars_format::fixed);
    if (problem != std::errc() || last != end || !(number >= 0 && number <= MOST))
        return std::nullopt;
    return number;
}

std::optional<Place> placeIn(const Arguments& arguments, std::size_t at) {
    if (arguments.size() < at + 2)
        return std::nullopt;
    const auto x = wholeNumber(arguments[at]);
    const auto y = wholeNumber(arguments[at + 1]);
    if (!x || !y || *x < 0 || *y < 0 || *x >= FACE_PIXELS || *y >= FACE_PIXELS)
        return std::nullopt;
    return Place{*x, *y};
}

std::string notSeconds(const std::string& text) {
    return "'" + text + "' is no number of seconds from 0 to 600";
}

std::string notPlace(const Arguments& arguments, std::size_t at) {
    return "'" + arguments[at] + " " + arguments[at + 1] +
           "' is no place on the face: x and y go from 0 to 359";
}

std::string notTextOrPlace(const Arguments& arguments) {
    if (!wholeNumber(arguments[0]) && !wholeNumber(arguments[1]))
        return NEEDS_QUOTES;
    return notPlace(arguments, 0) + " (" + NEEDS_QUOTES + ")";
}

std::string notSecondsAfterText(const std::string& text) {
    return notSeconds(text) + " (" + NEEDS_QUOTES + ")";
}

} // namespace simulator
