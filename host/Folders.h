/**
 * @file
 * @brief Where the device keeps things on this machine.
 */
#pragma once

#include <string>

#include "device_host.h"

namespace host {

/** Absolute paths without a trailing slash. */
struct Folders {
    std::string data;      ///< Settings and application data.
    std::string runtime;   ///< State until the next restart.
    std::string resources; ///< Themes and catalogues.
};

/** The folders in use; those of the environment when nobody called prepareFolders(). */
const Folders& folders();

/**
 * @brief Chooses the folders, creates those that are missing and checks that they can be written.
 * @param[out] error One sentence about the first unusable folder.
 */
bool prepareFolders(const device_host_config_s& config, std::string& error);

/** Goes back to nobody having called prepareFolders(). */
void forgetFolders();

/** Creates a folder and the missing ones above it, for the owner only. @return 0 or an errno. */
int createFolder(const std::string& path);

} // namespace host
