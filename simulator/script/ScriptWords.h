/**
 * @file
 * @brief The words of a script's line.
 */
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace simulator {

/** Longest line of a script in bytes. */
inline constexpr std::size_t SCRIPT_LINE_LIMIT = 4096;

/** A line, taken apart. */
struct ScriptWords {
    std::vector<std::string> words; ///< None for a blank line or a comment.
    std::string error;              ///< Why the line makes no sense; empty when it does.
};

/**
 * @brief Takes a line apart at its blanks.
 *
 * A word in double quotes may hold blanks, and the escapes \" \\ \n and \t. A word in single quotes
 * may hold blanks, and all in it stands for itself; only a quote before a blank or the line's end
 * ends it, so apostrophes in names need no care. What follows a # at the beginning of a word is a
 * comment.
 */
ScriptWords scriptWords(std::string_view line);

} // namespace simulator
