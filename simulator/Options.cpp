#include "Options.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstring>

#include "Keys.h"
#include "control/DeviceSettings.h"
#include "script/Commands.h"

namespace simulator {
namespace {

/** One option: applies its value and returns what is wrong with it, if anything. */
struct OptionRow {
    const char* name;
    const char* value; ///< Name of the value in the help; null for an option without one.
    const char* help;
    std::string (*apply)(Options& options, const std::string& value);
};

std::string applyDirectory(std::string& directory, const std::string& value) {
    directory = value;
    return value.empty() ? "needs the name of a folder" : "";
}

std::string applyLanguage(Options& options, const std::string& value) {
    const auto allowed = [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') ||
               std::strchr("_-@.", c) != nullptr;
    };
    options.language = value;
    return !value.empty() && std::all_of(value.begin(), value.end(), allowed)
               ? ""
               : "needs a language code such as en or pt_BR";
}

/** A whole number from 0 on. */
std::optional<int> numberOf(const std::string& value) {
    int number = 0;
    const char* end = value.data() + value.size();
    const auto [stop, failure] = std::from_chars(value.data(), end, number);
    if (failure != std::errc() || stop != end || number < 0)
        return std::nullopt;
    return number;
}

std::string applyEdit(Options& options, const std::string& value) {
    options.editId = numberOf(value);
    return options.editId ? "" : "needs the number of an alarm";
}

std::string applyVolume(Options& options, const std::string& value) {
    constexpr int LOUDEST = 15;
    options.volume = numberOf(value);
    return options.volume && *options.volume <= LOUDEST ? "" : "needs a level from 0 to 15";
}

std::string applyPowerSaving(Options& options, const std::string& value) {
    if (value != "on" && value != "off")
        return "needs 'on' or 'off'";
    options.powerSaving = value == "on";
    return "";
}

std::string applyScript(Options& options, const std::string& value) {
    options.script = value;
    return value.empty() ? "needs the name of a file" : "";
}

std::string applyCommand(Options& options, const std::string& value) {
    options.commands.push_back(value);
    return value.empty() ? "needs a command" : "";
}

/** Keeps a setting for the device. */
template <const char* SETTING>
std::string applySetting(Options& options, const std::string& value) {
    options.settings.emplace_back(SETTING, value);
    if (value.empty())
        return "needs a value";
    const std::string problem = checkDevice(SETTING, value);
    return problem.empty() ? "" : "cannot be used: " + problem;
}

constexpr char REGION[] = "region";
constexpr char TIME_ZONE[] = "time-zone";
constexpr char CLOCK[] = "clock";
constexpr char NETWORK[] = "network";
constexpr char MOTION[] = "motion";

constexpr std::array<OptionRow, 22> OPTION_ROWS{{
    {"--data", "DIR", "keep settings and alarms in DIR",
     [](Options& o, const std::string& v) {
         return applyDirectory(o.dataDir, v);
     }},
    {"--resources", "DIR", "take themes and texts from DIR",
     [](Options& o, const std::string& v) {
         return applyDirectory(o.resourceDir, v);
     }},
    {"--language", "CODE", "show texts in this language", applyLanguage},
    {"--12h", nullptr, "set the device to 12 hours",
     [](Options& o, const std::string&) {
         o.twelveHour = true;
         return std::string();
     }},
    {"--24h", nullptr, "set the device to 24 hours",
     [](Options& o, const std::string&) {
         o.twelveHour = false;
         return std::string();
     }},
    {"--region", "LOCALE", "set the device's region, for example de_DE", applySetting<REGION>},
    {"--time-zone", "NAME", "set the device's time zone, for example Asia/Tokyo",
     applySetting<TIME_ZONE>},
    {"--clock", "TIME", "set the device's clock: \"2026-12-31 23:59\", +SECONDS, real",
     applySetting<CLOCK>},
    {"--network", "DIGITS", "set the mobile network, for example 26201, or none",
     applySetting<NETWORK>},
    {"--motion", "on|off", "set whether things move", applySetting<MOTION>},
    {"--panel", nullptr, "open the control panel beside the face",
     [](Options& o, const std::string&) {
         o.panel = true;
         return std::string();
     }},
    {"--no-panel", nullptr, "open no control panel; as where there is no room for one",
     [](Options& o, const std::string&) {
         o.panel = false;
         return std::string();
     }},
    {"--create", nullptr, "open the editor for a new alarm",
     [](Options& o, const std::string&) {
         o.create = true;
         return std::string();
     }},
    {"--edit", "ID", "open the editor on a stored alarm", applyEdit},
    {"--pick-city", nullptr, "show the city picker alone",
     [](Options& o, const std::string&) {
         o.pickCity = true;
         return std::string();
     }},
    {"--world-clock", nullptr, "open the world clock",
     [](Options& o, const std::string&) {
         o.worldClock = true;
         return std::string();
     }},
    {"--set-volume", "LEVEL", "set the alarm's volume, 0 to 15, and end", applyVolume},
    {"--power-saving", "on|off", "switch ultra power saving and end", applyPowerSaving},
    {"--script", "FILE", "run the commands of FILE, and end", applyScript},
    {"--command", "LINE", "send a command to the watch that runs; - = standard input",
     applyCommand},
    {"--version", nullptr, "print the version",
     [](Options& o, const std::string&) {
         o.version = true;
         return std::string();
     }},
    {"--help", nullptr, "print this text",
     [](Options& o, const std::string&) {
         o.help = true;
         return std::string();
     }},
}};

const OptionRow* findOption(const std::string& name) {
    const auto* row = std::find_if(OPTION_ROWS.begin(), OPTION_ROWS.end(),
                                   [&name](const OptionRow& r) { return name == r.name; });
    return row == OPTION_ROWS.end() ? nullptr : row;
}

/** Both "--data DIR" and "--data=DIR" are understood. */
std::string applyNext(Options& options, const std::vector<std::string>& arguments,
                      std::size_t& next) {
    const std::string& argument = arguments[next++];
    const auto equals = argument.find('=');
    const std::string name = argument.substr(0, equals);
    const OptionRow* row = findOption(name);
    if (row == nullptr)
        return "unknown option '" + argument + "'";
    if (row->value == nullptr) {
        return equals == std::string::npos ? row->apply(options, "")
                                           : "option '" + name + "' takes no value";
    }
    std::string value;
    if (equals != std::string::npos)
        value = argument.substr(equals + 1);
    else if (next < arguments.size())
        value = arguments[next++];
    const std::string problem = row->apply(options, value);
    return problem.empty() ? "" : "option '" + name + "' " + problem;
}

/** The given options that say what the watch shows first. */
std::vector<std::string> openingOptions(const Options& options) {
    std::vector<std::string> names;
    if (options.create)
        names.emplace_back("--create");
    if (options.editId)
        names.emplace_back("--edit");
    if (options.worldClock)
        names.emplace_back("--world-clock");
    if (options.pickCity)
        names.emplace_back("--pick-city");
    return names;
}

} // namespace

Options parseOptions(const std::vector<std::string>& arguments) {
    Options options;
    for (std::size_t next = 0; next < arguments.size() && options.error.empty();)
        options.error = applyNext(options, arguments, next);
    const auto opens = openingOptions(options);
    if (options.error.empty() && opens.size() > 1)
        options.error = "options '" + opens[0] + "' and '" + opens[1] + "' exclude each other";
    if (options.error.empty() && options.onlySets() && !opens.empty())
        options.error = "the watch does not start to set '--set-volume' or '--power-saving'";
    if (options.error.empty() && !options.script.empty() &&
        (options.onlySets() || !options.commands.empty()))
        options.error = "'--script' needs a watch of its own, without '--set-volume', "
                        "'--power-saving' and '--command'";
    return options;
}

std::string helpText() {
    constexpr std::size_t NAME_WIDTH = 26;
    std::string text = "usage: clock-sim [options]\n\n"
                       "A watch with the clock application, in a window.\n\nOptions:\n";
    for (const OptionRow& row : OPTION_ROWS) {
        std::string name = row.name;
        if (row.value != nullptr)
            name += std::string(" ") + row.value;
        name.resize(std::max(name.size(), NAME_WIDTH), ' ');
        text += "  " + name + row.help + "\n";
    }
    text += "\nKeys:\n" + keysHelpText();
    text +=
        "\nCommands of --script and --command; a TEXT of several words stands in quotes, as in\n"
        "\"World clock\" or 'World clock':\n" +
        commandsHelpText();
    text +=
        "\nExit status: 0 after a normal end, 1 when the watch cannot start, 2 for a command "
        "line\nthat makes no sense. A watch that runs takes over what another clock-sim sets.\n";
    return text;
}

} // namespace simulator
