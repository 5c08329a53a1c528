#include "rules/EditorRows.h"

#include <initializer_list>

#include <gtest/gtest.h>

namespace {

using rules::EditorRow;
using rules::EditorRowSet;
using rules::SoundRowsChange;

EditorRowSet setOf(std::initializer_list<EditorRow> rows) {
    EditorRowSet set;
    for (const EditorRow row : rows)
        set.set(rules::placeOf(row));
    return set;
}

const EditorRowSet SILENT_ROWS = setOf({EditorRow::TimePicker, EditorRow::Repeat, EditorRow::Type,
                                        EditorRow::Snooze, EditorRow::Name});

TEST(EditorRowsTest, PlacesFollowTheDisplayOrder) {
    for (std::size_t place = 0; place < rules::EDITOR_ROW_COUNT; ++place)
        EXPECT_EQ(rules::placeOf(rules::EDITOR_ROWS.at(place)), place);
}

TEST(EditorRowsTest, AVibratingAlarmHasFiveRows) {
    EditorRowSet rows;
    for (const EditorRow row : rules::EDITOR_ROWS)
        rows.set(rules::placeOf(row), rules::hasRow(row, 1));
    EXPECT_EQ(rows, SILENT_ROWS);
}

TEST(EditorRowsTest, AnAlarmWithSoundHasEveryRow) {
    for (const EditorRow row : rules::EDITOR_ROWS) {
        EXPECT_TRUE(rules::hasRow(row, 0));
        EXPECT_TRUE(rules::hasRow(row, 2));
    }
}

TEST(EditorRowsTest, AnUnknownAlertTypeHasNoRowsOfSound) {
    for (const int type : {-1, 3, 99}) {
        EXPECT_FALSE(rules::hasRow(EditorRow::Volume, type));
        EXPECT_FALSE(rules::hasRow(EditorRow::Tone, type));
        EXPECT_FALSE(rules::hasRow(EditorRow::IncreaseVolume, type));
        EXPECT_TRUE(rules::hasRow(EditorRow::Snooze, type));
    }
}

struct AboveCase {
    EditorRow row;
    EditorRowSet present;
    std::optional<EditorRow> above;
};

class RowAboveTest : public testing::TestWithParam<AboveCase> {};

TEST_P(RowAboveTest, IsTheNearestOneThatIsThere) {
    EXPECT_EQ(rules::rowAbove(GetParam().row, GetParam().present), GetParam().above);
}

INSTANTIATE_TEST_SUITE_P(
    Places, RowAboveTest,
    testing::Values(
        AboveCase{EditorRow::TimePicker, SILENT_ROWS, std::nullopt},
        AboveCase{EditorRow::TimePicker, {}, std::nullopt},
        AboveCase{EditorRow::Name, {}, std::nullopt},
        AboveCase{EditorRow::Volume, SILENT_ROWS, EditorRow::Type},
        AboveCase{EditorRow::Tone, SILENT_ROWS, EditorRow::Type},
        AboveCase{EditorRow::Tone, SILENT_ROWS | setOf({EditorRow::Volume}), EditorRow::Volume},
        AboveCase{EditorRow::IncreaseVolume, SILENT_ROWS, EditorRow::Snooze},
        AboveCase{EditorRow::Name, SILENT_ROWS, EditorRow::Snooze},
        AboveCase{EditorRow::Name, setOf({EditorRow::TimePicker}), EditorRow::TimePicker},
        AboveCase{EditorRow::Repeat, setOf({EditorRow::Repeat, EditorRow::Name}), std::nullopt}));

struct SoundCase {
    int type;
    EditorRowSet present;
    SoundRowsChange change;
};

class SoundRowsTest : public testing::TestWithParam<SoundCase> {};

TEST_P(SoundRowsTest, FollowTheAlertType) {
    EXPECT_EQ(rules::soundRowsChange(GetParam().type, GetParam().present), GetParam().change);
}

const EditorRowSet ALL_ROWS = EditorRowSet().set();
const EditorRowSet WITHOUT_TONE = ALL_ROWS & ~setOf({EditorRow::Tone});

INSTANTIATE_TEST_SUITE_P(Types, SoundRowsTest,
                         testing::Values(SoundCase{0, SILENT_ROWS, SoundRowsChange::Insert},
                                         SoundCase{2, SILENT_ROWS, SoundRowsChange::Insert},
                                         SoundCase{0, ALL_ROWS, SoundRowsChange::RefreshIcon},
                                         SoundCase{2, ALL_ROWS, SoundRowsChange::RefreshIcon},
                                         SoundCase{0, WITHOUT_TONE, SoundRowsChange::RefreshIcon},
                                         SoundCase{1, ALL_ROWS, SoundRowsChange::Remove},
                                         SoundCase{1, SILENT_ROWS, SoundRowsChange::Remove},
                                         SoundCase{7, ALL_ROWS, SoundRowsChange::None},
                                         SoundCase{-1, SILENT_ROWS, SoundRowsChange::None}));

} // namespace
