// A closed chain of segments: one outline of a profile, adding area or, run clockwise, a hole.
#pragma once

#include "platform/base/geom/ZyrGeCompCurve2d.h"

class ZyrGeRing : public ZyrGeCompCurve2d {
public:
    // The signed area, arcs included: positive when the ring runs counter-clockwise. Summed
    // relative to the first segment's start point, so that a ring far from the origin keeps the
    // digits of the same ring near it.
    double area() const;
    // Whether the point lies inside the ring; a point on the outline may fall either way.
    bool contains(const HsGePoint2d& point) const;
};
