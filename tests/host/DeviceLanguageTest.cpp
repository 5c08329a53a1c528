// The language that a device speaks: its setting, the environment, and changes while it runs.

#include <clocale>
#include <cstdlib>
#include <string>

#include <Elementary.h>
#include <gtest/gtest.h>
#include <libintl.h>
#include <unicode/uloc.h>

#include "Helper.h"
#include "device/vconf.h"
#include "device_host.h"

namespace {

constexpr const char* LANGUAGE_KEY = "db/setting/language";

class DeviceLanguageTest : public testing::Test {
public:
    ~DeviceLanguageTest() override {
        device_host_shutdown();
        unsetenv("CLOCK_LANGUAGE");
        setenv("LANGUAGE", "en", 1);
        setlocale(LC_ALL, "");
    }

protected:
    DeviceLanguageTest() {
        setenv("LANGUAGE", "fr", 1);
        unsetenv("CLOCK_LANGUAGE");
        start();
    }

    void start() {
        const std::string data = folder / "data";
        const std::string runtime = folder / "run";
        const device_host_config_s config{data.c_str(), runtime.c_str(), CLOCK_RESOURCE_DIR};
        log = standardErrorOf([&] { ASSERT_EQ(device_host_init(&config, nullptr, 0), 0); });
    }
    void restart() {
        device_host_shutdown();
        start();
    }
    static std::string languages() {
        const char* value = std::getenv("LANGUAGE");
        return value ? value : "";
    }
    /** The text of a button that each language words differently. */
    static std::string cancel() { return dgettext("clock", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB"); }
    int warnings() const {
        int count = 0;
        for (std::size_t at = 0; (at = log.find("stay English", at)) != std::string::npos; ++at)
            ++count;
        return count;
    }

    TemporaryFolder folder;
    std::string log;
};

TEST_F(DeviceLanguageTest, WithoutASettingItIsTheEnvironments) {
    EXPECT_EQ(cancel(), "Annuler");
    vconf_set_str(LANGUAGE_KEY, "");
    restart();
    EXPECT_EQ(cancel(), "Annuler");
    EXPECT_EQ(languages(), "fr:en");
    EXPECT_EQ(warnings(), 0);
}

TEST_F(DeviceLanguageTest, TheSettingComesBeforeTheEnvironment) {
    vconf_set_str(LANGUAGE_KEY, "de");
    restart();
    EXPECT_EQ(languages(), "de:en");
    EXPECT_EQ(cancel(), "Abbrechen");
    EXPECT_STREQ(uloc_getDefault(), "de");
}

TEST_F(DeviceLanguageTest, ALanguageOfACountryMayBeTheLanguage) {
    vconf_set_str(LANGUAGE_KEY, "de_AT");
    restart();
    EXPECT_EQ(cancel(), "Abbrechen");
    EXPECT_STREQ(uloc_getDefault(), "de_AT");
    EXPECT_EQ(warnings(), 0);
}

TEST_F(DeviceLanguageTest, OneRunMaySpeakAnotherLanguage) {
    vconf_set_str(LANGUAGE_KEY, "de");
    setenv("CLOCK_LANGUAGE", "es", 1);
    restart();
    EXPECT_EQ(cancel(), "Cancelar");
    setenv("CLOCK_LANGUAGE", "", 1);
    restart();
    EXPECT_EQ(cancel(), "Abbrechen");
}

TEST_F(DeviceLanguageTest, WithoutTextsOneLineSaysThatTheyStayEnglish) {
    for (const char* code : {"tlh", "pt", "../de", "de/../de", "%s"}) {
        vconf_set_str(LANGUAGE_KEY, code);
        restart();
        EXPECT_EQ(languages(), "en") << code;
        EXPECT_EQ(cancel(), "Cancel") << code;
        EXPECT_EQ(warnings(), 1) << code << ": " << log;
    }
}

TEST_F(DeviceLanguageTest, TheEnvironmentIsLeftAsItWas) {
    vconf_set_str(LANGUAGE_KEY, "de");
    restart();
    device_host_shutdown();
    EXPECT_EQ(languages(), "fr");
}

class LiveDeviceLanguageTest : public DeviceLanguageTest {
public:
    ~LiveDeviceLanguageTest() override {
        elm_config_mirrored_set(EINA_FALSE);
        device_host_shutdown();
        elm_shutdown();
    }

protected:
    LiveDeviceLanguageTest() {
        elm_init(0, nullptr);
        EXPECT_EQ(device_host_init_toolkit(), 0);
    }
    void choose(const char* code) {
        log = standardErrorOf([&] {
            vconf_set_str(LANGUAGE_KEY, code);
            iterateFor(0.1);
        });
    }
};

TEST_F(LiveDeviceLanguageTest, AChangeIsFollowedAtOnce) {
    EXPECT_EQ(cancel(), "Annuler");
    choose("de");
    EXPECT_EQ(cancel(), "Abbrechen");
    EXPECT_FALSE(elm_config_mirrored_get());
    choose("ar");
    EXPECT_EQ(cancel(), "إلغاء");
    EXPECT_TRUE(elm_config_mirrored_get());
    EXPECT_STREQ(uloc_getDefault(), "ar");
    // Written from the right, but without texts.
    choose("he");
    EXPECT_EQ(cancel(), "Cancel");
    EXPECT_FALSE(elm_config_mirrored_get());
    EXPECT_EQ(warnings(), 1);
    choose("");
    EXPECT_EQ(cancel(), "Annuler");
}

/** What the process says to those who watch the setting after the device does. */
std::string told;

void changedCb(keynode_t*, void*) {
    told += dgettext("clock", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB");
    told += elm_config_mirrored_get() ? " from the right;" : " from the left;";
}

TEST_F(LiveDeviceLanguageTest, ApplicationsAreToldWhenAllIsDone) {
    told.clear();
    vconf_notify_key_changed(LANGUAGE_KEY, changedCb, nullptr);
    choose("ar");
    choose("de");
    EXPECT_EQ(told, "إلغاء from the right;Abbrechen from the left;");
}

TEST_F(LiveDeviceLanguageTest, TheLocaleStaysTheEnvironments) {
    const char* const all = std::getenv("LC_ALL");
    const std::string before = all ? all : "";
    unsetenv("LC_ALL");
    setenv("LANG", "C.UTF-8", 1);
    setenv("LC_NUMERIC", "C", 1);
    choose("de");
    EXPECT_STREQ(setlocale(LC_NUMERIC, nullptr), "C");
    EXPECT_STREQ(setlocale(LC_MESSAGES, nullptr), "C.UTF-8");
    unsetenv("LC_NUMERIC");
    if (all)
        setenv("LC_ALL", before.c_str(), 1);
}

TEST_F(LiveDeviceLanguageTest, ChoosingTheStoredLanguageEndsThatOfOneRun) {
    vconf_set_str(LANGUAGE_KEY, "de");
    device_host_shutdown();
    setenv("CLOCK_LANGUAGE", "es", 1);
    start();
    ASSERT_EQ(device_host_init_toolkit(), 0);
    EXPECT_EQ(cancel(), "Cancelar");
    // It is written for a moment only, as nobody is told of a value that stays.
    vconf_set_str(LANGUAGE_KEY, "");
    choose("de");
    EXPECT_EQ(cancel(), "Abbrechen");
    EXPECT_STREQ(std::getenv("CLOCK_LANGUAGE"), "");
}

TEST_F(LiveDeviceLanguageTest, AChangeEndsTheLanguageOfOneRun) {
    device_host_shutdown();
    setenv("CLOCK_LANGUAGE", "es", 1);
    start();
    ASSERT_EQ(device_host_init_toolkit(), 0);
    EXPECT_EQ(cancel(), "Cancelar");
    choose("de");
    EXPECT_EQ(cancel(), "Abbrechen");
    EXPECT_STREQ(std::getenv("CLOCK_LANGUAGE"), "");
}

} // namespace
