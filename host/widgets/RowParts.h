/**
 * @file
 * @brief What a row of a list shows.
 */
#pragma once

#include <string>
#include <vector>

#include <Elementary.h>

namespace host {

/**
 * @brief The texts of a row, with commas between them; empty for a row without text.
 *
 * A row that is out of sight has them as well.
 */
std::string textsOfRow(const Elm_Object_Item* row);

/** @brief The widgets in a row; empty while it has no picture. */
std::vector<Evas_Object*> contentsOfRow(const Elm_Object_Item* row);

} // namespace host
