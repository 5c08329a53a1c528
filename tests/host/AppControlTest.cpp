#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <fcntl.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <unistd.h>

#include "FaceConnection.h"
#include "Helper.h"
#include "base/LocalSocket.h"
#include "device/app_control.h"
#include "device_app.h"
#include "device_remote.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;
using testing::Pair;

namespace {

constexpr const char* appId = "com.example.picker";
constexpr const char* otherId = "com.example.other";

using Extras = std::vector<std::pair<std::string, std::string>>;

/** Frees a request or reply at its end. */
struct Destroy {
    void operator()(app_control_h control) const { app_control_destroy(control); }
};
using Control = std::unique_ptr<app_control_s, Destroy>;

Control makeControl() {
    app_control_h control = nullptr;
    EXPECT_EQ(app_control_create(&control), APP_CONTROL_ERROR_NONE);
    return Control(control);
}

Control makeRequest(const std::string& id = appId) {
    Control request = makeControl();
    EXPECT_EQ(app_control_set_app_id(request.get(), id.c_str()), APP_CONTROL_ERROR_NONE);
    return request;
}

Extras extrasOf(app_control_h control) {
    Extras extras;
    device_app_foreach_extra_data(
        control,
        [](const char* key, const char* value, void* data) {
            static_cast<Extras*>(data)->emplace_back(key, value);
            return true;
        },
        &extras);
    return extras;
}

/** What came back, in order. */
struct Answers {
    struct Answer {
        app_control_result_e result;
        Extras request;
        Extras reply;
    };
    std::vector<Answer> all;

    static void callback(app_control_h request, app_control_h reply, app_control_result_e result,
                         void* data) {
        static_cast<Answers*>(data)->all.push_back({result, extrasOf(request), extrasOf(reply)});
    }
};

class AppControl : public testing::Test {
public:
    ~AppControl() override {
        unsetenv("CLOCK_APPLICATION_DIR");
        unsetenv("CLOCK_TEST_OUTPUT");
        unsetenv("CLOCK_TEST_ACTION");
    }

protected:
    AppControl() {
        fs::create_directory(folder / "applications");
        for (const char* id : {appId, otherId})
            install(id);
        setenv("CLOCK_APPLICATION_DIR", (folder / "applications").c_str(), 1);
        setenv("CLOCK_TEST_OUTPUT", output().c_str(), 1);
    }

    void install(const std::string& id) {
        fs::create_symlink(CLOCK_TEST_APPLICATION, folder / "applications/" + id);
    }
    std::string output() const { return folder / "output"; }
    std::string seen() const { return readFile(output()); }
    bool hasSeen(const std::string& what) {
        return iterateUntil([&] { return seen() == what; });
    }
    /** The process that a program has reported. */
    pid_t reportedProcess() {
        EXPECT_TRUE(iterateUntil([&] { return fs::exists(output()); }));
        const pid_t process = std::atoi(seen().c_str());
        fs::remove(output());
        return process;
    }

    int send(const std::string& action, Control request, app_control_reply_cb callback,
             void* data) {
        setenv("CLOCK_TEST_ACTION", action.c_str(), 1);
        // The request is freed as soon as it was sent.
        return app_control_send_launch_request(request.get(), callback, data);
    }
    void start(const std::string& action, Control request = makeRequest()) {
        EXPECT_EQ(send(action, std::move(request), Answers::callback, &answers),
                  APP_CONTROL_ERROR_NONE);
    }
    bool isAnswered(std::size_t count = 1, double seconds = 10) {
        return iterateUntil([&] { return answers.all.size() >= count; }, seconds);
    }
    /** Starts the application and waits for its one answer. */
    app_control_result_e resultOf(const std::string& action) {
        log = standardErrorOf([&] {
            start(action);
            EXPECT_TRUE(isAnswered());
            iterateFor(0.1);
        });
        EXPECT_EQ(answers.all.size(), 1U) << action;
        return answers.all.empty() ? static_cast<app_control_result_e>(99)
                                   : answers.all.front().result;
    }

    DeviceHost host;
    TemporaryFolder folder;
    Answers answers;
    std::string log;
};

std::size_t openFiles() {
    const fs::directory_iterator files("/proc/self/fd");
    return static_cast<std::size_t>(std::distance(begin(files), end(files)));
}

std::string children() {
    return readFile("/proc/self/task/" + std::to_string(getpid()) + "/children");
}

/** Starts the application again as often as the data says. */
void launchAgain(app_control_h, app_control_h, app_control_result_e, void* data) {
    if (--*static_cast<int*>(data) > 0)
        app_control_send_launch_request(makeRequest().get(), launchAgain, data);
}

bool isRunning(pid_t process) {
    return kill(process, 0) == 0;
}

double processorSeconds() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return static_cast<double>(usage.ru_utime.tv_sec + usage.ru_stime.tv_sec) +
           static_cast<double>(usage.ru_utime.tv_usec + usage.ru_stime.tv_usec) / 1e6;
}

} // namespace

TEST_F(AppControl, TheApplicationGetsTheRequestWithItsTextsInOrder) {
    Control request = makeRequest();
    app_control_set_operation(request.get(), "http://example.com/operation/pick");
    app_control_set_launch_mode(request.get(), APP_CONTROL_LAUNCH_MODE_GROUP);
    for (const auto& [key, value] : Extras{{"caller", "alarm_setting"},
                                           {"silent", "silent none"},
                                           {"path", "/a b/c"},
                                           {"empty", ""},
                                           {"bytes", "\xff\xfe <&>"}})
        app_control_add_extra_data(request.get(), key.c_str(), value.c_str());
    start("echo", std::move(request));
    ASSERT_TRUE(isAnswered());
    EXPECT_EQ(seen(), "id com.example.picker\n"
                      "operation http://example.com/operation/pick\n"
                      "mode 1\n"
                      "caller=alarm_setting\nsilent=silent none\npath=/a b/c\nempty=\n"
                      "bytes=\xff\xfe <&>\n");
}

TEST_F(AppControl, TheAnswerComesBackWithItsTextsAndTheRequest) {
    Control request = makeRequest();
    app_control_add_extra_data(request.get(), "caller", "test");
    start("echo", std::move(request));
    ASSERT_TRUE(isAnswered());
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_THAT(answers.all[0].reply,
                ElementsAre(Pair("position", "2"), Pair("result", "/tones/a.ogg")));
    EXPECT_THAT(answers.all[0].request, ElementsAre(Pair("caller", "test")));
    iterateFor(0.1);
    EXPECT_EQ(answers.all.size(), 1U);
}

TEST_F(AppControl, ACancelledRequestIsAnsweredWithoutTexts) {
    EXPECT_EQ(resultOf("cancel"), APP_CONTROL_RESULT_CANCELED);
    EXPECT_THAT(answers.all[0].reply, IsEmpty());
}

TEST_F(AppControl, AnApplicationThatIsLeftWithoutAnAnswerCancels) {
    EXPECT_EQ(resultOf("leave"), APP_CONTROL_RESULT_CANCELED);
    EXPECT_THAT(answers.all[0].reply, IsEmpty());
    EXPECT_THAT(log, HasSubstr("com.example.picker was left without an answer"));
}

TEST_F(AppControl, AnApplicationThatFailsIsAFailure) {
    EXPECT_EQ(resultOf("fail"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(answers.all[0].reply, IsEmpty());
    EXPECT_THAT(log, HasSubstr("broke down"));
}

TEST_F(AppControl, AnApplicationThatIsKilledIsAFailure) {
    start("stay");
    kill(reportedProcess(), SIGKILL);
    log = standardErrorOf([&] { EXPECT_TRUE(isAnswered()); });
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(answers.all[0].reply, IsEmpty());
}

TEST_F(AppControl, GarbageIsAFailureAndItsSenderIsEnded) {
    EXPECT_EQ(resultOf("garbage"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("makes no sense"));
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
}

TEST_F(AppControl, GarbageWithoutEndIsAFailure) {
    EXPECT_EQ(resultOf("endless-garbage"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("too long"));
}

TEST_F(AppControl, AMessageThatIsTooLongIsAFailureAtOnce) {
    EXPECT_EQ(resultOf("overlong"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("too long"));
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
}

TEST_F(AppControl, HalfAnAnswerIsAFailureThoughTheApplicationEndsWell) {
    EXPECT_EQ(resultOf("half"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("ends in the middle"));
}

TEST_F(AppControl, AnApplicationThatGivesUpTheChannelAndRunsOnIsAFailure) {
    EXPECT_EQ(resultOf("close"), APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("runs on"));
    kill(std::atoi(children().c_str()), SIGKILL);
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
}

TEST_F(AppControl, ASecondAnswerIsRefused) {
    EXPECT_EQ(resultOf("answer-twice"), APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_THAT(answers.all[0].reply, ElementsAre(Pair("number", "1")));
    EXPECT_TRUE(hasSeen("0 -22"));
}

TEST_F(AppControl, ASecondAnswerThatIsSentAllTheSameIsDropped) {
    EXPECT_EQ(resultOf("answer-twice-raw"), APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_THAT(log, HasSubstr("answered a second time"));
}

TEST_F(AppControl, OnlyTheOwnRequestCanBeAnsweredAndNobodyFreesIt) {
    EXPECT_EQ(resultOf("answer-something-else"), APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(seen(), "-22 -22");
}

TEST_F(AppControl, NobodyWaitsForAnApplicationThatHangs) {
    start("hang");
    const pid_t process = reportedProcess();
    const double before = processorSeconds();
    iterateFor(0.5);
    EXPECT_THAT(answers.all, IsEmpty());
    EXPECT_LT(processorSeconds() - before, 0.4);
    kill(process, SIGKILL);
    standardErrorOf([&] { EXPECT_TRUE(isAnswered()); });
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_FAILED);
}

TEST_F(AppControl, ALongRequestDoesNotWaitForItsReader) {
    Control request = makeRequest();
    for (int key = 0; key < 14; ++key)
        app_control_add_extra_data(request.get(), std::to_string(key).c_str(),
                                   std::string(60000, 'x').c_str());
    const auto before = std::chrono::steady_clock::now();
    start("slow", std::move(request));
    EXPECT_LT(std::chrono::steady_clock::now() - before, std::chrono::milliseconds(200));
    ASSERT_TRUE(isAnswered());
    EXPECT_THAT(answers.all[0].reply, ElementsAre(Pair("length", "60000")));
}

TEST_F(AppControl, AReaderThatEndsBeforeALongRequestIsReadKillsNobody) {
    Control request = makeRequest();
    for (int key = 0; key < 14; ++key)
        app_control_add_extra_data(request.get(), std::to_string(key).c_str(),
                                   std::string(60000, 'x').c_str());
    standardErrorOf([&] {
        start("fail", std::move(request));
        ASSERT_TRUE(isAnswered());
    });
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_FAILED);
}

TEST_F(AppControl, ARequestThatIsTooLongIsNotSent) {
    Control request = makeRequest();
    for (int key = 0; key < 20; ++key)
        app_control_add_extra_data(request.get(), std::to_string(key).c_str(),
                                   std::string(60000, 'x').c_str());
    log = standardErrorOf([&] {
        EXPECT_EQ(send("echo", std::move(request), Answers::callback, &answers),
                  APP_CONTROL_ERROR_INVALID_PARAMETER);
    });
    EXPECT_THAT(log, HasSubstr("too long"));
    EXPECT_EQ(children(), "");
}

TEST_F(AppControl, AnApplicationNoticesThatItsCallerHasEnded) {
    start("call");
    ASSERT_TRUE(isAnswered());
    EXPECT_TRUE(hasSeen("gone"));
}

TEST_F(AppControl, TheSameApplicationStartedAgainReplacesTheFirstOne) {
    start("stay");
    const pid_t first = reportedProcess();
    log = standardErrorOf([&] {
        start("echo");
        EXPECT_TRUE(isAnswered(2));
    });
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(answers.all[1].result, APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_TRUE(iterateUntil([&] { return !isRunning(first); }));
    EXPECT_THAT(log, HasSubstr("started again"));
}

TEST_F(AppControl, AHangingApplicationIsReplacedAsWell) {
    start("hang");
    const pid_t first = reportedProcess();
    standardErrorOf([&] {
        start("cancel");
        EXPECT_TRUE(isAnswered(2));
    });
    EXPECT_TRUE(iterateUntil([&] { return !isRunning(first); }));
    ASSERT_EQ(answers.all.size(), 2U);
    // Replaced, not broken.
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_CANCELED);
    EXPECT_EQ(answers.all[1].result, APP_CONTROL_RESULT_CANCELED);
}

TEST_F(AppControl, DifferentApplicationsRunSideBySide) {
    start("stay");
    const pid_t first = reportedProcess();
    start("echo", makeRequest(otherId));
    ASSERT_TRUE(isAnswered());
    EXPECT_EQ(answers.all[0].result, APP_CONTROL_RESULT_SUCCEEDED);
    EXPECT_TRUE(isRunning(first));
    kill(first, SIGTERM);
    ASSERT_TRUE(isAnswered(2));
    EXPECT_EQ(answers.all[1].result, APP_CONTROL_RESULT_CANCELED);
}

TEST_F(AppControl, AnAnswerMayStartTheNextRequest) {
    int left = 3;
    EXPECT_EQ(send("cancel", makeRequest(), launchAgain, &left), APP_CONTROL_ERROR_NONE);
    EXPECT_TRUE(iterateUntil([&] { return left == 0; }));
    iterateFor(0.2);
    EXPECT_EQ(left, 0);
}

TEST_F(AppControl, NobodyHasToWaitForAnAnswer) {
    EXPECT_EQ(send("echo", makeRequest(), nullptr, nullptr), APP_CONTROL_ERROR_NONE);
    EXPECT_TRUE(iterateUntil([&] { return !seen().empty(); }));
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
}

TEST_F(AppControl, ManyLaunchesLeaveNothingBehind) {
    constexpr std::size_t count = 200;
    resultOf("cancel");
    answers.all.clear();
    iterateUntil([] { return children().empty(); });
    const std::size_t before = openFiles();
    for (std::size_t launch = 1; launch <= count; ++launch) {
        start("leave");
        ASSERT_TRUE(isAnswered(launch));
    }
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
    EXPECT_EQ(openFiles(), before);
    EXPECT_EQ(answers.all.size(), count);
}

TEST_F(AppControl, ManyApplicationsThatEndTogetherAreAllAnswered) {
    constexpr std::size_t count = 20;
    const std::size_t before = openFiles();
    for (std::size_t number = 0; number < count; ++number) {
        install("com.example.app" + std::to_string(number));
        start("fail", makeRequest("com.example.app" + std::to_string(number)));
    }
    standardErrorOf([&] { EXPECT_TRUE(isAnswered(count)); });
    EXPECT_TRUE(iterateUntil([] { return children().empty(); }));
    EXPECT_EQ(openFiles(), before);
    for (const auto& answer : answers.all)
        EXPECT_EQ(answer.result, APP_CONTROL_RESULT_FAILED);
}

TEST_F(AppControl, AnApplicationInheritsTheFoldersButNoOpenFiles) {
    const std::string secret = folder / "secret";
    writeFile(secret, "text");
    // As a library without the house's care opens it.
    const int file = open(secret.c_str(), O_RDONLY); // NOLINT(android-cloexec-open)
    resultOf("list-files");
    close(file);
    EXPECT_THAT(seen(), Not(HasSubstr(secret)));
    EXPECT_THAT(seen(), HasSubstr("socket:"));
    EXPECT_THAT(seen(), HasSubstr(host.dataDir() + "\n"));
}

TEST_F(AppControl, AnIdWithoutAProgramIsNotFound) {
    writeFile(folder / "applications/com.example.data", "no program");
    writeFile(folder / "outside", "#!/bin/sh");
    fs::permissions(folder / "outside", fs::perms::owner_all);
    fs::create_directory(folder / "applications/com.example.folder");
    for (const char* id : {"com.example.nobody", "com.example.data", "com.example.folder",
                           "../outside", ".", "..", "./com.example.picker"}) {
        log = standardErrorOf([&] {
            EXPECT_EQ(send("echo", makeRequest(id), Answers::callback, &answers),
                      APP_CONTROL_ERROR_APP_NOT_FOUND)
                << id;
        });
        EXPECT_THAT(log, HasSubstr(id));
    }
    iterateFor(0.1);
    EXPECT_THAT(answers.all, IsEmpty());
}

TEST_F(AppControl, AProgramThatCannotBeStartedIsAnErrorWithoutAnAnswer) {
    writeFile(folder / "applications/com.example.broken", "#!/nowhere/interpreter\n");
    fs::permissions(folder / "applications/com.example.broken", fs::perms::owner_all);
    const std::size_t before = openFiles();
    log = standardErrorOf([&] {
        EXPECT_EQ(send("echo", makeRequest("com.example.broken"), Answers::callback, &answers),
                  APP_CONTROL_ERROR_IO);
    });
    EXPECT_THAT(log, HasSubstr("com.example.broken"));
    iterateFor(0.1);
    EXPECT_THAT(answers.all, IsEmpty());
    EXPECT_EQ(openFiles(), before);
    EXPECT_EQ(children(), "");
}

TEST_F(AppControl, ARequestNeedsAnId) {
    log = standardErrorOf([&] {
        EXPECT_EQ(send("echo", makeControl(), Answers::callback, &answers),
                  APP_CONTROL_ERROR_INVALID_PARAMETER);
    });
    EXPECT_THAT(log, HasSubstr("id of an application"));
}

TEST_F(AppControl, ATextIsFoundUnderItsKeyAndReplacedByALaterOne) {
    const Control control = makeControl();
    app_control_add_extra_data(control.get(), "result", "first");
    app_control_add_extra_data(control.get(), "position", "1");
    app_control_add_extra_data(control.get(), "result", "second");
    char* text = nullptr;
    ASSERT_EQ(app_control_get_extra_data(control.get(), "result", &text), APP_CONTROL_ERROR_NONE);
    EXPECT_STREQ(text, "second");
    std::free(text);
    EXPECT_THAT(extrasOf(control.get()),
                ElementsAre(Pair("result", "second"), Pair("position", "1")));
    char* untouched = text = nullptr;
    EXPECT_EQ(app_control_get_extra_data(control.get(), "other", &untouched),
              APP_CONTROL_ERROR_KEY_NOT_FOUND);
    EXPECT_EQ(untouched, nullptr);
}

TEST_F(AppControl, TextsHaveALimit) {
    const Control control = makeControl();
    const std::string longest(65536, 'x');
    const std::string tooLong(65537, 'x');
    EXPECT_EQ(app_control_add_extra_data(control.get(), longest.c_str(), longest.c_str()),
              APP_CONTROL_ERROR_NONE);
    EXPECT_EQ(app_control_add_extra_data(control.get(), "key", tooLong.c_str()),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_add_extra_data(control.get(), tooLong.c_str(), "value"),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_set_app_id(control.get(), tooLong.c_str()),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(app_control_set_operation(control.get(), tooLong.c_str()),
              APP_CONTROL_ERROR_INVALID_PARAMETER);
}

TEST_F(AppControl, NullAndNonsenseAreRefused) {
    const Control control = makeRequest();
    constexpr app_control_s* none = nullptr;
    constexpr int refused = APP_CONTROL_ERROR_INVALID_PARAMETER;
    char* text = nullptr;
    EXPECT_EQ(app_control_create(nullptr), refused);
    EXPECT_EQ(app_control_destroy(none), refused);
    EXPECT_EQ(app_control_set_app_id(none, appId), refused);
    EXPECT_EQ(app_control_set_app_id(control.get(), nullptr), refused);
    EXPECT_EQ(app_control_set_app_id(control.get(), ""), refused);
    EXPECT_EQ(app_control_set_operation(none, ""), refused);
    EXPECT_EQ(app_control_set_operation(control.get(), nullptr), refused);
    EXPECT_EQ(app_control_set_launch_mode(none, APP_CONTROL_LAUNCH_MODE_GROUP), refused);
    EXPECT_EQ(app_control_set_launch_mode(control.get(), static_cast<app_control_launch_mode_e>(2)),
              refused);
    EXPECT_EQ(app_control_add_extra_data(none, "key", "value"), refused);
    EXPECT_EQ(app_control_add_extra_data(control.get(), nullptr, "value"), refused);
    EXPECT_EQ(app_control_add_extra_data(control.get(), "", "value"), refused);
    EXPECT_EQ(app_control_add_extra_data(control.get(), "key", nullptr), refused);
    EXPECT_EQ(app_control_get_extra_data(none, "key", &text), refused);
    EXPECT_EQ(app_control_get_extra_data(control.get(), nullptr, &text), refused);
    EXPECT_EQ(app_control_get_extra_data(control.get(), "key", nullptr), refused);
    EXPECT_EQ(standardErrorOf([&] {
                  EXPECT_EQ(app_control_send_launch_request(none, nullptr, nullptr), refused);
              }).empty(),
              false);
    EXPECT_EQ(device_app_get_app_id(none, &text), refused);
    EXPECT_EQ(device_app_get_operation(control.get(), nullptr), refused);
    EXPECT_EQ(device_app_get_launch_mode(control.get(), nullptr), refused);
    EXPECT_EQ(device_app_foreach_extra_data(control.get(), nullptr, nullptr), refused);
    EXPECT_EQ(text, nullptr);
}

TEST_F(AppControl, AProgramThatAPersonStartedHasNoRequest) {
    EXPECT_EQ(device_app_launch_request(), nullptr);
    device_app_set_caller_gone_callback([](void*) { FAIL(); }, nullptr);
    device_app_place_window(nullptr);
    const Control reply = makeControl();
    EXPECT_EQ(
        app_control_reply_to_launch_request(reply.get(), nullptr, APP_CONTROL_RESULT_SUCCEEDED),
        APP_CONTROL_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(
        app_control_reply_to_launch_request(reply.get(), reply.get(), APP_CONTROL_RESULT_SUCCEEDED),
        APP_CONTROL_ERROR_INVALID_PARAMETER);
}

TEST_F(AppControl, TheFaceOfAnApplicationThatWasKilledGoes) {
    const std::string faces = folder / "faces";
    fs::create_directory(faces);
    ASSERT_EQ(device_remote_listen(faces.c_str()), 0);
    start("stay");
    const std::string process = std::to_string(reportedProcess());
    // What a killed process leaves, and that of another one whose number ends so.
    writeFile(faces + "/2-" + process, "");
    writeFile(faces + "/2-1" + process, "");
    kill(std::atoi(process.c_str()), SIGKILL);
    ASSERT_TRUE(isAnswered());
    EXPECT_FALSE(fs::exists(faces + "/2-" + process));
    EXPECT_TRUE(fs::exists(faces + "/2-1" + process));
    device_remote_listen(nullptr);
    unsetenv("CLOCK_FACE_DIR");
}

TEST_F(AppControl, WhoUsesTheFaceFromOutsideIsToldWhatWasStarted) {
    const std::string faces = folder / "faces";
    fs::create_directory(faces);
    ASSERT_EQ(device_remote_listen(faces.c_str()), 0);
    const fs::directory_iterator face(faces);
    FaceConnection caller(base::connectTo(faces, begin(face)->path().filename()));
    caller.ask({{"launches"}});
    EXPECT_THAT(caller.hear(), testing::Optional(ElementsAre("")));
    start("stay");
    const pid_t process = reportedProcess();
    caller.ask({{"launches"}});
    EXPECT_THAT(caller.hear(), testing::Optional(ElementsAre("", std::to_string(process))));
    kill(process, SIGKILL);
    ASSERT_TRUE(isAnswered());
    caller.ask({{"launches"}});
    EXPECT_THAT(caller.hear(), testing::Optional(ElementsAre("")));
    device_remote_listen(nullptr);
    unsetenv("CLOCK_FACE_DIR");
}
