// Which cities a search text finds.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include <clock/ClockWorldClockDbData.h>

namespace rules {

// The locale in which cities are searched: the wearer's.
std::string searchLocale();

// True when the locale finds the text in "<city>, <country>", translated and without regard to
// case. Slow: for a whole list, see CitySearch.
bool isIncludeSearchText(const ClockWorldClockDbData& city, const std::string& text);

// isIncludeSearchText() for a whole list: what does not depend on the text is worked out once.
//
// The list may die or change before the search does; it then answers for the list as it was.
class CitySearch {
public:
    CitySearch(const std::vector<ClockWorldClockDbData>& cities, const std::string& locale);
    ~CitySearch();
    CitySearch(const CitySearch&) = delete;
    CitySearch& operator=(const CitySearch&) = delete;

    // The places in the list of the cities that a text finds, in the list's order.
    std::vector<std::size_t> find(const std::string& text);

    // Whether translations or collation may have changed since: make a new one then.
    const std::string& locale() const;

private:
    class Index;
    std::unique_ptr<Index> _index;
};

} // namespace rules
