#include "FocusRules.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace host {

namespace {

constexpr int DAYS_OF_WEEK = 7;
/** Pixels between things that lie beside each other. */
constexpr double ABOUT_AS_NEAR = 8;

FocusResponse move(FocusAction action) {
    return {action, 0};
}

FocusResponse turn(int values) {
    return {FocusAction::Turn, values};
}

FocusResponse withoutFocus(FocusInput input) {
    switch (input) {
    case FocusInput::Tab:
        return move(FocusAction::First);
    case FocusInput::BackTab:
        return move(FocusAction::Last);
    case FocusInput::Press:
    case FocusInput::Enter:
    case FocusInput::Space:
    case FocusInput::Hold:
        return move(FocusAction::PassOn);
    default:
        return move(FocusAction::Nearest);
    }
}

FocusResponse press(const FocusState& state) {
    if (canTurn(*state.kind))
        return move(state.turning ? FocusAction::StopTurning : FocusAction::StartTurning);
    return move(*state.kind == FocusKind::Field ? FocusAction::StartTyping : FocusAction::Activate);
}

/** Up and down, as -1 and 1. */
FocusResponse vertical(const FocusState& state, int direction) {
    switch (*state.kind) {
    case FocusKind::Wheel:
    case FocusKind::Index:
        return turn(direction);
    case FocusKind::Calendar:
        return turn(direction * DAYS_OF_WEEK);
    case FocusKind::Slider:
        if (state.turning)
            return turn(-direction);
        break;
    default:
        break;
    }
    return move(direction > 0 ? FocusAction::Next : FocusAction::Previous);
}

/** Left and right, as -1 and 1. */
FocusResponse horizontal(const FocusState& state, int direction) {
    const int alongText = state.mirrored ? -direction : direction;
    switch (*state.kind) {
    case FocusKind::Slider:
    case FocusKind::Calendar:
        return turn(alongText);
    case FocusKind::Wheel:
        // A time is written from left to right in every language.
        return move(direction > 0 ? FocusAction::Next : FocusAction::Previous);
    default:
        return move(alongText > 0 ? FocusAction::Next : FocusAction::Previous);
    }
}

FocusResponse step(const FocusState& state, int direction) {
    if (state.turning && canTurn(*state.kind))
        return turn(direction);
    return move(direction > 0 ? FocusAction::Next : FocusAction::Previous);
}

bool onOneLine(const FocusBox& a, const FocusBox& b) {
    const auto covers = [](const FocusBox& box, int y) {
        return y >= box.y && y < box.y + box.height;
    };
    return covers(a, b.middleY()) && covers(b, a.middleY());
}

} // namespace

bool canTurn(FocusKind kind) {
    return kind == FocusKind::Wheel || kind == FocusKind::Slider || kind == FocusKind::Calendar ||
           kind == FocusKind::Index;
}

FocusResponse respond(const FocusState& state, FocusInput input) {
    if (!state.kind)
        return withoutFocus(input);
    switch (input) {
    case FocusInput::StepForth:
        return step(state, 1);
    case FocusInput::StepBack:
        return step(state, -1);
    case FocusInput::Tab:
        return move(FocusAction::Next);
    case FocusInput::BackTab:
        return move(FocusAction::Previous);
    case FocusInput::Up:
        return vertical(state, -1);
    case FocusInput::Down:
        return vertical(state, 1);
    case FocusInput::Left:
    case FocusInput::Right:
        if (state.typing)
            return move(FocusAction::PassOn);
        return horizontal(state, input == FocusInput::Right ? 1 : -1);
    case FocusInput::Enter:
    case FocusInput::Space:
        // The field itself knows what ends its text.
        return state.typing ? move(FocusAction::PassOn) : press(state);
    case FocusInput::Press:
        return press(state);
    case FocusInput::Hold:
        return move(*state.kind == FocusKind::Row ? FocusAction::Hold : FocusAction::PassOn);
    }
    return {};
}

std::vector<std::size_t> readingOrder(const std::vector<FocusBox>& boxes, bool mirrored) {
    std::vector<std::size_t> order(boxes.size());
    std::iota(order.begin(), order.end(), 0);
    std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
        return boxes[a].middleY() < boxes[b].middleY();
    });
    for (auto line = order.begin(); line != order.end();) {
        const auto end = std::find_if(line + 1, order.end(), [&](std::size_t box) {
            return !onOneLine(boxes[*line], boxes[box]);
        });
        std::stable_sort(line, end, [&](std::size_t a, std::size_t b) {
            const int difference = boxes[a].middleX() - boxes[b].middleX();
            return mirrored ? difference > 0 : difference < 0;
        });
        line = end;
    }
    return order;
}

std::optional<std::size_t> nearestBox(const std::vector<FocusBox>& boxes, int x, int y) {
    const auto distance = [x, y](const FocusBox& box) {
        return std::hypot(box.middleX() - x, box.middleY() - y);
    };
    std::optional<std::size_t> nearest;
    for (std::size_t i = 0; i < boxes.size(); ++i)
        if (!nearest || distance(boxes[i]) + ABOUT_AS_NEAR < distance(boxes[*nearest]))
            nearest = i;
    return nearest;
}

std::tm dayAfterTurn(const std::tm& selected, const std::tm& displayed, int days) {
    std::tm day{};
    day.tm_year = displayed.tm_year;
    day.tm_mon = displayed.tm_mon;
    if (selected.tm_year == displayed.tm_year && selected.tm_mon == displayed.tm_mon)
        day.tm_mday = selected.tm_mday + days;
    else if (days > 0)
        day.tm_mday = 1;
    else
        ++day.tm_mon; // Its day 0 is the last one of the month before.
    // No hour of a day may be missing: a calendar has no summer time.
    day.tm_hour = 12;
    const std::time_t noon = timegm(&day);
    gmtime_r(&noon, &day);
    return day;
}

double levelAfterTurn(double level, double least, double most, double step, int turn) {
    const double range = most - least;
    const bool whole = range >= 2;
    const double from = whole ? std::round(level) : level;
    return std::clamp(from + turn * (whole ? 1.0 : step * range), least, most);
}

} // namespace host
