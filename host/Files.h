/**
 * @file
 * @brief Small files that are always whole: a reader sees the old contents or the new ones.
 */
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace host {

/**
 * @brief A file name for any name.
 *
 * Different names give different file names, and none begins with a dot.
 * @return Nothing when the name is empty or too long for a file.
 */
std::optional<std::string> fileNameFor(std::string_view name);

/** The name that fileNameFor() made a file name of; nothing for other files. */
std::optional<std::string> nameOfFile(std::string_view fileName);

/** Puts contents in the place of a file, also when power fails. @return 0 or an errno. */
int replaceFile(const std::string& folder, const std::string& fileName, std::string_view contents);

/** Reads a regular file of at most `limit` bytes. @return 0 or an errno. */
int readFile(const std::string& path, std::size_t limit, std::string& contents);

/** Removes what writers that were killed in replaceFile() left in a folder. */
void removeLeftovers(const std::string& folder);

} // namespace host
