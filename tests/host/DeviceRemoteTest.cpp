// Those who use a face from outside: what a process answers them, and what it asks of others.

#include "device_remote.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <string>
#include <utility>
#include <vector>

#include <Ecore.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>

#include "base/LocalSocket.h"
#include "base/Message.h"
#include "device/vconf.h"
#include "host/FaceConnection.h"
#include "host/Helper.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;

namespace {

using Words = std::vector<std::string>;

std::size_t openDescriptors() {
    const fs::directory_iterator all("/proc/self/fd");
    return static_cast<std::size_t>(std::distance(begin(all), end(all)));
}

Words namesIn(const std::string& folder) {
    Words names;
    for (const auto& entry : fs::directory_iterator(folder))
        names.push_back(entry.path().filename());
    return names;
}

/** Another application of the device. */
class OtherFace {
public:
    OtherFace(const std::string& folder, const std::string& name)
        : _path(folder + "/" + name), _channel(base::listenAt(folder, name)) {}
    ~OtherFace() {
        end();
        unlink(_path.c_str());
    }
    OtherFace(const OtherFace&) = delete;
    OtherFace& operator=(const OtherFace&) = delete;

    /** Its file stays, as that of a killed process does. */
    void end() {
        if (_channel >= 0)
            close(std::exchange(_channel, -1));
    }
    /** What it was asked for, once. */
    Words asked() const {
        const int caller = accept4(_channel, nullptr, nullptr, SOCK_CLOEXEC);
        return caller < 0 ? Words{} : FaceConnection(caller).hear().value_or(Words{});
    }

private:
    std::string _path;
    int _channel;
};

class DeviceRemoteTest : public testing::Test {
public:
    ~DeviceRemoteTest() override {
        device_remote_set_request_callback(nullptr, nullptr);
        device_remote_listen(nullptr);
        unsetenv("CLOCK_FACE_DIR");
        ecore_shutdown();
    }

protected:
    DeviceRemoteTest() {
        ecore_init();
        EXPECT_EQ(device_remote_listen(folder.path().c_str()), 0);
        const Words names = namesIn(folder.path());
        EXPECT_THAT(names, SizeIs(1));
        own = names.empty() ? "" : names.front();
        device_remote_set_request_callback(_requestCb, this);
    }
    FaceConnection connect() { return FaceConnection(base::connectTo(folder.path(), own)); }
    static int send(const Words& words, int (*how)(const char* const*, int) = device_remote_send) {
        std::vector<const char*> pointers;
        for (const std::string& word : words)
            pointers.push_back(word.c_str());
        return how(pointers.data(), static_cast<int>(pointers.size()));
    }
    static int sendToAll(const Words& words) { return send(words, device_remote_send_to_all); }

    TemporaryFolder folder;
    std::string own; ///< The name of this process's face.
    Words here;      ///< What this program was asked for last.
    int timesHere = 0;
    std::string answer;

private:
    static char* _requestCb(const char* const* words, int count, void* data) {
        auto* self = static_cast<DeviceRemoteTest*>(data);
        self->here = Words(words, words + count);
        ++self->timesHere;
        return self->answer.empty() ? nullptr : strdup(self->answer.c_str());
    }

    DeviceHost host;
};

} // namespace

TEST_F(DeviceRemoteTest, RequestsThatComeAtOnceAreDoneOneAfterTheOther) {
    FaceConnection caller = connect();
    answer = "=seven";
    caller.ask({{"still", "0.1"}});
    iterateFor(0.02);
    // While the first one is being done.
    caller.ask({{"get"}, {"still", "0.1"}, {"get"}});
    EXPECT_EQ(caller.hear(), Words{"no window is shown"});
    EXPECT_EQ(caller.hear(), (Words{"", "seven"}));
    EXPECT_EQ(caller.hear(), Words{"no window is shown"});
    EXPECT_EQ(caller.hear(), (Words{"", "seven"}));
}

TEST_F(DeviceRemoteTest, ARequestMayComeInPieces) {
    FaceConnection caller = connect();
    const std::string bytes = *base::encodeMessage({"settings"});
    for (const char byte : bytes) {
        caller.sendBytes(std::string(1, byte));
        iterateFor(0.01);
    }
    EXPECT_EQ(caller.hear(), Words{""});
}

TEST_F(DeviceRemoteTest, ALargeAnswerArrivesWhole) {
    FaceConnection caller = connect();
    answer = "=";
    for (int i = 0; answer.size() < 900000; ++i)
        answer += std::to_string(i) + " ";
    caller.ask({{"get"}, {"get"}});
    iterateFor(0.1);
    EXPECT_EQ(caller.hear(), (Words{"", answer.substr(1)}));
    EXPECT_EQ(caller.hear(), (Words{"", answer.substr(1)}));
}

TEST_F(DeviceRemoteTest, AnAnswerThatIsTooLargeIsToldOf) {
    FaceConnection caller = connect();
    answer = "=" + std::string(base::MESSAGE_LIMIT, 'x');
    caller.ask({{"get"}});
    EXPECT_EQ(caller.hear(), Words{"the answer is too long"});
}

TEST_F(DeviceRemoteTest, WhoAnnouncesTooMuchIsLeft) {
    FaceConnection caller = connect();
    caller.sendBytes(std::string(64, '\xFF'));
    EXPECT_TRUE(caller.isLeft());
}

TEST_F(DeviceRemoteTest, WhoHangsUpIsForgotten) {
    const std::size_t before = openDescriptors();
    const auto isAsBefore = [&] {
        return openDescriptors() == before;
    };
    for (const Words& request : {Words{"settings"}, Words{"still", "60"}, Words{"get"}}) {
        answer = "=" + std::string(900000, 'x');
        FaceConnection caller = connect();
        caller.ask({request});
        iterateFor(0.05);
        caller.hangUp();
        EXPECT_TRUE(iterateUntil(isAsBefore)) << request.front();
    }
    FaceConnection next = connect();
    next.ask({{"settings"}});
    EXPECT_EQ(next.hear(), Words{""});
}

TEST_F(DeviceRemoteTest, TheEndOfListeningHangsUpAndLeavesNothing) {
    const std::size_t before = openDescriptors();
    FaceConnection caller = connect();
    caller.ask({{"still", "60"}});
    iterateFor(0.05);
    device_remote_listen(nullptr);
    EXPECT_THAT(namesIn(folder.path()), IsEmpty());
    EXPECT_TRUE(caller.isLeft());
    EXPECT_LT(openDescriptors(), before);
}

TEST_F(DeviceRemoteTest, WhoListensAnewIsThereOnce) {
    ASSERT_EQ(device_remote_listen(folder.path().c_str()), 0);
    EXPECT_THAT(namesIn(folder.path()), ElementsAre(testing::Gt(own)))
        << "the last one is in front";
}

TEST_F(DeviceRemoteTest, NamesSortByTimeHoweverLongTheComputerRuns) {
    const auto end = own.find('-');
    EXPECT_EQ(end, 20U);
    EXPECT_EQ(own.substr(0, end).find_first_not_of("0123456789"), std::string::npos);
    EXPECT_EQ(own.substr(end + 1), std::to_string(getpid()));
}

TEST_F(DeviceRemoteTest, ApplicationsThatAreStartedListenThereToo) {
    EXPECT_STREQ(std::getenv("CLOCK_FACE_DIR"), folder.path().c_str());
}

TEST_F(DeviceRemoteTest, AFolderThatIsNotThereIsRefused) {
    EXPECT_EQ(device_remote_listen("/nowhere/at/all"), -ENOENT);
}

TEST_F(DeviceRemoteTest, AnApplicationThatCannotListenSaysSoAndGoesOn) {
    setenv("CLOCK_RESOURCE_DIR", CLOCK_RESOURCE_DIR, 1);
    setenv("CLOCK_FACE_DIR", "/nowhere/at/all", 1);
    EXPECT_THAT(standardErrorOf([] { EXPECT_EQ(std::system(CLOCK_DEVICE_CLOCK " >&2"), 0); }),
                testing::HasSubstr("Nobody can use this face from outside, in /nowhere/at/all: "
                                   "No such file or directory"));
    setenv("CLOCK_FACE_DIR", "", 1);
    EXPECT_THAT(standardErrorOf([] { EXPECT_EQ(std::system(CLOCK_DEVICE_CLOCK " >&2"), 0); }),
                testing::Not(testing::HasSubstr("Nobody can use this face")));
}

TEST_F(DeviceRemoteTest, SettingsOfOtherProcessesArriveBeforeTheAnswer) {
    int changes = 0;
    vconf_notify_key_changed(
        "db/setting/motion", [](keynode_t*, void* count) { ++*static_cast<int*>(count); },
        &changes);
    ASSERT_EQ(waitFor(startHelper({"set-int", "db/setting/motion", "0"})), 0);
    EXPECT_EQ(changes, 0);
    EXPECT_EQ(send({"settings"}), 0);
    EXPECT_EQ(changes, 1);
}

TEST_F(DeviceRemoteTest, WhatTheProgramSaysIsPassedOn) {
    FaceConnection caller = connect();
    caller.ask({{"set", "mood", "good"}, {""}, {}});
    EXPECT_EQ(caller.hear(), Words{""}) << "nothing was wrong";
    EXPECT_EQ(caller.hear(), Words{""});
    EXPECT_EQ(caller.hear(), Words{"nobody knows this request"}) << "it has no words";
    answer = "there is no mood";
    caller.ask({{"set", "mood", "good"}});
    EXPECT_EQ(caller.hear(), Words{"there is no mood"});
    EXPECT_EQ(here, (Words{"set", "mood", "good"}));
    device_remote_set_request_callback(nullptr, nullptr);
    caller.ask({{"set", "mood", "good"}});
    EXPECT_EQ(caller.hear(), Words{"nobody knows this request"});
}

TEST_F(DeviceRemoteTest, WithoutAWindowThereIsNothingToUse) {
    FaceConnection caller = connect();
    for (const Words& request :
         {Words{"pointer", "down", "1", "2", "3"}, Words{"bezel", "1", "2", "3"},
          Words{"key", "Return", "", "down"}, Words{"texts"}, Words{"wheels"}, Words{"typing"},
          Words{"picture"}, Words{"home", "on"}}) {
        caller.ask({request});
        EXPECT_EQ(caller.hear(), Words{"no window is shown"}) << request.front();
    }
    for (const Words& request : {Words{"texts", "all"}, Words{"pointer"}, Words{"still"}})
        caller.ask({request});
    EXPECT_EQ(caller.hear(), Words{"the request texts has other words"});
    EXPECT_EQ(caller.hear(), Words{"the request pointer has other words"});
    EXPECT_EQ(caller.hear(), Words{"standing still needs a time limit"});
}

TEST_F(DeviceRemoteTest, TheLastApplicationIsAskedAlone) {
    const OtherFace older(folder.path(), "0-1");
    const OtherFace newer(folder.path(), own + "1");
    const OtherFace newest(folder.path(), own + "2");
    EXPECT_EQ(send({"get", "a"}), 0);
    EXPECT_THAT(newest.asked(), ElementsAre("get", "a"));
    EXPECT_THAT(newer.asked(), IsEmpty());
    EXPECT_THAT(older.asked(), IsEmpty());
    EXPECT_THAT(here, IsEmpty());
}

TEST_F(DeviceRemoteTest, WhatHasEndedIsPassedOver) {
    const OtherFace older(folder.path(), "0-1");
    const OtherFace newer(folder.path(), own + "1");
    OtherFace newest(folder.path(), own + "2");
    newest.end();
    EXPECT_EQ(send({"get", "a"}), 0);
    EXPECT_THAT(newer.asked(), ElementsAre("get", "a"));
    EXPECT_THAT(here, IsEmpty());
}

TEST_F(DeviceRemoteTest, WhoIsInFrontItselfDoesItItself) {
    const OtherFace older(folder.path(), "0-1");
    EXPECT_EQ(send({"get", "a"}), 0);
    EXPECT_THAT(here, ElementsAre("get", "a"));
    EXPECT_THAT(older.asked(), IsEmpty());
    device_remote_listen(nullptr);
    EXPECT_EQ(send({"get", "b"}), 0);
    EXPECT_THAT(here, ElementsAre("get", "b"));
}

TEST_F(DeviceRemoteTest, EveryApplicationIsAskedOnce) {
    const OtherFace older(folder.path(), "0-1");
    OtherFace ended(folder.path(), own + "1");
    const OtherFace newest(folder.path(), own + "2");
    ended.end();
    const std::size_t before = openDescriptors();
    EXPECT_EQ(sendToAll({"get", "a"}), 0);
    EXPECT_EQ(openDescriptors(), before);
    EXPECT_THAT(older.asked(), ElementsAre("get", "a"));
    EXPECT_THAT(newest.asked(), ElementsAre("get", "a"));
    EXPECT_THAT(here, ElementsAre("get", "a"));
    iterateFor(0.1);
    EXPECT_EQ(timesHere, 1) << "this process has asked itself over its own socket";
}

TEST_F(DeviceRemoteTest, ARequestThatIsTooLongIsRefusedButDoneHere) {
    const OtherFace newest(folder.path(), own + "2");
    const std::string much(base::MESSAGE_LIMIT, 'x');
    EXPECT_EQ(send({"get", much}), -EMSGSIZE);
    EXPECT_THAT(here, IsEmpty());
    EXPECT_EQ(sendToAll({"get", much}), -EMSGSIZE);
    EXPECT_THAT(here, SizeIs(2));
}

TEST_F(DeviceRemoteTest, AShortageOfDescriptorsPasses) {
    FaceConnection caller = connect();
    rlimit usual{};
    getrlimit(RLIMIT_NOFILE, &usual);
    const rlimit none{0, usual.rlim_max};
    setrlimit(RLIMIT_NOFILE, &none);
    caller.ask({{"settings"}});
    iterateFor(0.05);
    setrlimit(RLIMIT_NOFILE, &usual);
    EXPECT_EQ(caller.hear(), Words{""});
}

TEST_F(DeviceRemoteTest, WhatARequestBeginsMayEndTheListening) {
    device_remote_set_request_callback(
        [](const char* const*, int, void*) -> char* {
            ecore_job_add([](void*) { device_remote_listen(nullptr); }, nullptr);
            return nullptr;
        },
        nullptr);
    FaceConnection caller = connect();
    caller.ask({{"get"}, {"get"}});
    EXPECT_EQ(caller.hear(), Words{""});
    EXPECT_TRUE(caller.isLeft());
    EXPECT_EQ(caller.hear(0.1), std::nullopt) << "the second one was done as well";
}
