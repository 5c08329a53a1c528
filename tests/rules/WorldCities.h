// The larger cities of the world in a language, and what people type to find them.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <clock/ClockWorldClockDbData.h>

// Where the package libtimezonemap-data keeps its cities.
inline constexpr const char* WORLD_CITIES_FILE = "/usr/share/libtimezonemap/ui/cities15000.txt";

// All of them or as many from all over the list, with names where a message identifier would be;
// none without the package. Many have no name in the language's script: they keep their own.
std::vector<ClockWorldClockDbData> worldCities(const std::string& language, std::size_t count = 0);

// Texts of one to ten characters: parts of names as they are, in capitals and without accents, in
// ten languages, and what nobody should type.
const std::vector<std::string>& searchTexts();

// Texts longer than a person can enter, and such as are no text.
std::vector<std::string> oddSearchTexts();
