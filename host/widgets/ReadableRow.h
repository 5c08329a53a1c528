/**
 * @file
 * @brief Rows as screen readers know them.
 */
#pragma once

namespace host {

/**
 * @brief From now on screen readers can press the rows that are made for lists.
 *
 * They are also told what a row says, whether its mark is on, and whether keys have reached it. A
 * row that only takes room is none to them.
 */
void makeRowsReadable();

} // namespace host
