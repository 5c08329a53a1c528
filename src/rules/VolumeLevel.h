// The levels of an alarm's volume, and how a slider stands for them.
#pragma once

#include <cstdint>
#include <optional>

namespace rules {

inline constexpr std::int32_t QUIETEST_LEVEL = 0;
inline constexpr std::int32_t LOUDEST_LEVEL = 15;

// The level of a slider's value: the nearest one, upwards from the middle between two.
std::int32_t levelOf(double sliderValue);

// Where a slider that was let go jumps to. The two ends are not alike: near the loudest one the
// slider jumps away from the level that it has set.
std::optional<double> snapOf(double sliderValue);

// The next level; nothing at the end of the scale.
std::optional<std::int32_t> louderLevel(std::int32_t level);
std::optional<std::int32_t> quieterLevel(std::int32_t level);

// Whether a level that was set elsewhere may replace the stored one. It is the stored one that has
// to be within the scale.
bool mayBeReplaced(std::int32_t storedLevel);

// The theme group of the icon of a level and an alert type.
const char* volumeIconGroup(std::int32_t level, std::int32_t alertType);

} // namespace rules
