// The time picker, turned by a finger.
#include <algorithm>
#include <cstdlib>
#include <optional>

#include "Actions.h"
#include "CommandArguments.h"

namespace simulator::actions {

namespace {

constexpr double DRAG_SECONDS = 0.2;
constexpr double REST_SECONDS = 0.2;

/** A wheel of the picker. */
struct Wheel {
    std::string name;
    FaceArea area;
    int step = 0; ///< Pixels from one value to the next.
    int value = 0;
    bool wraps = false;
    std::vector<std::string> texts;

    int count() const { return static_cast<int>(texts.size()); }
};

/** Takes wheels from an answer; a broken one ends the list. */
std::vector<Wheel> wheelsIn(const std::vector<std::string>& values) {
    constexpr std::size_t WORDS = 9;
    std::vector<Wheel> wheels;
    for (std::size_t at = 0; at + WORDS <= values.size();) {
        const auto number = [&](std::size_t i) {
            return wholeNumber(values[at + i]).value_or(0);
        };
        Wheel wheel{values[at],
                    {number(1), number(2), number(3), number(4)},
                    number(5),
                    number(6),
                    !values[at + 7].empty(),
                    {}};
        const auto count = static_cast<std::size_t>(std::max(0, number(8)));
        at += WORDS;
        if (at + count > values.size())
            break;
        wheel.texts.assign(values.begin() + static_cast<std::ptrdiff_t>(at),
                           values.begin() + static_cast<std::ptrdiff_t>(at + count));
        at += count;
        wheels.push_back(std::move(wheel));
    }
    return wheels;
}

std::string readWheel(ScriptRun& run, const std::string& name, std::optional<Wheel>& wheel) {
    wheel.reset();
    std::string problem = run.device().waitStill(STILL_SECONDS);
    if (!problem.empty())
        return problem;
    const Reply reply = run.device().askFront({"wheels"});
    for (const Wheel& each : wheelsIn(reply.values))
        if (each.name == name && each.area.height > 0 && each.step > 0 && each.count() > 0)
            wheel = each;
    return reply.problem;
}

/** So many values can be turned before the finger leaves the display. */
int mostAtOnce(const Wheel& wheel) {
    constexpr int EDGE = 10;
    return std::max(1, (wheel.area.y + wheel.area.height - 2 * EDGE) / wheel.step);
}

/** Turns by a few values; positive = to later ones. The finger starts on the wheel. */
std::string turnFew(ScriptRun& run, const Wheel& wheel, int steps) {
    constexpr int EDGE = 8;
    const int top = wheel.area.y + EDGE;
    const int bottom = wheel.area.y + wheel.area.height - EDGE;
    const Place from{wheel.area.middleX(), steps > 0 ? bottom : top};
    const Place to{from.x, std::clamp(from.y - steps * wheel.step, 0, FACE_PIXELS - 1)};
    return run.drag(from, to, DRAG_SECONDS, REST_SECONDS);
}

/** Where a wheel stands after so many steps. */
int valueAfter(const Wheel& wheel, int steps) {
    const int target = wheel.value + steps;
    if (!wheel.wraps)
        return std::clamp(target, 0, wheel.count() - 1);
    return (target % wheel.count() + wheel.count()) % wheel.count();
}

std::string turnBy(ScriptRun& run, const std::string& name, int steps) {
    std::optional<Wheel> wheel;
    std::string problem = readWheel(run, name, wheel);
    while (problem.empty() && wheel && steps != 0) {
        const int most = mostAtOnce(*wheel);
        const int few = std::clamp(steps, -most, most);
        const int expected = valueAfter(*wheel, few);
        problem = turnFew(run, *wheel, few);
        if (problem.empty())
            problem = readWheel(run, name, wheel);
        if (problem.empty() && wheel && wheel->value != expected)
            return "the " + name + " wheel stands at " +
                   wheel->texts[static_cast<std::size_t>(wheel->value)] + " instead of " +
                   wheel->texts[static_cast<std::size_t>(expected)];
        steps -= few;
    }
    if (problem.empty() && !wheel)
        return "there is no " + name + " wheel on the face";
    return problem;
}

/** The shorter way round. */
int stepsTo(const Wheel& wheel, int value) {
    int steps = value - wheel.value;
    if (wheel.wraps && steps > wheel.count() / 2)
        steps -= wheel.count();
    if (wheel.wraps && steps < -wheel.count() / 2)
        steps += wheel.count();
    return steps;
}

std::string turnTo(ScriptRun& run, const std::string& name, int value) {
    std::optional<Wheel> wheel;
    std::string problem = readWheel(run, name, wheel);
    if (!problem.empty())
        return problem;
    if (!wheel)
        return "there is no " + name + " wheel on the face";
    return turnBy(run, name, stepsTo(*wheel, value));
}

struct TimeOfDay {
    int hour = 0;
    int minute = 0;
};

std::optional<TimeOfDay> timeIn(const std::string& text) {
    const auto colon = text.find(':');
    if (colon == std::string::npos || colon == 0 || colon > 2 || text.size() - colon != 3)
        return std::nullopt;
    const auto hour = wholeNumber(text.substr(0, colon));
    const auto minute = wholeNumber(text.substr(colon + 1));
    if (!hour || !minute || *hour < 0 || *hour > 23 || *minute < 0 || *minute > 59)
        return std::nullopt;
    return TimeOfDay{*hour, *minute};
}

} // namespace

std::string checkTurn(const Arguments& arguments) {
    constexpr int MOST = 200;
    if (arguments[0] != "hour" && arguments[0] != "minute" && arguments[0] != "half")
        return "'" + arguments[0] + "' is no wheel: there are hour, minute and half";
    const auto steps = wholeNumber(arguments[1]);
    return steps && std::abs(*steps) <= MOST ? "" : "'" + arguments[1] + "' is no number of steps";
}

std::string turn(ScriptRun& run, const Arguments& arguments) {
    return turnBy(run, arguments[0], *wholeNumber(arguments[1]));
}

std::string checkTime(const Arguments& arguments) {
    return timeIn(arguments[0]) ? "" : "'" + arguments[0] + "' is no time from 00:00 to 23:59";
}

std::string time(ScriptRun& run, const Arguments& arguments) {
    const TimeOfDay wanted = *timeIn(arguments[0]);
    std::optional<Wheel> hour;
    std::optional<Wheel> half;
    std::string problem = readWheel(run, "hour", hour);
    if (problem.empty())
        problem = readWheel(run, "half", half);
    if (problem.empty() && !hour)
        return "there is no time picker on the face";
    if (problem.empty())
        problem = turnTo(run, "hour", wanted.hour % hour->count());
    if (problem.empty())
        problem = turnTo(run, "minute", wanted.minute);
    if (problem.empty() && half)
        problem = turnTo(run, "half", wanted.hour / hour->count());
    return problem;
}

} // namespace simulator::actions
