#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <Ecore.h>
#include <gtest/gtest.h>

#include "Helper.h"

namespace fs = std::filesystem;

namespace {

/** A home of its own, so that no test reads or writes the home of the person who runs it. */
class TemporaryHome {
public:
    TemporaryHome() {
        std::string folder = (fs::temp_directory_path() / "clock-host-XXXXXX").string();
        if (!mkdtemp(folder.data())) {
            std::perror("no temporary folder");
            std::exit(1);
        }
        _folder = folder;
        set("HOME", "home");
        set("XDG_DATA_HOME", "home/data");
        set("XDG_CONFIG_HOME", "home/config");
        set("XDG_CACHE_HOME", "home/cache");
        set("XDG_RUNTIME_DIR", "run");
        set("CLOCK_DATA_DIR", "device/data");
        set("CLOCK_RUNTIME_DIR", "device/run");
    }
    ~TemporaryHome() {
        std::error_code ignored;
        fs::remove_all(_folder, ignored);
    }
    TemporaryHome(const TemporaryHome&) = delete;
    TemporaryHome& operator=(const TemporaryHome&) = delete;

private:
    void set(const char* variable, const char* name) {
        const fs::path folder = fs::path(_folder) / name;
        fs::create_directories(folder);
        fs::permissions(folder, fs::perms::owner_all);
        setenv(variable, folder.c_str(), 1);
    }

    std::string _folder;
};

} // namespace

/** What the toolkit keeps from each of its starts. */
extern "C" __attribute__((visibility("default"))) const char* __lsan_default_suppressions() {
    return "leak:elm_init\nleak:ecore_init\n";
}

int main(int argc, char** argv) {
    // The tests start this program again as the other process that they need.
    if (argc > 2 && std::string(argv[1]) == "--helper")
        return runHelper({argv + 2, argv + argc});
    testing::InitGoogleTest(&argc, argv);
    const TemporaryHome home;
    setenv("LC_ALL", "C.UTF-8", 1);
    setenv("LANGUAGE", "en", 1);
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("EINA_LOG_LEVEL", "1", 0);
    setenv("EINA_LOG_BACKTRACE", "-1", 0);
    unsetenv("DISPLAY");
    ecore_init();
    const int result = RUN_ALL_TESTS();
    ecore_shutdown();
    return result;
}
