/**
 * @file
 * @brief What the arguments of commands may be.
 */
#pragma once

#include <optional>
#include <string>

#include "Commands.h"
#include "ScriptRun.h"

namespace simulator {

/** Width and height of the face in pixels. */
inline constexpr int FACE_PIXELS = 360;

std::optional<int> wholeNumber(const std::string& text);
/** A number of seconds from 0 to 600. */
std::optional<double> secondsIn(const std::string& text);
/** A place on the face, given as two arguments. */
std::optional<Place> placeIn(const Arguments& arguments, std::size_t at);

/** Said where words look like a text that was taken apart. */
inline constexpr const char* NEEDS_QUOTES =
    "a text of several words needs quotes, as in \"World clock\" or 'World clock'";

/** What is said about an argument that is no number of seconds. */
std::string notSeconds(const std::string& text);
/** The same about what follows a text. */
std::string notSecondsAfterText(const std::string& text);
std::string notPlace(const Arguments& arguments, std::size_t at);
/** What is said about two arguments that are neither a text nor a place. */
std::string notTextOrPlace(const Arguments& arguments);

} // namespace simulator
