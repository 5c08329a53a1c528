#include "rules/EditorRows.h"

#include <algorithm>

#include <clock/ClockAlarmDbData.h>

namespace rules {

namespace {

bool isSoundRow(EditorRow row) {
    return std::find(SOUND_ROWS.begin(), SOUND_ROWS.end(), row) != SOUND_ROWS.end();
}

bool makesSound(int alertType) {
    return alertType == CLOCK_ALARM_TYPE_SOUND || alertType == CLOCK_ALARM_TYPE_VIBRATION_AND_SOUND;
}

} // namespace

bool hasRow(EditorRow row, int alertType) {
    return !isSoundRow(row) || makesSound(alertType);
}

std::optional<EditorRow> rowAbove(EditorRow row, const EditorRowSet& present) {
    for (std::size_t place = placeOf(row); place > 0; --place)
        if (present.test(place - 1))
            return EDITOR_ROWS.at(place - 1);
    return std::nullopt;
}

SoundRowsChange soundRowsChange(int alertType, const EditorRowSet& present) {
    if (alertType == CLOCK_ALARM_TYPE_VIBRATION)
        return SoundRowsChange::Remove;
    if (!makesSound(alertType))
        return SoundRowsChange::None;
    const bool any = std::any_of(SOUND_ROWS.begin(), SOUND_ROWS.end(),
                                 [&](EditorRow row) { return present.test(placeOf(row)); });
    return any ? SoundRowsChange::RefreshIcon : SoundRowsChange::Insert;
}

} // namespace rules
