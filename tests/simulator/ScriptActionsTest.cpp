// What commands do to a device: a made-up one, with a list and the wheels of a time picker.

#include "script/Commands.h"
#include "script/Device.h"
#include "script/ScriptRun.h"
#include "script/ScriptWords.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

using simulator::Reply;
using simulator::Request;
using simulator::ScriptRun;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

struct MadeUpWheel {
    std::string name;
    int x;
    int value;
    int count;
    bool wraps;
};

/** Texts below each other in a list that a finger moves, and wheels that it turns. */
class MadeUpDevice : public simulator::Device {
public:
    static constexpr int ROW = 60;
    static constexpr int STEP = 54;
    static constexpr int TOP = 90;

    Reply askFront(const Request& request) override {
        asked.push_back(testing::PrintToString(request));
        if (!trouble.empty())
            return {trouble, {}};
        if (request[0] == "pointer")
            touch(request);
        if (request[0] == "key")
            keys.push_back(request[1] + "/" + request[2] + "/" + request[3]);
        if (request[0] == "texts")
            return {"", textWords()};
        if (request[0] == "wheels")
            return {"", wheelWords()};
        if (request[0] == "typing")
            return {"", {typing ? "yes" : "no"}};
        if (request[0] == "translate")
            return request[1] == "IDS_DONE" ? Reply{"", {"Fertig"}} : Reply{"there is no text", {}};
        return {};
    }
    Reply askWatch(const Request& request) override {
        toWatch.push_back(testing::PrintToString(request));
        return request[0] == "get" ? Reply{"", {"de"}} : Reply{};
    }
    std::string waitStill(double /*seconds*/) override {
        ++waits;
        return moving;
    }
    const std::string& folder() const override { return _folder; }
    void sleep(double seconds) override {
        _now += seconds;
        if (whenTimePasses)
            whenTimePasses(_now);
    }
    double now() override { return _now; }

    std::vector<std::string> rows;
    int scrolled = 0;  ///< Pixels.
    int faintFrom = 0; ///< Rows from here on have faded; 0 = none have.
    std::vector<MadeUpWheel> wheels;
    bool typing = false;
    std::string moving;
    std::string trouble;
    std::function<void(double now)> whenTimePasses;

    std::vector<std::string> asked;
    std::vector<std::string> keys;
    std::vector<std::string> toWatch;
    int waits = 0;
    int downs = 0;

private:
    void touch(const Request& request) {
        const int x = std::atoi(request[3].c_str());
        const int y = std::atoi(request[4].c_str());
        if (request[1] == "down") {
            ++downs;
            _fromX = x;
            _fromY = y;
        } else if (request[1] == "up") {
            dragged(_fromX, _fromY - y);
        }
    }
    void dragged(int x, int way) {
        for (MadeUpWheel& wheel : wheels) {
            if (std::abs(x - wheel.x) > 20)
                continue;
            const int value = wheel.value + static_cast<int>(std::lround(1.0 * way / STEP));
            wheel.value = wheel.wraps ? (value % wheel.count + wheel.count) % wheel.count
                                      : std::clamp(value, 0, wheel.count - 1);
            return;
        }
        const int most = std::max(0, static_cast<int>(rows.size()) * ROW - 180);
        scrolled = std::clamp(scrolled + way, 0, most);
    }
    std::vector<std::string> textWords() const {
        std::vector<std::string> words;
        for (std::size_t i = 0; i < rows.size(); ++i) {
            const int y = TOP + static_cast<int>(i) * ROW - scrolled;
            const int top = std::max(y, TOP);
            const int bottom = std::min(y + 30, 300);
            if (top >= bottom)
                continue;
            for (const int number : {100, y, 100, 30, 100, top, 100, bottom - top})
                words.push_back(std::to_string(number));
            words.emplace_back("");
            words.emplace_back(faintFrom > 0 && y >= faintFrom ? "faint" : "");
            words.push_back(rows[i]);
        }
        return words;
    }
    std::vector<std::string> wheelWords() const {
        std::vector<std::string> words;
        for (const MadeUpWheel& wheel : wheels) {
            words.push_back(wheel.name);
            for (const int number : {wheel.x - 40, 90, 80, 150, STEP, wheel.value})
                words.push_back(std::to_string(number));
            words.emplace_back(wheel.wraps ? "wraps" : "");
            words.push_back(std::to_string(wheel.count));
            for (int value = 0; value < wheel.count; ++value)
                words.push_back(std::to_string(value));
        }
        return words;
    }

    std::string _folder = "/nowhere";
    double _now = 0;
    int _fromX = 0;
    int _fromY = 0;
};

class ScriptActions : public testing::Test {
protected:
    std::string does(const std::string& line) {
        const auto words = simulator::scriptWords(line).words;
        EXPECT_EQ(simulator::checkCommand(words), "") << line;
        ScriptRun run(device);
        return simulator::findCommand(words[0])->act(run, {words.begin() + 1, words.end()});
    }

    MadeUpDevice device;
};

} // namespace

TEST_F(ScriptActions, ATapOfATextWaitsAndTouchesItsMiddle) {
    device.rows = {"Create", "Done"};
    EXPECT_EQ(does("tap Done"), "");
    EXPECT_EQ(device.waits, 1);
    EXPECT_THAT(device.asked, testing::Contains(HasSubstr(R"("down", "1", "150", "165")")));
    EXPECT_THAT(device.asked.back(), HasSubstr(R"("up", "1", "150", "165")"));
}

TEST_F(ScriptActions, ATapOfAPlaceDoesNotWait) {
    EXPECT_EQ(does("tap 10 20"), "");
    EXPECT_EQ(device.waits, 0);
    EXPECT_THAT(device.asked, SizeIs(2));
}

TEST_F(ScriptActions, AMessageIsFoundInTheLanguageThatIsShown) {
    device.rows = {"Abbrechen", "Fertig"};
    EXPECT_EQ(does("tap @IDS_DONE"), "");
    EXPECT_EQ(device.downs, 1);
    EXPECT_EQ(does("tap @IDS_GONE"), "there is no text");
}

TEST_F(ScriptActions, EachCommandReadsPastMarksOfDirection) {
    device.rows = {"\u200Fإنشاء", "\u2068Yoga\u2069\u200E", "c", "d", "e",
                   "f",           "\u202BRun\u202C 5"};
    for (const char* line : {"tap Yoga", "hold Yoga", "wait Yoga 1", "expect Yoga",
                             "scroll-to 'Run 5'", "tap 'Run 5'"})
        EXPECT_EQ(does(line), "") << line;
    EXPECT_GT(device.scrolled, 0);
    device.scrolled = 0;
    for (const char* line : {"wait gone Yoga 1", "expect-not Yoga"})
        EXPECT_NE(does(line), "") << line;
}

TEST_F(ScriptActions, NothingIsTouchedWhileTheFaceMoves) {
    device.rows = {"Done"};
    device.moving = "the face does not stand still";
    EXPECT_EQ(does("tap Done"), device.moving);
    EXPECT_EQ(does("wait idle"), device.moving);
    EXPECT_EQ(device.downs, 0);
}

TEST_F(ScriptActions, WhatTheApplicationRefusesIsTold) {
    device.trouble = "no window is shown";
    for (const char* line : {"tap 1 2", "hold 1 2", "drag 1 2 3 4", "key Return", "bezel 2",
                             "bezel-press", "texts", "time 07:30", "screenshot a.png"})
        EXPECT_EQ(does(line), device.trouble) << line;
}

TEST_F(ScriptActions, AHoldLastsAsLongAsItSays) {
    device.rows = {"Done"};
    const double before = device.now();
    EXPECT_EQ(does("hold Done 2.5"), "");
    EXPECT_NEAR(device.now() - before, 2.5, 0.01);
    EXPECT_EQ(does("hold 1 2"), "");
    EXPECT_NEAR(device.now() - before, 3.5, 0.01);
}

TEST_F(ScriptActions, ScrollingFindsWhatLiesFarBelowAndAboveAgain) {
    for (int i = 0; i < 40; ++i)
        device.rows.push_back("Row " + std::to_string(i) + ".");
    EXPECT_EQ(does("scroll-to \"Row 30.\""), "");
    EXPECT_EQ(does("expect \"Row 30.\""), "");
    EXPECT_EQ(does("scroll-to \"Row 2.\""), "");
    EXPECT_EQ(does("expect \"Row 2.\""), "");
}

TEST_F(ScriptActions, ScrollingLeavesAloneWhatIsInFullView) {
    device.rows = {"A", "B"};
    EXPECT_EQ(does("scroll-to B"), "");
    EXPECT_EQ(device.downs, 0);
}

TEST_F(ScriptActions, ScrollingGoesOnUntilARowCanBeRead) {
    for (int i = 0; i < 10; ++i)
        device.rows.push_back("Row " + std::to_string(i) + ".");
    device.faintFrom = 200;
    EXPECT_EQ(does("scroll-to \"Row 2.\""), "");
    EXPECT_GT(device.scrolled, 0) << "it was there, but it had faded";
}

TEST_F(ScriptActions, ScrollingPrefersTheWholeTextToOneThatBeginsSo) {
    device.rows = {"Alarm tone", "b", "c", "d", "e", "f", "g", "h", "Alarm"};
    EXPECT_EQ(does("scroll-to Alarm"), "");
    EXPECT_EQ(does("tap Alarm"), "");
    EXPECT_GT(device.scrolled, 0);
}

TEST_F(ScriptActions, ScrollingEndsWhereTheListDoes) {
    for (int i = 0; i < 10; ++i)
        device.rows.push_back("Row " + std::to_string(i) + ".");
    EXPECT_THAT(does("scroll-to Nowhere"),
                HasSubstr("after scrolling down and up, no text reads \"Nowhere\""));
    EXPECT_LT(device.downs, 40);
}

TEST_F(ScriptActions, TheWheelsAreTurnedTheShorterWay) {
    device.wheels = {{"hour", 120, 6, 24, true}, {"minute", 240, 0, 60, true}};
    EXPECT_EQ(does("time 22:55"), "");
    EXPECT_EQ(device.wheels[0].value, 22);
    EXPECT_EQ(device.wheels[1].value, 55);
    EXPECT_LE(device.downs, 8);
}

TEST_F(ScriptActions, TwelveHoursHaveAHalfOfTheDay) {
    device.wheels = {
        {"hour", 80, 6, 12, true}, {"minute", 180, 0, 60, true}, {"half", 280, 0, 2, false}};
    EXPECT_EQ(does("time 19:30"), "");
    EXPECT_EQ(device.wheels[0].value, 7);
    EXPECT_EQ(device.wheels[1].value, 30);
    EXPECT_EQ(device.wheels[2].value, 1);
    EXPECT_EQ(does("time 00:00"), "");
    EXPECT_EQ(device.wheels[0].value, 0);
    EXPECT_EQ(device.wheels[2].value, 0);
}

TEST_F(ScriptActions, AWheelTurnsByStepsAndStopsAtItsEnd) {
    device.wheels = {{"hour", 120, 6, 24, true}, {"half", 280, 0, 2, false}};
    EXPECT_EQ(does("turn hour -8"), "");
    EXPECT_EQ(device.wheels[0].value, 22);
    EXPECT_EQ(does("turn half 3"), "");
    EXPECT_EQ(device.wheels[1].value, 1);
    EXPECT_EQ(does("turn minute 1"), "there is no minute wheel on the face");
    device.wheels.clear();
    EXPECT_EQ(does("time 07:30"), "there is no time picker on the face");
}

TEST_F(ScriptActions, EachCharacterIsAKeyOfItsOwn) {
    device.typing = true;
    EXPECT_EQ(does(R"(type "a é\n")"), "");
    EXPECT_THAT(device.keys, ElementsAre("a/a/down", "a/a/up", "space/ /down", "space/ /up",
                                         "é/é/down", "é/é/up", "Return/\n/down", "Return/\n/up"));
}

TEST_F(ScriptActions, NothingIsTypedIntoNothing) {
    EXPECT_EQ(does("type abc"), "no text field has the focus; tap one first");
    EXPECT_THAT(device.keys, IsEmpty());
}

TEST_F(ScriptActions, AKeyGoesDownAndUp) {
    EXPECT_EQ(does("key XF86Back"), "");
    EXPECT_EQ(does("press Up"), "");
    EXPECT_EQ(does("release Up"), "");
    EXPECT_THAT(device.keys, ElementsAre("XF86Back//down", "XF86Back//up", "Up//down", "Up//up"));
}

TEST_F(ScriptActions, TheBezelTurnsDetentByDetent) {
    EXPECT_EQ(does("bezel -3"), "");
    EXPECT_THAT(device.asked, SizeIs(3));
    EXPECT_THAT(device.asked[0], HasSubstr(R"("bezel", "-1", "180", "180")"));
    device.asked.clear();
    EXPECT_EQ(does("bezel-press"), "");
    EXPECT_THAT(device.asked[0], HasSubstr(R"("down", "2", "180", "180")"));
}

TEST_F(ScriptActions, SettingsGoToTheWatchItself) {
    EXPECT_EQ(does("set language pt_BR"), "");
    EXPECT_THAT(device.toWatch, ElementsAre(HasSubstr(R"("set", "language", "pt_BR")")));
    EXPECT_EQ(does("expect-setting language de"), "");
    EXPECT_EQ(does("expect-setting language en"), "it is 'de'");
    EXPECT_EQ(does("quick-panel open"), "");
    EXPECT_EQ(does("background"), "");
    EXPECT_EQ(does("foreground"), "");
    EXPECT_THAT(device.asked, IsEmpty());
    EXPECT_THAT(device.toWatch, SizeIs(6));
}

TEST_F(ScriptActions, ATextMayCome) {
    device.whenTimePasses = [this](double now) {
        if (now > 2)
            device.rows = {"Alarm set"};
    };
    EXPECT_EQ(does("wait \"Alarm set\" 3"), "");
    EXPECT_NEAR(device.now(), 2, 0.2);
    EXPECT_THAT(does("wait Snooze 1"), HasSubstr("\"Snooze\" did not come; the face shows"));
}

TEST_F(ScriptActions, ATextMayGo) {
    device.rows = {"Alarm set"};
    EXPECT_THAT(does("wait gone \"Alarm set\" 1"), HasSubstr("\"Alarm set\" did not go"));
    device.whenTimePasses = [this](double) {
        device.rows.clear();
    };
    EXPECT_EQ(does("wait gone \"Alarm set\""), "");
}

TEST_F(ScriptActions, WhatIsExpectedIsThereOrNot) {
    device.rows = {"Done", "Cancel", "Done"};
    EXPECT_EQ(does("expect Done"), "") << "twice is there as well";
    EXPECT_EQ(does("expect-not Snooze"), "");
    EXPECT_THAT(does("expect Snooze"), HasSubstr("the face does not show \"Snooze\"; the face "));
    EXPECT_THAT(does("expect-not Done"), HasSubstr("the face shows \"Done\""));
}
