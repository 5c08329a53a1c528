#include "VisibleTexts.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <iterator>

#include <unicode/uchar.h>
#include <unicode/utf8.h>

namespace simulator {

namespace {

constexpr double RADIUS = 180;
/** Soft edges of letters may cross the rim. */
constexpr double RIM_TOLERANCE = 2;

bool isOnFace(const FaceArea& area) {
    for (const int x : {area.x, area.x + area.width}) {
        for (const int y : {area.y, area.y + area.height})
            if (std::hypot(x - RADIUS, y - RADIUS) > RADIUS + RIM_TOLERANCE)
                return false;
    }
    return true;
}

/** Pictures in a text, symbols of the device's font, and marks that only direct the writing. */
bool isUnread(UChar32 character) {
    constexpr UChar32 PICTURE = 0xFFFC;
    const auto type = u_charType(character);
    return character == PICTURE || type == U_FORMAT_CHAR || type == U_PRIVATE_USE_CHAR;
}

using Indices = std::vector<std::size_t>;

template <typename Fits>
Indices find(const std::vector<VisibleText>& texts, Fits&& fits) {
    Indices found;
    for (std::size_t i = 0; i < texts.size(); ++i)
        if (fits(texts[i]))
            found.push_back(i);
    return found;
}

/** What can be touched goes before what something else covers. */
Indices preferTouchable(const std::vector<VisibleText>& texts, const Indices& found) {
    Indices touchable;
    std::copy_if(found.begin(), found.end(), std::back_inserter(touchable),
                 [&](std::size_t i) { return !texts[i].covered; });
    return touchable.empty() ? found : touchable;
}

std::string placeOf(const VisibleText& text) {
    return std::to_string(text.seen.middleX()) + " " + std::to_string(text.seen.middleY());
}

std::string quoted(const VisibleText& text) {
    return std::string("\"").append(asRead(text.text)) + "\" (" + placeOf(text) + ")";
}

} // namespace

bool VisibleText::isFullySeen() const {
    return !covered && !faint && seen == area && isOnFace(area);
}

std::string asRead(const std::string& text) {
    std::string read;
    const auto size = static_cast<std::int32_t>(text.size());
    for (std::int32_t at = 0; at < size;) {
        const auto start = static_cast<std::size_t>(at);
        UChar32 character = 0;
        U8_NEXT(text.data(), at, size, character);
        if (character >= 0 && isUnread(character))
            continue;
        if (character < 0 || !u_isUWhiteSpace(character))
            read += text.substr(start, static_cast<std::size_t>(at) - start);
        else if (!read.empty() && read.back() != ' ')
            read += ' ';
    }
    if (!read.empty() && read.back() == ' ')
        read.pop_back();
    return read;
}

TextMatch matchText(const std::vector<VisibleText>& texts, const std::string& wanted, Match match) {
    const std::string sought = asRead(wanted);
    Indices found = find(texts, [&](const VisibleText& t) { return asRead(t.text) == sought; });
    if (found.empty() && match == Match::Beginning)
        found =
            find(texts, [&](const VisibleText& t) { return asRead(t.text).starts_with(sought); });
    if (found.empty())
        return {0, "no text reads \"" + sought + "\" or begins so; " + describeTexts(texts)};
    found = preferTouchable(texts, found);
    if (found.size() == 1)
        return {found.front(), ""};
    std::string several;
    for (const std::size_t i : found)
        several += (several.empty() ? "" : ", ") + quoted(texts[i]);
    return {0, "\"" + sought + "\" may mean " + several};
}

std::string describeTexts(const std::vector<VisibleText>& texts) {
    std::string all;
    for (const VisibleText& text : texts)
        if (!text.covered)
            all += (all.empty() ? "" : ", ") + quoted(text);
    return all.empty() ? "the face shows no text" : "the face shows " + all;
}

} // namespace simulator
