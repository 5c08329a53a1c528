// The days of a weekly alarm in words.
#pragma once

#include <string>

#include <clock/ClockText.h>

namespace rules {

// Gives the translation of a message identifier.
using Translate = const char* (*)(const char* id);

// The summary of a weekday set (bit 0 Sunday to bit 6 Saturday): the text for every day, or the
// days' short names from Monday to Sunday, each followed by a blank. Empty when no day is set. A
// name takes at most 63 bytes with its blank, the summary 1023; characters stay whole.
std::string weekdaySummary(int weekdays, Translate translate = clockText);

} // namespace rules
