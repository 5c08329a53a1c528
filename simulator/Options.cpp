#include "Options.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstring>

#include "Keys.h"

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

std::string applyEdit(Options& options, const std::string& value) {
    int id = 0;
    const char* end = value.data() + value.size();
    const auto [stop, failure] = std::from_chars(value.data(), end, id);
    if (failure != std::errc() || stop != end || id < 0)
        return "needs the number of an alarm";
    options.editId = id;
    return "";
}

constexpr std::array<OptionRow, 9> OPTION_ROWS{{
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
    {"--create", nullptr, "open the editor for a new alarm",
     [](Options& o, const std::string&) {
         o.create = true;
         return std::string();
     }},
    {"--edit", "ID", "open the editor on a stored alarm", applyEdit},
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

} // namespace

Options parseOptions(const std::vector<std::string>& arguments) {
    Options options;
    for (std::size_t next = 0; next < arguments.size() && options.error.empty();)
        options.error = applyNext(options, arguments, next);
    if (options.error.empty() && options.create && options.editId)
        options.error = "options '--create' and '--edit' exclude each other";
    return options;
}

std::string helpText() {
    constexpr std::size_t NAME_WIDTH = 18;
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
    text += "\nExit status: 0 after a normal end, 1 when the watch cannot start, 2 for a command "
            "line\nthat makes no sense.\n";
    return text;
}

} // namespace simulator
