// How a script's line is taken apart.

#include "script/ScriptWords.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

using simulator::scriptWords;

namespace {

using Words = std::vector<std::string>;

struct Line {
    std::string line;
    Words words;
};

} // namespace

TEST(ScriptWords, ALineIsTakenApartAtItsBlanks) {
    const std::vector<Line> lines{
        {"", {}},
        {"   \t ", {}},
        {"# tap Done", {}},
        {"  # tap Done", {}},
        {"tap Done", {"tap", "Done"}},
        {"  tap\tDone  ", {"tap", "Done"}},
        {"tap Done\r", {"tap", "Done"}},
        {"tap Done # and go on", {"tap", "Done"}},
        {"tap C#", {"tap", "C#"}},
        {R"(tap "World clock")", {"tap", "World clock"}},
        {R"(tap "# 1")", {"tap", "# 1"}},
        {R"(tap "")", {"tap", ""}},
        {R"(type "a \"b\" \\ c\n\td")", {"type", "a \"b\" \\ c\n\td"}},
        {R"(type \n)", {"type", "\\n"}},
        {"tap São", {"tap", "São"}},
        {"tap 'World clock'", {"tap", "World clock"}},
        {"wait 'World clock' 3", {"wait", "World clock", "3"}},
        {"tap 'Done'\t# and go on", {"tap", "Done"}},
        {R"(type 'a \n "b"')", {"type", R"(a \n "b")"}},
        {"tap ''", {"tap", ""}},
        {"tap 'O'Brien's alarm'", {"tap", "O'Brien's alarm"}},
        {"tap O'Brien", {"tap", "O'Brien"}},
        {"tap Côte D'Ivoire", {"tap", "Côte D'Ivoire"}},
        {"tap 's-Hertogenbosch", {"tap", "'s-Hertogenbosch"}},
        {"tap 'World clock", {"tap", "'World", "clock"}},
        {"tap James'", {"tap", "James'"}},
        {"tap '", {"tap", "'"}},
        {R"(tap "'s-Hertogenbosch'")", {"tap", "'s-Hertogenbosch'"}},
    };
    for (const Line& line : lines) {
        EXPECT_EQ(scriptWords(line.line).words, line.words) << line.line;
        EXPECT_EQ(scriptWords(line.line).error, "") << line.line;
    }
}

TEST(ScriptWords, ALineThatMakesNoSenseHasAReasonAndNoWords) {
    const std::vector<std::pair<std::string, std::string>> lines{
        {R"(tap "World clock)", "a quoted text has no end"},
        {R"(tap "World clock\")", "a quoted text has no end"},
        {R"(tap "World\qclock")", R"(a \ in a quoted text needs one of " \ n t behind it)"},
        {R"(tap "World\)", R"(a \ in a quoted text needs one of " \ n t behind it)"},
        {R"(tap "World"clock)", "a blank is missing after a quoted text"},
        {R"(tap Wor"ld")", "a quote in the middle of a word; put all of it in quotes"},
        {"tap \xC3", "the line is not in UTF-8"},
        {"tap \xED\xA0\x80", "the line is not in UTF-8"},
        {std::string("tap\0Done", 8), "the line has a zero byte in it"},
        {"tap " + std::string(simulator::SCRIPT_LINE_LIMIT, 'x'),
         "the line is longer than 4096 bytes"},
    };
    for (const auto& [line, error] : lines) {
        EXPECT_EQ(scriptWords(line).error, error) << line;
        EXPECT_EQ(scriptWords(line).words, Words{}) << line;
    }
}

TEST(ScriptWords, TheLongestLineIsStillUnderstood) {
    const std::string text(simulator::SCRIPT_LINE_LIMIT - 4, 'x');
    EXPECT_EQ(scriptWords("tap " + text).words, (Words{"tap", text}));
}
