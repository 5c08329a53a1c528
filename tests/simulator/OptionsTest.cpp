// The simulator's command line.

#include "Options.h"

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

using simulator::Options;
using simulator::parseOptions;

TEST(SimulatorOptions, theAlarmsVolumeIsALevel) {
    for (const int level : {0, 7, 15}) {
        const Options options = parseOptions({"--set-volume", std::to_string(level)});
        EXPECT_EQ(options.error, "");
        EXPECT_EQ(options.volume, level);
        EXPECT_TRUE(options.onlySets());
    }
    for (const char* value : {"16", "-1", "", "7x", "loud", "99999999999"}) {
        EXPECT_EQ(parseOptions({"--set-volume", value}).error,
                  "option '--set-volume' needs a level from 0 to 15")
            << value;
    }
    EXPECT_NE(parseOptions({"--set-volume"}).error, "");
}

TEST(SimulatorOptions, powerSavingIsOnOrOff) {
    EXPECT_EQ(parseOptions({"--power-saving", "on"}).powerSaving, true);
    EXPECT_EQ(parseOptions({"--power-saving=off"}).powerSaving, false);
    EXPECT_TRUE(parseOptions({"--power-saving=off"}).onlySets());
    for (const char* value : {"", "2", "On", "yes"}) {
        EXPECT_EQ(parseOptions({"--power-saving", value}).error,
                  "option '--power-saving' needs 'on' or 'off'")
            << value;
    }
}

TEST(SimulatorOptions, aWatchThatOnlySetsDoesNotOpenAnEditor) {
    EXPECT_NE(parseOptions({"--set-volume", "3", "--create"}).error, "");
    EXPECT_NE(parseOptions({"--edit", "1", "--power-saving", "on"}).error, "");
    EXPECT_EQ(parseOptions({"--set-volume", "3", "--power-saving", "on", "--data", "d"}).error, "");
}

TEST(SimulatorOptions, otherwiseTheWatchStarts) {
    EXPECT_FALSE(parseOptions({}).onlySets());
    EXPECT_FALSE(parseOptions({"--24h", "--create"}).onlySets());
}

TEST(SimulatorOptions, onePageOpensFirst) {
    EXPECT_TRUE(parseOptions({"--world-clock"}).worldClock);
    EXPECT_TRUE(parseOptions({"--pick-city"}).pickCity);
    EXPECT_EQ(parseOptions({"--world-clock", "--edit", "1"}).error,
              "options '--edit' and '--world-clock' exclude each other");
    EXPECT_EQ(parseOptions({"--pick-city", "--world-clock"}).error,
              "options '--world-clock' and '--pick-city' exclude each other");
    EXPECT_NE(parseOptions({"--set-volume", "3", "--world-clock"}).error, "");
}

TEST(SimulatorOptions, settingsOfTheDeviceAreTakenInTheirOrder) {
    using Settings = std::vector<std::pair<std::string, std::string>>;
    const auto options = parseOptions({"--time-zone", "Asia/Tokyo", "--clock", "-3600",
                                       "--region=ja_JP", "--network", "none", "--motion=off"});
    EXPECT_EQ(options.error, "");
    EXPECT_EQ(options.settings, (Settings{{"time-zone", "Asia/Tokyo"},
                                          {"clock", "-3600"},
                                          {"region", "ja_JP"},
                                          {"network", "none"},
                                          {"motion", "off"}}));
    EXPECT_EQ(parseOptions({"--clock="}).error, "option '--clock' needs a value");
    EXPECT_FALSE(options.onlySets());
}

TEST(SimulatorOptions, aSettingsBadValueMakesNoSense) {
    using Pair = std::pair<const char*, const char*>;
    for (const auto& [option, value] : std::vector<Pair>{{"--region", "Germany"},
                                                         {"--time-zone", "Berlin"},
                                                         {"--clock", "tomorrow"},
                                                         {"--network", "12"},
                                                         {"--motion", "slow"}}) {
        const std::string error = parseOptions({option, value}).error;
        EXPECT_TRUE(error.starts_with(std::string("option '") + option + "' cannot be used: '"))
            << error;
        EXPECT_NE(error.find(std::string("'") + value + "' is "), std::string::npos) << error;
    }
    for (const auto& [option, value] : std::vector<Pair>{{"--region", "de_DE"},
                                                         {"--time-zone", "Asia/Kolkata"},
                                                         {"--clock", "before-dst"},
                                                         {"--clock", "2026-12-31 23:59"},
                                                         {"--network", "none"},
                                                         {"--motion", "off"}})
        EXPECT_EQ(parseOptions({option, value}).error, "") << option << " " << value;
}

TEST(SimulatorOptions, thePanelOpensByItselfOrAsTold) {
    EXPECT_EQ(parseOptions({}).panel, std::nullopt);
    EXPECT_EQ(parseOptions({"--panel"}).panel, true);
    EXPECT_EQ(parseOptions({"--no-panel"}).panel, false);
}
