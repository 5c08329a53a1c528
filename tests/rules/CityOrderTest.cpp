#include "rules/CityOrder.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <random>
#include <string>
#include <vector>

#include <dlfcn.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "rules/CatalogueForTest.h"
#include "rules/GmtOffset.h"

namespace {

using Cities = std::vector<ClockWorldClockDbData>;
using testing::ElementsAre;

/** Comparisons that succeed before all others fail; negative = none fails. */
int comparisonsLeft = -1;

} // namespace

// Comes before the device's, which it calls.
DEVICE_API int i18n_ucollator_str_collator(i18n_ucollator_h collator, const i18n_uchar* a,
                                           int32_t a_length, const i18n_uchar* b, int32_t b_length,
                                           i18n_ucollator_result_e* result) {
    if (comparisonsLeft == 0)
        return I18N_ERROR_INTERNAL;
    if (comparisonsLeft > 0)
        --comparisonsLeft;
    static const auto real = reinterpret_cast<decltype(&i18n_ucollator_str_collator)>(
        dlsym(RTLD_NEXT, "i18n_ucollator_str_collator"));
    return real(collator, a, a_length, b, b_length, result);
}

namespace {

ClockWorldClockDbData city(const std::string& name, const std::string& offset, int index = 0) {
    ClockWorldClockDbData record;
    record.city = name;
    record.timezone = offset;
    record.index = index;
    return record;
}

std::vector<std::string> namesOf(const Cities& cities) {
    std::vector<std::string> names;
    for (const auto& record : cities)
        names.push_back(record.city);
    return names;
}

class CityOrder : public testing::Test {
public:
    CityOrder() { i18n_ucollator_create("de", &collator); }
    ~CityOrder() override {
        i18n_ucollator_destroy(collator);
        comparisonsLeft = -1;
    }

protected:
    bool isBefore(const ClockWorldClockDbData& a, const ClockWorldClockDbData& b) const {
        return rules::isNotAfterByGmtOffset(a, b, collator) &&
               !rules::isNotAfterByGmtOffset(b, a, collator);
    }

    i18n_ucollator_h collator = nullptr;
};

TEST_F(CityOrder, NamesAreComparedAsTheLanguageDoes) {
    EXPECT_TRUE(rules::isNotAfterByName(city("Åbo", ""), city("Bonn", ""), collator));
    EXPECT_FALSE(rules::isNotAfterByName(city("Bonn", ""), city("Åbo", ""), collator));
}

TEST_F(CityOrder, EqualNamesAreNotAfterEachOther) {
    EXPECT_TRUE(rules::isNotAfterByName(city("Bonn", ""), city("Bonn", ""), collator));
}

TEST_F(CityOrder, WithoutACollatorAllNamesAreEqual) {
    EXPECT_TRUE(rules::isNotAfterByName(city("Bonn", ""), city("Aachen", ""), nullptr));
    EXPECT_TRUE(rules::isNotAfterByName(city("Aachen", ""), city("Bonn", ""), nullptr));
}

TEST_F(CityOrder, NamesAreComparedInTheirTranslation) {
    const CatalogueForTest german("de", {{"IDS_A", "Zwickau"}, {"IDS_B", "Aachen"}});
    EXPECT_FALSE(rules::isNotAfterByName(city("IDS_A", ""), city("IDS_B", ""), collator));
    Cities cities{city("IDS_A", "GMT+01:00"), city("IDS_B", "GMT+01:00")};
    rules::sortCities(cities, collator);
    EXPECT_THAT(namesOf(cities), ElementsAre("IDS_B", "IDS_A"));
}

TEST_F(CityOrder, NamesAreComparedUpTo255Units) {
    const std::string head(255, 'a');
    const Cities longNames{city(head + "z", ""), city(head + "b", "")};
    EXPECT_TRUE(rules::isNotAfterByName(longNames[0], longNames[1], collator));
    Cities sorted = longNames;
    rules::sortCities(sorted, collator);
    EXPECT_EQ(namesOf(sorted), namesOf(longNames));
    const std::string shorter(254, 'a');
    EXPECT_FALSE(
        rules::isNotAfterByName(city(shorter + "z", ""), city(shorter + "b", ""), collator));
}

TEST_F(CityOrder, TheOffsetComesFirst) {
    const auto early = city("Z", "GMT-03:30");
    const auto late = city("A", "GMT+05:45");
    EXPECT_TRUE(rules::isNotAfterByGmtOffset(early, late, collator));
    EXPECT_FALSE(rules::isNotAfterByGmtOffset(late, early, collator));
    EXPECT_TRUE(rules::isNotAfterByGmtOffset(late, late, collator));
}

TEST_F(CityOrder, OffsetsThatCannotBeComparedLeaveItToTheNames) {
    EXPECT_TRUE(
        rules::isNotAfterByGmtOffset(city("A", "GMTnan"), city("B", "GMT-05:00"), collator));
    EXPECT_FALSE(rules::isNotAfterByGmtOffset(city("B", "GMTinf"), city("A", "GMTinf"), collator));
}

TEST_F(CityOrder, CitiesAreSortedByOffsetThenByName) {
    Cities cities{city("Delhi", "GMT+05:30"),     city("Zürich", "GMT+01:00"),
                  city("Kathmandu", "GMT+05:45"), city("Åbo", "GMT+01:00"),
                  city("Lima", "GMT-05:00"),      city("Bonn", "GMT+01:00")};
    rules::sortCities(cities, collator);
    EXPECT_THAT(namesOf(cities),
                ElementsAre("Lima", "Åbo", "Bonn", "Zürich", "Delhi", "Kathmandu"));
}

TEST_F(CityOrder, WithoutACollatorCitiesOfOneOffsetKeepTheirOrder) {
    Cities cities{city("C", "GMT+02:00"), city("B", "GMT+01:00"), city("A", "GMT+01:00"),
                  city("D", "GMT+00:00")};
    rules::sortCities(cities, nullptr);
    EXPECT_THAT(namesOf(cities), ElementsAre("D", "B", "A", "C"));
}

TEST_F(CityOrder, ACollatorThatFailsOnTheWayLeavesNoHalfOrder) {
    const Cities before{city("D", "GMT+01:00"), city("C", "GMT+01:00"), city("B", "GMT+01:00"),
                        city("A", "GMT+01:00")};
    for (comparisonsLeft = 0; comparisonsLeft <= 2; ++comparisonsLeft) {
        const int left = comparisonsLeft;
        auto cities = before;
        rules::sortCities(cities, collator);
        EXPECT_EQ(namesOf(cities), namesOf(before)) << "after " << left;
        comparisonsLeft = left;
    }
}

TEST_F(CityOrder, WhatACollatorCannotCompareIsEqual) {
    comparisonsLeft = 0;
    EXPECT_TRUE(rules::isNotAfterByName(city("Bonn", ""), city("Aachen", ""), collator));
}

TEST_F(CityOrder, ACityWithoutANumberStandsAmongTheOthersByItsName) {
    Cities cities{city("C", "GMT+03:00"), city("B", "GMTnan"), city("A", "GMT+01:00"),
                  city("D", "GMTnan")};
    rules::sortCities(cities, collator);
    EXPECT_THAT(namesOf(cities), ElementsAre("A", "B", "C", "D"));
}

TEST_F(CityOrder, ACircleOfNamesAndOffsetsIsBroken) {
    Cities cities{city("M", "GMTnan"), city("A", "GMT+02:00"), city("Z", "GMT+01:00")};
    rules::sortCities(cities, collator);
    EXPECT_THAT(namesOf(cities), ElementsAre("M", "Z", "A")) << "numbers keep their order";
}

TEST_F(CityOrder, NoCitiesAreInOrder) {
    Cities cities;
    rules::sortCities(cities, collator);
    EXPECT_TRUE(cities.empty());
}

/** Cities with many equal names and offsets, and offsets that are no numbers. */
Cities randomCities(std::mt19937& random, bool numbersOnly) {
    static constexpr std::array offsets{"GMT+01:00", "GMT-12:00", "GMT+05:30", "GMT+05:45",
                                        "GMTinf",    "GMT-inf",   "GMT+1.0",   "",
                                        "GMTnan",    "GMT-nan"};
    static constexpr std::array names{"a",    "A", "å",  "b",       "ß", "ss",
                                      "\xff", "",  "東", "e\u0301", "é"};
    Cities cities(random() % 200);
    int index = 0;
    for (auto& record : cities) {
        // An empty identifier has the catalogue's head as its translation.
        record = city(names.at(random() % names.size()),
                      offsets.at(random() % (offsets.size() - (numbersOnly ? 2U : 0U))), index++);
    }
    return cities;
}

std::vector<int> indexesOf(const Cities& cities) {
    std::vector<int> indexes;
    for (const auto& record : cities)
        indexes.push_back(record.index);
    return indexes;
}

TEST_F(CityOrder, AnyCitiesAreSortedAndNoneIsLost) {
    std::mt19937 random(1);
    for (int round = 0; round < 200; ++round) {
        const auto before = randomCities(random, round % 2 == 0);
        auto cities = before;
        rules::sortCities(cities, round % 10 == 0 ? nullptr : collator);
        EXPECT_THAT(indexesOf(cities), testing::UnorderedElementsAreArray(indexesOf(before)));
        for (std::size_t later = 1; later < cities.size() && round % 2 == 0; ++later) {
            EXPECT_FALSE(isBefore(cities[later], cities[later - 1]) && round % 10 != 0)
                << cities[later].city << " is before " << cities[later - 1].city;
        }
    }
}

TEST_F(CityOrder, WhereThePredicateIsAnOrderItIsFollowed) {
    std::mt19937 random(2);
    for (int round = 0; round < 50; ++round) {
        auto cities = randomCities(random, true);
        auto plain = cities;
        std::stable_sort(plain.begin(), plain.end(),
                         [this](const auto& a, const auto& b) { return isBefore(a, b); });
        rules::sortCities(cities, collator);
        EXPECT_EQ(indexesOf(cities), indexesOf(plain));
    }
}

} // namespace
