#include "base/Text.h"

#include <array>
#include <climits>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace {

struct CutCase {
    const char* text;
    std::size_t maxBytes;
    const char* head;
};

class BaseTextCutTest : public testing::TestWithParam<CutCase> {};

TEST_P(BaseTextCutTest, KeepsWholeCharacters) {
    const CutCase& cut = GetParam();
    EXPECT_EQ(base::cutUtf8(cut.text, cut.maxBytes), cut.head);
}

INSTANTIATE_TEST_SUITE_P(
    Texts, BaseTextCutTest,
    testing::Values(CutCase{"", 0, ""}, CutCase{"", 5, ""}, CutCase{"alarm", 5, "alarm"},
                    CutCase{"alarm", 4, "alar"}, CutCase{"alarm", 0, ""},
                    // Two bytes a letter.
                    CutCase{"äöü", 6, "äöü"}, CutCase{"äöü", 5, "äö"}, CutCase{"äöü", 4, "äö"},
                    CutCase{"äöü", 3, "ä"}, CutCase{"äöü", 1, ""},
                    // Three bytes.
                    CutCase{"日本", 6, "日本"}, CutCase{"日本", 5, "日"}, CutCase{"日本", 4, "日"},
                    CutCase{"日本", 3, "日"}, CutCase{"日本", 2, ""},
                    // Four bytes.
                    CutCase{"a⏰😀", 7, "a⏰"}, CutCase{"a😀", 5, "a😀"}, CutCase{"a😀", 4, "a"},
                    CutCase{"a😀", 2, "a"},
                    // Broken text is cut somewhere, but it is cut.
                    CutCase{"\x80\x80\x80\x80\x80\x80", 5, "\x80\x80\x80\x80\x80"},
                    CutCase{"a\xff\xff\xff", 2, "a\xff"}, CutCase{"ab\xe6", 2, "ab"}));

TEST(BaseTextCopy, TerminatesTheBufferAndStaysInside) {
    std::array<char, 8> buffer{};
    buffer.fill('#');
    base::copyUtf8(buffer.data(), 6, "Weckër");
    EXPECT_STREQ(buffer.data(), "Weck");
    EXPECT_EQ(buffer[6], '#');
    EXPECT_EQ(buffer[7], '#');
}

TEST(BaseTextCopy, FitsExactly) {
    std::array<char, 6> buffer{};
    base::copyUtf8(buffer.data(), buffer.size(), "alarm");
    EXPECT_STREQ(buffer.data(), "alarm");
}

TEST(BaseTextCopy, WithoutRoomDoesNothing) {
    char letter = '#';
    base::copyUtf8(&letter, 0, "alarm");
    EXPECT_EQ(letter, '#');
    base::copyUtf8(&letter, 1, "alarm");
    EXPECT_EQ(letter, '\0');
    base::copyUtf8(nullptr, 6, "alarm");
}

struct FormatCase {
    const char* translation;
    std::vector<base::FormatArgument> arguments;
    const char* text;
};

class BaseTextFormatTest : public testing::TestWithParam<FormatCase> {};

TEST_P(BaseTextFormatTest, FillsPlaceholders) {
    const FormatCase& format = GetParam();
    EXPECT_EQ(base::formatTranslation(format.translation, format.arguments), format.text);
}

const std::string noon = "12:00";

INSTANTIATE_TEST_SUITE_P(
    GoodTranslations, BaseTextFormatTest,
    testing::Values(FormatCase{"", {}, ""}, FormatCase{"Done", {}, "Done"},
                    FormatCase{"100 %%", {}, "100 %"},
                    FormatCase{"Set for %s.", {noon}, "Set for 12:00."},
                    FormatCase{"%s", {std::string("50 % off %s %n")}, "50 % off %s %n"},
                    FormatCase{"At most %d characters", {30}, "At most 30 characters"},
                    FormatCase{"%i", {INT_MIN}, "-2147483648"}, FormatCase{"%d%%", {-5}, "-5%"},
                    FormatCase{"%d of %s", {3, noon}, "3 of 12:00"},
                    FormatCase{"%2$s: %1$d", {3, noon}, "12:00: 3"},
                    FormatCase{"%1$s and again %1$s", {noon}, "12:00 and again 12:00"},
                    FormatCase{"%1$02d:%2$02d", {7, 5}, "07:05"},
                    FormatCase{"[%4d]", {42}, "[  42]"}, FormatCase{"[%-4d]", {42}, "[42  ]"},
                    FormatCase{"[%04d]", {-42}, "[-042]"}, FormatCase{"[%-04d]", {42}, "[42  ]"},
                    FormatCase{"[%+d]", {42}, "[+42]"}, FormatCase{"[% d]", {42}, "[ 42]"},
                    FormatCase{"[%+05d]", {42}, "[+0042]"},
                    // Widths count letters, not bytes.
                    FormatCase{"[%4s]", {std::string("äö")}, "[  äö]"},
                    FormatCase{"[%-4s]", {std::string("äö")}, "[äö  ]"}));

struct BadFormatCase {
    const char* what;
    const char* translation;
    std::vector<base::FormatArgument> arguments;
};

class BaseTextBadFormatTest : public testing::TestWithParam<BadFormatCase> {};

TEST_P(BaseTextBadFormatTest, IsShownAsItIs) {
    const BadFormatCase& format = GetParam();
    EXPECT_EQ(base::formatTranslation(format.translation, format.arguments), format.translation)
        << format.what;
}

INSTANTIATE_TEST_SUITE_P(
    HostileTranslations, BaseTextBadFormatTest,
    testing::Values(
        BadFormatCase{"writes to memory", "%n", {1}},
        BadFormatCase{"writes to memory beside a good one", "%s %n", {noon, 1}},
        BadFormatCase{"takes the width from an argument", "%*d", {1}},
        BadFormatCase{"takes the width from a position", "%1$*1$d", {1}},
        BadFormatCase{"text as number", "%d", {noon}}, BadFormatCase{"number as text", "%s", {1}},
        BadFormatCase{"number as pointer", "%p", {1}}, BadFormatCase{"other type", "%f", {1}},
        BadFormatCase{"longer integer", "%ld", {1}}, BadFormatCase{"precision", "%.2s", {noon}},
        BadFormatCase{"too few", "none", {1}}, BadFormatCase{"too many", "%s %s", {noon}},
        BadFormatCase{"one where none belongs", "100 % sure", {}},
        BadFormatCase{"one position missing", "%1$s", {noon, noon}},
        BadFormatCase{"position out of range", "%3$s", {noon, noon}},
        BadFormatCase{"position 0", "%0$s", {noon}},
        BadFormatCase{"huge position", "%99999999999999999999$s", {noon}},
        BadFormatCase{"positional and plain", "%1$s %s", {noon, noon}},
        BadFormatCase{"plain and positional", "%s %2$s", {noon, noon}},
        BadFormatCase{"huge width", "%100d", {1}},
        BadFormatCase{"width that runs over", "%18446744073709551617d", {1}},
        BadFormatCase{"ends in the middle", "%", {1}},
        BadFormatCase{"ends after a width", "%12", {1}},
        BadFormatCase{"ends after a position", "%1$", {1}},
        BadFormatCase{"percent with a width", "%5% %d", {1}},
        BadFormatCase{"zeros before a text", "%05s", {noon}}));

TEST(BaseTextFormat, CutsTheResultBetweenCharacters) {
    EXPECT_EQ(base::formatTranslation("%s", {std::string("ööö")}, 5), "öö");
    EXPECT_EQ(base::formatTranslation("ööö %n", {}, 5), "öö");
    EXPECT_EQ(base::formatTranslation("%s", {std::string(600, 'x')}).size(), 511U);
}

} // namespace
