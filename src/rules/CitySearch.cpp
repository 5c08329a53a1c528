#include "rules/CitySearch.h"

#include <array>
#include <cstdint>
#include <cstdio>
#include <numeric>
#include <string_view>
#include <unordered_map>

#include <clock/ClockText.h>
#include <device/i18n.h>
#include <unicode/ustring.h>

#include "rules/CollationElements.h"

#define LOG_TAG "WORLDCLOCK"
#include <base/Log.h>

namespace rules {

namespace {

constexpr std::int32_t UNITS = 512;
constexpr std::size_t TARGET_BYTES = 512;

using Buffer = std::array<i18n_uchar, UNITS>;
using Target = std::array<char, TARGET_BYTES>;

// What a city is searched by; longer names are cut.
Target targetOf(const ClockWorldClockDbData& city) {
    Target target{};
    std::snprintf(target.data(), target.size(), "%s, %s", clockText(city.city.c_str()),
                  clockText(city.country.c_str()));
    return target;
}

} // namespace

std::string searchLocale() {
    const char* locale = nullptr;
    if (i18n_ulocale_get_default(&locale) > I18N_ERROR_NONE || !locale)
        return "en_GB";
    return locale;
}

namespace {

// The steps of one search, as the device's functions take them.
class PlainSearch {
public:
    PlainSearch(const Target& target, const std::string& text) : _locale(searchLocale()) {
        i18n_ustring_copy_ua_n(_text.data(), text.c_str(), UNITS - 1);
        i18n_ustring_copy_ua_n(_target.data(), target.data(), UNITS - 1);
        _textLength = i18n_ustring_get_length(_text.data());
        _targetLength = i18n_ustring_get_length(_target.data());
    }

    bool isFound() {
        if (_textLength == 0)
            return true;
        if (_textLength > _targetLength)
            return false;
        lower();
        return isMatched();
    }

private:
    // The second text stays empty where the first fails: the error is passed on.
    void lower() {
        auto error = I18N_ERROR_NONE;
        i18n_ustring_to_lower(_lowerTarget.data(), UNITS, _target.data(), _targetLength,
                              _locale.c_str(), &error);
        if (error > I18N_ERROR_NONE)
            LOG_ERROR("i18n_ustring_to_lower failed :: uStrLower");
        i18n_ustring_to_lower(_lowerText.data(), UNITS, _text.data(), _textLength, _locale.c_str(),
                              &error);
        if (error > I18N_ERROR_NONE)
            LOG_ERROR("i18n_ustring_to_lower failed :: uSearchStrLower");
    }

    bool isMatched() {
        i18n_usearch_h search = nullptr;
        i18n_usearch_create_new(_lowerText.data(), _textLength, _lowerTarget.data(), _targetLength,
                                _locale.c_str(), nullptr, &search);
        if (!search)
            return false;
        auto error = I18N_ERROR_NONE;
        i18n_usearch_first(search, &error);
        Buffer matched{};
        const auto length = i18n_usearch_get_matched_text(search, matched.data(), UNITS, &error);
        i18n_usearch_destroy(search);
        return length > 0;
    }

    std::string _locale;
    Buffer _text{};
    Buffer _target{};
    Buffer _lowerText{};
    Buffer _lowerTarget{};
    std::int32_t _textLength = 0;
    std::int32_t _targetLength = 0;
};

} // namespace

bool isIncludeSearchText(const ClockWorldClockDbData& city, const std::string& text) {
    return PlainSearch(targetOf(city), text).isFound();
}

namespace {

// A text in lower case, cut or filled up to its length before: what is behind it in its buffer.
struct LowerText {
    std::array<char16_t, UNITS> units{};
    std::int32_t length = 0;
    bool failed = false;

    std::u16string_view view() const { return {units.data(), static_cast<std::size_t>(length)}; }
};

LowerText lowered(const char* utf8, const std::string& locale) {
    std::array<char16_t, UNITS> units{};
    LowerText lower;
    UErrorCode status = U_ZERO_ERROR;
    u_strFromUTF8WithSub(units.data(), UNITS - 1, nullptr, utf8, -1, 0xfffd, nullptr, &status);
    lower.length = u_strlen(units.data());
    status = U_ZERO_ERROR;
    u_strToLower(lower.units.data(), UNITS, units.data(), lower.length, locale.c_str(), &status);
    lower.failed = U_FAILURE(status);
    return lower;
}

} // namespace

// The collation elements of all targets behind each other, numbered: the search for a text is that
// for a row of numbers.
class CitySearch::Index {
public:
    Index(const std::vector<ClockWorldClockDbData>& cities, const std::string& locale)
        : _locale(locale), _elements(locale) {
        _targets.reserve(cities.size());
        for (const auto& city : cities)
            add(city);
    }

    const std::string& locale() const { return _locale; }
    std::vector<std::size_t> find(const std::string& text);

private:
    using Keys = std::u32string_view;

    struct TargetKeys {
        std::size_t end = 0;     // Where they end among all keys.
        std::uint64_t kinds = 0; // A bit for each key, shared by many: what lacks one is no match.
        std::int32_t length = 0; // Of the text, in units.
    };

    static constexpr std::uint8_t BEGINS = 1;
    static constexpr std::uint8_t ENDS = 2;

    static std::uint64_t kindOf(char32_t key) { return std::uint64_t{1} << (key % 64U); }
    static std::uint64_t kindsOf(Keys keys) {
        std::uint64_t kinds = 0;
        for (const auto key : keys)
            kinds |= kindOf(key);
        return kinds;
    }

    void add(const ClockWorldClockDbData& city);
    // Empty when no target can hold it.
    std::u32string patternOf(const LowerText& text);
    bool holds(std::size_t start, std::size_t end, Keys pattern) const;

    std::string _locale;
    CollationElements _elements;
    std::unordered_map<std::uint64_t, char32_t> _numbers; // From 1, by weights.
    std::u32string _keys;
    std::vector<std::uint8_t> _borders; // Beside the keys.
    std::vector<TargetKeys> _targets;
};

void CitySearch::Index::add(const ClockWorldClockDbData& city) {
    const auto text = lowered(targetOf(city).data(), _locale);
    TargetKeys target;
    target.length = text.length;
    if (text.failed)
        LOG_ERROR("i18n_ustring_to_lower failed :: uStrLower");
    else if (_elements.isUsable()) {
        for (const auto& element : _elements.ofText(text.view())) {
            const auto next = static_cast<char32_t>(_numbers.size() + 1);
            const auto key = _numbers.try_emplace(element.weights, next).first->second;
            _keys.push_back(key);
            _borders.push_back(static_cast<std::uint8_t>((element.begins ? BEGINS : 0) |
                                                         (element.ends ? ENDS : 0)));
            target.kinds |= kindOf(key);
        }
    }
    target.end = _keys.size();
    _targets.push_back(target);
}

bool CitySearch::Index::holds(std::size_t start, std::size_t end, Keys pattern) const {
    const auto keys = Keys(_keys).substr(start, end - start);
    for (auto place = keys.find(pattern); place != Keys::npos;
         place = keys.find(pattern, place + 1)) {
        const auto first = start + place;
        const auto last = first + pattern.size() - 1;
        if ((_borders[first] & BEGINS) != 0 && (_borders[last] & ENDS) != 0)
            return true;
    }
    return false;
}

std::u32string CitySearch::Index::patternOf(const LowerText& text) {
    std::u32string pattern;
    if (!_elements.isUsable())
        return pattern;
    for (const auto weights : _elements.ofPattern(text.view())) {
        const auto number = _numbers.find(weights);
        if (number == _numbers.end())
            return {};
        pattern.push_back(number->second);
    }
    return pattern;
}

std::vector<std::size_t> CitySearch::Index::find(const std::string& text) {
    std::vector<std::size_t> found;
    const auto lower = lowered(text.c_str(), _locale);
    if (lower.length == 0) {
        found.resize(_targets.size());
        std::iota(found.begin(), found.end(), std::size_t{0});
        return found;
    }
    if (lower.failed)
        LOG_ERROR("i18n_ustring_to_lower failed :: uSearchStrLower");
    const auto pattern = patternOf(lower);
    if (pattern.empty())
        return found;
    const auto kinds = kindsOf(pattern);
    std::size_t start = 0;
    for (std::size_t place = 0; place < _targets.size(); ++place) {
        const auto& target = _targets[place];
        if ((target.kinds & kinds) == kinds && lower.length <= target.length &&
            holds(start, target.end, pattern))
            found.push_back(place);
        start = target.end;
    }
    return found;
}

CitySearch::CitySearch(const std::vector<ClockWorldClockDbData>& cities, const std::string& locale)
    : _index(std::make_unique<Index>(cities, locale)) {}

CitySearch::~CitySearch() = default;

std::vector<std::size_t> CitySearch::find(const std::string& text) {
    return _index->find(text);
}

const std::string& CitySearch::locale() const {
    return _index->locale();
}

} // namespace rules
