#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include "Helper.h"
#include "device/app_control.h"

namespace fs = std::filesystem;

using testing::HasSubstr;

namespace {

/** The real application, drawing into memory; nobody touches it here. */
class TonePicker : public testing::Test {
public:
    ~TonePicker() override { unsetenv("CLOCK_TONE_DIR"); }

protected:
    TonePicker() {
        // The resources that were built, in the folders of the test.
        for (const char* name : {"edje", "locale", "fonts"})
            fs::create_symlink(std::string(CLOCK_RESOURCE_DIR) + "/" + name,
                               host.resourceDir() + "/" + name);
        setenv("CLOCK_TONE_DIR", folder.path().c_str(), 1);
    }

    void start(const std::string& path) {
        app_control_h request = nullptr;
        app_control_create(&request);
        app_control_set_app_id(request, "com.vendra.setting.sound-tone-list");
        app_control_add_extra_data(request, "caller", "alarm_setting");
        app_control_add_extra_data(request, "silent", "silent none");
        app_control_add_extra_data(request, "path", path.c_str());
        app_control_add_extra_data(request, "marked_mode", (path + "/Gone.ogg").c_str());
        app_control_set_launch_mode(request, APP_CONTROL_LAUNCH_MODE_GROUP);
        EXPECT_EQ(app_control_send_launch_request(request, answered, &result),
                  APP_CONTROL_ERROR_NONE);
        app_control_destroy(request);
    }
    static void answered(app_control_h, app_control_h reply, app_control_result_e result,
                         void* data) {
        char* text = nullptr;
        EXPECT_EQ(app_control_get_extra_data(reply, "result", &text),
                  APP_CONTROL_ERROR_KEY_NOT_FOUND);
        *static_cast<std::optional<app_control_result_e>*>(data) = result;
    }
    bool isAnswered(double seconds = 20) {
        return iterateUntil([&] { return result.has_value(); }, seconds);
    }
    static pid_t process() {
        return std::atoi(
            readFile("/proc/self/task/" + std::to_string(getpid()) + "/children").c_str());
    }
    /** The program has read the folder's tones and waits for a person. */
    static bool isWaiting() {
        const auto state = [] {
            return readFile("/proc/" + std::to_string(process()) + "/wchan");
        };
        return iterateUntil([&] { return state().find("poll") != std::string::npos; }, 20);
    }

    DeviceHost host;
    TemporaryFolder folder;
    std::optional<app_control_result_e> result;
};

} // namespace

TEST_F(TonePicker, IsFoundBesideTheLibraryAndEndsWithoutAnAnswerWhenItIsToldTo) {
    standardErrorOf([&] {
        start("/opt/usr/share/settings/Ringtones");
        ASSERT_TRUE(isWaiting());
        EXPECT_FALSE(isAnswered(0.5));
        kill(process(), SIGTERM);
        ASSERT_TRUE(isAnswered());
    });
    EXPECT_EQ(result, APP_CONTROL_RESULT_CANCELED);
}

TEST_F(TonePicker, AFolderThatIsNotThereIsShownAsAnEmptyOne) {
    const std::string log = standardErrorOf([&] {
        start(folder / "nowhere");
        ASSERT_TRUE(isWaiting());
        EXPECT_FALSE(isAnswered(0.5));
        kill(process(), SIGTERM);
        ASSERT_TRUE(isAnswered());
    });
    EXPECT_EQ(result, APP_CONTROL_RESULT_CANCELED);
    EXPECT_THAT(log, HasSubstr("nowhere cannot be read"));
}

TEST_F(TonePicker, WithoutItsThemeItFails) {
    fs::remove(host.resourceDir() + "/edje");
    const std::string log = standardErrorOf([&] {
        start("/opt/usr/share/settings/Ringtones");
        ASSERT_TRUE(isAnswered());
    });
    EXPECT_EQ(result, APP_CONTROL_RESULT_FAILED);
    EXPECT_THAT(log, HasSubstr("theme"));
}
