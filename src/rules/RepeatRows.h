// The rows of the repeat screen.
#pragma once

#include <array>

namespace rules {

// Row 0 stands for every day, rows 1 to 7 for Sunday to Saturday.
inline constexpr int REPEAT_ROW_COUNT = 8;

// The label of a row; null for an index outside 0 to 7.
const char* repeatRowTextId(int index);

// Whether a row's check is on when the screen shows a weekday set.
bool isRepeatRowOn(int index, int weekdays);

using RepeatChecks = std::array<bool, REPEAT_ROW_COUNT>;

struct RepeatToggle {
    int weekdays;
    // The rows to turn, in this order, all of them to `on`.
    std::array<int, REPEAT_ROW_COUNT> rows;
    int rowCount;
    bool on;
};

// What a tap on a row does, given the weekday set and the checks before it. The set and the checks
// are taken to agree: a day is added to the set or subtracted from it, whatever the set holds.
RepeatToggle toggleRepeatRow(int index, int weekdays, const RepeatChecks& checks);

} // namespace rules
