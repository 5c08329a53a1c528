// The control panel beside the face: each control by a real click.

#include "control/ControlPanel.h"

#include <cstdlib>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_Input.h>
#include <gmock/gmock.h>

#include "PanelHand.h"
#include "control/AccessibleName.h"
#include "control/DeviceSettings.h"
#include "control/Languages.h"
#include "device/dlog.h"
#include "device_host.h"
#include "support/ScreenTest.h"
#include "support/VirtualClock.h"

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

namespace {

const std::string THEME = CLOCK_RESOURCE_DIR "/edje/simulator.edj";

struct Listeners {
    device_host_log_cb log = nullptr;
    void* logData = nullptr;
    device_host_haptic_cb haptic = nullptr;
    void* hapticData = nullptr;
};

Listeners& listeners() {
    static Listeners all;
    return all;
}

} // namespace

// They come before the device's.
void device_host_set_log_callback(device_host_log_cb callback, void* data) {
    listeners().log = callback;
    listeners().logData = data;
}

void device_host_set_haptic_callback(device_host_haptic_cb callback, void* data) {
    listeners().haptic = callback;
    listeners().hapticData = data;
}

namespace {

class ControlPanelTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        elm_theme_extension_add(nullptr, THEME.c_str());
        stage();
        device().setVolume(SOUND_TYPE_ALARM, 7);
        open();
    }
    void TearDown() override {
        panel.reset();
        ScreenTest::TearDown();
        elm_theme_extension_del(nullptr, THEME.c_str());
        EXPECT_EQ(listeners().log, nullptr) << "the log is still listened to";
        EXPECT_EQ(listeners().haptic, nullptr);
    }
    void open() {
        simulator::ControlActions actions;
        actions.key = [this](const std::string& key, bool down) {
            done.push_back(key + (down ? " down" : " up"));
        };
        actions.bezel = [this](int direction) {
            done.push_back("bezel " + std::to_string(direction));
        };
        actions.bezelPress = [this] {
            done.emplace_back("bezel press");
        };
        actions.quickPanel = [this] {
            done.emplace_back("quick panel");
        };
        actions.background = [this](bool away) {
            done.emplace_back(away ? "background" : "front");
        };
        panel = std::make_unique<simulator::ControlPanel>(stage().window(), THEME, actions, [this] {
            ++closed;
            panel.reset();
        });
        hand.emplace(panel->window());
        Stage::advance(0.5);
    }
    void log(int priority, const std::string& text) {
        listeners().log(priority, "test", text.c_str(), listeners().logData);
    }
    std::string logText() { return hand->part("Log lines", "log.text"); }
    std::string setting(const char* key) {
        const auto value = device().setting(key);
        return value ? std::get<std::string>(*value) : "unset";
    }
    int number(const char* key) {
        const auto value = device().setting(key);
        return value ? std::get<int>(*value) : -1;
    }
    bool isOn(const std::string& check) {
        return elm_check_state_get(hand->widget(check)) != EINA_FALSE;
    }
    std::string message() { return hand->part("Readout", "readout.message"); }

    std::vector<std::string> done;
    int closed = 0;
    std::unique_ptr<simulator::ControlPanel> panel;
    std::optional<PanelHand> hand;
};

} // namespace

TEST_F(ControlPanelTest, eachLanguageIsAClickAway) {
    device().setSetting("db/setting/language", std::string("zh_CN"));
    Stage::advance(0.5);
    for (const auto& language : simulator::LANGUAGES) {
        hand->click(std::string("Language ") + language.name);
        EXPECT_EQ(setting("db/setting/language"), language.code);
    }
}

TEST_F(ControlPanelTest, theHoursHaveTwoForms) {
    hand->click("12 hours");
    EXPECT_EQ(number("db/menu_widget/regionformat_time1224"), 1);
    hand->click("24 hours");
    EXPECT_EQ(number("db/menu_widget/regionformat_time1224"), 2);
}

TEST_F(ControlPanelTest, powerSavingAndMotionAreSwitches) {
    hand->click("Power saving");
    EXPECT_EQ(number("db/setting/psmode"), 2);
    hand->click("Power saving");
    EXPECT_EQ(number("db/setting/psmode"), 0);
    EXPECT_TRUE(isOn("Motion"));
    hand->click("Motion");
    EXPECT_EQ(number("db/setting/motion"), 0);
    hand->click("Motion");
    EXPECT_EQ(number("db/setting/motion"), 1);
}

TEST_F(ControlPanelTest, theSliderSetsTheAlarmsVolume) {
    hand->click("Alarm volume", 0.99);
    EXPECT_EQ(device().volume(SOUND_TYPE_ALARM), 15);
    hand->click("Alarm volume", 0.01);
    EXPECT_EQ(device().volume(SOUND_TYPE_ALARM), 0);
    hand->click("Alarm volume", 0.5);
    EXPECT_THAT(device().volume(SOUND_TYPE_ALARM), testing::AnyOf(7, 8));
}

TEST_F(ControlPanelTest, regionAndNetworkAreTyped) {
    hand->type("Region", "ko_KR");
    EXPECT_EQ(setting("db/menu_widget/regionformat"), "unset") << "before the return key";
    hand->key("Return", "\n");
    EXPECT_EQ(setting("db/menu_widget/regionformat"), "ko_KR");
    hand->type("Network", "26201");
    hand->key("Return", "\n");
    EXPECT_EQ(setting("memory/telephony/plmn"), "26201");
}

TEST_F(ControlPanelTest, aClickSoonAfterAnotherOneEntersAFieldToo) {
    hand->type("Region", "ko_KR");
    hand->key("Return", "\n");
    hand->click("Motion");
    for (const auto flags : {EVAS_BUTTON_DOUBLE_CLICK, EVAS_BUTTON_TRIPLE_CLICK}) {
        hand->click("Motion");
        hand->clickSoon("Region", flags);
        EXPECT_EQ(hand->focused(), "Region");
        hand->write(flags == EVAS_BUTTON_DOUBLE_CLICK ? "de_DE" : "tr_TR");
        hand->key("Return", "\n");
    }
    EXPECT_EQ(setting("db/menu_widget/regionformat"), "tr_TR");
    EXPECT_EQ(device().callsTo("vconf_set_str").size(), 3U) << "what was there was not replaced";
}

TEST_F(ControlPanelTest, aClickIntoAFieldSelectsWhatItHolds) {
    hand->type("Region", "ko_KR");
    hand->key("Return", "\n");
    hand->click("Motion");
    hand->click("Region", 0.2); // NOLINT(readability-magic-numbers)
    const char* const selection = elm_entry_selection_get(hand->widget("Region"));
    EXPECT_STREQ(selection, "ko_KR");
    hand->write("de_DE");
    hand->key("Return", "\n");
    EXPECT_EQ(setting("db/menu_widget/regionformat"), "de_DE");
}

TEST_F(ControlPanelTest, buttonsMayBeClickedQuickly) {
    hand->click("One hour on");
    hand->clickSoon("One hour on");
    hand->clickSoon("One hour on", EVAS_BUTTON_TRIPLE_CLICK);
    EXPECT_EQ(number("db/setting/clock_shift"), 3 * 3600);
    hand->click("Power saving");
    hand->clickSoon("Power saving");
    EXPECT_EQ(number("db/setting/psmode"), 0);
    hand->clickSoon("12 hours");
    EXPECT_EQ(number("db/menu_widget/regionformat_time1224"), 1);
    hand->clickSoon("Raise volume key");
    hand->clickSoon("Raise volume key", EVAS_BUTTON_TRIPLE_CLICK);
    EXPECT_THAT(done, ElementsAre("XF86AudioRaiseVolume down", "XF86AudioRaiseVolume up",
                                  "XF86AudioRaiseVolume down", "XF86AudioRaiseVolume up"));
}

TEST_F(ControlPanelTest, allChoicesAreWrittenEquallyLarge) {
    std::set<int> sizes;
    std::vector<std::pair<std::string, std::string>> chips;
    chips.reserve(std::size(simulator::LANGUAGES) + 4);
    for (const auto& language : simulator::LANGUAGES)
        chips.emplace_back(std::string("Language ") + language.name, language.name);
    for (const char* other : {"12 hours", "24 hours", "Power saving", "Motion"})
        chips.emplace_back(other, other);
    for (const auto& [name, label] : chips) {
        const Evas_Object* text =
            edje_object_part_object_get(elm_layout_edje_get(hand->widget(name)), "elm.text");
        int size = 0;
        evas_object_text_font_get(text, nullptr, &size);
        sizes.insert(size);
        EXPECT_EQ(evas_object_text_text_get(text), label) << "it is cut";
    }
    EXPECT_EQ(sizes.size(), 1U) << testing::PrintToString(sizes);
}

TEST_F(ControlPanelTest, midnightAndTheChangeOfTheZonesClocksAreOnePressEach) {
    hand->click("Before midnight");
    int shift = number("db/setting/clock_shift");
    VirtualClock::jump(shift);
    Stage::advance(0.5);
    EXPECT_THAT(hand->part("Readout", "readout.time"), testing::StartsWith("23:59:5"));
    EXPECT_EQ(hand->part("Readout", "readout.date"), "Wed 18 Nov 2026");
    VirtualClock::jump(-shift);
    hand->type("Time zone", "new york");
    hand->key("Return", "\n");
    VirtualClock::setZone("America/New_York");
    hand->click("Before the daylight-saving change");
    shift = number("db/setting/clock_shift");
    VirtualClock::jump(shift);
    Stage::advance(0.5);
    EXPECT_THAT(hand->part("Readout", "readout.time"), testing::StartsWith("01:59:5"));
    EXPECT_EQ(hand->part("Readout", "readout.date"), "Sun 14 Mar 2027");
    Stage::advance(10);
    EXPECT_THAT(hand->part("Readout", "readout.time"), testing::StartsWith("03:00:0"));
    EXPECT_EQ(hand->part("Readout", "readout.zone"), "America/New_York · UTC−4:00");
}

TEST_F(ControlPanelTest, aRefusedValueIsExplainedForAMomentAndTheOldOneComesBack) {
    hand->type("Region", "Germany");
    hand->key("Return", "\n");
    EXPECT_EQ(setting("db/menu_widget/regionformat"), "unset");
    EXPECT_EQ(message(), "'Germany' is not a language and a country such as de_DE");
    hand->click("Motion");
    EXPECT_EQ(message(), "Real time") << "something else worked";
    Stage::advance(0.5);
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Region")), "en");
    hand->type("Network", "<b>x</b>");
    hand->key("Return", "\n");
    EXPECT_THAT(message(), HasSubstr("'<b>x</b>' is not a network"));
    Stage::advance(7);
    EXPECT_EQ(message(), "Real time");
}

TEST_F(ControlPanelTest, theClockIsSetByReadingAndByJumps) {
    hand->type("Date and time", "2026-11-18 10:41");
    hand->click("Set the clock");
    EXPECT_NEAR(number("db/setting/clock_shift"), 3600, 5);
    hand->type("Date and time", "2026-11-18 11:41");
    hand->key("Return", "\n");
    EXPECT_NEAR(number("db/setting/clock_shift"), 7200, 5);
    hand->click("Back to the real time");
    EXPECT_EQ(number("db/setting/clock_shift"), 0);
    EXPECT_EQ(message(), "Real time");
    hand->click("One hour on");
    hand->click("One hour on");
    EXPECT_EQ(number("db/setting/clock_shift"), 7200);
    EXPECT_EQ(message(), "02:00:00 ahead of real time");
    hand->click("One hour back");
    hand->click("One hour back");
    hand->click("One hour back");
    EXPECT_EQ(message(), "01:00:00 behind real time");
    hand->click("Before midnight");
    EXPECT_NEAR(number("db/setting/clock_shift"), 14 * 3600 + 19 * 60 - 10, 5);
    hand->click("Before the daylight-saving change");
    EXPECT_GT(number("db/setting/clock_shift"), 100 * 24 * 3600);
    EXPECT_THAT(message(), HasSubstr(" d "));
}

TEST_F(ControlPanelTest, aTimeZoneIsChosenFromThoseThatFit) {
    hand->type("Time zone", "tokyo");
    hand->click("Asia/Tokyo");
    EXPECT_EQ(setting("db/setting/time_zone"), "Asia/Tokyo");
    EXPECT_EQ(hand->widget("Asia/Tokyo"), nullptr) << "the list is still there";
    hand->type("Time zone", "new york");
    hand->key("Return", "\n");
    EXPECT_EQ(setting("db/setting/time_zone"), "America/New_York");
    hand->type("Time zone", "nowhere");
    hand->key("Return", "\n");
    EXPECT_EQ(message(), "'nowhere' is not a time zone such as Europe/Berlin");
    EXPECT_EQ(setting("db/setting/time_zone"), "America/New_York");
    Stage::advance(0.5);
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Time zone")), "America/New_York");
}

TEST_F(ControlPanelTest, aChosenZoneMakesRoomForTheNextOne) {
    hand->type("Time zone", "tokyo");
    hand->click("Asia/Tokyo");
    device().setSetting("db/setting/time_zone", std::string("Asia/Seoul"));
    Stage::advance(0.5);
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Time zone")), "Asia/Seoul")
        << "what was chosen counts as being typed";
    hand->type("Time zone", "berlin");
    hand->key("Return", "\n");
    Stage::advance(0.5);
    hand->write("honol");
    hand->key("Return", "\n");
    EXPECT_EQ(setting("db/setting/time_zone"), "Pacific/Honolulu");
}

TEST_F(ControlPanelTest, theListOfZonesGoesWithTheField) {
    hand->type("Time zone", "berlin");
    EXPECT_NE(hand->widget("Europe/Berlin"), nullptr);
    hand->click("Region");
    EXPECT_EQ(hand->widget("Europe/Berlin"), nullptr);
    hand->type("Time zone", "berlin");
    panel.reset();
}

TEST_F(ControlPanelTest, aHeldVolumeKeyIsDownRepeatsAndIsReleased) {
    hand->press("Raise volume key");
    EXPECT_THAT(done, ElementsAre("XF86AudioRaiseVolume down"));
    Stage::advance(1.0);
    EXPECT_GE(done.size(), 6U);
    EXPECT_THAT(done, Not(testing::Contains("XF86AudioRaiseVolume up")));
    hand->release();
    const std::size_t count = done.size();
    EXPECT_EQ(done.back(), "XF86AudioRaiseVolume up");
    Stage::advance(1.0);
    EXPECT_EQ(done.size(), count) << "it goes on after the release";
}

TEST_F(ControlPanelTest, aShortPressIsOnePress) {
    hand->click("Back key");
    hand->click("Lower volume key");
    EXPECT_THAT(done, ElementsAre("XF86Back down", "XF86Back up", "XF86AudioLowerVolume down",
                                  "XF86AudioLowerVolume up"));
}

TEST_F(ControlPanelTest, aPanelThatGoesReleasesItsKeys) {
    hand->press("Raise volume key");
    panel.reset();
    EXPECT_THAT(done, ElementsAre("XF86AudioRaiseVolume down", "XF86AudioRaiseVolume up"));
}

TEST_F(ControlPanelTest, theReturnKeyPressesAKeyOnce) {
    elm_object_focus_set(hand->widget("Back key"), EINA_TRUE);
    Stage::frames(3);
    hand->key("Return", "\n");
    Stage::advance(0.3);
    EXPECT_THAT(done, ElementsAre("XF86Back down", "XF86Back up"));
}

TEST_F(ControlPanelTest, theOtherActionsAreDoneOnce) {
    for (const char* name : {"Turn the bezel left", "Turn the bezel right", "Press the bezel",
                             "Quick panel", "Send to the background", "Bring to the front"})
        hand->click(name);
    EXPECT_THAT(done, ElementsAre("bezel -1", "bezel 1", "bezel press", "quick panel", "background",
                                  "front"));
}

TEST_F(ControlPanelTest, itFollowsWhatOthersSet) {
    device().setSetting("db/setting/language", std::string("ja"));
    device().setSetting("db/menu_widget/regionformat_time1224", 1);
    device().setSetting("db/menu_widget/regionformat", std::string("tr_TR"));
    device().setSetting("db/setting/psmode", 2);
    device().setSetting("db/setting/motion", 0);
    device().setSetting("db/setting/clock_shift", 90);
    device().setSetting("memory/telephony/plmn", std::string("45005"));
    device().setSetting("db/setting/time_zone", std::string("Asia/Seoul"));
    device().setVolume(SOUND_TYPE_ALARM, 3);
    Stage::advance(0.5);
    EXPECT_STREQ(
        simulator::LANGUAGES
            .at(static_cast<std::size_t>(elm_radio_value_get(hand->widget("Language English"))))
            .code,
        "ja");
    EXPECT_EQ(elm_radio_value_get(hand->widget("12 hours")), 12);
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Region")), "tr_TR");
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Network")), "45005");
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Time zone")), "Asia/Seoul");
    EXPECT_TRUE(isOn("Power saving"));
    EXPECT_FALSE(isOn("Motion"));
    EXPECT_EQ(elm_slider_value_get(hand->widget("Alarm volume")), 3);
    EXPECT_EQ(message(), "00:01:30 ahead of real time");
    EXPECT_THAT(device().callsTo("vconf_set_int"), IsEmpty()) << "it answered by setting";
    EXPECT_THAT(device().callsTo("vconf_set_str"), IsEmpty());
}

TEST_F(ControlPanelTest, whatIsBeingTypedStays) {
    hand->type("Region", "ko");
    device().setSetting("db/menu_widget/regionformat", std::string("tr_TR"));
    Stage::advance(0.5);
    EXPECT_STREQ(elm_entry_entry_get(hand->widget("Region")), "ko");
}

TEST_F(ControlPanelTest, theReadoutShowsTheDevicesTime) {
    EXPECT_THAT(hand->part("Readout", "readout.time"), testing::StartsWith("09:41:0"));
    EXPECT_EQ(hand->part("Readout", "readout.date"), "Wed 18 Nov 2026");
    EXPECT_EQ(hand->part("Readout", "readout.zone"), "Europe/Berlin · UTC+1:00");
    VirtualClock::setNow("Asia/Kolkata", "2027-01-01 23:59:50");
    Stage::advance(0.5);
    EXPECT_THAT(hand->part("Readout", "readout.time"), testing::StartsWith("23:59:5"));
    EXPECT_EQ(hand->part("Readout", "readout.zone"), "Asia/Kolkata · UTC+5:30");
}

TEST_F(ControlPanelTest, linesOfTheLogComeWithTheirColours) {
    log(DLOG_INFO, "Keys.cpp: raise(12) > F5: away");
    log(DLOG_WARN, "odd");
    log(DLOG_ERROR, "File.cpp: f(1) > * Critical * lost");
    log(DLOG_INFO, "notification.cpp: post(3) > Toast: Alarm set");
    Stage::advance(0.5);
    EXPECT_THAT(logText(), HasSubstr("<info>F5: away</info>"));
    EXPECT_THAT(logText(), HasSubstr("<warning>odd</warning>"));
    EXPECT_THAT(logText(), HasSubstr("<error>lost</error>"));
    EXPECT_THAT(logText(), HasSubstr("<toast>Toast: Alarm set</toast>"));
    EXPECT_THAT(logText(), HasSubstr("<time>09:41:0"));
}

TEST_F(ControlPanelTest, aHostileTextIsOnlyAText) {
    log(DLOG_INFO, "Toast: </toast><b>big</b>&amp;<br/>" + std::string(100000, 'x'));
    log(DLOG_INFO, std::string("broken \xff\xfe \xe6\x97") + " end");
    Stage::advance(0.5);
    EXPECT_THAT(logText(),
                HasSubstr("Toast: &lt;/toast&gt;&lt;b&gt;big&lt;/b&gt;&amp;amp;&lt;br/"));
    EXPECT_LT(logText().size(), 1500U);
    EXPECT_THAT(logText(), HasSubstr(" end"));
}

TEST_F(ControlPanelTest, theLogKeepsItsLastLines) {
    for (int line = 1; line <= 305; ++line)
        log(DLOG_INFO, "line " + std::to_string(line) + ".");
    Stage::advance(0.5);
    EXPECT_THAT(logText(), Not(HasSubstr("line 5.")));
    EXPECT_THAT(logText(), HasSubstr("line 6."));
    EXPECT_THAT(logText(), HasSubstr("line 305."));
    Evas_Object* scroller = hand->widget("Log");
    int y = 0;
    int height = 0;
    elm_scroller_region_get(scroller, nullptr, &y, nullptr, &height);
    EXPECT_GT(y, 10 * height) << "the end is shown";
    elm_scroller_region_show(scroller, 0, 0, 1, 1);
    Stage::advance(0.5);
    log(DLOG_INFO, "one more");
    Stage::advance(0.5);
    elm_scroller_region_get(scroller, nullptr, &y, nullptr, nullptr);
    EXPECT_EQ(y, 0) << "it scrolled away from what is being read";
}

TEST_F(ControlPanelTest, aHapticTapFlashesAtTheRim) {
    const auto rim = [this] {
        return stage().pixel(180, 4) & 0xFFU;
    };
    const unsigned before = rim();
    ASSERT_NE(listeners().haptic, nullptr);
    listeners().haptic(0, listeners().hapticData);
    const auto lamp = [this] {
        double value = 0;
        const char* state = edje_object_part_state_get(elm_layout_edje_get(hand->widget("Readout")),
                                                       "pulse", &value);
        return std::string(state == nullptr ? "" : state);
    };
    Stage::frames(4);
    EXPECT_GT(rim(), before + 60);
    EXPECT_EQ(lamp(), "on");
    Stage::advance(1);
    EXPECT_EQ(rim(), before);
    EXPECT_EQ(lamp(), "default");
}

TEST_F(ControlPanelTest, aPersonCanCloseIt) {
    evas_object_smart_callback_call(panel->window(), "delete,request", nullptr);
    Stage::frames(5);
    EXPECT_EQ(closed, 1);
    EXPECT_EQ(panel, nullptr);
    open();
    EXPECT_NE(hand->widget("Back key"), nullptr) << "it can be opened again";
}

TEST_F(ControlPanelTest, everyControlIsReachedWithTabAndHasAName) {
    std::set<std::string> reached;
    elm_object_focus_set(hand->widget("Back key"), EINA_TRUE);
    Stage::frames(3);
    for (int step = 0; step < 60; ++step) {
        reached.insert(hand->focused());
        hand->key("Tab");
    }
    std::vector<std::string> expected{"Back key",
                                      "Lower volume key",
                                      "Raise volume key",
                                      "Turn the bezel left",
                                      "Press the bezel",
                                      "Turn the bezel right",
                                      "Quick panel",
                                      "Send to the background",
                                      "Bring to the front",
                                      "12 hours",
                                      "24 hours",
                                      "Power saving",
                                      "Motion",
                                      "Region",
                                      "Network",
                                      "Alarm volume",
                                      "Date and time",
                                      "Set the clock",
                                      "One hour back",
                                      "One hour on",
                                      "Before midnight",
                                      "Before the daylight-saving change",
                                      "Back to the real time",
                                      "Time zone",
                                      "Log"};
    for (const auto& language : simulator::LANGUAGES)
        expected.push_back(std::string("Language ") + language.name);
    for (const std::string& name : expected) {
        EXPECT_TRUE(reached.contains(name)) << name;
        ASSERT_NE(hand->widget(name), nullptr) << name;
        EXPECT_EQ(simulator::control::accessibleName(hand->widget(name)), name);
    }
}

TEST_F(ControlPanelTest, whoWalksWithKeysSeesWhereAndWhoPointsDoesNot) {
    elm_object_focus_set(hand->widget("Back key"), EINA_TRUE);
    Stage::frames(3);
    hand->key("Tab");
    EXPECT_TRUE(elm_win_focus_highlight_enabled_get(panel->window()));
    hand->click("Motion");
    EXPECT_FALSE(elm_win_focus_highlight_enabled_get(panel->window()));
}

TEST_F(ControlPanelTest, aClickBringsTheKeysWhereNoWindowManagerDoes) {
    Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(panel->window()));
    ecore_evas_focus_set(ee, EINA_FALSE);
    Stage::frames(2);
    auto* event =
        static_cast<Ecore_Event_Mouse_Button*>(calloc(1, sizeof(Ecore_Event_Mouse_Button)));
    event->window = event->event_window = ecore_evas_window_get(ee);
    ecore_event_add(ECORE_EVENT_MOUSE_BUTTON_DOWN, event, nullptr, nullptr);
    Stage::frames(2);
    EXPECT_TRUE(ecore_evas_focus_get(ee));
}

TEST_F(ControlPanelTest, itStandsTheSameWayInALanguageThatRunsToTheLeft) {
    const Area before = Stage::area(hand->widget("Back key"));
    elm_config_mirrored_set(EINA_TRUE);
    Stage::advance(0.3);
    const Area after = Stage::area(hand->widget("Back key"));
    elm_config_mirrored_set(EINA_FALSE);
    EXPECT_EQ(before.x, after.x);
    Stage::advance(0.3);
}
