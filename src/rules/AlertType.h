// The alert types in words.
#pragma once

namespace rules {

inline constexpr int ALERT_TYPE_COUNT = 3;

// The label of an alert type; null for a value outside 0 to 2.
const char* alertTypeTextId(int type);

} // namespace rules
