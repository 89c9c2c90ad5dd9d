// One edge of a profile ring: a straight line or a circular arc, held as start, end and bulge.
#include "platform/base/geom/ZyrGeSegment2d.h"

#include "platform/base/geom/ZyrAngle.h"
#include "platform/base/geom/ZyrGeBoundBox3d.h"
#include "platform/base/geom/ZyrGeometryTools.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeLineSeg2d.h"
#include "platform/host/ge/HsGeMatrix3d.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <algorithm>
#include <cmath>
#include <memory>

namespace {

double includedAngleOfBulge(double bulge) {
    return 4.0 * std::atan(std::abs(bulge));
}

HsGePoint2d transformed(const HsGePoint2d& point, const HsGeMatrix3d& matrix) {
    return (matrix * HsGePoint3d(point.x, point.y, 0.0)).convert2d();
}

// Two points on a segment (line or arc) come from the same carrier; both tests below answer
// whether a point found on the carrier also lies within the segment's bounds.
bool lineHolds(const HsGePoint2d& start, const HsGePoint2d& end, const HsGePoint2d& point,
               const HsGeTol& tol) {
    const HsGeVector2d span = end - start;
    const double along = (point - start).dotProduct(span) / span.length();
    return along >= -tol.equalPoint() && along <= span.length() + tol.equalPoint();
}

bool arcHolds(const HsGeCircArc2d& arc, const HsGePoint2d& point, const HsGeTol& tol) {
    const HsGeVector2d fromCenter = point - arc.center();
    return arc.spansAngle(std::atan2(fromCenter.y, fromCenter.x)) ||
           point.isEqualTo(arc.startPoint(), tol) || point.isEqualTo(arc.endPoint(), tol);
}

void addContact(ZyrGeSegment2d::Contact& contact, const HsGePoint2d& point) {
    contact.points[contact.count++] = point;
}

ZyrGeSegment2d::Contact lineWithLine(const HsGePoint2d& a0, const HsGePoint2d& a1,
                                     const HsGePoint2d& b0, const HsGePoint2d& b1,
                                     const HsGeTol& tol) {
    ZyrGeSegment2d::Contact contact;
    const HsGeLineSeg2d first(a0, a1);
    const HsGeLineSeg2d second(b0, b1);
    if (!first.isParallelTo(second, tol)) {
        HsGePoint2d point;
        if (first.intersectWith(second, point, tol)) {
            addContact(contact, point);
        }
        return contact;
    }
    const HsGeVector2d direction = first.direction();
    if (std::abs(direction.crossProduct(b0 - a0)) > tol.equalPoint()) {
        return contact;
    }
    // Collinear: compare the stretches as distances along the first segment.
    const double firstEnd = first.length();
    const double along0 = (b0 - a0).dotProduct(direction);
    const double along1 = (b1 - a0).dotProduct(direction);
    const double low = std::max(0.0, std::min(along0, along1));
    const double high = std::min(firstEnd, std::max(along0, along1));
    if (high - low > tol.equalPoint()) {
        contact.overlapping = true;
    } else if (high - low >= -tol.equalPoint()) {
        addContact(contact, a0 + direction * ((low + high) / 2.0));
    }
    return contact;
}

ZyrGeSegment2d::Contact lineWithArc(const HsGePoint2d& start, const HsGePoint2d& end,
                                    const HsGeCircArc2d& arc, const HsGeTol& tol) {
    ZyrGeSegment2d::Contact contact;
    // The line's points start + t * unit against the circle, relative to the line's start.
    const HsGeVector2d unit = (end - start).normal(tol);
    const HsGeVector2d toCenter = arc.center() - start;
    const double foot = toCenter.dotProduct(unit);
    const double offset = toCenter.crossProduct(unit);
    const double gap = std::abs(offset) - arc.radius();
    if (gap > tol.equalPoint()) {
        return contact;
    }
    const double halfChord =
        gap >= -tol.equalPoint() ? 0.0 : std::sqrt(arc.radius() * arc.radius() - offset * offset);
    const double candidates[2] = {foot - halfChord, foot + halfChord};
    const int candidateCount = halfChord == 0.0 ? 1 : 2;
    for (int index = 0; index < candidateCount; ++index) {
        const HsGePoint2d point = start + unit * candidates[index];
        if (lineHolds(start, end, point, tol) && arcHolds(arc, point, tol)) {
            addContact(contact, point);
        }
    }
    return contact;
}

bool sameCircleOverlap(const HsGeCircArc2d& first, const HsGeCircArc2d& second,
                       const HsGeTol& tol) {
    // Two stretches of one circle share more than a point exactly when an end of either lies
    // strictly inside the other, or they are the same stretch, whose middle then lies in both.
    const double margin = tol.equalPoint() / first.radius();
    const auto strictlyInside = [margin](const HsGeCircArc2d& arc, double angle) {
        const double turned = arc.isClockWise() ? arc.startAng() - angle : angle - arc.startAng();
        const double wrapped =
            std::fmod(std::fmod(turned, ZyrAngle::kTwoPi) + ZyrAngle::kTwoPi, ZyrAngle::kTwoPi);
        return wrapped > margin && wrapped < arc.includedAngle() - margin;
    };
    const auto endInside = [&strictlyInside](const HsGeCircArc2d& arc, const HsGeCircArc2d& other) {
        return strictlyInside(arc, other.startAng()) || strictlyInside(arc, other.endAng());
    };
    const double halfOfSecond = second.includedAngle() / 2.0;
    const double middleOfSecond =
        second.startAng() + (second.isClockWise() ? -halfOfSecond : halfOfSecond);
    return endInside(first, second) || endInside(second, first) ||
           strictlyInside(first, middleOfSecond);
}

ZyrGeSegment2d::Contact arcWithArc(const HsGeCircArc2d& first, const HsGeCircArc2d& second,
                                   const HsGeTol& tol) {
    ZyrGeSegment2d::Contact contact;
    const HsGeVector2d between = second.center() - first.center();
    const double distance = between.length();
    const double r1 = first.radius();
    const double r2 = second.radius();
    if (distance <= tol.equalPoint() && std::abs(r1 - r2) <= tol.equalPoint()) {
        contact.overlapping = sameCircleOverlap(first, second, tol);
        for (const HsGePoint2d& end : {second.startPoint(), second.endPoint()}) {
            if (!contact.overlapping && contact.count < 2 && arcHolds(first, end, tol)) {
                addContact(contact, end);
            }
        }
        return contact;
    }
    if (distance > r1 + r2 + tol.equalPoint() || distance < std::abs(r1 - r2) - tol.equalPoint() ||
        distance <= tol.equalPoint()) {
        return contact;
    }
    const double along = (r1 * r1 - r2 * r2 + distance * distance) / (2.0 * distance);
    const double across = std::sqrt(std::max(0.0, r1 * r1 - along * along));
    const HsGeVector2d unit = between / distance;
    const HsGePoint2d base = first.center() + unit * along;
    const HsGePoint2d candidates[2] = {base + unit.perpVector() * across,
                                       base - unit.perpVector() * across};
    const int candidateCount = across <= tol.equalPoint() ? 1 : 2;
    for (int index = 0; index < candidateCount; ++index) {
        if (arcHolds(first, candidates[index], tol) && arcHolds(second, candidates[index], tol)) {
            addContact(contact, candidates[index]);
        }
    }
    return contact;
}

} // namespace

ZyrGeSegment2d::ZyrGeSegment2d(const HsGePoint2d& start, const HsGePoint2d& end, double bulge)
    : m_start(start), m_end(end), m_bulge(bulge) {}

ZyrGeSegment2d::ZyrGeSegment2d(HsGeCurve2d* curve) {
    const std::unique_ptr<HsGeCurve2d> owned(curve);
    if (owned == nullptr) {
        throw HsAssertionViolation("ZyrGeSegment2d of a null curve");
    }
    switch (owned->type()) {
    case HsGe::kLineSeg2d: {
        const auto* line = static_cast<const HsGeLineSeg2d*>(owned.get());
        *this = ZyrGeSegment2d(line->startPoint(), line->endPoint());
        return;
    }
    case HsGe::kCircArc2d: {
        const auto* arc = static_cast<const HsGeCircArc2d*>(owned.get());
        *this = ZyrGeSegment2d(arc->startPoint(), arc->endPoint(), arc->bulge());
        return;
    }
    case HsGe::kLine2d:
        throw HsAssertionViolation("ZyrGeSegment2d of an unbounded line");
    }
}

bool ZyrGeSegment2d::getArc(HsGeCircArc2d& arc) const {
    return isArc() && arc.setFromBulge(m_start, m_end, m_bulge);
}

double ZyrGeSegment2d::length() const {
    const double chord = m_start.distanceTo(m_end);
    if (!isArc()) {
        return chord;
    }
    // Arc over chord is (a/2) / sin(a/2), which tends to 1 as the arc flattens.
    const double halfAngle = includedAngleOfBulge(m_bulge) / 2.0;
    return chord * halfAngle / std::sin(halfAngle);
}

double ZyrGeSegment2d::arcArea() const {
    if (!isArc()) {
        return 0.0;
    }
    const double chord = m_start.distanceTo(m_end);
    const double b = std::abs(m_bulge);
    const double radius = chord * (1.0 + b * b) / (4.0 * b);
    const double area = ZyrGeometryTools::circularSegmentArea(radius, includedAngleOfBulge(b));
    return m_bulge > 0.0 ? area : -area;
}

double ZyrGeSegment2d::areaContribution(const HsGePoint2d& origin) const {
    return (m_start - origin).crossProduct(m_end - origin) / 2.0 + arcArea();
}

bool ZyrGeSegment2d::isFinite() const {
    return std::isfinite(m_start.x) && std::isfinite(m_start.y) && std::isfinite(m_end.x) &&
           std::isfinite(m_end.y) && std::isfinite(m_bulge);
}

void ZyrGeSegment2d::reverse() {
    std::swap(m_start, m_end);
    m_bulge = -m_bulge;
}

void ZyrGeSegment2d::transformBy(const HsGeMatrix3d& matrix) {
    HsGeCircArc2d arc;
    const bool wasArc = getArc(arc);
    m_start = transformed(m_start, matrix);
    m_end = transformed(m_end, matrix);
    if (!wasArc) {
        return;
    }
    // The arc through the images of its ends and its middle: the same arc under a similarity
    // (the sense turning with a mirror), and under a stretch the circle nearest to the ellipse
    // the arc would become. Ends that fall together or in line with the middle leave a line.
    const double halfAngle = arc.includedAngle() / 2.0;
    const double middleAngle = arc.startAng() + (arc.isClockWise() ? -halfAngle : halfAngle);
    const HsGePoint2d middle = transformed(
        arc.center() + HsGeVector2d(std::cos(middleAngle), std::sin(middleAngle)) * arc.radius(),
        matrix);
    m_bulge = arc.set(m_start, middle, m_end) ? arc.bulge() : 0.0;
}

void ZyrGeSegment2d::addExtents(ZyrGeBoundBox3d& box) const {
    box.addPoint({m_start.x, m_start.y, 0.0});
    box.addPoint({m_end.x, m_end.y, 0.0});
    HsGeCircArc2d arc;
    if (!getArc(arc)) {
        return;
    }
    for (int quarter = 0; quarter < 4; ++quarter) {
        const double angle = quarter * ZyrAngle::kHalfPi;
        if (arc.spansAngle(angle)) {
            const HsGePoint2d extreme =
                arc.center() + HsGeVector2d(std::cos(angle), std::sin(angle)) * arc.radius();
            box.addPoint({extreme.x, extreme.y, 0.0});
        }
    }
}

ZyrGeSegment2d::Contact ZyrGeSegment2d::intersectWith(const ZyrGeSegment2d& other,
                                                      const HsGeTol& tol) const {
    // Worked out with this segment's start as the origin: the shift is exact for nearby points,
    // and a crossing at a joint far from the origin then comes back as the joint itself.
    const HsGeVector2d shift = m_start.asVector();
    const ZyrGeSegment2d here(m_start - shift, m_end - shift, m_bulge);
    const ZyrGeSegment2d there(other.m_start - shift, other.m_end - shift, other.m_bulge);
    Contact contact = here.localIntersectWith(there, tol);
    for (int index = 0; index < contact.count; ++index) {
        contact.points[index] += shift;
    }
    return contact;
}

ZyrGeSegment2d::Contact ZyrGeSegment2d::localIntersectWith(const ZyrGeSegment2d& other,
                                                           const HsGeTol& tol) const {
    HsGeCircArc2d arc;
    HsGeCircArc2d otherArc;
    const bool arcHere = getArc(arc);
    const bool arcThere = other.getArc(otherArc);
    if (arcHere && arcThere) {
        return arcWithArc(arc, otherArc, tol);
    }
    if (arcHere) {
        return lineWithArc(other.m_start, other.m_end, arc, tol);
    }
    if (arcThere) {
        return lineWithArc(m_start, m_end, otherArc, tol);
    }
    return lineWithLine(m_start, m_end, other.m_start, other.m_end, tol);
}
