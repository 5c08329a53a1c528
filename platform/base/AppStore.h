/**
 * @file
 * @brief Databases in the application's data folder.
 */
#pragma once

#include <string>
#include <vector>

#include "base/SqliteDatabase.h"

namespace base {

/**
 * @brief The path of a file in the application's data folder.
 * @param tag Tag of the log line about a device without such a folder.
 * @return Empty when there is none.
 */
std::string appDataPath(const char* fileName, const char* tag);

/**
 * @brief Opens a database, and tells at error priority when a damaged one was put aside for it.
 * @param owner See SqliteDatabase::open().
 * @param migrations See SqliteDatabase::open().
 * @param tag Tag of the log line.
 * @return False when it cannot be opened.
 */
bool openAppStore(SqliteDatabase& database, const char* owner,
                  const std::vector<std::string>& migrations, const char* tag);

} // namespace base
