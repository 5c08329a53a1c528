#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>

#include <libintl.h>

#include <Efreet.h>
#include <Elementary.h>
#include <gtest/gtest.h>

#include <device_host.h>

#include "support/VirtualClock.h"

namespace {

/** A home of its own, so that no test reads or writes the developer's. */
class TemporaryHome {
public:
    TemporaryHome() {
        std::string path = std::filesystem::temp_directory_path() / "screen-tests-XXXXXX";
        if (mkdtemp(path.data()) == nullptr) {
            std::perror(path.c_str());
            std::exit(1);
        }
        _path = path;
        for (const char* const name :
             {"HOME", "XDG_RUNTIME_DIR", "XDG_DATA_HOME", "XDG_CONFIG_HOME", "XDG_CACHE_HOME"}) {
            const std::filesystem::path folder = _path / name;
            std::filesystem::create_directory(folder);
            std::filesystem::permissions(folder, std::filesystem::perms::owner_all);
            setenv(name, folder.c_str(), 1);
        }
    }
    ~TemporaryHome() {
        std::error_code ignored;
        std::filesystem::remove_all(_path, ignored);
    }
    TemporaryHome(const TemporaryHome&) = delete;
    TemporaryHome& operator=(const TemporaryHome&) = delete;

private:
    std::filesystem::path _path;
};

void setEnvironment() {
    setenv("ELM_ENGINE", "buffer", 1);
    setenv("ELM_PROFILE", "mobile", 1);
    setenv("ELM_SCALE", "1", 1);
    // A frame that is drawn in a thread is ready some turns later, each time another number.
    setenv("ECORE_EVAS_FORCE_SYNC_RENDER", "1", 1);
    setenv("LC_ALL", "C.UTF-8", 1);
    setenv("LANGUAGE", "en", 1);
    setenv("EINA_LOG_BACKTRACE", "-1", 0);
    // There is no session bus, and the toolkit says so many times.
    setenv("EINA_LOG_LEVELS",
           "eldbus:0,eina_safety:0,ecore_system_upower:0,ecore_system_systemd:0,ecore_con:0", 0);
    setenv("DBUS_SESSION_BUS_ADDRESS", "unix:path=/nonexistent", 1);
    unsetenv("DISPLAY");
#ifdef __SANITIZE_ADDRESS__
    // One allocation for each list node, so that a lost list shows.
    setenv("EINA_MEMPOOL_PASS", "1", 1);
#endif
    std::setlocale(LC_ALL, "");
    bindtextdomain("clock", CLOCK_RESOURCE_DIR "/locale");
    bind_textdomain_codeset("clock", "UTF-8");
    textdomain("clock");
}

int runTests(int argc, char** argv) {
    const TemporaryHome home;
    setEnvironment();
    VirtualClock::start();
    // The cache's helper process would keep the test runner's pipe open for seconds.
    efreet_cache_disable();
    if (elm_init(argc, argv) == 0) {
        std::fprintf(stderr, "the toolkit does not start\n");
        return 1;
    }
    // A home without settings gets its profile late; the toolkit asks the environment only once.
    elm_config_profile_set("mobile");
    int result = 1;
    if (device_host_init_toolkit() != 0) {
        std::fprintf(stderr, "the device's theme is missing\n");
    } else {
        result = RUN_ALL_TESTS();
    }
    elm_shutdown();
    return result;
}

} // namespace

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    return GTEST_FLAG_GET(list_tests) ? RUN_ALL_TESTS() : runTests(argc, argv);
}
