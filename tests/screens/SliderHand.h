/**
 * @file
 * @brief A finger on a slider.
 */
#pragma once

#include <string>

#include <Elementary.h>

#include "support/Stage.h"

/** Takes hold of sliders by their knob. */
class SliderHand {
public:
    explicit SliderHand(Stage& stage) : _stage(stage) {}

    /** Where the knob is. */
    static Spot knob(Evas_Object* slider);
    /** Where the knob would stand for a value. */
    static Spot place(Evas_Object* slider, double value);

    /** Puts the finger on the knob. */
    void take(Evas_Object* slider);
    /** Moves the finger to a value, in steps; it stays down. */
    void moveTo(Evas_Object* slider, double value);
    /** Lets go. */
    void letGo();
    /** All three of it. */
    void drag(Evas_Object* slider, double value);

private:
    Stage& _stage;
    Spot _finger;
};

/** The icon of a slider, as its theme group; empty when it shows none. */
std::string iconGroupOf(Evas_Object* slider);
