// A closed chain of segments: one outline of a profile, adding area or, run clockwise, a hole.
#include "platform/base/geom/ZyrGeRing.h"

#include "platform/host/ge/HsGeCircArc2d.h"

namespace {

// Whether a horizontal ray from the point to the right crosses the chord; half-open in y so
// that a ray through a vertex counts it once.
bool rayCrossesChord(const HsGePoint2d& point, const HsGePoint2d& start, const HsGePoint2d& end) {
    if ((start.y > point.y) == (end.y > point.y)) {
        return false;
    }
    const double crossingX = start.x + (point.y - start.y) / (end.y - start.y) * (end.x - start.x);
    return crossingX > point.x;
}

// The region between an arc and its chord is the part of the disc on the arc's side of the
// chord, for minor and major arcs alike.
bool liesBetweenArcAndChord(const ZyrGeSegment2d& segment, const HsGePoint2d& point) {
    HsGeCircArc2d arc;
    if (!segment.getArc(arc) || point.distanceTo(arc.center()) >= arc.radius()) {
        return false;
    }
    const double side =
        (segment.endPoint() - segment.startPoint()).crossProduct(point - segment.startPoint());
    // A counter-clockwise arc bulges to the right of its chord.
    return segment.bulge() > 0.0 ? side < 0.0 : side > 0.0;
}

} // namespace

double ZyrGeRing::area() const {
    if (segments().empty()) {
        return 0.0;
    }
    const HsGePoint2d origin = segments().front()->startPoint();
    double sum = 0.0;
    for (const auto& segment : segments()) {
        sum += segment->areaContribution(origin);
    }
    return sum;
}

bool ZyrGeRing::contains(const HsGePoint2d& point) const {
    // Inside the polygon of chords, with each arc's segment region toggled: the regions of a
    // simple ring lie outside the polygon where the arc bulges out and inside where it bulges in.
    bool inside = false;
    for (const auto& segment : segments()) {
        inside ^= rayCrossesChord(point, segment->startPoint(), segment->endPoint());
        inside ^= liesBetweenArcAndChord(*segment, point);
    }
    return inside;
}
