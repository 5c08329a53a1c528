/**
 * @file
 * @brief The commands of scripts.
 */
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace simulator {

class ScriptRun;

/** What stands behind a command's name. */
using Arguments = std::vector<std::string>;

/** One command. */
struct Command {
    const char* name;
    const char* arguments; ///< As the help shows them; empty for a command without any.
    const char* help;
    std::size_t least; ///< Fewest arguments.
    std::size_t most;
    /** @return What is wrong with the arguments, before anything runs; may be null. */
    std::string (*check)(const Arguments& arguments);
    /** @return Empty, or one sentence why it was not done. */
    std::string (*act)(ScriptRun& run, const Arguments& arguments);
};

/** @brief All commands, in the order of the help. */
const std::vector<Command>& commands();

/** @brief The command of a name; null when there is none. */
const Command* findCommand(const std::string& name);

/**
 * @brief Looks at one command before it runs.
 * @param words Its name and arguments.
 * @return Empty, or what is wrong with it.
 */
std::string checkCommand(const std::vector<std::string>& words);

/** @brief One line for each command, for --help. */
std::string commandsHelpText();

} // namespace simulator
