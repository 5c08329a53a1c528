#include "rules/EverySearch.h"

#include <array>

#include <clock/ClockText.h>
#include <unicode/ustring.h>

namespace {

constexpr std::int32_t ROOM = 512;

/** In lower case, in a buffer of zeros, and of the length that it had before. */
std::u16string lowered(const std::string& utf8, const std::string& locale, bool& failed) {
    std::array<char16_t, ROOM> text{};
    std::array<char16_t, ROOM> lower{};
    UErrorCode status = U_ZERO_ERROR;
    u_strFromUTF8WithSub(text.data(), ROOM - 1, nullptr, utf8.c_str(), -1, 0xfffd, nullptr,
                         &status);
    const auto length = u_strlen(text.data());
    status = U_ZERO_ERROR;
    u_strToLower(lower.data(), ROOM, text.data(), length, locale.c_str(), &status);
    failed = U_FAILURE(status);
    return {lower.data(), static_cast<std::size_t>(length)};
}

} // namespace

EverySearch::EverySearch(const std::vector<ClockWorldClockDbData>& cities,
                         const std::string& locale)
    : _locale(locale) {
    for (const auto& city : cities) {
        const std::string text =
            std::string(clockText(city.city.c_str())) + ", " + clockText(city.country.c_str());
        Target target;
        target.lower = lowered(text.substr(0, ROOM - 1), locale, target.failed);
        _targets.push_back(target);
    }
}

std::vector<std::size_t> EverySearch::find(const std::string& text) {
    bool failed = false;
    const auto pattern = lowered(text, _locale, failed);
    UErrorCode status = U_ZERO_ERROR;
    _search.reset(pattern.empty()
                      ? nullptr
                      : usearch_open(pattern.data(), static_cast<std::int32_t>(pattern.size()),
                                     u"x", 1, _locale.c_str(), nullptr, &status));
    std::vector<std::size_t> found;
    for (std::size_t place = 0; place < _targets.size(); ++place) {
        if (isFoundIn(_targets[place], pattern))
            found.push_back(place);
    }
    return found;
}

bool EverySearch::isFoundIn(const Target& target, const std::u16string& pattern) {
    if (pattern.empty())
        return true;
    if (pattern.size() > target.lower.size() || target.failed || !_search)
        return false;
    UErrorCode status = U_ZERO_ERROR;
    usearch_setText(_search.get(), target.lower.data(),
                    static_cast<std::int32_t>(target.lower.size()), &status);
    usearch_first(_search.get(), &status);
    return usearch_getMatchedText(_search.get(), nullptr, 0, &status) > 0;
}
