/**
 * @file
 * @brief What can be wrong with texts on the face.
 */
#pragma once

#include <string>
#include <vector>

#include "support/Stage.h"

/** True when a line is wider than what can be seen of it. */
bool isCut(const FoundText& found);
/** True when lines of a text block are higher than its place. */
bool isTooLow(const FoundText& found);
/**
 * @brief Texts without a translation or with other digits than 0 to 9, texts that do not fit or end
 * in dots, and texts whose pixels are lost or lie over those of others.
 */
std::vector<std::string> faultsOf(const std::vector<FoundText>& texts);
