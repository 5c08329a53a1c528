// The face as scripts use it: real requests over a real socket, and real screens.
#define EFL_BETA_API_SUPPORT

#include <algorithm>
#include <atomic>
#include <filesystem>
#include <fstream>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <thread>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <stdlib.h>
#include <sys/socket.h>
#include <unistd.h>

#include "AlarmEditViewController.h"
#include "base/LocalSocket.h"
#include "base/Message.h"
#include "clock/ClockEventListener.h"
#include "device_remote.h"
#include "device_settings.h"
#include "script/Commands.h"
#include "script/FaceChannel.h"
#include "script/RunningWatch.h"
#include "script/ScriptRun.h"
#include "script/ScriptWords.h"
#include "support/ScreenTest.h"
#include "support/ToolkitErrors.h"

using simulator::Reply;
using simulator::Request;
using simulator::VisibleText;

namespace {

/** The real applications; only the waiting is left to the test, whose loop never sleeps. */
class TestedWatch : public simulator::Device {
public:
    explicit TestedWatch(const std::string& folder) : _watch(folder) {}

    Reply askFront(const Request& request) override { return _watch.askFront(request); }
    Reply askWatch(const Request& request) override { return _watch.askWatch(request); }
    std::string waitStill(double /*seconds*/) override {
        moving = true;
        while (moving)
            _watch.sleep(0.002);
        return "";
    }
    const std::string& folder() const override { return _watch.folder(); }
    void sleep(double seconds) override {
        const double end = now() + seconds;
        while (now() < end)
            _watch.sleep(0.002);
    }
    double now() override { return _watch.now(); }

    std::atomic<bool> moving = false; ///< Until the test has let the face come to rest.

private:
    simulator::RunningWatch _watch;
};

class RemoteFaceTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        stage();
        std::string path = std::filesystem::temp_directory_path() / "face-XXXXXX";
        _folder = mkdtemp(path.data());
        ASSERT_EQ(device_remote_listen(_folder.c_str()), 0);
        _watch = std::make_unique<TestedWatch>(_folder);
        _canvas = stage().canvas();
        Stage::advance(0.5);
    }
    void TearDown() override {
        _watch.reset();
        device_remote_listen(nullptr);
        unsetenv("CLOCK_FACE_DIR");
        std::error_code ignored;
        std::filesystem::remove_all(_folder, ignored);
        takeStageDown();
        for (const std::string& line : takeErrors())
            EXPECT_THAT(line,
                        testing::AnyOf("Alarm Name is NULL !!", "Focus is not set for entry !!"));
        ScreenTest::TearDown();
    }

    /** Runs the main loop while another thread works. */
    void during(const std::function<void()>& work) {
        constexpr useconds_t FRAME = 2000;
        std::atomic<bool> over = false;
        std::thread thread([&] {
            work();
            over = true;
        });
        while (!over) {
            Stage::frames(1);
            usleep(FRAME);
            if (_watch->moving) {
                EXPECT_TRUE(stage().settle());
                _watch->moving = false;
            }
        }
        thread.join();
    }
    std::string does(const std::string& line) {
        const auto words = simulator::scriptWords(line).words;
        EXPECT_EQ(simulator::checkCommand(words), "") << line;
        std::string problem;
        during([&] {
            simulator::ScriptRun run(*_watch);
            problem = simulator::findCommand(words[0])->act(run, {words.begin() + 1, words.end()});
        });
        return problem;
    }
    Reply ask(const Request& request) {
        Reply reply;
        during([&] { reply = _watch->askFront(request); });
        return reply;
    }
    std::vector<VisibleText> texts() {
        std::vector<VisibleText> all;
        std::string problem;
        during([&] {
            simulator::ScriptRun run(*_watch);
            problem = run.readTextsWhenStill(all);
        });
        EXPECT_EQ(problem, "");
        return all;
    }
    /** The text as it is told, if it is. */
    std::optional<VisibleText> told(const std::string& text) {
        std::vector<VisibleText> all;
        during([&] { simulator::ScriptRun(*_watch).readTexts(all); });
        const auto found = std::find_if(all.begin(), all.end(),
                                        [&](const VisibleText& t) { return t.text == text; });
        return found == all.end() ? std::nullopt : std::optional(*found);
    }
    void openEditor() {
        ClockAlarmDbData alarm{};
        alarm.hour = 6;
        alarm.name = "Swim";
        stage().push(new AlarmEditViewController(ALARM_EDIT_VIEW_CALLER_CLOCK, alarm, false));
    }
    Evas_Object* list() { return stage().widgets("Elm_Genlist").front(); }
    void scrollTo(int y) {
        elm_scroller_region_show(list(), 0, y, 1, Stage::SIZE);
        stage().settle();
    }
    /** The pixels of a text's rows that are as bright as letters, left and right. */
    std::pair<int, int> drawnSpan(const VisibleText& text) {
        constexpr unsigned BRIGHT = 90;
        const auto pixels = stage().pixels(0, text.area.y, Stage::SIZE, text.area.height);
        int left = Stage::SIZE;
        int right = -1;
        for (int at = 0; at < static_cast<int>(pixels.size()); ++at) {
            const int x = at % Stage::SIZE;
            if ((pixels.at(static_cast<std::size_t>(at)) & 0xFFU) < BRIGHT || x > 200)
                continue;
            left = std::min(left, x);
            right = std::max(right, x);
        }
        return {left, right};
    }

    const std::string& folder() const { return _folder; }
    bool hasKeys() const {
        return ecore_evas_focus_get(ecore_evas_ecore_evas_get(_canvas)) != EINA_FALSE;
    }
    /** The names of the wheels that a script sees. */
    std::vector<std::string> wheels() {
        std::vector<std::string> names;
        const auto values = ask({"wheels"}).values;
        for (std::size_t at = 0; at + 8 < values.size(); at += 9 + std::stoul(values[at + 8]))
            names.push_back(values[at]);
        return names;
    }
    std::vector<std::string> shownTexts() {
        std::vector<std::string> all;
        for (const FoundText& found : stage().texts())
            all.push_back(found.text);
        return all;
    }

private:
    std::string _folder;
    std::unique_ptr<TestedWatch> _watch;
    Evas* _canvas = nullptr;
};

} // namespace

TEST_F(RemoteFaceTest, textsAreWhereTheyAreDrawn) {
    openEditor();
    int shrunk = 0;
    for (int y = 150; y < 600; y += 25) {
        scrollTo(y);
        for (const VisibleText& text : texts()) {
            if (text.covered || text.faint || text.text.size() > 16 || text.area.height > 40 ||
                text.area.y < 240 || text.area.y + text.area.height > 345 || text.seen != text.area)
                continue;
            const auto [left, right] = drawnSpan(text);
            EXPECT_NEAR(left, text.area.x, 6) << text.text << " at " << y;
            EXPECT_LE(right, std::max(200, text.area.x + text.area.width + 4)) << text.text;
            ++shrunk;
        }
    }
    EXPECT_GT(shrunk, 8);
}

TEST_F(RemoteFaceTest, scrollingBringsARowWhereItCanBeReadAndTouched) {
    openEditor();
    for (const char* text : {"Snooze", "Repeat weekly", "Alarm tone", "Alarm type"}) {
        EXPECT_EQ(does(std::string("scroll-to \"") + text + "\""), "") << text;
        bool found = false;
        for (const VisibleText& shown : texts())
            found |= shown.text == text && shown.isFullySeen();
        EXPECT_TRUE(found) << text;
    }
    EXPECT_EQ(does("tap \"Alarm type\""), "");
    stage().settle();
    EXPECT_TRUE(stage().shows("Vibration")) << testing::PrintToString(shownTexts());
}

TEST_F(RemoteFaceTest, aRowThatHasFadedIsNotInFullView) {
    openEditor();
    bool faded = false;
    for (int y = 100; y < 300; y += 10) {
        scrollTo(y);
        for (const VisibleText& text : texts()) {
            faded |= text.faint;
            EXPECT_FALSE(text.faint && text.isFullySeen()) << text.text;
        }
    }
    EXPECT_TRUE(faded);
}

TEST_F(RemoteFaceTest, requestsWithOtherWordsAreRefused) {
    EXPECT_EQ(ask({"home", "on", "now"}).problem, "the request home has other words");
    EXPECT_EQ(ask({"home", "perhaps"}).problem, "home is on or off");
    EXPECT_EQ(ask({"pointer", "wave", "1", "2", "3"}).problem,
              "the pointer needs move, down or up, a button and a place");
    EXPECT_EQ(ask({"bezel", "x", "1", "2"}).problem, "the bezel needs a direction and a place");
    EXPECT_EQ(ask({"key", "", "", "down"}).problem, "a key needs a name, and down or up");
    EXPECT_EQ(ask({"still", "soon"}).problem, "standing still needs a time limit");
    EXPECT_EQ(ask({"translate", "IDS_NOTHING"}).problem, "there is no text IDS_NOTHING");
    EXPECT_EQ(ask({"juggle"}).problem, "nobody knows this request");
    EXPECT_EQ(ask({"settings"}).problem, "");
    EXPECT_EQ(ask({"translate", "IDS_COM_SK_CANCEL"}).values, std::vector<std::string>{"Cancel"});
}

TEST_F(RemoteFaceTest, fingersKeysAndTheBezelReachTheFace) {
    Evas_Object* entry = elm_entry_add(stage().window());
    elm_entry_single_line_set(entry, EINA_TRUE);
    evas_object_resize(entry, Stage::SIZE, Stage::SIZE);
    evas_object_show(entry);
    Stage::advance(0.3);
    EXPECT_EQ(ask({"typing"}).values, std::vector<std::string>{"no"});
    int turned = 0;
    evas_object_event_callback_add(
        entry, EVAS_CALLBACK_MOUSE_WHEEL,
        [](void* sum, Evas*, Evas_Object*, void* info) {
            *static_cast<int*>(sum) += static_cast<Evas_Event_Mouse_Wheel*>(info)->z;
        },
        &turned);
    EXPECT_EQ(does("tap 180 180"), "");
    EXPECT_EQ(ask({"typing"}).values, std::vector<std::string>{"yes"});
    EXPECT_EQ(does("type \"a b\""), "");
    EXPECT_STREQ(elm_entry_entry_get(entry), "a b");
    EXPECT_EQ(does("bezel 2"), "");
    EXPECT_EQ(does("bezel -1"), "");
    Stage::frames(5);
    EXPECT_EQ(turned, 1);
    evas_object_del(entry);
}

TEST_F(RemoteFaceTest, theWheelsThatCanBeTurnedAreTold) {
    openEditor();
    EXPECT_THAT(wheels(), testing::ElementsAre("hour", "minute"));
    scrollTo(600);
    EXPECT_THAT(wheels(), testing::IsEmpty()) << "they are out of sight";
    scrollTo(0);
    device().setSetting(DEVICE_SETTING_TIME_FORM, 1);
    ClockEventListener::raise(ClockEventListener::SETTINGS_CHANGED);
    stage().settle();
    EXPECT_THAT(wheels(), testing::ElementsAre("hour", "minute", "half"));
}

TEST_F(RemoteFaceTest, aFieldThatIsOutOfSightTakesNothing) {
    Evas_Object* entry = elm_entry_add(stage().window());
    evas_object_resize(entry, Stage::SIZE, Stage::SIZE);
    evas_object_show(entry);
    elm_object_focus_set(entry, EINA_TRUE);
    Stage::advance(0.3);
    EXPECT_EQ(ask({"typing"}).values, std::vector<std::string>{"yes"});
    evas_object_move(entry, 0, 2 * Stage::SIZE);
    Stage::frames(2);
    EXPECT_EQ(ask({"typing"}).values, std::vector<std::string>{"no"});
    evas_object_del(entry);
}

TEST_F(RemoteFaceTest, aFingerComesGoesDownAndUpAndIsNowhereThen) {
    Evas_Object* shape = evas_object_rectangle_add(stage().canvas());
    evas_object_resize(shape, Stage::SIZE, Stage::SIZE);
    evas_object_layer_set(shape, EVAS_LAYER_MAX - 1);
    evas_object_show(shape);
    Stage::frames(2);
    std::vector<std::string> seen;
    std::vector<unsigned> times;
    struct Notes {
        std::vector<std::string>& seen;
        std::vector<unsigned>& times;
    } notes{seen, times};
    evas_object_event_callback_add(
        shape, EVAS_CALLBACK_MOUSE_IN,
        [](void* data, Evas*, Evas_Object*, void*) {
            static_cast<Notes*>(data)->seen.emplace_back("in");
        },
        &notes);
    evas_object_event_callback_add(
        shape, EVAS_CALLBACK_MOUSE_DOWN,
        [](void* data, Evas*, Evas_Object*, void* info) {
            static_cast<Notes*>(data)->seen.emplace_back("down");
            static_cast<Notes*>(data)->times.push_back(
                static_cast<Evas_Event_Mouse_Down*>(info)->timestamp);
        },
        &notes);
    evas_object_event_callback_add(
        shape, EVAS_CALLBACK_MOUSE_UP,
        [](void* data, Evas*, Evas_Object*, void* info) {
            static_cast<Notes*>(data)->seen.emplace_back("up");
            static_cast<Notes*>(data)->times.push_back(
                static_cast<Evas_Event_Mouse_Up*>(info)->timestamp);
        },
        &notes);
    evas_object_event_callback_add(
        shape, EVAS_CALLBACK_MOUSE_OUT,
        [](void* data, Evas*, Evas_Object*, void*) {
            static_cast<Notes*>(data)->seen.emplace_back("out");
        },
        &notes);
    EXPECT_EQ(ask({"pointer", "move", "0", "90", "90"}).problem, "");
    Stage::frames(2);
    seen.clear();
    // At the same instant.
    for (const char* press : {"down", "up", "down", "up"}) {
        const char* words[] = {"pointer", press, "1", "100", "100"};
        EXPECT_EQ(device_remote_send(words, 5), 0);
    }
    Stage::frames(2);
    EXPECT_THAT(seen, testing::ElementsAre("down", "up", "out", "in", "down", "up", "out"));
    EXPECT_THAT(std::adjacent_find(times.begin(), times.end(), std::greater_equal<>()),
                testing::Eq(times.end()))
        << testing::PrintToString(times);
    evas_object_del(shape);
}

TEST_F(RemoteFaceTest, aRequestTurnsTheBezelByOneDetent) {
    std::vector<int> turns;
    Evas_Object* shape = evas_object_rectangle_add(stage().canvas());
    evas_object_resize(shape, Stage::SIZE, Stage::SIZE);
    evas_object_show(shape);
    evas_object_event_callback_add(
        shape, EVAS_CALLBACK_MOUSE_WHEEL,
        [](void* all, Evas*, Evas_Object*, void* info) {
            static_cast<std::vector<int>*>(all)->push_back(
                static_cast<Evas_Event_Mouse_Wheel*>(info)->z);
        },
        &turns);
    EXPECT_EQ(ask({"bezel", "7", "180", "180"}).problem, "");
    EXPECT_EQ(ask({"bezel", "-7", "180", "180"}).problem, "");
    EXPECT_EQ(ask({"bezel", "1x", "180", "180"}).problem,
              "the bezel needs a direction and a place");
    Stage::frames(2);
    EXPECT_THAT(turns, testing::ElementsAre(1, -1));
    evas_object_del(shape);
}

TEST_F(RemoteFaceTest, aPlaceOrAKeyThatIsNoneIsRefused) {
    const std::string place = "the pointer needs move, down or up, a button and a place";
    EXPECT_EQ(ask({"pointer", "down", "", "2", "3"}).problem, place);
    EXPECT_EQ(ask({"pointer", "down", "1", "x", "3"}).problem, place);
    EXPECT_EQ(ask({"pointer", "down", "1", "2", "3.5"}).problem, place);
    const std::string key = "a key needs a name, and down or up";
    EXPECT_EQ(ask({"key", std::string("F\0", 2), "", "down"}).problem, key);
    EXPECT_EQ(ask({"key", "F1", "", "sideways"}).problem, key);
}

TEST_F(RemoteFaceTest, theKeysGoToTheLastApplication) {
    const auto become = [this](const std::string& name) {
        const int channel = base::listenAt(folder(), name);
        Stage::advance(0.1);
        close(channel);
    };
    EXPECT_TRUE(hasKeys());
    become("0-1");
    EXPECT_TRUE(hasKeys()) << "that one came before";
    become("9-1");
    EXPECT_FALSE(hasKeys());
    std::filesystem::remove(folder() + "/9-1");
    Stage::advance(0.1);
    EXPECT_TRUE(hasKeys());
    std::ofstream(folder() + "/9-2") << "no application";
    Stage::advance(0.1);
    EXPECT_TRUE(hasKeys());
}

TEST_F(RemoteFaceTest, aWindowThatGoesEndsTheWaitForIt) {
    openEditor();
    const ToolkitErrors errors;
    simulator::RunningWatch watch(folder());
    Reply reply;
    std::atomic<bool> over = false;
    std::thread thread([&] {
        reply = watch.askFront({"still", "1"});
        over = true;
    });
    for (int frames = 0; !over; ++frames) {
        Stage::frames(1);
        usleep(2000);
        if (frames == 20)
            takeStageDown();
    }
    thread.join();
    EXPECT_EQ(reply.problem, "no window is shown");
    EXPECT_EQ(ask({"settings"}).problem, "");
    EXPECT_EQ(errors.count(), 0) << "a canvas that has gone was used";
}

TEST_F(RemoteFaceTest, aWaitThatIsOverLeavesTheWindowAlone) {
    openEditor();
    const ToolkitErrors errors;
    EXPECT_NE(ask({"still", "0.2"}).problem, "") << "this loop never sleeps";
    takeStageDown();
    EXPECT_EQ(ask({"settings"}).problem, "");
    EXPECT_EQ(errors.count(), 0) << "a canvas that has gone was used";
}

TEST_F(RemoteFaceTest, whoHangsUpWhileWaitingLeavesNothingBehind) {
    const auto listeners = [this] {
        return efl_event_callback_count(stage().canvas(), EFL_CANVAS_SCENE_EVENT_RENDER_POST);
    };
    const unsigned before = listeners();
    const auto own = *std::filesystem::directory_iterator(folder());
    const int channel = base::connectTo(folder(), own.path().filename());
    const std::string request = *base::encodeMessage({"still", "60"});
    EXPECT_EQ(send(channel, request.data(), request.size(), 0),
              static_cast<ssize_t>(request.size()));
    Stage::advance(0.2);
    EXPECT_EQ(listeners(), before + 1);
    close(channel);
    Stage::advance(0.2);
    EXPECT_EQ(listeners(), before);
    EXPECT_NE(ask({"still", "0.2"}).problem, "");
    EXPECT_EQ(listeners(), before) << "the wait is over";
}

TEST_F(RemoteFaceTest, aKeyHasItsNameAndOnlyTheTextThatItWrites) {
    struct Key {
        std::string keyname;
        std::string key;
        std::string text;
    };
    std::vector<Key> keys;
    Ecore_Event_Handler* handler = ecore_event_handler_prepend(
        ECORE_EVENT_KEY_DOWN,
        [](void* all, int, void* info) -> Eina_Bool {
            const auto& event = *static_cast<Ecore_Event_Key*>(info);
            static_cast<std::vector<Key>*>(all)->push_back(
                {event.keyname, event.key, event.string == nullptr ? "none" : event.string});
            return ECORE_CALLBACK_PASS_ON;
        },
        &keys);
    EXPECT_EQ(ask({"key", "XF86Reload", "", "down"}).problem, "");
    EXPECT_EQ(ask({"key", "é", "é", "down"}).problem, "");
    Stage::frames(2);
    ecore_event_handler_del(handler);
    ASSERT_EQ(keys.size(), 2U);
    EXPECT_EQ(keys[0].keyname, "XF86Reload");
    EXPECT_EQ(keys[0].key, "XF86Reload");
    EXPECT_EQ(keys[0].text, "none");
    EXPECT_EQ(keys[1].key, "é");
    EXPECT_EQ(keys[1].text, "é");
}

TEST_F(RemoteFaceTest, whatCannotBeSeenIsNotTold) {
    Evas* canvas = stage().canvas();
    Evas_Object* text = evas_object_text_add(canvas);
    evas_object_text_font_set(text, "Roboto", 30);
    evas_object_text_text_set(text, "Look");
    evas_object_move(text, 120, 150);
    evas_object_show(text);
    Stage::frames(2);
    EXPECT_TRUE(told("Look"));

    evas_object_color_set(text, 0, 0, 0, 0);
    EXPECT_FALSE(told("Look")) << "it has no colour";
    evas_object_color_set(text, 255, 255, 255, 255);

    Evas_Map* map = evas_map_new(4);
    evas_map_util_points_populate_from_object(map, text);
    evas_map_util_points_color_set(map, 0, 0, 0, 0);
    evas_object_map_set(text, map);
    evas_object_map_enable_set(text, EINA_TRUE);
    EXPECT_FALSE(told("Look")) << "it has faded";
    evas_object_map_enable_set(text, EINA_FALSE);
    evas_map_free(map);
    EXPECT_TRUE(told("Look"));

    // A group that leaves its members alone when it is hidden.
    static const Evas_Smart_Class plain = EVAS_SMART_CLASS_INIT_NAME_VERSION("Plain");
    static Evas_Smart* const kind = evas_smart_class_new(&plain);
    Evas_Object* group = evas_object_smart_add(canvas, kind);
    evas_object_smart_member_add(text, group);
    evas_object_show(group);
    EXPECT_TRUE(told("Look"));
    evas_object_hide(group);
    EXPECT_FALSE(told("Look")) << "its group is hidden";
    evas_object_del(group);
    evas_object_del(text);
}

TEST_F(RemoteFaceTest, whatLiesBelowAButtonIsCovered) {
    Evas_Object* table = elm_table_add(stage().window());
    evas_object_resize(table, Stage::SIZE, Stage::SIZE);
    const auto addButton = [table](const char* text) {
        Evas_Object* button = elm_button_add(table);
        elm_object_text_set(button, text);
        elm_table_pack(table, button, 0, 0, 1, 1);
        evas_object_show(button);
        return button;
    };
    addButton("Below");
    Evas_Object* above = addButton("Above");
    evas_object_show(table);
    Stage::frames(3);
    ASSERT_TRUE(told("Below") && told("Above"));
    EXPECT_TRUE(told("Below")->covered);
    EXPECT_FALSE(told("Above")->covered);
    evas_object_hide(above);
    Stage::frames(2);
    EXPECT_FALSE(told("Below")->covered);
    evas_object_del(table);
}

TEST_F(RemoteFaceTest, ofTwoThingsOnTheFaceTheUpperOneCovers) {
    const auto addButton = [this](const char* text, short layer) {
        Evas_Object* button = elm_button_add(stage().window());
        elm_object_text_set(button, text);
        evas_object_resize(button, Stage::SIZE, Stage::SIZE);
        evas_object_layer_set(button, layer);
        evas_object_show(button);
        return button;
    };
    Evas_Object* upper = addButton("Upper", 2);
    Evas_Object* lower = addButton("Lower", 1);
    Stage::frames(3);
    EXPECT_FALSE(told("Upper")->covered);
    EXPECT_TRUE(told("Lower")->covered);
    evas_object_layer_set(upper, 1);
    evas_object_stack_below(upper, lower);
    Stage::frames(2);
    EXPECT_TRUE(told("Upper")->covered);
    EXPECT_FALSE(told("Lower")->covered);
    Evas_Object* text = evas_object_text_add(stage().canvas());
    evas_object_text_font_set(text, "Roboto", 30);
    evas_object_text_text_set(text, "Toast");
    evas_object_pass_events_set(text, EINA_TRUE);
    evas_object_layer_set(text, 3);
    evas_object_show(text);
    evas_object_move(text, 120, 150);
    Stage::frames(2);
    EXPECT_FALSE(told("Toast")->covered) << "a touch goes through it to what lies below";
    for (Evas_Object* object : {upper, lower, text})
        evas_object_del(object);
}
