/**
 * @file
 * @brief What the face shows of the focus that keys and the bezel lead.
 */
#pragma once

#include <string>
#include <vector>

#include "support/Stage.h"

/** Something with a ring round it. */
struct Ringed {
    std::string name; ///< Its first text, else what a button is called, else its widget's type.
    std::string type; ///< Of the closest widget.
    Evas_Object* edje = nullptr;
    Evas_Object* ring = nullptr; ///< What draws the ring.
    Area area;
};

/** Everything that is ringed and in sight. */
std::vector<Ringed> ringed(const Stage& stage);

/** The only ringed thing; fails the test when there is none, or more than one. */
Ringed theRinged(const Stage& stage);

/** The same, by its name alone; "-" for none. */
std::string ringedName(const Stage& stage);
