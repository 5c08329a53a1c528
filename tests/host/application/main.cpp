// An application for tests. CLOCK_TEST_ACTION says what it does, CLOCK_TEST_OUTPUT is the file into
// which it writes what it has seen. The badly behaved actions write to the channel themselves.
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <string>

#include <Ecore.h>
#include <unistd.h>

#include "device_app.h"
#include "device_host.h"

using namespace std::string_literals;

namespace {

constexpr int channel = 3;

std::string variable(const char* name) {
    const char* value = std::getenv(name);
    return value ? value : "";
}

/** Renamed when it is whole, so that no test reads half of it. */
void report(const std::string& text) {
    const std::string path = variable("CLOCK_TEST_OUTPUT");
    std::ofstream(path + ".part") << text;
    std::filesystem::rename(path + ".part", path);
}

std::string owned(char* text) {
    std::string copy = text ? text : "(null)";
    std::free(text);
    return copy;
}

bool describeExtra(const char* key, const char* value, void* data) {
    *static_cast<std::string*>(data) += key + "="s + value + "\n";
    return true;
}

std::string describe(app_control_h request) {
    char* id = nullptr;
    char* operation = nullptr;
    app_control_launch_mode_e mode = APP_CONTROL_LAUNCH_MODE_SINGLE;
    device_app_get_app_id(request, &id);
    device_app_get_operation(request, &operation);
    device_app_get_launch_mode(request, &mode);
    std::string text = "id " + owned(id) + "\noperation " + owned(operation) + "\nmode " +
                       std::to_string(mode) + "\n";
    device_app_foreach_extra_data(request, describeExtra, &text);
    return text;
}

int answer(app_control_result_e result, const std::map<std::string, std::string>& extras) {
    app_control_h reply = nullptr;
    app_control_create(&reply);
    for (const auto& [key, value] : extras)
        app_control_add_extra_data(reply, key.c_str(), value.c_str());
    const int code =
        app_control_reply_to_launch_request(reply, device_app_launch_request(), result);
    app_control_destroy(reply);
    return code;
}

int echo() {
    report(describe(device_app_launch_request()));
    return answer(APP_CONTROL_RESULT_SUCCEEDED, {{"result", "/tones/a.ogg"}, {"position", "2"}});
}

/** Answers late, so that a request that does not fit the channel at once has to wait. */
int slow() {
    usleep(300000);
    char* text = nullptr;
    app_control_get_extra_data(device_app_launch_request(), "10", &text);
    return answer(APP_CONTROL_RESULT_SUCCEEDED, {{"length", std::to_string(owned(text).size())}});
}

int answerTwice() {
    const int first = answer(APP_CONTROL_RESULT_SUCCEEDED, {{"number", "1"}});
    const int second = answer(APP_CONTROL_RESULT_SUCCEEDED, {{"number", "2"}});
    report(std::to_string(first) + " " + std::to_string(second));
    return 0;
}

int answerSomethingElse() {
    app_control_h other = nullptr;
    app_control_create(&other);
    const int wrong =
        app_control_reply_to_launch_request(other, other, APP_CONTROL_RESULT_SUCCEEDED);
    const int destroyed = app_control_destroy(device_app_launch_request());
    app_control_destroy(other);
    report(std::to_string(wrong) + " " + std::to_string(destroyed));
    return answer(APP_CONTROL_RESULT_CANCELED, {});
}

/** Stays until nobody waits for it any more. */
int stay() {
    ecore_init();
    bool gone = false;
    device_app_set_caller_gone_callback(
        [](void* data) {
            *static_cast<bool*>(data) = true;
            ecore_main_loop_quit();
        },
        &gone);
    report(std::to_string(getpid()));
    ecore_main_loop_begin();
    report(gone ? "gone" : "told to end");
    ecore_shutdown();
    return 0;
}

/** Notices nothing: neither its caller nor a request to end. */
int hang() {
    std::signal(SIGTERM, SIG_IGN);
    report(std::to_string(getpid()));
    for (;;)
        pause();
}

/** Starts another application and is gone before that one has answered. */
int call() {
    ecore_init();
    setenv("CLOCK_TEST_ACTION", "stay", 1);
    app_control_h request = nullptr;
    app_control_create(&request);
    app_control_set_app_id(request, "com.example.other");
    app_control_send_launch_request(
        request, [](auto, auto, auto, auto) {}, nullptr);
    app_control_destroy(request);
    for (int turn = 0; turn < 200 && !std::filesystem::exists(variable("CLOCK_TEST_OUTPUT"));
         ++turn) {
        ecore_main_loop_iterate();
        usleep(10000);
    }
    ecore_shutdown();
    return 0;
}

int sendRaw(const std::string& bytes) {
    return write(channel, bytes.data(), bytes.size()) == static_cast<ssize_t>(bytes.size()) ? 0 : 1;
}

std::string rawAnswer() {
    const std::string message = "\0\0\0\x19"s + "clock application reply 1" + "\0\0\0\1"s + "0";
    return "\0\0\0"s + static_cast<char>(message.size()) + message;
}

int answerTwiceRaw() {
    const int code = sendRaw(rawAnswer() + rawAnswer());
    sleep(5);
    return code;
}

int garbage() {
    const int code = sendRaw("\0\0\0\5hello"s);
    sleep(60);
    return code;
}

int endlessGarbage() {
    const std::string much(100000, 'x');
    while (sendRaw(much) == 0) {
    }
    return 0;
}

int closeChannel() {
    close(channel);
    sleep(60);
    return 0;
}

int listFiles() {
    std::string text;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        std::error_code ignored;
        text += std::filesystem::read_symlink(entry, ignored).string() + "\n";
    }
    report(text + variable("CLOCK_DATA_DIR") + "\n");
    return 0;
}

} // namespace

int main() {
    const std::map<std::string, int (*)()> actions{
        {"echo", echo},
        {"slow", slow},
        {"cancel",
         [] {
             return answer(APP_CONTROL_RESULT_CANCELED, {});
         }},
        {"leave",
         [] {
             return device_app_launch_request() ? 0 : 1;
         }},
        {"fail",
         [] {
             return 3;
         }},
        {"answer-twice", answerTwice},
        {"answer-something-else", answerSomethingElse},
        {"stay", stay},
        {"hang", hang},
        {"call", call},
        {"answer-twice-raw", answerTwiceRaw},
        {"garbage", garbage},
        {"endless-garbage", endlessGarbage},
        {"overlong",
         [] {
             return sendRaw("\x7f\xff\xff\xff") + static_cast<int>(sleep(60));
         }},
        {"half",
         [] {
             return sendRaw("\0\0\0\x40half"s);
         }},
        {"close", closeChannel},
        {"list-files", listFiles},
    };
    const auto action = actions.find(variable("CLOCK_TEST_ACTION"));
    return action == actions.end() ? 99 : action->second();
}
