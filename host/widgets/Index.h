/**
 * @file
 * @brief The index along the rim, without a finger.
 */
#pragma once

#include <string>

#include <Evas.h>

namespace host {

/** @brief Selects an entry some steps further on. @return False when there are no entries. */
bool turnIndex(Evas_Object* index, int steps);

/** @brief The text of the entry that was turned to last, or of the first one. */
std::string indexText(const Evas_Object* index);

} // namespace host
