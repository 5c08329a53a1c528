#include "ScriptRun.h"

#include <algorithm>
#include <charconv>

namespace simulator {

namespace {

constexpr double FRAME_SECONDS = 1.0 / 60;

int numberOf(const std::string& text) {
    int number = 0;
    std::from_chars(text.data(), text.data() + text.size(), number);
    return number;
}

FaceArea areaAt(const std::vector<std::string>& values, std::size_t at) {
    return {numberOf(values[at]), numberOf(values[at + 1]), numberOf(values[at + 2]),
            numberOf(values[at + 3])};
}

Request pointerRequest(const char* what, int button, Place place) {
    return {"pointer", what, std::to_string(button), std::to_string(place.x),
            std::to_string(place.y)};
}

} // namespace

std::string ScriptRun::press(Place place, int button) {
    return _device.askFront(pointerRequest("down", button, place)).problem;
}

std::string ScriptRun::move(Place place) {
    return _device.askFront(pointerRequest("move", 0, place)).problem;
}

std::string ScriptRun::release(Place place, int button) {
    return _device.askFront(pointerRequest("up", button, place)).problem;
}

std::string ScriptRun::touch(Place place, double seconds, int button) {
    std::string problem = press(place, button);
    if (!problem.empty())
        return problem;
    _device.sleep(seconds);
    return release(place, button);
}

std::string ScriptRun::drag(Place from, Place to, double seconds, double rest) {
    std::string problem = press(from);
    const double start = _device.now();
    for (double part = 0; problem.empty() && part < 1;) {
        _device.sleep(FRAME_SECONDS);
        part = std::min(1.0, seconds <= 0 ? 1.0 : (_device.now() - start) / seconds);
        problem = move({from.x + static_cast<int>((to.x - from.x) * part),
                        from.y + static_cast<int>((to.y - from.y) * part)});
    }
    if (!problem.empty())
        return problem;
    if (rest > 0) {
        _device.sleep(rest);
        // A finger that rests has no speed: it has to be told that it is still there.
        problem = move(to);
    }
    return problem.empty() ? release(to) : problem;
}

std::string ScriptRun::key(const std::string& name, const std::string& text, bool down) {
    return _device.askFront({"key", name, text, down ? "down" : "up"}).problem;
}

std::string ScriptRun::readTexts(std::vector<VisibleText>& texts) {
    constexpr std::size_t WORDS = 11;
    const Reply reply = _device.askFront({"texts"});
    texts.clear();
    for (std::size_t at = 0; at + WORDS <= reply.values.size(); at += WORDS)
        texts.push_back({reply.values[at + 10], areaAt(reply.values, at),
                         areaAt(reply.values, at + 4), !reply.values[at + 8].empty(),
                         !reply.values[at + 9].empty()});
    return reply.problem;
}

std::string ScriptRun::readTextsWhenStill(std::vector<VisibleText>& texts) {
    const std::string problem = _device.waitStill(STILL_SECONDS);
    return problem.empty() ? readTexts(texts) : problem;
}

std::string ScriptRun::meantText(const std::string& argument, std::string& text) {
    text = argument;
    if (!argument.starts_with("@IDS_"))
        return "";
    const Reply reply = _device.askFront({"translate", argument.substr(1)});
    if (reply.problem.empty() && !reply.values.empty())
        text = reply.values.front();
    return reply.problem;
}

std::string ScriptRun::find(const std::string& argument, VisibleText& found) {
    std::string text;
    std::vector<VisibleText> texts;
    std::string problem = readTextsWhenStill(texts);
    if (problem.empty())
        problem = meantText(argument, text);
    if (!problem.empty())
        return problem;
    const TextMatch match = matchText(texts, text);
    if (match.problem.empty())
        found = texts[match.index];
    return match.problem;
}

} // namespace simulator
