#include "host/widgets/FocusRules.h"

#include <string>

#include <gtest/gtest.h>

using host::FocusAction;
using host::FocusBox;
using host::FocusInput;
using host::FocusKind;
using host::FocusState;

namespace {

struct Row {
    const char* what;
    FocusState state;
    FocusInput input;
    FocusAction action;
    int turn = 0;
};

constexpr FocusState NOTHING{};
constexpr FocusState on(FocusKind kind, bool turning = false, bool typing = false,
                        bool mirrored = false) {
    return {kind, turning, typing, mirrored};
}

const Row ROWS[] = {
    {"keys begin at the first", NOTHING, FocusInput::Tab, FocusAction::First},
    {"and backwards at the last", NOTHING, FocusInput::BackTab, FocusAction::Last},
    {"the bezel begins in the middle", NOTHING, FocusInput::StepForth, FocusAction::Nearest},
    {"in both directions", NOTHING, FocusInput::StepBack, FocusAction::Nearest},
    {"so do arrows", NOTHING, FocusInput::Down, FocusAction::Nearest},
    {"nothing is pressed", NOTHING, FocusInput::Press, FocusAction::PassOn},
    {"nor by the keyboard", NOTHING, FocusInput::Enter, FocusAction::PassOn},

    {"step", on(FocusKind::Button), FocusInput::StepForth, FocusAction::Next},
    {"step back", on(FocusKind::Row), FocusInput::StepBack, FocusAction::Previous},
    {"press a button", on(FocusKind::Button), FocusInput::Press, FocusAction::Activate},
    {"space on a row", on(FocusKind::Row), FocusInput::Space, FocusAction::Activate},
    {"hold a row", on(FocusKind::Row), FocusInput::Hold, FocusAction::Hold},
    {"nothing else is held", on(FocusKind::Button), FocusInput::Hold, FocusAction::PassOn},
    {"a field's own key", on(FocusKind::Field, false, true), FocusInput::Hold, FocusAction::PassOn},
    {"nothing is held", NOTHING, FocusInput::Hold, FocusAction::PassOn},
    {"down a list", on(FocusKind::Row), FocusInput::Down, FocusAction::Next},
    {"up a list", on(FocusKind::Row), FocusInput::Up, FocusAction::Previous},
    {"right", on(FocusKind::Button), FocusInput::Right, FocusAction::Next},
    {"right, mirrored", on(FocusKind::Button, false, false, true), FocusInput::Right,
     FocusAction::Previous},

    {"a step passes a wheel", on(FocusKind::Wheel), FocusInput::StepForth, FocusAction::Next},
    {"a press takes hold of it", on(FocusKind::Wheel), FocusInput::Press,
     FocusAction::StartTurning},
    {"a step turns it", on(FocusKind::Wheel, true), FocusInput::StepForth, FocusAction::Turn, 1},
    {"back", on(FocusKind::Wheel, true), FocusInput::StepBack, FocusAction::Turn, -1},
    {"a press lets go", on(FocusKind::Wheel, true), FocusInput::Press, FocusAction::StopTurning},
    {"Tab leaves it", on(FocusKind::Wheel, true), FocusInput::Tab, FocusAction::Next},
    {"Up is the value above", on(FocusKind::Wheel), FocusInput::Up, FocusAction::Turn, -1},
    {"Down the one below", on(FocusKind::Wheel), FocusInput::Down, FocusAction::Turn, 1},
    {"wheels stand from left to right", on(FocusKind::Wheel, false, false, true), FocusInput::Right,
     FocusAction::Next},

    {"louder", on(FocusKind::Slider), FocusInput::Right, FocusAction::Turn, 1},
    {"louder, mirrored", on(FocusKind::Slider, false, false, true), FocusInput::Left,
     FocusAction::Turn, 1},
    {"past a slider", on(FocusKind::Slider), FocusInput::Down, FocusAction::Next},
    {"up is louder while it is held", on(FocusKind::Slider, true), FocusInput::Up,
     FocusAction::Turn, 1},

    {"a day", on(FocusKind::Calendar), FocusInput::Right, FocusAction::Turn, 1},
    {"a day, mirrored", on(FocusKind::Calendar, false, false, true), FocusInput::Right,
     FocusAction::Turn, -1},
    {"a week", on(FocusKind::Calendar), FocusInput::Down, FocusAction::Turn, 7},
    {"a week back", on(FocusKind::Calendar), FocusInput::Up, FocusAction::Turn, -7},
    {"a step past the days", on(FocusKind::Calendar), FocusInput::StepForth, FocusAction::Next},
    {"a step among the days", on(FocusKind::Calendar, true), FocusInput::StepForth,
     FocusAction::Turn, 1},

    {"an hour of the index", on(FocusKind::Index), FocusInput::Down, FocusAction::Turn, 1},

    {"a press opens a field", on(FocusKind::Field), FocusInput::Press, FocusAction::StartTyping},
    {"blanks are typed", on(FocusKind::Field, false, true), FocusInput::Space, FocusAction::PassOn},
    {"Return is the field's", on(FocusKind::Field, false, true), FocusInput::Enter,
     FocusAction::PassOn},
    {"the cursor moves", on(FocusKind::Field, false, true), FocusInput::Left, FocusAction::PassOn},
    {"Tab leaves a field", on(FocusKind::Field, false, true), FocusInput::Tab, FocusAction::Next},
    {"so does Down", on(FocusKind::Field, false, true), FocusInput::Down, FocusAction::Next},
};

TEST(FocusRulesTest, EachInputMeansOneThing) {
    for (const Row& row : ROWS) {
        const host::FocusResponse response = respond(row.state, row.input);
        EXPECT_EQ(response.action, row.action) << row.what;
        EXPECT_EQ(response.turn, row.turn) << row.what;
    }
}

using Order = std::vector<std::size_t>;

TEST(FocusRulesTest, ReadingGoesLineByLineAlongTheText) {
    // Two title buttons of unlike heights, a list, and a button over its lower end.
    const std::vector<FocusBox> page = {
        {0, 84, 360, 276}, {190, 36, 90, 48}, {80, 40, 90, 40}, {0, 300, 360, 60}};
    EXPECT_EQ(host::readingOrder(page, false), (Order{2, 1, 0, 3}));
    EXPECT_EQ(host::readingOrder(page, true), (Order{1, 2, 0, 3}));
    EXPECT_EQ(host::readingOrder({}, false), Order{});
    EXPECT_EQ(host::readingOrder({{0, 50, 0, 0}, {0, 50, 0, 0}, {0, 10, 0, 0}}, false),
              (Order{2, 0, 1}))
        << "what is not laid out yet has no size";
}

TEST(FocusRulesTest, TheNearestToTheMiddleIsTheFirstOfThoseAboutAsNear) {
    const std::vector<FocusBox> wheels = {{50, 100, 115, 160}, {194, 100, 116, 160}};
    EXPECT_EQ(host::nearestBox(wheels, 180, 180), 0U);
    EXPECT_EQ(host::nearestBox({{0, 0, 10, 10}, {100, 170, 100, 20}}, 180, 180), 1U);
    EXPECT_EQ(host::nearestBox({}, 180, 180), std::nullopt);
}

std::string dayAfter(int year, int month, int day, int shownYear, int shownMonth, int days) {
    std::tm selected{};
    selected.tm_year = year - 1900;
    selected.tm_mon = month - 1;
    selected.tm_mday = day;
    std::tm displayed{};
    displayed.tm_year = shownYear - 1900;
    displayed.tm_mon = shownMonth - 1;
    displayed.tm_mday = 1;
    const std::tm next = host::dayAfterTurn(selected, displayed, days);
    char text[16];
    std::strftime(text, sizeof text, "%Y-%m-%d", &next);
    return text;
}

TEST(FocusRulesTest, ATurnOfACalendarCrossesMonths) {
    EXPECT_EQ(dayAfter(2026, 11, 18, 2026, 11, 1), "2026-11-19");
    EXPECT_EQ(dayAfter(2026, 11, 30, 2026, 11, 1), "2026-12-01");
    EXPECT_EQ(dayAfter(2026, 12, 28, 2026, 12, 7), "2027-01-04");
    EXPECT_EQ(dayAfter(2024, 3, 1, 2024, 3, -1), "2024-02-29");
    EXPECT_EQ(dayAfter(2026, 11, 18, 2027, 1, 1), "2027-01-01") << "the month that is shown";
    EXPECT_EQ(dayAfter(2026, 11, 18, 2026, 9, -7), "2026-09-30");
}

TEST(FocusRulesTest, ASliderMovesByWholeLevels) {
    EXPECT_EQ(host::levelAfterTurn(8, 0, 15, 0.05, 1), 9);
    EXPECT_EQ(host::levelAfterTurn(7.6, 0, 15, 0.05, -1), 7);
    EXPECT_EQ(host::levelAfterTurn(15, 0, 15, 0.05, 1), 15);
    EXPECT_DOUBLE_EQ(host::levelAfterTurn(0.5, 0, 1, 0.1, 1), 0.6);
}

} // namespace
