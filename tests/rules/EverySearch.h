// ICU's search in every city, with one search object: the plain steps' answers in a time that
// allows many texts.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include <unicode/usearch.h>

#include <clock/ClockWorldClockDbData.h>

class EverySearch {
public:
    EverySearch(const std::vector<ClockWorldClockDbData>& cities, const std::string& locale);

    // The places of the cities that a text finds.
    std::vector<std::size_t> find(const std::string& text);

private:
    struct Target {
        std::u16string lower;
        bool failed = false;
    };

    bool isFoundIn(const Target& target, const std::u16string& pattern);

    std::string _locale;
    std::vector<Target> _targets;
    std::unique_ptr<UStringSearch, decltype(&usearch_close)> _search{nullptr, usearch_close};
};
