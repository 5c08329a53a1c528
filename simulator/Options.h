/**
 * @file
 * @brief The simulator's command line.
 */
#pragma once

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace simulator {

/** What the command line asks for. Empty texts mean the device's defaults. */
struct Options {
    bool help = false;
    bool version = false;
    bool create = false;             ///< Open the editor for a new alarm at once.
    std::optional<int> editId;       ///< Open the editor on a stored alarm at once.
    bool worldClock = false;         ///< Open the world clock at once.
    bool pickCity = false;           ///< Show the city picker alone.
    std::optional<bool> twelveHour;  ///< Set the device to 12 or to 24 hours.
    std::optional<int> volume;       ///< Set the alarm's level, and no more.
    std::optional<bool> powerSaving; ///< Switch ultra power saving, and no more.
    std::optional<bool>
        panel; ///< Open the control panel, or do not; by itself where there is room.
    std::vector<std::pair<std::string, std::string>> settings; ///< Of the device, by their names.
    std::string dataDir;
    std::string resourceDir;
    std::string language;
    std::string script;                ///< File of the script to run.
    std::vector<std::string> commands; ///< For a watch that runs already; "-" = standard input.
    int channel = -1;  ///< To the process that runs the script; not from the command line.
    std::string error; ///< Why the command line makes no sense; empty when it does.

    /** True when only settings are written, for a watch that may be running. */
    bool onlySets() const { return volume.has_value() || powerSaving.has_value(); }
};

/** @brief Reads a command line. @param arguments Without the program's name. */
Options parseOptions(const std::vector<std::string>& arguments);

/** @brief The text of --help. */
std::string helpText();

} // namespace simulator
