// What counts as a change worth asking about.
#pragma once

#include <clock/ClockAlarmDbData.h>

namespace rules {

// True when what a person can set in the editor differs. Ids, times, dates, the switch, the snooze
// counter and the tone's position do not count.
bool isChanged(const ClockAlarmDbData& alarm, const ClockAlarmDbData& before);

} // namespace rules
