// Time zones by what a person types of their names.

#include "control/ZoneNames.h"

#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "base/CivilTime.h"

using simulator::zonesMatching;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

TEST(ZoneNamesTest, anyPartOfANameFindsIt) {
    EXPECT_THAT(zonesMatching("Europe/Berlin", 9), ElementsAre("Europe/Berlin"));
    EXPECT_THAT(zonesMatching("berl", 9), ElementsAre("Europe/Berlin"));
    EXPECT_THAT(zonesMatching("NEW YORK", 9), ElementsAre("America/New_York"));
    EXPECT_THAT(zonesMatching("utc", 9), Contains("UTC"));
    EXPECT_THAT(zonesMatching("", 9), IsEmpty());
    EXPECT_THAT(zonesMatching("no such place", 9), IsEmpty());
}

TEST(ZoneNamesTest, citiesThatBeginSoComeFirst) {
    const auto zones = zonesMatching("par", 9);
    ASSERT_FALSE(zones.empty());
    EXPECT_THAT(zones.front(), testing::AnyOf("Europe/Paris", "America/Paramaribo"));
}

TEST(ZoneNamesTest, noMoreThanAskedForAndAllOfThemKnown) {
    EXPECT_EQ(zonesMatching("a", 5).size(), 5U);
    for (const std::string& zone : zonesMatching("/", 1000))
        EXPECT_TRUE(base::isTimeZone(zone)) << zone;
    EXPECT_GT(zonesMatching("/", 1000).size(), 300U);
}
