// What sorting and searching the cities costs: with the plain steps for every city, and with what
// the picker keeps for it. With --compare=LANGUAGE it compares all answers instead.

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

#include "RatioReporter.h"
#include "device/dlog.h"
#include "device/i18n.h"
#include "rules/CatalogueForTest.h"
#include "rules/CityOrder.h"
#include "rules/CitySearch.h"
#include "rules/EverySearch.h"
#include "rules/WorldCities.h"

// Writing the log is not what is measured.
DEVICE_API int __dlog_print(log_id_t, int, const char*, const char*, ...) {
    return 0;
}

namespace {

using Cities = std::vector<ClockWorldClockDbData>;

constexpr int SIZES[] = {600, 4233, 23461};
constexpr const char* LANGUAGES[] = {"de", "tr"};
// From one letter, which many cities have, to names; in the languages of the run and others.
constexpr const char* TYPED[] = {"a", "is", "mün", "istanb", "são paulo", "東京"};

/** Cities with message identifiers, and a catalogue that has their names. */
class TranslatedCities {
public:
    TranslatedCities(const char* language, std::size_t count) {
        CatalogueForTest::Texts texts;
        std::map<std::string, std::string> countries;
        cities = worldCities(language, count);
        std::shuffle(cities.begin(), cities.end(), std::mt19937(count));
        for (auto& city : cities) {
            auto& country = countries[city.country];
            if (country.empty())
                country = "IDS_BENCH_COUNTRY_" + std::to_string(countries.size());
            texts[country] = city.country;
            city.country = country;
            const auto name = "IDS_BENCH_CITY_" + std::to_string(city.index);
            texts[name] = city.city;
            city.city = name;
        }
        _catalogue = std::make_unique<CatalogueForTest>(language, texts);
        // The first look at a text reads the catalogue, which is not what is measured.
        for (const auto& city : cities)
            rules::isIncludeSearchText(city, "\u2603 is nowhere");
        i18n_ucollator_create(language, &collator);
    }
    ~TranslatedCities() { i18n_ucollator_destroy(collator); }
    TranslatedCities(const TranslatedCities&) = delete;
    TranslatedCities& operator=(const TranslatedCities&) = delete;

    Cities cities;
    i18n_ucollator_h collator = nullptr;

private:
    std::unique_ptr<CatalogueForTest> _catalogue;
};

std::vector<std::size_t> filterPlainly(const Cities& cities, const std::string& text) {
    std::vector<std::size_t> found;
    for (std::size_t place = 0; place < cities.size(); ++place) {
        if (rules::isIncludeSearchText(cities[place], text))
            found.push_back(place);
    }
    return found;
}

void filterPlain(benchmark::State& state, const char* language, int count) {
    const TranslatedCities world(language, static_cast<std::size_t>(count));
    while (state.KeepRunning()) {
        for (const char* text : TYPED)
            benchmark::DoNotOptimize(filterPlainly(world.cities, text));
    }
}

void filterKept(benchmark::State& state, const char* language, int count) {
    const TranslatedCities world(language, static_cast<std::size_t>(count));
    rules::CitySearch search(world.cities, rules::searchLocale());
    while (state.KeepRunning()) {
        for (const char* text : TYPED)
            benchmark::DoNotOptimize(search.find(text));
    }
}

void prepareFilter(benchmark::State& state, const char* language, int count) {
    const TranslatedCities world(language, static_cast<std::size_t>(count));
    while (state.KeepRunning())
        benchmark::DoNotOptimize(rules::CitySearch(world.cities, rules::searchLocale()));
}

template <typename Sort>
void sortBench(benchmark::State& state, const char* language, int count, Sort&& sort) {
    const TranslatedCities world(language, static_cast<std::size_t>(count));
    while (state.KeepRunning()) {
        state.PauseTiming();
        auto cities = world.cities;
        state.ResumeTiming();
        sort(cities, world.collator);
        benchmark::DoNotOptimize(cities.data());
        state.PauseTiming();
        cities.clear();
        state.ResumeTiming();
    }
}

/** The predicate's own opposite is an order, at the price of one predicate. */
void sortPlainly(Cities& cities, i18n_ucollator_h collator) {
    std::sort(cities.begin(), cities.end(), [collator](const auto& a, const auto& b) {
        return !rules::isNotAfterByGmtOffset(b, a, collator);
    });
}

std::string nameOf(const char* what, const char* language, int count) {
    return std::string(what) + ", " + language + ", " + std::to_string(count) + " cities";
}

constexpr const char* FILTER_PLAIN = "filter, plain";
constexpr const char* FILTER = "filter, kept";
constexpr const char* PREPARE = "filter, prepare";
constexpr const char* SORT_PLAIN = "sort, plain";
constexpr const char* SORT = "sort, kept";

void registerBenchmarks(const char* language, int count) {
    const auto add = [language, count](const char* what, auto&& function) {
        benchmark::RegisterBenchmark(
            nameOf(what, language, count).c_str(),
            [=](benchmark::State& state) { function(state, language, count); })
            ->Unit(benchmark::kMillisecond);
    };
    add(FILTER_PLAIN, filterPlain);
    add(FILTER, filterKept);
    add(PREPARE, prepareFilter);
    add(SORT_PLAIN,
        [](benchmark::State& state, const char* l, int c) { sortBench(state, l, c, sortPlainly); });
    add(SORT, [](benchmark::State& state, const char* l, int c) {
        sortBench(state, l, c, rules::sortCities);
    });
}

void printRatios(RatioReporter& reporter, const char* language, int count) {
    const auto timeOf = [&](const char* what) {
        return reporter.medianOf(nameOf(what, language, count));
    };
    const auto texts = static_cast<double>(std::size(TYPED));
    const double filterPlain = timeOf(FILTER_PLAIN) / texts;
    const double filter = timeOf(FILTER) / texts;
    const double sortPlain = timeOf(SORT_PLAIN);
    const double sort = timeOf(SORT);
    if (filter <= 0 || sort <= 0)
        return;
    std::printf("%s %6d cities: one text %9.3f ms / %7.4f ms = %6.0f times faster; "
                "sort %8.2f ms / %7.2f ms = %5.1f times faster; prepared once in %6.2f ms\n",
                language, count, filterPlain, filter, filterPlain / filter, sortPlain, sort,
                sortPlain / sort, timeOf(PREPARE));
}

/** Asks for every text in every city. @return 1 when an answer differs from the plain one. */
int compareAnswers(const char* language) {
    const CatalogueForTest catalogue(language);
    const auto cities = worldCities(language);
    rules::CitySearch search(cities, rules::searchLocale());
    EverySearch every(cities, rules::searchLocale());
    std::size_t found = 0;
    int different = 0;
    const auto& texts = searchTexts();
    for (const auto& text : texts) {
        const auto plain = every.find(text);
        found += plain.size();
        if (search.find(text) == plain)
            continue;
        ++different;
        std::printf("different answers for \"%s\"\n", text.c_str());
    }
    std::printf("%s: %zu texts, %zu cities, %zu matches, %d texts with other answers\n", language,
                texts.size(), cities.size(), found, different);
    return different == 0 ? 0 : 1;
}

} // namespace

int main(int argc, char** argv) {
    if (!std::filesystem::exists(WORLD_CITIES_FILE)) {
        std::printf("Nothing to measure: %s is missing; install libtimezonemap-data\n",
                    WORLD_CITIES_FILE);
        return 0;
    }
    constexpr const char* compare = "--compare=";
    if (argc > 1 && std::strncmp(argv[1], compare, std::strlen(compare)) == 0)
        return compareAnswers(argv[1] + std::strlen(compare));
    for (const char* language : LANGUAGES) {
        for (const int count : SIZES)
            registerBenchmarks(language, count);
    }
    benchmark::Initialize(&argc, argv);
    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    std::printf("\n");
    for (const char* language : LANGUAGES) {
        for (const int count : SIZES)
            printRatios(reporter, language, count);
    }
    return 0;
}
