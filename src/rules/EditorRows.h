// Which rows the alarm editor has, and in which order.
#pragma once

#include <array>
#include <bitset>
#include <cstddef>
#include <optional>

namespace rules {

// The editor's rows from top to bottom.
enum class EditorRow : int {
    TimePicker,
    Repeat,
    Type,
    Volume,
    Tone,
    Snooze,
    IncreaseVolume,
    Name,
};

inline constexpr std::size_t EDITOR_ROW_COUNT = 8;

inline constexpr std::array<EditorRow, EDITOR_ROW_COUNT> EDITOR_ROWS = {
    EditorRow::TimePicker, EditorRow::Repeat, EditorRow::Type,           EditorRow::Volume,
    EditorRow::Tone,       EditorRow::Snooze, EditorRow::IncreaseVolume, EditorRow::Name,
};

// The rows of an alarm that makes a sound.
inline constexpr std::array<EditorRow, 3> SOUND_ROWS = {
    EditorRow::Volume,
    EditorRow::Tone,
    EditorRow::IncreaseVolume,
};

// The rows that are there, by their place.
using EditorRowSet = std::bitset<EDITOR_ROW_COUNT>;

constexpr std::size_t placeOf(EditorRow row) {
    return static_cast<std::size_t>(row);
}

// True when an alarm of an alert type has a row.
bool hasRow(EditorRow row, int alertType);

// The nearest row above a row's place that is there.
std::optional<EditorRow> rowAbove(EditorRow row, const EditorRowSet& present);

// What a newly chosen alert type does to the rows of sound.
enum class SoundRowsChange {
    None,
    Insert,
    RefreshIcon, // They stay; the volume row's icon depends on the type.
    Remove,
};

SoundRowsChange soundRowsChange(int alertType, const EditorRowSet& present);

} // namespace rules
