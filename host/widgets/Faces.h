/**
 * @file
 * @brief Everything that stands on the screen, when the language changes.
 */
#pragma once

namespace host {

/** Turns every widget to the side from which it is read now, with what the toolkit forgets. */
void turnFaces(bool toTheLeft);

/** Makes every list ask for the texts of its rows again. */
void readFacesAgain();

} // namespace host
