// The explanations under the editor's switches.
#pragma once

#include <string>

namespace rules {

// How often and at which intervals (minutes) a snoozed alarm sounds again.
std::string snoozeExplanation(int times, int minutes);

// For how long a gradually rising alarm rises. The text always says 60 seconds.
std::string increaseVolumeExplanation();

} // namespace rules
