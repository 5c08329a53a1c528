/**
 * @file
 * @brief How a row shrinks and fades toward the rim of a round face, without a toolkit.
 *
 * Lengths are pixels from the middle of the face, positive downwards.
 */
#pragma once

#include <vector>

namespace host {

/** A part of a row that must lie inside the circle, where it would be drawn at full size. */
struct RimBox {
    double reach = 0; ///< Its greater distance from the face's vertical middle line.
    double top = 0;
    double bottom = 0;

    bool operator==(const RimBox&) const = default;
};

/** What bounds a list. */
struct RimEdges {
    double top = 0;
    double bottom = 0;
    double radius = 0; ///< Of the circle.
};

/** How a row is drawn. */
struct RimLook {
    double anchor = 0;  ///< The height that stays in place while the row shrinks.
    double scale = 1;   ///< 0..1
    double opacity = 1; ///< 0..1

    bool operator==(const RimLook&) const = default;
};

/**
 * @brief The height that stays in place: the edge of the row that is nearer to the middle.
 * @return 0 for a row that covers the middle.
 */
double rimAnchor(double top, double bottom);

/**
 * @brief The greatest scale, at most 1, at which a box that shrinks toward an anchor lies in the
 * circle.
 * @param edges What of it lies beyond the list's edges is not seen, and may be anywhere.
 */
double rimScale(const RimBox& box, double anchor, const RimEdges& edges);

/**
 * @brief How a row from `top` to `bottom` is drawn so that its boxes lie inside the circle.
 *
 * A row that would have to become too small to be read is not drawn at all.
 */
RimLook rimLook(double top, double bottom, const std::vector<RimBox>& boxes, const RimEdges& edges);

} // namespace host
