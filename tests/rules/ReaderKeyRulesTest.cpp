#include "host/ReaderKeyRules.h"

#include <Ecore_Input.h>
#include <gtest/gtest.h>

namespace {

struct Modifiers {
    unsigned toolkit;
    int reader;
};

class ReaderModifiersTest : public testing::TestWithParam<Modifiers> {};

TEST_P(ReaderModifiersTest, AreThoseOfTheAccessibilityBus) {
    EXPECT_EQ(host::readerModifiers(GetParam().toolkit), GetParam().reader);
}

INSTANTIATE_TEST_SUITE_P(
    Bits, ReaderModifiersTest,
    testing::Values(
        Modifiers{0, 0}, Modifiers{ECORE_EVENT_MODIFIER_SHIFT, 1},
        Modifiers{ECORE_EVENT_MODIFIER_CAPS, 2}, Modifiers{ECORE_EVENT_MODIFIER_CTRL, 4},
        Modifiers{ECORE_EVENT_MODIFIER_ALT, 8}, Modifiers{ECORE_EVENT_MODIFIER_WIN, 32},
        Modifiers{ECORE_EVENT_MODIFIER_ALTGR, 64}, Modifiers{ECORE_EVENT_MODIFIER_NUM, 16384},
        Modifiers{ECORE_EVENT_MODIFIER_CTRL | ECORE_EVENT_MODIFIER_ALT, 12},
        Modifiers{ECORE_EVENT_MODIFIER_SCROLL, 0}, Modifiers{ECORE_EVENT_LOCK_CAPS, 0}));

TEST(ReadableText, IsWhatCanBePrinted) {
    EXPECT_TRUE(host::isReadable("a"));
    EXPECT_TRUE(host::isReadable(" "));
    EXPECT_TRUE(host::isReadable("é"));
    EXPECT_FALSE(host::isReadable("\t"));
    EXPECT_FALSE(host::isReadable("\x7f"));
    EXPECT_FALSE(host::isReadable(""));
    EXPECT_FALSE(host::isReadable(nullptr));
}

} // namespace
