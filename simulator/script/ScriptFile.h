/**
 * @file
 * @brief A script, as it is written.
 */
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace simulator {

/** A line that does something. */
struct ScriptLine {
    int number = 0; ///< From 1 on.
    std::vector<std::string> words;
};

/** A whole script. */
struct Script {
    std::string name; ///< As messages name it.
    std::vector<ScriptLine> lines;
    std::vector<std::string> errors; ///< Complete messages; a script with any does not run.
};

/** @brief "NAME:LINE: COMMAND: why", with what cannot be printed left out. */
std::string scriptMessage(const std::string& name, int line, const std::string& command,
                          const std::string& why);

/** @brief Reads a script and looks at each of its commands. @param name For messages. */
Script parseScript(const std::string& name, std::string_view text);

} // namespace simulator
