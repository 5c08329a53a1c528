#include "Helper.h"

#include <atomic>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string_view>
#include <utility>

#include <Ecore.h>
#include <gtest/gtest.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include "device/app_resource_manager.h"
#include "device/notification.h"
#include "device/vconf.h"
#include "device_host.h"

namespace fs = std::filesystem;

namespace {

int writeForEver(const std::string& key) {
    // Long values, so that a half-written one would be seen.
    const std::string ones(20000, '1');
    const std::string twos(60000, '2');
    for (;;) {
        if (vconf_set_str(key.c_str(), ones.c_str()) != VCONF_OK ||
            vconf_set_str(key.c_str(), twos.c_str()) != VCONF_OK)
            return 1;
    }
}

int findResource(const std::string& name, const std::string& output) {
    app_resource_manager_init();
    char* path = nullptr;
    const int result = app_resource_manager_get(APP_RESOURCE_TYPE_IMAGE, name.c_str(), &path);
    if (path)
        writeFile(output, path);
    std::free(path);
    return result == APP_RESOURCE_ERROR_NONE ? 0 : 1;
}

} // namespace

int runHelper(const std::vector<std::string>& words) {
    const std::string& command = words[0];
    if (command == "set-int" && words.size() == 3)
        return vconf_set_int(words[1].c_str(), std::stoi(words[2])) == VCONF_OK ? 0 : 1;
    if (command == "set-str" && words.size() == 3)
        return vconf_set_str(words[1].c_str(), words[2].c_str()) == VCONF_OK ? 0 : 1;
    if (command == "write-for-ever" && words.size() == 2)
        return writeForEver(words[1]);
    if (command == "post" && words.size() == 3)
        return notification_post_with_tag(words[1].c_str(), words[2].c_str()) == 0 ? 0 : 1;
    if (command == "resource" && words.size() == 3)
        return findResource(words[1], words[2]);
    std::fprintf(stderr, "unknown helper command %s\n", command.c_str());
    return 2;
}

pid_t startHelper(const std::vector<std::string>& words) {
    std::vector<std::string> all{"host-tests", "--helper"};
    all.insert(all.end(), words.begin(), words.end());
    std::vector<char*> arguments;
    arguments.reserve(all.size() + 1);
    for (auto& word : all)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    const pid_t process = fork();
    if (process == 0) {
        // A test that fails must not leave it behind.
        prctl(PR_SET_PDEATHSIG, SIGKILL);
        execv("/proc/self/exe", arguments.data());
        _exit(127);
    }
    return process;
}

int waitFor(pid_t process) {
    int status = 0;
    if (waitpid(process, &status, 0) != process || !WIFEXITED(status))
        return -1;
    return WEXITSTATUS(status);
}

bool iterateUntil(const std::function<bool()>& condition, double seconds) {
    const double end = ecore_time_get() + seconds;
    while (!condition()) {
        if (ecore_time_get() > end)
            return false;
        ecore_main_loop_iterate();
        usleep(1000);
    }
    return true;
}

void iterateFor(double seconds) {
    iterateUntil([] { return false; }, seconds);
}

std::string standardErrorOf(const std::function<void()>& action) {
    testing::internal::CaptureStderr();
    action();
    return testing::internal::GetCapturedStderr();
}

namespace {

/** Whether a line with a text has been logged. */
class LineWatch {
public:
    explicit LineWatch(std::string text) : _text(std::move(text)) {
        device_host_set_log_callback(lineCb, this);
    }
    ~LineWatch() { device_host_set_log_callback(nullptr, nullptr); }
    LineWatch(const LineWatch&) = delete;
    LineWatch& operator=(const LineWatch&) = delete;

    bool isSeen() const { return _seen; }

private:
    static void lineCb(int, const char*, const char* line, void* data) {
        auto* watch = static_cast<LineWatch*>(data);
        if (std::string_view(line).find(watch->_text) != std::string_view::npos)
            watch->_seen = true;
    }

    std::string _text;
    std::atomic<bool> _seen = false;
};

} // namespace

std::string standardErrorUntil(const std::string& text, const std::function<void()>& action) {
    return standardErrorOf([&] {
        const LineWatch watch(text);
        action();
        iterateUntil([&] { return watch.isSeen(); });
    });
}

TemporaryFolder::TemporaryFolder() {
    std::string path = (fs::temp_directory_path() / "clock-host-XXXXXX").string();
    if (!mkdtemp(path.data()))
        std::abort();
    _path = path;
}

TemporaryFolder::~TemporaryFolder() {
    std::error_code ignored;
    fs::remove_all(_path, ignored);
}

DeviceHost::DeviceHost() {
    fs::create_directories(resourceDir());
    // In the environment, so that helper processes use the same folders.
    setVariable("CLOCK_DATA_DIR", dataDir());
    setVariable("CLOCK_RUNTIME_DIR", runtimeDir());
    setVariable("CLOCK_RESOURCE_DIR", resourceDir());
    char error[512] = "";
    EXPECT_EQ(device_host_init(nullptr, error, sizeof error), 0) << error;
}

DeviceHost::~DeviceHost() {
    device_host_shutdown();
    for (const auto& [name, value] : _earlier) {
        if (value.empty())
            unsetenv(name);
        else
            setenv(name, value.c_str(), 1);
    }
}

void DeviceHost::setVariable(const char* name, const std::string& value) {
    const char* earlier = std::getenv(name);
    _earlier.emplace_back(name, earlier ? earlier : "");
    setenv(name, value.c_str(), 1);
}

void writeFile(const std::string& path, const std::string& contents) {
    fs::create_directories(fs::path(path).parent_path());
    std::ofstream(path, std::ios::binary) << contents;
}

std::string readFile(const std::string& path) {
    std::ostringstream contents;
    contents << std::ifstream(path, std::ios::binary).rdbuf();
    return contents.str();
}
