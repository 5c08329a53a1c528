#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <string>

#include <Elementary.h>
#include <dlfcn.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <libintl.h>

#include "Helper.h"
#include "device/app_common.h"
#include "device/app_resource_manager.h"
#include "device/vconf.h"
#include "device_host.h"

namespace fs = std::filesystem;

using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

/** An environment variable with another value, or without one, for a while. */
class Variable {
public:
    Variable(const char* name, const char* value) : _name(name) {
        if (const char* earlier = std::getenv(name))
            _earlier = earlier;
        if (value)
            setenv(name, value, 1);
        else
            unsetenv(name);
    }
    ~Variable() {
        if (_earlier)
            setenv(_name, _earlier->c_str(), 1);
        else
            unsetenv(_name);
    }
    Variable(const Variable&) = delete;
    Variable& operator=(const Variable&) = delete;

private:
    const char* _name;
    std::optional<std::string> _earlier;
};

class DeviceHostTest : public testing::Test {
public:
    ~DeviceHostTest() override {
        device_host_shutdown();
        setlocale(LC_ALL, "");
    }

protected:
    DeviceHostTest() { fs::create_directories(resources); }

    /** Starts the device; what goes wrong lands in `error`. */
    int init(const std::string& data, const std::string& runtime, const std::string& resource) {
        const device_host_config_s config{data.c_str(), runtime.c_str(), resource.c_str()};
        char text[512] = "";
        int result = 0;
        log = standardErrorOf([&] { result = device_host_init(&config, text, sizeof text); });
        error = text;
        return result;
    }

    std::string dataPath() const {
        char* path = app_get_data_path();
        std::string copy = path ? path : "";
        std::free(path);
        return copy;
    }

    TemporaryFolder folder;
    const std::string resources = folder / "resources";
    std::string error;
    std::string log;
};

std::string languages() {
    const char* value = std::getenv("LANGUAGE");
    return value ? value : "(unset)";
}

} // namespace

TEST_F(DeviceHostTest, MissingFoldersAreMadeForTheOwnerAlone) {
    ASSERT_EQ(init(folder / "a/data", folder / "b/run", resources), 0) << error;
    for (const char* name : {"a", "a/data", "b", "b/run"})
        EXPECT_EQ(fs::status(folder / name).permissions(), fs::perms::owner_all) << name;
    EXPECT_EQ(dataPath(), folder / "a/data/");
}

TEST_F(DeviceHostTest, NothingIsLeftInTheFoldersThatWereTried) {
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0);
    EXPECT_TRUE(fs::is_empty(folder / "data"));
    EXPECT_TRUE(fs::is_empty(folder / "run"));
}

TEST_F(DeviceHostTest, AFileInAFoldersPlaceIsNamedWithTheReason) {
    writeFile(folder / "file", "");
    EXPECT_LT(init(folder / "file", folder / "run", resources), 0);
    EXPECT_EQ(error, "The data folder " + (folder / "file") + " cannot be used: Not a directory.");
    EXPECT_EQ(log, "");
    EXPECT_LT(init(folder / "data", folder / "file/run", resources), 0);
    EXPECT_EQ(error,
              "The runtime folder " + (folder / "file/run") + " cannot be used: Not a directory.");
}

TEST_F(DeviceHostTest, AFolderThatCannotBeWrittenIsNamedWithTheReason) {
    // Nobody can make files here, not even root.
    EXPECT_LT(init("/proc/self", folder / "run", resources), 0);
    EXPECT_THAT(error,
                AllOf(StartsWith("The data folder /proc/self cannot be used: "), EndsWith(".")));
    EXPECT_LT(init(folder / "data", "/proc/self/nothing", resources), 0);
    EXPECT_THAT(error, StartsWith("The runtime folder /proc/self/nothing cannot be used: "));
}

TEST_F(DeviceHostTest, MissingResourcesAreNamedWithTheReason) {
    EXPECT_LT(init(folder / "data", folder / "run", folder / "nothing"), 0);
    EXPECT_EQ(error, "The resource folder " + (folder / "nothing") +
                         " cannot be used: No such file or directory.");
}

TEST_F(DeviceHostTest, TheSentenceIsCutToItsBufferAndMayBeLeftOut) {
    const std::string data = folder / "data";
    const std::string missing = folder / "nothing";
    const device_host_config_s config{data.c_str(), data.c_str(), missing.c_str()};
    char text[8] = "";
    EXPECT_LT(device_host_init(&config, text, sizeof text), 0);
    EXPECT_LT(device_host_init(&config, text, 0), 0);
    EXPECT_STREQ(text, "The res");
    const std::string logged =
        standardErrorOf([&] { EXPECT_LT(device_host_init(&config, nullptr, 100), 0); });
    EXPECT_THAT(logged, HasSubstr("The resource folder"));
}

TEST_F(DeviceHostTest, TheEnvironmentChoosesWhatTheProgramLeavesOpen) {
    const std::string data = folder / "from-environment";
    const Variable variable("CLOCK_DATA_DIR", data.c_str());
    ASSERT_EQ(init("", folder / "run", resources), 0) << error;
    EXPECT_EQ(dataPath(), data + "/");
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0) << error;
    EXPECT_EQ(dataPath(), folder / "data/") << "the program's choice comes first";
}

TEST_F(DeviceHostTest, WithoutAnyChoiceFoldersFollowTheDesktopsConventions) {
    const std::string home = folder / "home";
    const Variable data("CLOCK_DATA_DIR", nullptr);
    const Variable homeVariable("HOME", home.c_str());
    {
        const Variable dataHome("XDG_DATA_HOME", (folder / "share").c_str());
        ASSERT_EQ(init("", folder / "run", resources), 0) << error;
        EXPECT_EQ(dataPath(), folder / "share/clock-ui/");
    }
    {
        const Variable dataHome("XDG_DATA_HOME", "relative/is/ignored");
        ASSERT_EQ(init("", folder / "run", resources), 0) << error;
        EXPECT_EQ(dataPath(), home + "/.local/share/clock-ui/");
    }
    const Variable runtime("CLOCK_RUNTIME_DIR", nullptr);
    const Variable runtimeHome("XDG_RUNTIME_DIR", (folder / "runtime").c_str());
    ASSERT_EQ(init(folder / "data", "", resources), 0) << error;
    EXPECT_TRUE(fs::is_directory(folder / "runtime/clock-ui"));
}

TEST_F(DeviceHostTest, AnInstalledLibraryFindsTheResourcesBesideIt) {
    Dl_info library{};
    ASSERT_NE(dladdr(reinterpret_cast<const void*>(&device_host_init), &library), 0);
    for (const char* libraries : {"lib", "lib/x86_64-linux-gnu"}) {
        // Under the name that programs look for; that folder comes before their own.
        const fs::path copy = fs::path(folder / libraries) / fs::path(library.dli_fname).filename();
        fs::create_directories(folder / libraries);
        fs::copy_file(fs::canonical(library.dli_fname), copy, fs::copy_options::overwrite_existing);
        writeFile(folder / "share/clock-ui/edje/Some.edj", "theme");
        const Variable resource("CLOCK_RESOURCE_DIR", nullptr);
        const Variable first("LD_LIBRARY_PATH", (folder / libraries).c_str());
        EXPECT_EQ(waitFor(startHelper({"resource", "edje/Some.edj", folder / "path"})), 0);
        EXPECT_EQ(readFile(folder / "path"), folder / "share/clock-ui/edje/Some.edj");
        fs::remove(copy);
    }
}

TEST_F(DeviceHostTest, ARelativeFolderStaysWhereItWasWhenTheProgramMoves) {
    const fs::path earlier = fs::current_path();
    fs::current_path(folder.path());
    ASSERT_EQ(init("data/", "./run", resources), 0) << error;
    fs::current_path(earlier);
    EXPECT_EQ(dataPath(), folder / "data/");
    EXPECT_EQ(vconf_set_int("memory/a", 1), VCONF_OK);
    EXPECT_TRUE(fs::exists(folder / "run/settings"));
}

TEST_F(DeviceHostTest, ServicesWorkForAProgramThatDoesNotStartTheDevice) {
    device_host_shutdown();
    const Variable data("CLOCK_DATA_DIR", (folder / "data").c_str());
    const Variable runtime("CLOCK_RUNTIME_DIR", (folder / "run").c_str());
    const Variable resource("CLOCK_RESOURCE_DIR", resources.c_str());
    EXPECT_EQ(dataPath(), folder / "data/");
    EXPECT_EQ(vconf_set_int("db/a", 1), VCONF_OK);
    EXPECT_TRUE(fs::exists(folder / "data/settings"));
}

TEST_F(DeviceHostTest, StartingAgainMovesToTheNewFoldersAndDropsCallbacks) {
    ASSERT_EQ(init(folder / "first", folder / "run", resources), 0);
    int changes = 0;
    const auto countCb = [](keynode_t*, void* count) {
        ++*static_cast<int*>(count);
    };
    vconf_notify_key_changed("memory/a", countCb, &changes);
    ASSERT_EQ(init(folder / "second", folder / "run", resources), 0);
    EXPECT_EQ(dataPath(), folder / "second/");
    vconf_set_int("memory/a", 1);
    iterateFor(0.1);
    EXPECT_EQ(changes, 0);
}

TEST_F(DeviceHostTest, WithoutALocaleTextsAreEnglish) {
    for (const char* locale : {"C", "POSIX", "", "xx_YY.UTF-8"}) {
        const Variable all("LC_ALL", locale);
        const Variable lang("LANG", nullptr);
        const Variable language("LANGUAGE", nullptr);
        ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
        EXPECT_STREQ(setlocale(LC_ALL, nullptr), "C.UTF-8") << locale;
        EXPECT_EQ(languages(), "en") << locale;
        EXPECT_STREQ(dgettext("clock", "IDS_COM_BODY_ALARM"), "Alarm") << locale;
        EXPECT_STREQ(gettext("IDS_COM_BODY_ALARM"), "Alarm") << "clock is the default domain";
    }
}

TEST_F(DeviceHostTest, AnEnvironmentWithoutALocaleForTextsShowsEnglish) {
    const Variable all("LC_ALL", nullptr);
    const Variable lang("LANG", "C.UTF-8");
    const Variable messages("LC_MESSAGES", "C");
    const Variable numeric("LC_NUMERIC", "C");
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    EXPECT_STREQ(setlocale(LC_NUMERIC, nullptr), "C") << "other choices stay";
    EXPECT_STREQ(dgettext("clock", "IDS_COM_BODY_ALARM"), "Alarm");
}

TEST_F(DeviceHostTest, ALanguageWithoutACatalogueShowsEnglish) {
    const Variable language("LANGUAGE", "tlh");
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    EXPECT_EQ(languages(), "tlh:en");
    EXPECT_STREQ(dgettext("clock", "IDS_COM_BODY_ALARM"), "Alarm");
}

TEST_F(DeviceHostTest, EnglishIsAddedToTheLanguagesOnlyOnce) {
    const Variable language("LANGUAGE", "ko:en:de");
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0) << error;
    EXPECT_EQ(languages(), "ko:en:de");
}

TEST_F(DeviceHostTest, TextsComeFromTheResourcesInUse) {
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0) << error;
    EXPECT_EQ(bindtextdomain("clock", nullptr), resources + "/locale");
    EXPECT_STREQ(bind_textdomain_codeset("clock", nullptr), "UTF-8");
    EXPECT_STREQ(dgettext("clock", "IDS_COM_BODY_ALARM"), "IDS_COM_BODY_ALARM")
        << "there is no catalogue";
}

namespace {

class Toolkit : public DeviceHostTest {
public:
    Toolkit() { elm_init(0, nullptr); }
    ~Toolkit() override {
        device_host_shutdown();
        elm_shutdown();
    }
};

bool usesTheme(const std::string& path) {
    const Eina_List* overlays = elm_theme_overlay_list_get(nullptr);
    const Eina_List* item = nullptr;
    void* data = nullptr;
    EINA_LIST_FOREACH(overlays, item, data) {
        if (path == static_cast<const char*>(data))
            return true;
    }
    return false;
}

} // namespace

TEST_F(Toolkit, AMissingThemeIsAnErrorThatNamesIt) {
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0);
    const auto output = standardErrorOf([] { EXPECT_LT(device_host_init_toolkit(), 0); });
    EXPECT_THAT(output, HasSubstr(resources + "/edje/device.edj is missing or damaged"));
}

TEST_F(Toolkit, ADamagedThemeIsAnErrorThatNamesIt) {
    writeFile(resources + "/edje/device.edj", "no theme at all");
    ASSERT_EQ(init(folder / "data", folder / "run", resources), 0);
    const auto output = standardErrorOf([] { EXPECT_LT(device_host_init_toolkit(), 0); });
    EXPECT_THAT(output, HasSubstr("is missing or damaged"));
    EXPECT_FALSE(usesTheme(resources + "/edje/device.edj"));
}

TEST_F(Toolkit, HasTheDevicesThemeAndFeel) {
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    ASSERT_EQ(device_host_init_toolkit(), 0);
    EXPECT_TRUE(usesTheme(CLOCK_RESOURCE_DIR "/edje/device.edj"));
    EXPECT_EQ(elm_config_finger_size_get(), 40);
    EXPECT_TRUE(elm_config_scroll_thumbscroll_enabled_get());
    EXPECT_TRUE(elm_config_scroll_bounce_enabled_get());
    EXPECT_EQ(elm_config_scale_get(), 1.0);
    int red = -1;
    int green = -1;
    int blue = -1;
    int alpha = -1;
    edje_color_class_get("/bg/normal", &red, &green, &blue, &alpha, nullptr, nullptr, nullptr,
                         nullptr, nullptr, nullptr, nullptr, nullptr);
    EXPECT_EQ(red + green + blue, 0);
    EXPECT_EQ(alpha, 255);
}

TEST_F(Toolkit, AProgramThatLinksTheToolkitFirstIsToldSo) {
    const Variable data("CLOCK_DATA_DIR", (folder / "data").c_str());
    const Variable runtime("CLOCK_RUNTIME_DIR", (folder / "run").c_str());
    const std::string command = std::string(CLOCK_TOOLKIT_FIRST) + " 2> '" + (folder / "log") + "'";
    EXPECT_EQ(std::system(command.c_str()), 0) << readFile(folder / "log");
    EXPECT_THAT(readFile(folder / "log"), HasSubstr("link the device library before the toolkit"));
}

TEST_F(Toolkit, LeavesTheThemeWhenTheDeviceEnds) {
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    ASSERT_EQ(device_host_init_toolkit(), 0);
    device_host_shutdown();
    EXPECT_FALSE(usesTheme(CLOCK_RESOURCE_DIR "/edje/device.edj"));
}

TEST_F(Toolkit, KeepsTheLocaleThatTheDeviceChose) {
    const Variable all("LC_ALL", "C");
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    // The start of the toolkit's main loop does this.
    setlocale(LC_CTYPE, "");
    ASSERT_EQ(device_host_init_toolkit(), 0);
    EXPECT_STREQ(setlocale(LC_CTYPE, nullptr), "C.UTF-8");
    EXPECT_STREQ(dgettext("clock", "IDS_COM_BODY_ALARM"), "Alarm");
}

TEST_F(Toolkit, TheDeviceMayEndAfterTheToolkit) {
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    ASSERT_EQ(device_host_init_toolkit(), 0);
    elm_shutdown();
    device_host_shutdown();
    elm_init(0, nullptr);
    ASSERT_EQ(init(folder / "data", folder / "run", CLOCK_RESOURCE_DIR), 0) << error;
    ASSERT_EQ(device_host_init_toolkit(), 0);
    EXPECT_TRUE(usesTheme(CLOCK_RESOURCE_DIR "/edje/device.edj")) << "a toolkit started anew";
}
