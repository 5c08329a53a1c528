#include "rules/RepeatRows.h"

#include <climits>
#include <vector>

#include <gtest/gtest.h>

namespace {

using rules::RepeatChecks;
using rules::RepeatToggle;

/** The checks that show a weekday set. */
RepeatChecks checksOf(int weekdays) {
    RepeatChecks checks{};
    for (int row = 0; row < rules::REPEAT_ROW_COUNT; ++row)
        checks.at(static_cast<std::size_t>(row)) = rules::isRepeatRowOn(row, weekdays);
    return checks;
}

std::vector<int> rowsOf(const RepeatToggle& toggle) {
    return {toggle.rows.begin(), toggle.rows.begin() + toggle.rowCount};
}

const std::vector<int> EVERY_ROW = {0, 1, 2, 3, 4, 5, 6, 7};

struct LabelCase {
    int row;
    const char* textId;
};

class RepeatLabelTest : public testing::TestWithParam<LabelCase> {};

TEST_P(RepeatLabelTest, BelongsToTheRow) {
    EXPECT_STREQ(rules::repeatRowTextId(GetParam().row), GetParam().textId);
}

INSTANTIATE_TEST_SUITE_P(Rows, RepeatLabelTest,
                         testing::Values(LabelCase{0, "IDS_ALM_BODY_EVERYDAY"},
                                         LabelCase{1, "IDS_ALM_BODY_EVERY_SUNDAY"},
                                         LabelCase{2, "IDS_ALM_BODY_EVERY_MONDAY"},
                                         LabelCase{3, "IDS_ALM_BODY_EVERY_TUESDAY"},
                                         LabelCase{4, "IDS_ALM_BODY_EVERY_WEDNESDAY"},
                                         LabelCase{5, "IDS_ALM_BODY_EVERY_THURSDAY"},
                                         LabelCase{6, "IDS_ALM_BODY_EVERY_FRIDAY"},
                                         LabelCase{7, "IDS_ALM_BODY_EVERY_SATURDAY"},
                                         LabelCase{-1, nullptr}, LabelCase{8, nullptr},
                                         LabelCase{INT_MIN, nullptr}, LabelCase{INT_MAX, nullptr}));

struct ShownCase {
    int weekdays;
    std::vector<int> on;
};

class RepeatShownTest : public testing::TestWithParam<ShownCase> {};

TEST_P(RepeatShownTest, RowsOfTheSetAreOn) {
    std::vector<int> on;
    for (int row = 0; row < rules::REPEAT_ROW_COUNT; ++row) {
        if (rules::isRepeatRowOn(row, GetParam().weekdays))
            on.push_back(row);
    }
    EXPECT_EQ(on, GetParam().on);
}

INSTANTIATE_TEST_SUITE_P(
    Sets, RepeatShownTest,
    testing::Values(ShownCase{0, {}}, ShownCase{1, {1}}, ShownCase{2, {2}}, ShownCase{4, {3}},
                    ShownCase{8, {4}}, ShownCase{16, {5}}, ShownCase{32, {6}}, ShownCase{64, {7}},
                    ShownCase{62, {2, 3, 4, 5, 6}}, ShownCase{65, {1, 7}},
                    ShownCase{126, {2, 3, 4, 5, 6, 7}}, ShownCase{127, EVERY_ROW},
                    // Stray bits are no days, and a set with them is not "every day".
                    ShownCase{128, {}}, ShownCase{255, {1, 2, 3, 4, 5, 6, 7}},
                    ShownCase{-1, {1, 2, 3, 4, 5, 6, 7}}));

TEST(RepeatRowsTest, NoOtherRowIsOn) {
    for (const int row : {-1, 8, INT_MIN, INT_MAX})
        EXPECT_FALSE(rules::isRepeatRowOn(row, 62)) << row;
}

TEST(RepeatRowsTest, EveryDayTurnsEverythingOn) {
    for (const int weekdays : {0, 1, 62, 65, 126}) {
        const RepeatToggle toggle = rules::toggleRepeatRow(0, weekdays, checksOf(weekdays));
        EXPECT_EQ(toggle.weekdays, 127);
        EXPECT_TRUE(toggle.on);
        EXPECT_EQ(rowsOf(toggle), EVERY_ROW);
    }
}

TEST(RepeatRowsTest, EveryDayAgainTurnsEverythingOff) {
    const RepeatToggle toggle = rules::toggleRepeatRow(0, 127, checksOf(127));
    EXPECT_EQ(toggle.weekdays, 0);
    EXPECT_FALSE(toggle.on);
    EXPECT_EQ(rowsOf(toggle), EVERY_ROW);
}

struct DayCase {
    int row;
    int before;
    int after;
    bool on;
    std::vector<int> rows;
};

class RepeatDayTest : public testing::TestWithParam<DayCase> {};

TEST_P(RepeatDayTest, TurnsItsDay) {
    const DayCase& day = GetParam();
    const RepeatToggle toggle = rules::toggleRepeatRow(day.row, day.before, checksOf(day.before));
    EXPECT_EQ(toggle.weekdays, day.after);
    EXPECT_EQ(toggle.on, day.on);
    EXPECT_EQ(rowsOf(toggle), day.rows);
}

INSTANTIATE_TEST_SUITE_P(
    Days, RepeatDayTest,
    testing::Values(DayCase{1, 0, 1, true, {1}}, DayCase{2, 0, 2, true, {2}},
                    DayCase{3, 0, 4, true, {3}}, DayCase{4, 0, 8, true, {4}},
                    DayCase{5, 0, 16, true, {5}}, DayCase{6, 0, 32, true, {6}},
                    DayCase{7, 0, 64, true, {7}}, DayCase{1, 1, 0, false, {1}},
                    DayCase{7, 64, 0, false, {7}}, DayCase{4, 62, 54, false, {4}},
                    DayCase{7, 62, 126, true, {7}}, // The sixth day.
                    DayCase{1, 126, 127, true, {0, 1}}, DayCase{4, 119, 127, true, {0, 4}},
                    DayCase{7, 63, 127, true, {0, 7}}, DayCase{1, 127, 126, false, {0, 1}},
                    DayCase{7, 127, 63, false, {0, 7}}, DayCase{7, 126, 62, false, {7}}));

TEST(RepeatRowsTest, TheEveryDayRowFollowsWhicheverDayIsTheSeventh) {
    for (int row = 1; row < rules::REPEAT_ROW_COUNT; ++row) {
        const int missing = 127 - (1 << (row - 1));
        const RepeatToggle complete = rules::toggleRepeatRow(row, missing, checksOf(missing));
        EXPECT_EQ(complete.weekdays, 127);
        EXPECT_EQ(rowsOf(complete), (std::vector<int>{0, row}));
        const RepeatToggle broken = rules::toggleRepeatRow(row, 127, checksOf(127));
        EXPECT_EQ(broken.weekdays, missing);
        EXPECT_EQ(rowsOf(broken), (std::vector<int>{0, row}));
    }
}

TEST(RepeatRowsTest, EveryTapUndoesItself) {
    for (int weekdays = 0; weekdays < 128; ++weekdays) {
        for (int row = 1; row < rules::REPEAT_ROW_COUNT; ++row) {
            const int once = rules::toggleRepeatRow(row, weekdays, checksOf(weekdays)).weekdays;
            EXPECT_EQ(once ^ weekdays, 1 << (row - 1));
            EXPECT_EQ(rules::toggleRepeatRow(row, once, checksOf(once)).weekdays, weekdays);
        }
    }
}

TEST(RepeatRowsTest, TheChecksDecideNotTheSet) {
    // Sunday is in the set, but its check is off: it is added a second time.
    const RepeatToggle added = rules::toggleRepeatRow(1, 1, RepeatChecks{});
    EXPECT_EQ(added.weekdays, 2);
    EXPECT_TRUE(added.on);
    // And the other way round.
    const RepeatToggle subtracted = rules::toggleRepeatRow(1, 0, checksOf(1));
    EXPECT_EQ(subtracted.weekdays, -1);
    EXPECT_FALSE(subtracted.on);
    EXPECT_EQ(rules::toggleRepeatRow(0, 127, RepeatChecks{}).weekdays, 127);
    EXPECT_EQ(rules::toggleRepeatRow(0, 0, checksOf(127)).weekdays, 0);
}

TEST(RepeatRowsTest, TheEveryDayCheckDoesNotCountAsADay) {
    RepeatChecks checks = checksOf(62); // Five days ...
    checks.front() = true;              // ... and a wrong "every day".
    EXPECT_EQ(rowsOf(rules::toggleRepeatRow(1, 62, checks)), (std::vector<int>{1}));
}

TEST(RepeatRowsTest, AStrayBitStaysInTheSet) {
    EXPECT_EQ(rules::toggleRepeatRow(1, 128, checksOf(128)).weekdays, 129);
    EXPECT_EQ(rules::toggleRepeatRow(0, 255, checksOf(255)).weekdays, 127);
}

TEST(RepeatRowsTest, NoOtherRowDoesAnything) {
    for (const int row : {-1, 8, INT_MIN, INT_MAX}) {
        const RepeatToggle toggle = rules::toggleRepeatRow(row, 62, checksOf(62));
        EXPECT_EQ(toggle.weekdays, 62);
        EXPECT_EQ(toggle.rowCount, 0);
    }
}

} // namespace
