/**
 * @file
 * @brief How keys and the bezel lead the focus. No toolkit.
 */
#pragma once

#include <cstddef>
#include <ctime>
#include <optional>
#include <vector>

namespace host {

/** What can have the focus. */
enum class FocusKind {
    Button,
    Row,   ///< A row of a list that is pressed as a whole.
    Wheel, ///< A column of a time picker.
    Slider,
    Calendar, ///< The days of a calendar.
    Index,    ///< Letters or hours that lead through a list.
    Field,    ///< A line to type into.
};

enum class FocusInput {
    StepForth,
    StepBack,
    Press,
    Tab,
    BackTab,
    Up,
    Down,
    Left,
    Right,
    Enter,
    Space,
    Hold, ///< A press that rests.
};

enum class FocusAction {
    PassOn, ///< Not for the focus: the toolkit may have it.
    First,
    Last,
    Nearest, ///< What lies nearest to the middle of the face.
    Next,
    Previous,
    Activate,
    Hold, ///< As a finger that rests on it.
    StartTurning,
    StopTurning,
    Turn,
    StartTyping,
};

struct FocusState {
    std::optional<FocusKind> kind; ///< Of what has the focus; nothing when there is none.
    bool turning = false;          ///< Steps change its value.
    bool typing = false;           ///< Characters go to it.
    bool mirrored = false;         ///< Text runs from right to left.
};

struct FocusResponse {
    FocusAction action = FocusAction::PassOn;
    int turn = 0; ///< For Turn: values, or days.

    bool operator==(const FocusResponse&) const = default;
};

/** @brief What an input means. */
FocusResponse respond(const FocusState& state, FocusInput input);

/** @brief True when steps can change its value. */
bool canTurn(FocusKind kind);

struct FocusBox {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;

    int middleX() const { return x + width / 2; }
    int middleY() const { return y + height / 2; }
    bool contains(int px, int py) const {
        return px >= x && px < x + width && py >= y && py < y + height;
    }
};

/** @brief Positions in the order of reading: line by line, along the text. */
std::vector<std::size_t> readingOrder(const std::vector<FocusBox>& boxes, bool mirrored);

/** @brief The box whose middle is nearest to a point, the first of those that are about as near. */
std::optional<std::size_t> nearestBox(const std::vector<FocusBox>& boxes, int x, int y);

/**
 * @brief The day that a turn leads to.
 *
 * When the calendar shows another month than the one of the selected day, the first turn enters
 * that month from its nearer end.
 * @param displayed Its month and year count.
 */
std::tm dayAfterTurn(const std::tm& selected, const std::tm& displayed, int days);

/** @brief Where a slider stands after a turn: whole numbers where its range has several. */
double levelAfterTurn(double level, double least, double most, double step, int turn);

} // namespace host
