#include "rules/NetworkCode.h"

#include <gtest/gtest.h>

namespace {

struct CodeCase {
    const char* code;
    const char* list;
    bool matched;
};

class NetworkCodeTest : public testing::TestWithParam<CodeCase> {};

TEST_P(NetworkCodeTest, IsMatchedWhenTheListHoldsIt) {
    const CodeCase& c = GetParam();
    EXPECT_EQ(rules::isMccValueMatched(c.code, c.list), c.matched)
        << (c.code ? c.code : "null") << " in " << (c.list ? c.list : "null");
}

INSTANTIATE_TEST_SUITE_P(
    Lists, NetworkCodeTest,
    testing::Values(CodeCase{"262", "262", true}, CodeCase{"262", "263", false},
                    CodeCase{"310", "310 311", true}, CodeCase{"311", "310 311", true},
                    CodeCase{"312", "310 311", false}, CodeCase{"31", "310 311", false},
                    CodeCase{"310 311", "310 311", false}, CodeCase{"3100", "310 311", false}));

// The code is that of a network which may have told anything.
INSTANTIATE_TEST_SUITE_P(
    ShortCodesAndOddLists, NetworkCodeTest,
    testing::Values(CodeCase{"26", "26", true}, CodeCase{"2", "1 2", false},
                    CodeCase{"2", "1 22 2", true}, CodeCase{"1 2", "1 2", false},
                    CodeCase{"", "", false}, CodeCase{"", "   ", false},
                    CodeCase{"", "310  311", false}, CodeCase{"262", "", false},
                    CodeCase{"262", "   ", false}, CodeCase{"262", " 262", true},
                    CodeCase{"262", "262 ", true}, CodeCase{"262", "  261   262  ", true},
                    CodeCase{"262", "261\t262", false}, CodeCase{nullptr, "262", false},
                    CodeCase{"262", nullptr, false}, CodeCase{nullptr, nullptr, false}));

} // namespace
