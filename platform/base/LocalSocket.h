/**
 * @file
 * @brief UNIX sockets that are files of a folder, however long the folder's path is.
 */
#pragma once

#include <string>

namespace base {

/** @brief Listens at a new file. @return A non-blocking descriptor, or a negative errno. */
int listenAt(const std::string& folder, const std::string& name);

/**
 * @brief Connects to who listens at a file.
 * @return A blocking descriptor, or a negative errno; -ECONNREFUSED when nobody listens any more.
 */
int connectTo(const std::string& folder, const std::string& name);

} // namespace base
