// What can be asked of a face from outside.
#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <optional>
#include <string_view>
#include <utility>

#include <Elementary.h>
#include <libintl.h>

#include "../HomeScreen.h"
#include "../Launch.h"
#include "../Settings.h"
#include "../widgets/TimePicker.h"
#include "FaceAgent.h"
#include "FaceInput.h"
#include "FacePixels.h"
#include "FaceStill.h"
#include "FaceTexts.h"
#include "FaceWindow.h"
#include "ProgramRequests.h"

namespace host {

namespace {

constexpr const char* NO_WINDOW = "no window is shown";

template <typename Number>
std::optional<Number> numberIn(const std::string& word) {
    Number number{};
    const char* end = word.data() + word.size();
    const auto [last, problem] = std::from_chars(word.data(), end, number);
    if (problem != std::errc() || last != end)
        return std::nullopt;
    return number;
}

std::optional<Press> pressIn(const std::string& word) {
    if (word == "down")
        return Press::Down;
    if (word == "up")
        return Press::Up;
    return std::nullopt;
}

void append(Words& words, const Area& area) {
    for (const int number : {area.x, area.y, area.width, area.height})
        words.push_back(std::to_string(number));
}

/** pointer move|down|up BUTTON X Y */
Words pointer(const Words& request) {
    const auto button = numberIn<int>(request[2]);
    const auto x = numberIn<int>(request[3]);
    const auto y = numberIn<int>(request[4]);
    const auto press = pressIn(request[1]);
    if (!button || !x || !y || (!press && request[1] != "move"))
        return {"the pointer needs move, down or up, a button and a place"};
    if (press)
        pressPointer(*button, *press, *x, *y);
    else
        movePointer(*x, *y);
    return {""};
}

/** bezel DIRECTION X Y */
Words bezel(const Words& request) {
    const auto direction = numberIn<int>(request[1]);
    const auto x = numberIn<int>(request[2]);
    const auto y = numberIn<int>(request[3]);
    if (!direction || !x || !y)
        return {"the bezel needs a direction and a place"};
    turnBezel(*direction, *x, *y);
    return {""};
}

/** key NAME TEXT down|up */
Words key(const Words& request) {
    const auto press = pressIn(request[3]);
    if (!press || request[1].empty() || request[1].find('\0') != std::string::npos)
        return {"a key needs a name, and down or up"};
    pressKey(request[1], request[2], *press);
    return {""};
}

/**
 * texts: for each text its area, what is seen of it, "covered" or nothing, "faint" or nothing, and
 * itself.
 */
Words texts(const Words& /*request*/) {
    Words answer{""};
    for (const FaceText& text : faceTexts(ecore_evas_get(faceWindow()))) {
        append(answer, text.area);
        append(answer, text.seen);
        answer.emplace_back(text.covered ? "covered" : "");
        answer.emplace_back(text.faint ? "faint" : "");
        answer.push_back(text.text);
    }
    return answer;
}

void appendWheel(Words& answer, const char* name, const TimeWheel* wheel) {
    if (!wheel || !evas_object_visible_get(wheel->object()))
        return;
    answer.emplace_back(name);
    append(answer, seenArea(wheel->object()));
    answer.push_back(std::to_string(wheel->stepHeight()));
    answer.push_back(std::to_string(wheel->value()));
    answer.emplace_back(wheel->values().wraps ? "wraps" : "");
    answer.push_back(std::to_string(wheel->values().texts.size()));
    for (const std::string& text : wheel->values().texts)
        answer.push_back(text);
}

void appendWheels(Evas_Object* object, void* data) {
    const TimePicker* picker = elm_object_widget_check(object) ? TimePicker::of(object) : nullptr;
    if (!picker || seenArea(object).isEmpty())
        return;
    auto& answer = *static_cast<Words*>(data);
    appendWheel(answer, "hour", picker->hourWheel());
    appendWheel(answer, "minute", picker->minuteWheel());
    appendWheel(answer, "half", picker->halfWheel());
}

/** wheels: for each its name, area, pixels per step, value, "wraps" or nothing, and its texts. */
Words wheels(const Words& /*request*/) {
    Words answer{""};
    walkCanvas(ecore_evas_get(faceWindow()), appendWheels, &answer);
    return answer;
}

void findFocusedEntry(Evas_Object* object, void* data) {
    if (elm_object_widget_check(object) && elm_object_focus_get(object) &&
        std::string_view(elm_object_widget_type_get(object)) == "Elm_Entry" &&
        !seenArea(object).isEmpty())
        *static_cast<bool*>(data) = true;
}

/** typing: "yes" while a field takes what is typed. */
Words typing(const Words& /*request*/) {
    bool found = false;
    walkCanvas(ecore_evas_get(faceWindow()), findFocusedEntry, &found);
    return {"", found ? "yes" : "no"};
}

/** translate ID */
Words translate(const Words& request) {
    const char* text = dgettext(nullptr, request[1].c_str());
    return text == request[1] ? Words{"there is no text " + request[1]} : Words{"", text};
}

/** home on|off: nobody looks at the application any more, or somebody does again. */
Words home(const Words& request) {
    if (request[1] != "on" && request[1] != "off")
        return {"home is on or off"};
    showHome(faceWindow(), request[1] == "on");
    return {""};
}

/** settings: answers when all that was written before has reached this process. */
Words settings(const Words& /*request*/) {
    deliverSettingChanges();
    return {""};
}

/** launches: the processes that were started from here. */
Words launches(const Words& /*request*/) {
    Words answer{""};
    for (const pid_t process : launchedProcesses())
        answer.push_back(std::to_string(process));
    return answer;
}

/** picture: width, height, and the pixels. */
Words picture(const Words& /*request*/) {
    FacePixels pixels = facePixels();
    if (pixels.bytes.empty())
        return {"the display shows nothing of the window"};
    return {"", std::to_string(pixels.width), std::to_string(pixels.height),
            std::move(pixels.bytes)};
}

struct Request {
    const char* name;
    std::size_t words;
    bool needsWindow;
    Words (*act)(const Words& request);
};

constexpr std::array<Request, 11> REQUESTS{{
    {"pointer", 5, true, pointer},
    {"bezel", 4, true, bezel},
    {"key", 4, true, key},
    {"texts", 1, true, texts},
    {"wheels", 1, true, wheels},
    {"typing", 1, true, typing},
    {"picture", 1, true, picture},
    {"home", 2, true, home},
    {"settings", 1, false, settings},
    {"translate", 2, false, translate},
    {"launches", 1, false, launches},
}};

/** still SECONDS */
Work still(const Words& request, const Answer& answer) {
    const auto seconds = request.size() == 2 ? numberIn<double>(request[1]) : std::nullopt;
    if (!seconds) {
        answer({"standing still needs a time limit"});
        return nullptr;
    }
    return std::make_shared<FaceStill>(*seconds,
                                       [answer](const std::string& why) { answer({why}); });
}

Words answerTo(const Request& request, const Words& words) {
    if (words.size() != request.words)
        return {std::string("the request ") + request.name + " has other words"};
    if (request.needsWindow && !faceWindow())
        return {NO_WINDOW};
    return request.act(words);
}

} // namespace

Work doRequest(const Words& words, const Answer& answer) {
    const std::string name = words.empty() ? "" : words[0];
    if (name == "still")
        return still(words, answer);
    const auto* found = std::find_if(REQUESTS.begin(), REQUESTS.end(),
                                     [&](const Request& r) { return name == r.name; });
    answer(found != REQUESTS.end() ? answerTo(*found, words) : askProgram(words));
    return nullptr;
}

} // namespace host
