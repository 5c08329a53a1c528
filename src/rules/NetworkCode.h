// Mobile country codes.
#pragma once

namespace rules {

// True when a list of codes, separated by spaces, holds a code. Null is an empty text.
bool isMccValueMatched(const char* code, const char* list);

} // namespace rules
