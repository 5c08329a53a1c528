// The offsets of cities as they are ordered, and the hours of the list's index.
#pragma once

#include <optional>

namespace rules {

// The number behind a three-character prefix, with minutes as a decimal fraction: "GMT+05:30" is
// 5.3. This keeps the order within an hour and the whole hour exact. Not a number in, 0 out; null
// is an empty text.
float gmtOffset(const char* timezone);

// The labels of the index beside one list: one for each whole hour, for its first city.
class IndexHours {
public:
    // The label that the list's next city gets, if it gets one.
    std::optional<int> next(const char* timezone);

private:
    // Only later hours get labels: cities at -12 never do.
    int _last = -12;
};

} // namespace rules
