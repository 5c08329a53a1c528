// Finds the screens' theme files.
#pragma once

#include <string>

// The path of a theme by its resource name ("edje/..."); empty, with a log line, when there is
// none.
std::string themePath(const char* resourceName);
