// The order of cities: by offset, then by translated name.
#pragma once

#include <vector>

#include <clock/ClockWorldClockDbData.h>
#include <device/i18n.h>

namespace rules {

// True unless the first city's name comes after the second's: also for equal names, and for all
// names when the collator is missing or fails.
bool isNotAfterByName(const ClockWorldClockDbData& a, const ClockWorldClockDbData& b,
                      i18n_ucollator_h collator);

// True when the first city's offset is the smaller one; as isNotAfterByName() when none of both is.
// Not an order that sorting functions could use.
bool isNotAfterByGmtOffset(const ClockWorldClockDbData& a, const ClockWorldClockDbData& b,
                           i18n_ucollator_h collator);

// Sorts by "a is not after b, but b is after a", whatever the cities' data are. Without a working
// collator cities of one offset keep their order.
void sortCities(std::vector<ClockWorldClockDbData>& cities, i18n_ucollator_h collator);

} // namespace rules
