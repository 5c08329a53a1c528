#include <algorithm>
#include <cstdlib>

#include <unicode/utf8.h>

#include "Actions.h"
#include "CommandArguments.h"

namespace simulator::actions {

namespace {

constexpr double KEY_SECONDS = 0.05;
constexpr double TYPE_SECONDS = 0.02;
constexpr double DETENT_SECONDS = 0.05;
constexpr Place MIDDLE{FACE_PIXELS / 2, FACE_PIXELS / 2};
constexpr int BEZEL_BUTTON = 2;

/** The characters of a text in UTF-8, one by one. */
std::vector<std::string> charactersOf(const std::string& text) {
    std::vector<std::string> characters;
    const auto size = static_cast<std::int32_t>(text.size());
    for (std::int32_t at = 0; at < size;) {
        const std::int32_t start = at;
        U8_FWD_1(text.data(), at, size);
        characters.push_back(
            text.substr(static_cast<std::size_t>(start), static_cast<std::size_t>(at - start)));
    }
    return characters;
}

/** The name of the key that writes a character. */
std::string keyOf(const std::string& character) {
    if (character == " ")
        return "space";
    if (character == "\n")
        return "Return";
    return character == "\t" ? "Tab" : character;
}

/** What a key writes besides its function. */
std::string textOf(const std::string& key) {
    if (key == "space")
        return " ";
    return key == "Return" || key == "KP_Enter" ? "\n" : charactersOf(key).size() == 1 ? key : "";
}

} // namespace

std::string type(ScriptRun& run, const Arguments& arguments) {
    std::string text;
    std::string problem = run.device().waitStill(STILL_SECONDS);
    if (problem.empty())
        problem = run.meantText(arguments[0], text);
    if (!problem.empty())
        return problem;
    const Reply typing = run.device().askFront({"typing"});
    if (!typing.problem.empty())
        return typing.problem;
    if (typing.values.empty() || typing.values.front() != "yes")
        return "no text field has the focus; tap one first";
    for (const std::string& character : charactersOf(text)) {
        problem = run.key(keyOf(character), character, true);
        if (problem.empty())
            problem = run.key(keyOf(character), character, false);
        if (!problem.empty())
            return problem;
        run.device().sleep(TYPE_SECONDS);
    }
    return "";
}

std::string checkKey(const Arguments& arguments) {
    constexpr std::size_t LONGEST = 64;
    const std::string& name = arguments[0];
    const bool plain = std::none_of(name.begin(), name.end(),
                                    [](char c) { return c == ' ' || c == '\t' || c == '\n'; });
    return !name.empty() && name.size() <= LONGEST && plain
               ? ""
               : "'" + name + "' is no name of a key; XF86Back and Return are";
}

std::string key(ScriptRun& run, const Arguments& arguments) {
    std::string problem = press(run, arguments);
    if (!problem.empty())
        return problem;
    run.device().sleep(KEY_SECONDS);
    return release(run, arguments);
}

std::string press(ScriptRun& run, const Arguments& arguments) {
    return run.key(arguments[0], textOf(arguments[0]), true);
}

std::string release(ScriptRun& run, const Arguments& arguments) {
    return run.key(arguments[0], "", false);
}

std::string checkBezel(const Arguments& arguments) {
    constexpr int MOST = 1000;
    const auto steps = wholeNumber(arguments[0]);
    return steps && *steps != 0 && std::abs(*steps) <= MOST
               ? ""
               : "'" + arguments[0] + "' is no number of steps";
}

std::string bezel(ScriptRun& run, const Arguments& arguments) {
    const int steps = *wholeNumber(arguments[0]);
    for (int left = std::abs(steps); left > 0; --left) {
        std::string problem = run.device()
                                  .askFront({"bezel", steps < 0 ? "-1" : "1",
                                             std::to_string(MIDDLE.x), std::to_string(MIDDLE.y)})
                                  .problem;
        if (!problem.empty())
            return problem;
        run.device().sleep(DETENT_SECONDS);
    }
    return "";
}

std::string bezelPress(ScriptRun& run, const Arguments& /*arguments*/) {
    return run.touch(MIDDLE, KEY_SECONDS, BEZEL_BUTTON);
}

} // namespace simulator::actions
