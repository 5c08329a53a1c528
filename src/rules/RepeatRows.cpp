#include "rules/RepeatRows.h"

#include <algorithm>

#include <clock/ClockAlarmDbData.h>

namespace rules {

namespace {

constexpr int DAYS = 7;

struct RepeatRow {
    int weekdays;
    const char* textId;
};

constexpr std::array<RepeatRow, REPEAT_ROW_COUNT> REPEAT_ROWS = {{
    {CLOCK_ALARM_EVERY_DAY, "IDS_ALM_BODY_EVERYDAY"},
    {1, "IDS_ALM_BODY_EVERY_SUNDAY"},
    {2, "IDS_ALM_BODY_EVERY_MONDAY"},
    {4, "IDS_ALM_BODY_EVERY_TUESDAY"},
    {8, "IDS_ALM_BODY_EVERY_WEDNESDAY"},
    {16, "IDS_ALM_BODY_EVERY_THURSDAY"},
    {32, "IDS_ALM_BODY_EVERY_FRIDAY"},
    {64, "IDS_ALM_BODY_EVERY_SATURDAY"},
}};

bool isRow(int index) {
    return index >= 0 && index < REPEAT_ROW_COUNT;
}

RepeatToggle toggleEveryDay(bool wasOn) {
    return {wasOn ? 0 : CLOCK_ALARM_EVERY_DAY, {0, 1, 2, 3, 4, 5, 6, 7}, REPEAT_ROW_COUNT, !wasOn};
}

} // namespace

const char* repeatRowTextId(int index) {
    return isRow(index) ? REPEAT_ROWS.at(static_cast<std::size_t>(index)).textId : nullptr;
}

bool isRepeatRowOn(int index, int weekdays) {
    if (weekdays == CLOCK_ALARM_EVERY_DAY)
        return true;
    return index > 0 && isRow(index) &&
           (weekdays & REPEAT_ROWS.at(static_cast<std::size_t>(index)).weekdays) != 0;
}

RepeatToggle toggleRepeatRow(int index, int weekdays, const RepeatChecks& checks) {
    if (!isRow(index))
        return {weekdays, {}, 0, false};
    const auto row = static_cast<std::size_t>(index);
    if (index == 0)
        return toggleEveryDay(checks.front());
    const bool on = !checks.at(row);
    const int bit = REPEAT_ROWS.at(row).weekdays;
    const auto days = std::count(checks.begin() + 1, checks.end(), true);
    const bool everyDayTurns = on ? days == DAYS - 1 : days == DAYS;
    RepeatToggle toggle{on ? weekdays + bit : weekdays - bit, {}, 0, on};
    if (everyDayTurns)
        toggle.rows.at(static_cast<std::size_t>(toggle.rowCount++)) = 0;
    toggle.rows.at(static_cast<std::size_t>(toggle.rowCount++)) = index;
    return toggle;
}

} // namespace rules
