#include "Commands.h"

#include <algorithm>

#include "Actions.h"
#include "CommandArguments.h"

namespace simulator {

namespace {

std::size_t distance(const std::string& a, const std::string& b) {
    std::vector<std::size_t> row(b.size() + 1);
    for (std::size_t j = 0; j <= b.size(); ++j)
        row[j] = j;
    for (std::size_t i = 1; i <= a.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            const std::size_t above = row[j];
            row[j] = std::min({above + 1, row[j - 1] + 1, diagonal + (a[i - 1] != b[j - 1])});
            diagonal = above;
        }
    }
    return row.back();
}

std::string unknownCommand(const std::string& name) {
    constexpr std::size_t CLOSE = 2;
    constexpr std::size_t LONGEST = 32;
    std::string all;
    const Command* nearest = nullptr;
    std::size_t least = CLOSE + 1;
    for (const Command& command : commands()) {
        all += (all.empty() ? "" : ", ") + std::string(command.name);
        const std::size_t away = name.size() > LONGEST ? least : distance(name, command.name);
        if (away < least) {
            least = away;
            nearest = &command;
        }
    }
    if (nearest != nullptr)
        return "there is no such command; did you mean '" + std::string(nearest->name) + "'?";
    return "there is no such command; there are " + all;
}

std::string usage(const Command& command) {
    return std::string(command.name) + (*command.arguments != '\0' ? " " : "") + command.arguments;
}

} // namespace

const std::vector<Command>& commands() {
    using namespace actions;
    static const std::vector<Command> all{
        {"tap", "TEXT | X Y", "touch a text, or a place", 1, 2, checkTap, tap},
        {"hold", "TEXT | X Y [SECONDS]", "touch it longer, 1 second if nothing is said", 1, 3,
         checkHold, hold},
        {"drag", "X1 Y1 X2 Y2 [SECONDS]", "move the finger, and rest before it is lifted", 4, 5,
         checkDrag, drag},
        {"flick", "X1 Y1 X2 Y2 [SECONDS]", "move the finger fast, and lift it on the way", 4, 5,
         checkDrag, flick},
        {"scroll-to", "TEXT", "move the list until all of the text can be read and touched", 1, 1,
         checkText, scrollTo},
        {"turn", "hour|minute|half STEPS", "turn a wheel of the time picker", 2, 2, checkTurn,
         turn},
        {"time", "HH:MM", "turn the wheels of the time picker to a time", 1, 1, checkTime, time},
        {"type", "TEXT", "type into the field that has the focus", 1, 1, nullptr, type},
        {"key", "NAME", "press and release a key", 1, 1, checkKey, key},
        {"press", "NAME", "press a key and keep it down", 1, 1, checkKey, press},
        {"release", "NAME", "release a key", 1, 1, checkKey, release},
        {"bezel", "STEPS", "turn the bezel, clockwise for positive numbers", 1, 1, checkBezel,
         bezel},
        {"bezel-press", "", "press the bezel", 0, 0, nullptr, bezelPress},
        {"set", "NAME VALUE", "change a setting of the device", 2, 2, nullptr, set},
        {"get", "NAME", "print a setting of the device", 1, 1, nullptr, get},
        {"expect-setting", "NAME VALUE", "go on only if a setting has this value", 2, 2, nullptr,
         expectSetting},
        {"quick-panel", "open|close", "pull the quick panel down, or push it up", 1, 1,
         checkQuickPanel, quickPanel},
        {"background", "", "show the time instead of the applications", 0, 0, nullptr, background},
        {"foreground", "", "bring them back", 0, 0, nullptr, foreground},
        {"wait", "idle | TEXT [SECONDS] | gone TEXT [SECONDS] | SECONDS",
         "wait until nothing moves, a text comes or goes, or a time is over", 1, 3, checkWait,
         wait},
        {"expect", "TEXT", "go on only if the face shows the text", 1, 1, checkText, expect},
        {"expect-not", "TEXT", "go on only if it does not", 1, 1, checkText, expectNot},
        {"texts", "", "print the texts of the face with their places", 0, 0, nullptr, texts},
        {"screenshot", "FILE [square]", "write a PNG file of the round face, or of all of it", 1, 2,
         checkScreenshot, screenshot},
        {"record", "start FILE [FPS] | stop", "write an animated WebP file of the round face", 1, 3,
         checkRecord, record},
    };
    return all;
}

const Command* findCommand(const std::string& name) {
    const auto found = std::find_if(commands().begin(), commands().end(),
                                    [&](const Command& c) { return name == c.name; });
    return found == commands().end() ? nullptr : &*found;
}

std::string checkCommand(const std::vector<std::string>& words) {
    if (words.empty())
        return "a command is missing";
    const Command* command = findCommand(words.front());
    if (command == nullptr)
        return unknownCommand(words.front());
    const Arguments arguments(words.begin() + 1, words.end());
    if (arguments.size() < command->least)
        return "something is missing: " + usage(*command);
    if (arguments.size() > command->most)
        return "there is too much: " + usage(*command) + " (" + NEEDS_QUOTES + ")";
    return command->check == nullptr ? "" : command->check(arguments);
}

std::string commandsHelpText() {
    constexpr std::size_t WIDTH = 36;
    std::string text;
    for (const Command& command : commands()) {
        std::string line = "  " + usage(command);
        if (line.size() >= WIDTH)
            line += "\n";
        line.resize(line.back() == '\n' ? line.size() + WIDTH : WIDTH, ' ');
        text += line + command.help + "\n";
    }
    return text;
}

} // namespace simulator
