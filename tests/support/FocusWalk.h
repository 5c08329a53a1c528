/**
 * @file
 * @brief A screen used without a finger.
 */
#pragma once

#include <string>
#include <vector>

#include "support/Ring.h"
#include "support/Stage.h"

/** What somebody without a finger uses. */
enum class Hand {
    Keys,  ///< Tab, Shift and Tab, Return, and the arrows while something is turned.
    Bezel, ///< Steps and presses of the bezel.
};

/** "Keys" or "Bezel", for the names of tests. */
std::string nameOf(Hand hand);

/** Leads the focus over a screen by keys alone, or by the bezel alone. */
class FocusWalk {
public:
    FocusWalk(Stage& stage, Hand hand) : _stage(stage), _hand(hand) {}

    void next();
    void previous();
    void press();
    /** Changes what is being turned by one. */
    void turn();

    /** The name of what has the focus; "-" for nothing. */
    std::string focused() const { return ringedName(_stage); }
    /** Goes on until something of a name has the focus; fails the test when nothing has. */
    bool goTo(const std::string& name, int direction = 1);
    /** The names of all that the focus comes by until it stays; each must be seen. */
    std::vector<std::string> walk(int direction);
    /** All that can have the focus from the first to the last; on the way back it must be the same.
     */
    std::vector<std::string> everything();
    /** Fails the test unless a person sees where the focus is, and reads what has it. */
    void expectVisible(const Ringed& thing);

private:
    void go(int direction) { direction > 0 ? next() : previous(); }

    Stage& _stage;
    Hand _hand;
};
