#include <algorithm>
#include <optional>

#include <unicode/uloc.h>

#include "Actions.h"
#include "CommandArguments.h"

namespace simulator::actions {

namespace {

constexpr double TAP_SECONDS = 0.06;
constexpr double HOLD_SECONDS = 1;
constexpr double DRAG_SECONDS = 0.3;
constexpr double FLICK_SECONDS = 0.08;
/** A finger that rests so long has no speed left. */
constexpr double REST_SECONDS = 0.25;

constexpr const char* EMPTY_TEXT = "a text is missing between the quotes";

Place middleOf(const VisibleText& text) {
    return {text.seen.middleX(), text.seen.middleY()};
}

/** A place, or the middle of a text. */
std::string findPlace(ScriptRun& run, const Arguments& arguments, std::optional<Place>& place) {
    place = placeIn(arguments, 0);
    if (place)
        return "";
    VisibleText text;
    std::string problem = run.find(arguments[0], text);
    if (!problem.empty())
        return problem;
    if (text.covered)
        return std::string("\"").append(asRead(text.text)) + "\" lies below something else";
    place = middleOf(text);
    return "";
}

bool isNumberPair(const Arguments& arguments) {
    return arguments.size() >= 2 && wholeNumber(arguments[0]) && wholeNumber(arguments[1]);
}

} // namespace

std::string checkText(const Arguments& arguments) {
    return asRead(arguments[0]).empty() ? EMPTY_TEXT : "";
}

std::string checkTap(const Arguments& arguments) {
    if (arguments.size() == 2)
        return placeIn(arguments, 0) ? "" : notTextOrPlace(arguments);
    return checkText(arguments);
}

std::string tap(ScriptRun& run, const Arguments& arguments) {
    std::optional<Place> place;
    const std::string problem = findPlace(run, arguments, place);
    return problem.empty() ? run.touch(*place, TAP_SECONDS) : problem;
}

std::string checkHold(const Arguments& arguments) {
    const bool place = isNumberPair(arguments);
    if (place && !placeIn(arguments, 0))
        return notPlace(arguments, 0);
    if (!place && arguments.size() == 3)
        return notTextOrPlace(arguments);
    const std::size_t time = place ? 2 : 1;
    if (arguments.size() > time && !secondsIn(arguments[time]))
        return place ? notSeconds(arguments[time]) : notSecondsAfterText(arguments[time]);
    return checkText(arguments);
}

std::string hold(ScriptRun& run, const Arguments& arguments) {
    std::optional<Place> place;
    std::string problem =
        findPlace(run, isNumberPair(arguments) ? arguments : Arguments{arguments[0]}, place);
    if (!problem.empty())
        return problem;
    const std::size_t time = isNumberPair(arguments) ? 2 : 1;
    const auto seconds = arguments.size() > time ? secondsIn(arguments[time]) : HOLD_SECONDS;
    return run.touch(*place, *seconds);
}

std::string checkDrag(const Arguments& arguments) {
    for (const std::size_t at : {0, 2})
        if (!placeIn(arguments, at))
            return notPlace(arguments, at);
    return arguments.size() < 5 || secondsIn(arguments[4]) ? "" : notSeconds(arguments[4]);
}

std::string drag(ScriptRun& run, const Arguments& arguments) {
    const auto seconds = arguments.size() > 4 ? secondsIn(arguments[4]) : DRAG_SECONDS;
    return run.drag(*placeIn(arguments, 0), *placeIn(arguments, 2), *seconds, REST_SECONDS);
}

std::string flick(ScriptRun& run, const Arguments& arguments) {
    const auto seconds = arguments.size() > 4 ? secondsIn(arguments[4]) : FLICK_SECONDS;
    return run.drag(*placeIn(arguments, 0), *placeIn(arguments, 2), *seconds, 0);
}

namespace {

/** Where a list can be taken without turning or moving what lies in it: where its rows begin. */
constexpr int SCROLL_X = 60;
constexpr int SCROLL_TOP = 110;
constexpr int SCROLL_BOTTOM = 270;
/** More than any page is long; only the list of cities is longer. */
constexpr int MOST_DRAGS = 60;

using Texts = std::vector<VisibleText>;

bool sameTexts(const Texts& a, const Texts& b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](const VisibleText& x, const VisibleText& y) {
                          return x.text == y.text && x.area == y.area;
                      });
}

/** The text among those that can be seen, if there is one. */
std::optional<VisibleText> among(const Texts& texts, const std::string& text, Match match) {
    const TextMatch found = matchText(texts, text, match);
    return found.problem.empty() ? std::optional(texts[found.index]) : std::nullopt;
}

bool isRightToLeft(ScriptRun& run) {
    const Reply reply = run.device().askWatch({"get", "language"});
    return !reply.values.empty() && uloc_isRightToLeft(reply.values.front().c_str());
}

/** Moves the list by some pixels; positive = towards its end. */
std::string scrollBy(ScriptRun& run, int pixels) {
    const int x = isRightToLeft(run) ? FACE_PIXELS - SCROLL_X : SCROLL_X;
    const int middle = (SCROLL_TOP + SCROLL_BOTTOM) / 2;
    const Place from{x, middle + pixels / 2};
    const Place to{x, from.y - pixels};
    return run.drag(from, to, DRAG_SECONDS, REST_SECONDS);
}

/** Pixels that bring a text to the middle, as far as one drag goes. */
int wayTo(const VisibleText& text) {
    constexpr int THRESHOLD = 20; // what a finger moves before the list follows
    constexpr int MOST = SCROLL_BOTTOM - SCROLL_TOP;
    const int way = text.area.middleY() - FACE_PIXELS / 2;
    return std::clamp(way + (way > 0 ? THRESHOLD : -THRESHOLD), -MOST, MOST);
}

/** What a list is searched for. */
struct Sought {
    std::string text;
    Match match;
};

bool isInView(const Texts& texts, const Sought& sought) {
    const auto found = among(texts, sought.text, sought.match);
    return found && found->isFullySeen();
}

/** Moves the list in one direction until the text is there or the list ends. */
std::string seek(ScriptRun& run, const Sought& sought, int direction, Texts& texts) {
    Texts before;
    for (int drags = 0; drags < MOST_DRAGS && !isInView(texts, sought); ++drags) {
        const auto found = among(texts, sought.text, sought.match);
        std::string problem =
            scrollBy(run, found ? wayTo(*found) : direction * (SCROLL_BOTTOM - SCROLL_TOP));
        before = texts;
        if (problem.empty())
            problem = run.readTextsWhenStill(texts);
        if (!problem.empty())
            return problem;
        if (sameTexts(before, texts))
            break;
    }
    return "";
}

} // namespace

std::string scrollTo(ScriptRun& run, const Arguments& arguments) {
    Sought sought{"", Match::Whole};
    Texts texts;
    std::string problem = run.readTextsWhenStill(texts);
    if (problem.empty())
        problem = run.meantText(arguments[0], sought.text);
    // One that begins so may come before the one that is meant.
    for (const Match match : {Match::Whole, Match::Beginning}) {
        sought.match = match;
        for (const int direction : {1, -1})
            if (problem.empty())
                problem = seek(run, sought, direction, texts);
        if (!problem.empty() || isInView(texts, sought))
            return problem;
    }
    const TextMatch match = matchText(texts, sought.text);
    return match.problem.empty()
               ? std::string("\"").append(asRead(sought.text)) + "\" does not come into full view"
               : "after scrolling down and up, " + match.problem;
}

} // namespace simulator::actions
