/**
 * @file
 * @brief Whether something on the face looks otherwise than before.
 */
#pragma once

#include <vector>

#include "support/Stage.h"

/** @brief A rectangle of the face as it was drawn once. */
class Look {
public:
    /** Waits until nothing moves. */
    Look(Stage& stage, const Area& area);
    Look(Stage& stage, Evas_Object* object) : Look(stage, Stage::area(object)) {}

    /** Number of pixels that differ clearly. */
    int unlike(const Look& other) const;
    /** Number of pixels in the accent colour or near it. */
    int accent() const;
    /** The brightest channel of any pixel, 0 to 255. */
    int brightest() const;
    /** The same of the darkest pixel. */
    int darkest() const;

private:
    std::vector<unsigned> _pixels;
};

/** @brief Whether it looks otherwise: this many pixels are seen at arm's length. */
inline constexpr int SEEN = 60;

/** @brief Puts the finger on the middle of an object; it stays there. */
void pressOn(Stage& stage, Evas_Object* object);
/** @brief Goes on with the Tab key until a widget is ringed. @return False when it never is. */
bool tabTo(Stage& stage, const Evas_Object* widget);
