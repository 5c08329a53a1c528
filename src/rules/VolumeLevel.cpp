#include "rules/VolumeLevel.h"

#include <clock/ClockAlarmDbData.h>

namespace rules {

std::int32_t levelOf(double sliderValue) {
    constexpr double HALF = 0.5;
    return static_cast<std::int32_t>(sliderValue + HALF);
}

std::optional<double> snapOf(double sliderValue) {
    constexpr double SNAPS_TO_QUIETEST_BELOW = 0.5;
    constexpr double SNAPS_TO_LOUDEST_ABOVE = 14.0;
    constexpr double SNAPS_TO_LOUDEST_BELOW = 14.5;
    if (QUIETEST_LEVEL < sliderValue && sliderValue < SNAPS_TO_QUIETEST_BELOW)
        return QUIETEST_LEVEL;
    if (SNAPS_TO_LOUDEST_ABOVE < sliderValue && sliderValue < SNAPS_TO_LOUDEST_BELOW)
        return LOUDEST_LEVEL;
    return std::nullopt;
}

std::optional<std::int32_t> louderLevel(std::int32_t level) {
    if (level >= LOUDEST_LEVEL)
        return std::nullopt;
    return level + 1;
}

std::optional<std::int32_t> quieterLevel(std::int32_t level) {
    if (level <= QUIETEST_LEVEL)
        return std::nullopt;
    return level - 1;
}

bool mayBeReplaced(std::int32_t storedLevel) {
    return static_cast<std::uint32_t>(storedLevel) <= static_cast<std::uint32_t>(LOUDEST_LEVEL);
}

const char* volumeIconGroup(std::int32_t level, std::int32_t alertType) {
    if (level > QUIETEST_LEVEL)
        return "volume.normal.bg";
    return alertType == CLOCK_ALARM_TYPE_VIBRATION_AND_SOUND ? "volume.vibrate.bg"
                                                             : "volume.mute.bg";
}

} // namespace rules
