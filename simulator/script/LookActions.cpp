// Waiting for the face, and looking at it.
#include <algorithm>
#include <cstdio>
#include <optional>

#include "Actions.h"
#include "CommandArguments.h"

namespace simulator::actions {

namespace {

constexpr double TEXT_SECONDS = 10;
constexpr double LOOK_AGAIN_SECONDS = 0.05;

using Texts = std::vector<VisibleText>;

/** True when one or more texts that nothing covers read so. */
bool shows(const Texts& texts, const std::string& text) {
    Texts open;
    std::copy_if(texts.begin(), texts.end(), std::back_inserter(open),
                 [](const VisibleText& t) { return !t.covered; });
    return std::any_of(open.begin(), open.end(),
                       [&](const VisibleText& t) { return asRead(t.text) == asRead(text); }) ||
           matchText(open, text).problem.empty();
}

std::string waitForText(ScriptRun& run, const std::string& argument, bool there, double seconds) {
    const double end = run.device().now() + seconds;
    std::string text;
    std::string problem = run.meantText(argument, text);
    Texts texts;
    while (problem.empty()) {
        problem = run.readTexts(texts);
        if (problem.empty() && shows(texts, text) == there)
            return "";
        const bool over = run.device().now() >= end;
        // An application that has just started shows nothing yet.
        if (!problem.empty() && !over && run.device().askWatch({"launches"}).problem.empty())
            problem.clear();
        if (problem.empty() && over)
            return std::string("\"").append(asRead(text)) +
                   (there ? "\" did not come; " : "\" did not go; ") + describeTexts(texts);
        run.device().sleep(LOOK_AGAIN_SECONDS);
    }
    return problem;
}

/** How a "wait" is meant. */
enum class Wait { Idle, Seconds, Text, Gone };

Wait waitOf(const Arguments& arguments) {
    if (arguments.size() == 1 && arguments[0] == "idle")
        return Wait::Idle;
    if (arguments.size() == 1 && secondsIn(arguments[0]))
        return Wait::Seconds;
    return arguments[0] == "gone" && arguments.size() > 1 ? Wait::Gone : Wait::Text;
}

/** The index of the time limit, behind the text. */
std::size_t limitOf(const Arguments& arguments) {
    return waitOf(arguments) == Wait::Gone ? 2 : 1;
}

std::string expectation(ScriptRun& run, const std::string& argument, bool there) {
    Texts texts;
    std::string text;
    std::string problem = run.readTextsWhenStill(texts);
    if (problem.empty())
        problem = run.meantText(argument, text);
    if (!problem.empty() || shows(texts, text) == there)
        return problem;
    return (there ? "the face does not show \"" : "the face shows \"") + asRead(text) + "\"; " +
           describeTexts(texts);
}

} // namespace

std::string checkWait(const Arguments& arguments) {
    if (waitOf(arguments) == Wait::Idle || waitOf(arguments) == Wait::Seconds)
        return "";
    const std::size_t limit = limitOf(arguments);
    if (arguments.size() > limit + 1)
        return NEEDS_QUOTES;
    if (arguments.size() > limit && !secondsIn(arguments[limit]))
        return notSecondsAfterText(arguments[limit]);
    return checkText({arguments[limit - 1]});
}

std::string wait(ScriptRun& run, const Arguments& arguments) {
    const Wait kind = waitOf(arguments);
    if (kind == Wait::Idle)
        return run.device().waitStill(STILL_SECONDS);
    if (kind == Wait::Seconds) {
        run.device().sleep(*secondsIn(arguments[0]));
        return "";
    }
    const std::size_t limit = limitOf(arguments);
    const auto seconds = arguments.size() > limit ? secondsIn(arguments[limit]) : TEXT_SECONDS;
    return waitForText(run, arguments[limit - 1], kind == Wait::Text, *seconds);
}

std::string expect(ScriptRun& run, const Arguments& arguments) {
    return expectation(run, arguments[0], true);
}

std::string expectNot(ScriptRun& run, const Arguments& arguments) {
    return expectation(run, arguments[0], false);
}

std::string texts(ScriptRun& run, const Arguments& /*arguments*/) {
    Texts all;
    std::string problem = run.readTextsWhenStill(all);
    for (const VisibleText& text : all)
        std::printf("%3d %3d  %3d x %-3d %s%s\n", text.seen.middleX(), text.seen.middleY(),
                    text.seen.width, text.seen.height, asRead(text.text).c_str(),
                    text.covered ? "  (covered)" : "");
    std::fflush(stdout);
    return problem;
}

} // namespace simulator::actions
