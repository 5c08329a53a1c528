#include "rules/GmtOffset.h"

#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;

constexpr float INFINITE = std::numeric_limits<float>::infinity();

struct OffsetCase {
    std::string text;
    float offset;
};

class GmtOffsetTest : public testing::TestWithParam<OffsetCase> {};

TEST_P(GmtOffsetTest, IsTheNumberBehindThePrefix) {
    EXPECT_EQ(rules::gmtOffset(GetParam().text.c_str()), GetParam().offset) << GetParam().text;
}

INSTANTIATE_TEST_SUITE_P(Offsets, GmtOffsetTest,
                         testing::Values(OffsetCase{"GMT+00:00", 0}, OffsetCase{"GMT+05:30", 5.3F},
                                         OffsetCase{"GMT+05:45", 5.45F},
                                         OffsetCase{"GMT-03:30", -3.3F}, OffsetCase{"GMT+14", 14},
                                         OffsetCase{"GMT-11:00", -11}, OffsetCase{"UTC+1:00", 1}));

// "5,30" has no fraction, whatever decimals look like in the wearer's language.
INSTANTIATE_TEST_SUITE_P(OddTexts, GmtOffsetTest,
                         testing::Values(OffsetCase{"", 0}, OffsetCase{"G", 0},
                                         OffsetCase{"GMT", 0}, OffsetCase{"+05:30", 0.3F},
                                         OffsetCase{"GMT noon", 0}, OffsetCase{"GMT 5 o'clock", 5},
                                         OffsetCase{"GMT+05:30:15", 5.3F}, OffsetCase{"GMT5,30", 5},
                                         OffsetCase{"GMT+5.5", 5.5F},
                                         OffsetCase{"GMTinf", INFINITE},
                                         OffsetCase{"GMT-inf", -INFINITE},
                                         OffsetCase{"GMT1e99", INFINITE}));

TEST(GmtOffsetText, MayBeNoNumber) {
    EXPECT_TRUE(std::isnan(rules::gmtOffset("GMTnan")));
    EXPECT_EQ(rules::gmtOffset(nullptr), 0);
}

TEST(GmtOffsetText, IsReadUpTo127Bytes) {
    const std::string blanks(124, ' ');
    EXPECT_EQ(rules::gmtOffset(("GMT" + blanks + "123").c_str()), 123);
    EXPECT_EQ(rules::gmtOffset(("GMT" + blanks + "1234").c_str()), 123);
    EXPECT_EQ(rules::gmtOffset(("GMT" + blanks + "12:5").c_str()), 12);
}

using Labels = std::vector<std::optional<int>>;

Labels labelsOf(const std::vector<const char*>& offsets) {
    rules::IndexHours hours;
    Labels labels;
    for (const char* offset : offsets)
        labels.push_back(hours.next(offset));
    return labels;
}

TEST(IndexHours, EveryWholeHourHasOneLabelAtItsFirstCity) {
    EXPECT_THAT(labelsOf({"GMT-11:00", "GMT-11:00", "GMT-03:30", "GMT-03:00", "GMT+00:00",
                          "GMT+05:00", "GMT+05:45", "GMT+06:00"}),
                ElementsAre(-11, std::nullopt, -3, std::nullopt, 0, 5, std::nullopt, 6));
}

TEST(IndexHours, MinutesAreCutTowardsZero) {
    EXPECT_THAT(labelsOf({"GMT-00:30", "GMT+00:30"}), ElementsAre(0, std::nullopt));
}

TEST(IndexHours, CitiesAtMinusTwelveHaveNoLabel) {
    EXPECT_THAT(labelsOf({"GMT-12:00", "GMT-12:45", "GMT-11:00"}),
                ElementsAre(std::nullopt, std::nullopt, -11));
}

TEST(IndexHours, WhatIsNoHourHasNoLabelAndTakesNoneAway) {
    EXPECT_THAT(labelsOf({"GMTnan", "GMT-inf", "GMTinf", "GMT1e30", "GMT+01:00"}),
                ElementsAre(std::nullopt, std::nullopt, std::nullopt, std::nullopt, 1));
}

} // namespace
