#include "rules/CityOrder.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstring>
#include <iterator>
#include <numeric>
#include <string>
#include <utility>

#include <clock/ClockText.h>

#include "rules/GmtOffset.h"

namespace rules {

namespace {

constexpr std::size_t NAME_UNITS = 256;

using NameBuffer = std::array<i18n_uchar, NAME_UNITS>;

// A longer name is cut.
NameBuffer translatedName(const ClockWorldClockDbData& city) {
    NameBuffer name{};
    const char* text = clockText(city.city.c_str());
    if (std::strlen(text) < name.size())
        i18n_ustring_copy_ua(name.data(), text);
    else
        i18n_ustring_copy_ua_n(name.data(), text, static_cast<std::int32_t>(name.size() - 1));
    return name;
}

using Places = std::vector<std::size_t>;

// The cities' offsets and names, worked out once.
class SortTable {
public:
    SortTable(const std::vector<ClockWorldClockDbData>& cities, i18n_ucollator_h collator)
        : _collator(collator) {
        for (const auto& city : cities) {
            _offsets.push_back(gmtOffset(city.timezone.c_str()));
            if (!_collator)
                continue;
            const auto name = translatedName(city);
            const auto length = i18n_ustring_get_length(name.data());
            _ends.push_back(_names.size() + static_cast<std::size_t>(length));
            _names.insert(_names.end(), name.data(), name.data() + length);
        }
    }

    Places sorted() {
        Places places = sortedByOffsetAndName();
        // Half of the names compared is no order of names.
        return _collatorFailed ? sortedByOffsetAndName() : places;
    }

private:
    // What has a number as its offset and what has none are ordered apart, as only within either
    // "before" is an order. They are then merged by name, which is how they compare.
    Places sortedByOffsetAndName() {
        Places places(_offsets.size());
        std::iota(places.begin(), places.end(), std::size_t{0});
        const auto numbersEnd =
            std::stable_partition(places.begin(), places.end(),
                                  [this](std::size_t city) { return !std::isnan(_offsets[city]); });
        std::stable_sort(places.begin(), numbersEnd, [this](std::size_t a, std::size_t b) {
            if (_offsets[a] != _offsets[b])
                return _offsets[a] < _offsets[b];
            return isBeforeByName(a, b);
        });
        const auto byName = [this](std::size_t a, std::size_t b) {
            return isBeforeByName(a, b);
        };
        std::stable_sort(numbersEnd, places.end(), byName);
        Places merged;
        merged.reserve(places.size());
        std::merge(places.begin(), numbersEnd, numbersEnd, places.end(), std::back_inserter(merged),
                   byName);
        return merged;
    }

    bool isBeforeByName(std::size_t a, std::size_t b) {
        if (!_collator || _collatorFailed)
            return false;
        auto result = I18N_UCOLLATOR_EQUAL;
        const int error =
            i18n_ucollator_str_collator(_collator, name(a), length(a), name(b), length(b), &result);
        _collatorFailed = error != I18N_ERROR_NONE;
        return !_collatorFailed && result == I18N_UCOLLATOR_LESS;
    }

    std::size_t start(std::size_t city) const { return city == 0 ? 0 : _ends[city - 1]; }
    const i18n_uchar* name(std::size_t city) const { return _names.data() + start(city); }
    std::int32_t length(std::size_t city) const {
        return static_cast<std::int32_t>(_ends[city] - start(city));
    }

    i18n_ucollator_h _collator;
    bool _collatorFailed = false;
    std::vector<float> _offsets;
    std::vector<i18n_uchar> _names;
    Places _ends;
};

} // namespace

bool isNotAfterByName(const ClockWorldClockDbData& a, const ClockWorldClockDbData& b,
                      i18n_ucollator_h collator) {
    auto result = I18N_UCOLLATOR_EQUAL;
    i18n_ucollator_str_collator(collator, translatedName(a).data(), -1, translatedName(b).data(),
                                -1, &result);
    return result != I18N_UCOLLATOR_GREATER;
}

bool isNotAfterByGmtOffset(const ClockWorldClockDbData& a, const ClockWorldClockDbData& b,
                           i18n_ucollator_h collator) {
    const float difference = gmtOffset(a.timezone.c_str()) - gmtOffset(b.timezone.c_str());
    if (difference > 0)
        return false;
    if (difference < 0)
        return true;
    return isNotAfterByName(a, b, collator);
}

void sortCities(std::vector<ClockWorldClockDbData>& cities, i18n_ucollator_h collator) {
    std::vector<ClockWorldClockDbData> sorted;
    sorted.reserve(cities.size());
    for (const auto place : SortTable(cities, collator).sorted())
        sorted.push_back(std::move(cities[place]));
    cities = std::move(sorted);
}

} // namespace rules
