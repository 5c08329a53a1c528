// What commands understand before they run, and how a script's mistakes are told.

#include "script/Commands.h"
#include "script/ScriptFile.h"

#include <fstream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "script/ScriptWords.h"

using simulator::checkCommand;
using simulator::parseScript;
using simulator::Script;
using simulator::scriptWords;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

TEST(ScriptCommands, TheseMakeSense) {
    for (const char* line : {"tap Done",
                             "tap 0 359",
                             "tap \"180 60\"",
                             "tap 7",
                             "tap @IDS_ALM_BODY_NO_TONES",
                             "hold Done",
                             "hold Done 0.5",
                             "hold 10 20",
                             "hold 10 20 3",
                             "drag 1 2 3 4",
                             "drag 1 2 3 4 0",
                             "flick 1 2 3 4 0.05",
                             "scroll-to \"Alarm tone\"",
                             "tap 'Alarm type'",
                             "hold 'Alarm type' 2",
                             "turn hour -3",
                             "turn half 1",
                             "time 00:00",
                             "time 7:05",
                             "time 23:59",
                             "type \"\"",
                             "key XF86Back",
                             "press Up",
                             "release Up",
                             "bezel -1",
                             "bezel-press",
                             "set language de",
                             "get clock",
                             "expect-setting volume 7",
                             "quick-panel open",
                             "quick-panel close",
                             "background",
                             "foreground",
                             "wait idle",
                             "wait 0.5",
                             "wait Done",
                             "wait Done 3",
                             "wait gone Done",
                             "wait gone Done 3",
                             "wait gone",
                             "expect Done",
                             "expect-not Done",
                             "texts",
                             "screenshot a.png",
                             "screenshot a.png square",
                             "record start a.webp",
                             "record start a.webp 60",
                             "record stop"})
        EXPECT_EQ(checkCommand(scriptWords(line).words), "") << line;
}

TEST(ScriptCommands, TheseMakeNone) {
    const std::vector<std::pair<const char*, const char*>> lines{
        {"tap", "something is missing: tap TEXT | X Y"},
        {"tap \" \"", "a text is missing between the quotes"},
        {"tap 1 360", "'1 360' is no place on the face"},
        {"tap -1 5", "'-1 5' is no place on the face"},
        {"tap World clock", "a text of several words needs quotes, as in \"World clock\" or 'World "
                            "clock'"},
        {"tap 'World clock", "a text of several words needs quotes"},
        {"tap World clock now", "a text of several words needs quotes"},
        {"hold World clock", "a text of several words needs quotes"},
        {"hold World clock 2", "a text of several words needs quotes"},
        {"tap 10 clock", "'10 clock' is no place on the face: x and y go from 0 to 359 (a text"},
        {"drag a b 1 2", "'a b' is no place on the face: x and y go from 0 to 359"},
        {"tap 1 2 3", "there is too much: tap TEXT | X Y"},
        {"hold Done soon", "'soon' is no number of seconds from 0 to 600"},
        {"hold 400 20", "'400 20' is no place on the face"},
        {"hold Done -1", "'-1' is no number of seconds"},
        {"drag 1 2 3", "something is missing: drag X1 Y1 X2 Y2 [SECONDS]"},
        {"drag 1 2 3 x", "'3 x' is no place on the face"},
        {"flick 1 2 3 4 601", "'601' is no number of seconds"},
        {"flick 1 2 3 4 nan", "'nan' is no number of seconds"},
        {"flick 1 2 3 4 1e2", "'1e2' is no number of seconds"},
        {"turn day 1", "'day' is no wheel: there are hour, minute and half"},
        {"turn hour much", "'much' is no number of steps"},
        {"turn hour 201", "'201' is no number of steps"},
        {"time 24:00", "'24:00' is no time from 00:00 to 23:59"},
        {"time 7:5", "'7:5' is no time"},
        {"time 07-30", "'07-30' is no time"},
        {"time -1:30", "'-1:30' is no time"},
        {"key \"\"", "'' is no name of a key"},
        {"key \"a b\"", "'a b' is no name of a key"},
        {"bezel 0", "'0' is no number of steps"},
        {"bezel 1.5", "'1.5' is no number of steps"},
        {"bezel 99999999999", "'99999999999' is no number of steps"},
        {"quick-panel down", "'down' is neither open nor close"},
        {"wait", "something is missing: wait idle"},
        {"wait Done soon", "'soon' is no number of seconds"},
        {"wait World clock", "'clock' is no number of seconds from 0 to 600 (a text of several"},
        {"wait World clock 3", "a text of several words needs quotes"},
        {"wait gone Done soon", "'soon' is no number of seconds"},
        {"expect \"\"", "a text is missing between the quotes"},
        {"screenshot \"\"", "the name of a file is missing"},
        {"screenshot a.png round", "'round' is unknown: only square may follow the file"},
        {"record", "something is missing: record"},
        {"record start", "the name of a file is missing"},
        {"record begin", "'begin' is neither start nor stop"},
        {"record start a.webp 61", "'61' is no number of pictures a second from 1 to 60"},
        {"record start a.webp 0", "'0' is no number of pictures"},
        {"record stop now", "nothing follows stop"},
        {"tapp Done", "there is no such command; did you mean 'tap'?"},
        {"screnshot a", "there is no such command; did you mean 'screenshot'?"},
        {"launch", "there is no such command; there are tap, hold, drag"},
    };
    for (const auto& [line, problem] : lines)
        EXPECT_THAT(checkCommand(scriptWords(line).words), HasSubstr(problem)) << line;
}

TEST(ScriptCommands, EachHasANameOfItsOwnAndAHelp) {
    std::vector<std::string> names;
    for (const simulator::Command& command : simulator::commands()) {
        EXPECT_THAT(names, testing::Not(testing::Contains(command.name)));
        names.emplace_back(command.name);
        EXPECT_STRNE(command.help, "") << command.name;
        EXPECT_LE(command.least, command.most) << command.name;
        EXPECT_THAT(simulator::commandsHelpText(), HasSubstr("  " + names.back()));
        EXPECT_EQ(simulator::findCommand(command.name), &command);
    }
}

TEST(ScriptCommands, TheDocumentListsThemAsTheHelpDoes) {
    std::ifstream file(CLOCK_SOURCE_DIR "/docs/SIMULATOR.md");
    std::vector<std::string> listed;
    for (std::string line; std::getline(file, line);)
        if (line.starts_with("| `"))
            listed.push_back(line);
    std::vector<std::string> expected;
    for (const simulator::Command& command : simulator::commands()) {
        std::string usage = command.name;
        if (*command.arguments != '\0')
            usage += std::string(" ") + command.arguments;
        // A bar would end a column of the table.
        for (std::size_t at = 0; (at = usage.find('|', at)) != std::string::npos; at += 2)
            usage.insert(at, "\\");
        expected.push_back("| `" + usage + "` | " + command.help + " |");
    }
    EXPECT_EQ(listed, expected);
}

TEST(ScriptFile, ItsLinesKeepTheirNumbers) {
    const Script script = parseScript("day.clk", "# a day\n\ntap Create\r\n\n  time 07:30");
    EXPECT_THAT(script.errors, IsEmpty());
    ASSERT_THAT(script.lines, SizeIs(2));
    EXPECT_EQ(script.lines[0].number, 3);
    EXPECT_THAT(script.lines[0].words, ElementsAre("tap", "Create"));
    EXPECT_EQ(script.lines[1].number, 5);
    EXPECT_THAT(script.lines[1].words, ElementsAre("time", "07:30"));
}

TEST(ScriptFile, EveryMistakeIsToldWithItsPlace) {
    const Script script = parseScript("day.clk", "tap Create\ntime 25:00\ntap \"Done\nwiggle\n");
    EXPECT_THAT(script.errors,
                ElementsAre("day.clk:2: time: '25:00' is no time from 00:00 to 23:59",
                            "day.clk:3: a quoted text has no end",
                            testing::StartsWith("day.clk:4: wiggle: there is no such command")));
}

TEST(ScriptFile, OfARandomFileNotEveryLineIsTold) {
    std::string text;
    for (int i = 0; i < 1000; ++i)
        text += "\xFF\n";
    EXPECT_THAT(parseScript("noise", text).errors, SizeIs(20));
}

TEST(ScriptFile, AnEditorsByteOrderMarkIsNoCommand) {
    const Script script = parseScript("a", "\xEF\xBB\xBFtap Done");
    EXPECT_THAT(script.errors, IsEmpty());
    EXPECT_THAT(script.lines, SizeIs(1));
}

TEST(ScriptFile, AMessageIsOneLineOfPrintableText) {
    EXPECT_EQ(simulator::scriptMessage("a", 3, "tap", "two\nlines\x1B[31m"),
              "a:3: tap: two lines [31m");
    EXPECT_EQ(simulator::scriptMessage("a", 3, "", "why"), "a:3: why");
}
