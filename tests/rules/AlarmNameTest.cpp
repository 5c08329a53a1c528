#include "rules/AlarmName.h"

#include <gtest/gtest.h>

namespace {

struct NameCase {
    const char* typed;
    const char* saved;
};

class AlarmNameTest : public testing::TestWithParam<NameCase> {};

TEST_P(AlarmNameTest, OnlyBlanksBeforeTheNameAreDropped) {
    EXPECT_EQ(rules::withoutLeadingBlanks(GetParam().typed), GetParam().saved);
}

INSTANTIATE_TEST_SUITE_P(Names, AlarmNameTest,
                         testing::Values(NameCase{"", ""}, NameCase{" ", ""}, NameCase{"    ", ""},
                                         NameCase{"Gym", "Gym"}, NameCase{"  Gym", "Gym"},
                                         NameCase{"Gym  ", "Gym  "}, NameCase{" a  b ", "a  b "},
                                         NameCase{"\tGym", "\tGym"}, NameCase{" \n x", "\n x"},
                                         NameCase{" ä", "ä"}));

} // namespace
