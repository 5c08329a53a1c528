// The device's settings by name: what can be set, what is refused, and where it is kept.

#include "control/DeviceSettings.h"

#include <cstdlib>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>

#include "control/Languages.h"
#include "device/vconf.h"
#include "support/ScreenTest.h"
#include "support/VirtualClock.h"

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

using Stored = std::optional<::DeviceSetting>;

class DeviceSettingsTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        VirtualClock::setNow("Europe/Berlin", "2026-03-28 14:00:00");
    }
};

struct GoodValue {
    const char* setting;
    const char* value;
    const char* key;
    ::DeviceSetting stored;
};

struct BadValue {
    const char* setting;
    const char* value;
    const char* problem;
};

} // namespace

TEST_F(DeviceSettingsTest, theSettingsAreThese) {
    std::vector<std::string> names;
    for (const auto& row : simulator::deviceSettings())
        names.emplace_back(row.name);
    EXPECT_THAT(names, ElementsAre("language", "region", "time-form", "power-saving", "volume",
                                   "network", "time-zone", "clock", "motion"));
}

TEST_F(DeviceSettingsTest, aGoodValueIsKeptUnderTheDevicesKeyAndReadBack) {
    const std::vector<GoodValue> table{
        {"language", "de", "db/setting/language", std::string("de")},
        {"language", "pt_BR", "db/setting/language", std::string("pt_BR")},
        {"language", "de_AT", "db/setting/language", std::string("de_AT")},
        {"region", "de_DE", "db/menu_widget/regionformat", std::string("de_DE")},
        {"region", "zh_Hant_TW", "db/menu_widget/regionformat", std::string("zh_Hant_TW")},
        {"time-form", "12", "db/menu_widget/regionformat_time1224", 1},
        {"time-form", "24", "db/menu_widget/regionformat_time1224", 2},
        {"power-saving", "on", "db/setting/psmode", 2},
        {"power-saving", "off", "db/setting/psmode", 0},
        {"network", "26201", "memory/telephony/plmn", std::string("26201")},
        {"network", "310410", "memory/telephony/plmn", std::string("310410")},
        {"network", "none", "memory/telephony/plmn", std::string()},
        {"time-zone", "Asia/Kolkata", "db/setting/time_zone", std::string("Asia/Kolkata")},
        {"clock", "+3600", "db/setting/clock_shift", 3600},
        {"clock", "-90", "db/setting/clock_shift", -90},
        {"clock", "real", "db/setting/clock_shift", 0},
        {"motion", "off", "db/setting/motion", 0},
        {"motion", "on", "db/setting/motion", 1},
    };
    for (const auto& row : table) {
        SCOPED_TRACE(std::string(row.setting) + " " + row.value);
        EXPECT_EQ(simulator::setDevice(row.setting, row.value), "");
        EXPECT_EQ(device().setting(row.key), Stored(row.stored));
        EXPECT_EQ(simulator::deviceSetting(row.setting), row.value);
    }
}

TEST_F(DeviceSettingsTest, aBadValueIsRefusedInOneSentenceAndChangesNothing) {
    const std::vector<BadValue> table{
        {"language", "", "'' is not a language of this watch"},
        {"language", "xx", "'xx' is not a language of this watch"},
        {"language", "de/../..", "'de/../..' is not a language of this watch"},
        {"region", "Germany", "'Germany' is not a language and a country such as de_DE"},
        {"region", "de_", "'de_' is not a language and a country such as de_DE"},
        {"region", "de_ZZZZ", "'de_ZZZZ' is not a language and a country such as de_DE"},
        {"region", "de_DE.UTF-8", "'de_DE.UTF-8' is not a language and a country such as de_DE"},
        {"region", "de_DE@euro", "'de_DE@euro' is not a language and a country such as de_DE"},
        {"region", "de_DE x", "'de_DE x' is not a language and a country such as de_DE"},
        {"time-form", "13", "'13' is neither 12 nor 24"},
        {"power-saving", "yes", "'yes' is neither on nor off"},
        {"volume", "16", "'16' is not a level from 0 to 15"},
        {"volume", "-1", "'-1' is not a level from 0 to 15"},
        {"volume", "7 ", "'7 ' is not a level from 0 to 15"},
        {"volume", "99999999999", "'99999999999' is not a level from 0 to 15"},
        {"network", "2620", "'2620' is not a network of five or six digits such as 26201"},
        {"network", "2620111", "'2620111' is not a network of five or six digits such as 26201"},
        {"network", "26-201", "'26-201' is not a network of five or six digits such as 26201"},
        {"time-zone", "Berlin", "'Berlin' is not a time zone such as Europe/Berlin"},
        {"time-zone", "", "'' is not a time zone such as Europe/Berlin"},
        {"clock", "tomorrow",
         "'tomorrow' is not one of: real | YYYY-MM-DD HH:MM[:SS] | +SECONDS | -SECONDS | "
         "before-midnight | before-dst"},
        {"clock", "2027-02-29 10:00", "there is no 2027-02-29 10:00 in the calendar"},
        {"clock", "2027-01-01 24:00", "there is no 2027-01-01 24:00 in the calendar"},
        {"clock", "+", "'+' is not a number of seconds"},
        {"clock", "+-5", "'+-5' is not a number of seconds"},
        {"clock", "+9999999999", "'+9999999999' is not a number of seconds"},
        {"clock", "1969-12-30 10:00",
         "the clock cannot be set so far: it goes from 1970 to 68 years from now"},
        {"clock", "9999-01-01 10:00",
         "the clock cannot be set so far: it goes from 1970 to 68 years from now"},
        {"motion", "", "'' is neither on nor off"},
        {"brightness", "5", "there is no setting 'brightness'"},
    };
    for (const auto& row : table) {
        SCOPED_TRACE(std::string(row.setting) + " " + row.value);
        const std::string before = simulator::deviceSetting(row.setting);
        EXPECT_EQ(simulator::setDevice(row.setting, row.value), row.problem);
        EXPECT_EQ(simulator::deviceSetting(row.setting), before);
    }
    EXPECT_THAT(device().callsTo("vconf_set_int"), IsEmpty());
    EXPECT_THAT(device().callsTo("vconf_set_str"), IsEmpty());
}

TEST_F(DeviceSettingsTest, aSettingThatCannotBeWrittenIsToldOf) {
    device().fail("vconf_set_int");
    device().fail("vconf_set_str");
    device().fail("sound_manager_set_volume");
    for (const auto& [setting, value] :
         std::vector<std::pair<std::string, std::string>>{{"language", "de"},
                                                          {"time-form", "12"},
                                                          {"volume", "3"},
                                                          {"power-saving", "on"},
                                                          {"clock", "+1"},
                                                          {"motion", "off"}}) {
        EXPECT_EQ(simulator::setDevice(setting, value),
                  "the setting cannot be written; the log tells why")
            << setting;
    }
}

TEST_F(DeviceSettingsTest, theLanguageOfARunGivesWayToThatOfTheSettingToo) {
    device().setSetting("db/setting/language", std::string("de"));
    int changes = 0;
    vconf_notify_key_changed(
        "db/setting/language", [](keynode_t*, void* count) { ++*static_cast<int*>(count); },
        &changes);
    EXPECT_EQ(simulator::setDevice("language", "de"), "");
    device().deliverChanges();
    EXPECT_EQ(changes, 0) << "nothing was to change";
    setenv("CLOCK_LANGUAGE", "en", 1);
    EXPECT_EQ(simulator::deviceSetting("language"), "en");
    EXPECT_EQ(simulator::setDevice("language", "de"), "");
    device().deliverChanges();
    EXPECT_GT(changes, 0) << "the device did not hear of it";
    EXPECT_EQ(device().setting("db/setting/language"), Stored(std::string("de")));
    device().fail("vconf_set_str");
    EXPECT_EQ(simulator::setDevice("language", "de"),
              "the setting cannot be written; the log tells why");
    unsetenv("CLOCK_LANGUAGE");
}

TEST_F(DeviceSettingsTest, aValueCanBeCheckedWithoutADevice) {
    const std::size_t calls = device().calls().size();
    EXPECT_EQ(simulator::checkDevice("region", "de_DE"), "");
    EXPECT_EQ(simulator::checkDevice("clock", "before-dst"), "");
    EXPECT_EQ(simulator::checkDevice("clock", "before-midnight"), "");
    EXPECT_EQ(simulator::checkDevice("clock", "2027-02-29 10:00"),
              "there is no 2027-02-29 10:00 in the calendar");
    EXPECT_EQ(simulator::checkDevice("mood", "good"), "there is no setting 'mood'");
    EXPECT_EQ(device().calls().size(), calls);
}

TEST_F(DeviceSettingsTest, theVolumeIsThatOfAlarms) {
    EXPECT_EQ(simulator::setDevice("volume", "15"), "");
    EXPECT_EQ(device().volume(SOUND_TYPE_ALARM), 15);
    EXPECT_EQ(simulator::deviceSetting("volume"), "15");
}

TEST_F(DeviceSettingsTest, theClockJumpsToAReadingOfTheDevicesZone) {
    EXPECT_EQ(simulator::setDevice("clock", "2026-03-28 15:00:30"), "");
    EXPECT_EQ(device().setting("db/setting/clock_shift"), Stored(3630));
    EXPECT_EQ(simulator::setDevice("time-zone", "Europe/London"), "");
    EXPECT_EQ(simulator::setDevice("clock", "2026-03-28 15:00"), "");
    EXPECT_EQ(device().setting("db/setting/clock_shift"), Stored(7200));
    EXPECT_EQ(simulator::deviceSetting("clock"), "+7200");
}

TEST_F(DeviceSettingsTest, beforeMidnightEndsTheDayThatTheDeviceShows) {
    EXPECT_EQ(simulator::setDevice("clock", "before-midnight"), "");
    EXPECT_EQ(device().setting("db/setting/clock_shift"), Stored(10 * 3600 - 10));
    EXPECT_EQ(simulator::setDevice("clock", "2026-04-02 00:00:01"), "");
    EXPECT_EQ(simulator::setDevice("clock", "before-midnight"), "");
    const int shift = std::get<int>(*device().setting("db/setting/clock_shift"));
    VirtualClock::jump(shift);
    const std::time_t now = VirtualClock::now();
    std::tm shown{};
    localtime_r(&now, &shown);
    EXPECT_EQ(shown.tm_mday, 2);
    EXPECT_EQ(shown.tm_hour * 10000 + shown.tm_min * 100 + shown.tm_sec, 235950);
}

TEST_F(DeviceSettingsTest, beforeDstIsTenSecondsBeforeTheNextChangeOfTheZone) {
    // 2026-03-29 02:00 in Berlin: from 14:00 on the day before it is twelve hours.
    EXPECT_EQ(simulator::setDevice("clock", "before-dst"), "");
    EXPECT_EQ(device().setting("db/setting/clock_shift"), Stored(12 * 3600 - 10));
    // Once more from there: the one in autumn, 2026-10-25 03:00 summer time.
    EXPECT_EQ(simulator::setDevice("clock", "before-dst"), "");
    EXPECT_EQ(device().setting("db/setting/clock_shift"),
              Stored(static_cast<int>(12 * 3600 - 10 + 210LL * 24 * 3600)));
}

TEST_F(DeviceSettingsTest, aZoneWithoutChangesHasNoDayBeforeOne) {
    for (const char* zone : {"Asia/Tokyo", "UTC", "Asia/Kolkata"}) {
        EXPECT_EQ(simulator::setDevice("time-zone", zone), "");
        EXPECT_EQ(simulator::setDevice("clock", "before-dst"),
                  std::string("there is no daylight-saving change ahead in ") + zone);
    }
}

TEST(LanguagesTest, aLocaleGetsTheTextsOfItsFullNameOrItsLanguage) {
    const auto code = [](const char* locale) {
        const auto* language = simulator::languageOf(locale);
        return std::string(language == nullptr ? "none" : language->code);
    };
    EXPECT_EQ(code("de"), "de");
    EXPECT_EQ(code("de_AT.UTF-8"), "de");
    EXPECT_EQ(code("pt_BR"), "pt_BR");
    EXPECT_EQ(code("pt_PT"), "none");
    EXPECT_EQ(code("sr@latin"), "none");
    EXPECT_EQ(code(""), "none");
}
