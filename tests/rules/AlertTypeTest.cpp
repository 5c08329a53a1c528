#include "rules/AlertType.h"

#include <climits>

#include <gtest/gtest.h>

namespace {

TEST(AlertTypeTest, EachTypeHasItsLabel) {
    EXPECT_STREQ(rules::alertTypeTextId(0), "IDS_ALM_BODY_SOUND");
    EXPECT_STREQ(rules::alertTypeTextId(1), "IDS_ALM_BODY_ALERTTYEP_VIBRATION");
    EXPECT_STREQ(rules::alertTypeTextId(2), "IDS_ALM_POP_VIBRATION_AND_SOUND");
}

TEST(AlertTypeTest, AnyOtherTypeHasNone) {
    for (const int type : {-1, 3, 127, INT_MIN, INT_MAX})
        EXPECT_EQ(rules::alertTypeTextId(type), nullptr) << type;
}

TEST(AlertTypeTest, TheTypesAreCounted) {
    for (int type = 0; type < rules::ALERT_TYPE_COUNT; ++type)
        EXPECT_NE(rules::alertTypeTextId(type), nullptr) << type;
    EXPECT_EQ(rules::alertTypeTextId(rules::ALERT_TYPE_COUNT), nullptr);
}

} // namespace
