/**
 * @file
 * @brief What is drawn on the face, and where: shrunk rows, faded popups and all.
 */
#pragma once

#include <string>
#include <vector>

#include <Evas.h>

/** A rectangle on the face; a shrunk row has no whole pixels. */
struct InkArea {
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
    /** The distance of its farthest corner from the middle of the face. */
    double reach() const;
};

/** A line of text, an image, or the rectangle of a ground or a line, as far as it can be seen. */
struct Ink {
    std::string what; ///< The text, the file of the image, or the group of the rectangle.
    Evas_Object* object = nullptr;
    InkArea area;
    double opacity = 1; ///< 0..1
    bool isText = false;
    double rounding = 0; ///< Radius of its corners, when it is a pill or a rounded ring.

    /** The distance of its farthest point from the middle of the face. */
    double reach() const;
};

/**
 * @brief Everything drawn on a canvas that is not covered altogether.
 *
 * Without what has the colour of the ground, and what the theme's data "bleed" names.
 */
std::vector<Ink> inkOf(const Evas* canvas);

/** What the circle of the face cuts, of all that can be seen well; each with its place. */
std::vector<std::string> cutByCircle(const Evas* canvas);

/** Where a rectangle of an object is drawn: maps of what it is part of move and shrink it. */
InkArea drawnArea(const Evas_Object* object, InkArea area);
