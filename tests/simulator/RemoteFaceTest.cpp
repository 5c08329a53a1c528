// The face as scripts use it: real requests over a real socket, and real screens.

#include <atomic>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <thread>
#include <vector>

#include <Elementary.h>
#include <gmock/gmock.h>
#include <stdlib.h>
#include <unistd.h>

#include "AlarmEditViewController.h"
#include "device_remote.h"
#include "script/Commands.h"
#include "script/FaceChannel.h"
#include "script/RunningWatch.h"
#include "script/ScriptRun.h"
#include "script/ScriptWords.h"
#include "support/ScreenTest.h"

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

    std::vector<std::string> shownTexts() {
        std::vector<std::string> all;
        for (const FoundText& found : stage().texts())
            all.push_back(found.text);
        return all;
    }

private:
    std::string _folder;
    std::unique_ptr<TestedWatch> _watch;
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
