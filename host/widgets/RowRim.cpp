#include "RowRim.h"

#include <algorithm>
#include <cmath>

namespace host {

namespace {

/** A row fades between these scales. */
constexpr double SOLID = 0.9;
constexpr double GONE = 0.5;

/** Half of the circle's width at a height. */
double halfWidth(double height, double radius) {
    return std::abs(height) < radius ? std::sqrt(radius * radius - height * height) : 0;
}

/** The scale at which the corner (x, y), counted from the anchor, meets the circle. */
double cornerScale(double x, double y, double anchor, double radius) {
    const double away = x * x + y * y;
    const double room = radius * radius - anchor * anchor;
    if (away <= 0)
        return 1;
    return room <= 0 ? 0 : (std::sqrt(anchor * y * anchor * y + away * room) - anchor * y) / away;
}

/** The same for a corner beyond an edge of the list: what shows ends at the edge. */
double cutScale(double x, double y, double anchor, double edge, double radius) {
    const double room = halfWidth(edge, radius);
    const double scale = x <= room ? 1 : room / x;
    const bool isBeyond = std::abs(anchor + scale * y) >= std::abs(edge);
    return isBeyond && room > 0 ? scale : 0;
}

double sideScale(double x, double y, double anchor, double edge, double radius) {
    const double scale = cornerScale(x, y, anchor, radius);
    // A list that does not reach across the middle has both edges on one side of it.
    const bool sameSide = edge * (anchor + y) > 0;
    return sameSide ? std::max(scale, cutScale(x, y, anchor, edge, radius)) : scale;
}

} // namespace

double rimAnchor(double top, double bottom) {
    return std::clamp(0.0, top, std::max(top, bottom));
}

double rimScale(const RimBox& box, double anchor, const RimEdges& edges) {
    const double upper = sideScale(box.reach, box.top - anchor, anchor, edges.top, edges.radius);
    const double lower =
        sideScale(box.reach, box.bottom - anchor, anchor, edges.bottom, edges.radius);
    return std::clamp(std::min(upper, lower), 0.0, 1.0);
}

RimLook rimLook(double top, double bottom, const std::vector<RimBox>& boxes,
                const RimEdges& edges) {
    RimLook look{rimAnchor(top, bottom), 1, 1};
    for (const RimBox& box : boxes)
        look.scale = std::min(look.scale, rimScale(box, look.anchor, edges));
    look.opacity = std::clamp((look.scale - GONE) / (SOLID - GONE), 0.0, 1.0);
    return look;
}

} // namespace host
