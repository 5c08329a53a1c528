// Finds the screens' theme files.
#pragma once

#include <string>

// The path of a theme by its resource name ("edje/..."); empty, with a log line, when there is
// none. The tag is that of the log lines.
std::string themePath(const char* resourceName, const char* tag = "alarm-ui-common");
