// What a script asks of the applications of a watch: made-up ones, each a thread with a socket.

#include "script/RunningWatch.h"

#include <array>
#include <atomic>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <poll.h>
#include <stdlib.h>
#include <sys/socket.h>
#include <unistd.h>

#include <filesystem>

#include "base/LocalSocket.h"
#include "base/Message.h"

using simulator::RunningWatch;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/** Notes, for all applications of a watch, who was asked what. */
class Notes {
public:
    void add(const std::string& who, const std::string& what) {
        const std::scoped_lock lock(_mutex);
        _all.push_back(who + " " + what);
    }
    std::vector<std::string> all() const {
        const std::scoped_lock lock(_mutex);
        return _all;
    }
    std::vector<std::string> without(const std::string& what) const {
        std::vector<std::string> rest = all();
        std::erase_if(rest, [&](const std::string& note) { return note.ends_with(" " + what); });
        return rest;
    }

private:
    mutable std::mutex _mutex;
    std::vector<std::string> _all;
};

/** One application, which does all it is asked for at once. */
class MadeUpFace {
public:
    MadeUpFace(const std::string& folder, const std::string& name, Notes& notes)
        : _folder(folder), _name(name), _notes(notes), _channel(base::listenAt(folder, name)),
          _thread([this] { run(); }) {}
    ~MadeUpFace() {
        _over = true;
        _thread.join();
        close(_channel);
        unlink((_folder + "/" + _name).c_str());
    }
    MadeUpFace(const MadeUpFace&) = delete;
    MadeUpFace& operator=(const MadeUpFace&) = delete;

private:
    bool comes(int channel) const {
        constexpr int MILLISECONDS = 10;
        pollfd wanted{channel, POLLIN, 0};
        while (!_over)
            if (poll(&wanted, 1, MILLISECONDS) > 0)
                return true;
        return false;
    }
    void run() {
        while (comes(_channel)) {
            const int caller = accept4(_channel, nullptr, nullptr, SOCK_CLOEXEC);
            serve(caller);
            close(caller);
        }
    }
    void serve(int caller) {
        base::MessageReader reader;
        std::array<char, 1024> bytes{};
        while (comes(caller)) {
            const ssize_t size = recv(caller, bytes.data(), bytes.size(), 0);
            if (size <= 0)
                return;
            reader.add({bytes.data(), static_cast<std::size_t>(size)});
            while (const auto message = reader.next()) {
                _notes.add(_name, std::string(base::textsOfMessage(*message).front()));
                const std::string answer = *base::encodeMessage({""});
                send(caller, answer.data(), answer.size(), MSG_NOSIGNAL);
            }
        }
    }

    std::string _folder;
    std::string _name;
    Notes& _notes;
    int _channel;
    std::atomic<bool> _over = false;
    std::thread _thread;
};

class RunningWatchTest : public testing::Test {
public:
    ~RunningWatchTest() override {
        std::error_code ignored;
        std::filesystem::remove_all(_folder, ignored);
    }

protected:
    RunningWatchTest() {
        std::string path = std::filesystem::temp_directory_path() / "watch-XXXXXX";
        _folder = mkdtemp(path.data());
    }
    const std::string& folder() const { return _folder; }

    Notes notes;

private:
    std::string _folder;
};

} // namespace

TEST_F(RunningWatchTest, standingStillWaitsForSettingsInEveryApplicationFirst) {
    const MadeUpFace watch(folder(), "1-100", notes);
    const MadeUpFace picker(folder(), "2-200", notes);
    RunningWatch running(folder());
    EXPECT_EQ(running.waitStill(5), "");
    EXPECT_THAT(notes.without("launches"),
                ElementsAre("1-100 settings", "2-200 settings", "2-200 still"));
}

TEST_F(RunningWatchTest, theLastOneIsInFrontAndTheFirstOneIsTheWatch) {
    const MadeUpFace watch(folder(), "1-100", notes);
    const MadeUpFace picker(folder(), "2-200", notes);
    RunningWatch running(folder());
    EXPECT_EQ(running.askFront({"texts"}).problem, "");
    EXPECT_EQ(running.askWatch({"get", "clock"}).problem, "");
    EXPECT_THAT(notes.all(), ElementsAre("2-200 texts", "1-100 get"));
}

TEST_F(RunningWatchTest, whatHasEndedIsNotInFront) {
    const MadeUpFace watch(folder(), "1-100", notes);
    RunningWatch running(folder());
    {
        const MadeUpFace picker(folder(), "2-200", notes);
        EXPECT_EQ(running.askFront({"texts"}).problem, "");
    }
    EXPECT_EQ(running.askFront({"wheels"}).problem, "");
    EXPECT_THAT(notes.all(), ElementsAre("2-200 texts", "1-100 wheels"));
}

TEST_F(RunningWatchTest, withoutApplicationsItHasEnded) {
    RunningWatch running(folder());
    EXPECT_EQ(running.askFront({"texts"}).problem, "the watch has ended");
    EXPECT_EQ(running.askWatch({"get", "clock"}).problem, "the watch has ended");
    EXPECT_EQ(running.waitStill(1), "the watch has ended");
    EXPECT_THAT(notes.all(), IsEmpty());
}
