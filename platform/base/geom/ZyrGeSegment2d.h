// One edge of a profile ring: a straight line or a circular arc, held as start, end and bulge.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGePoint2d.h"

class HsGeCurve2d;
class HsGeCircArc2d;
class HsGeMatrix3d;
class ZyrGeBoundBox3d;

class ZyrGeSegment2d {
public:
    // What two segments have in common: up to two single points, or a shared stretch.
    struct Contact {
        int count = 0;
        HsGePoint2d points[2];
        bool overlapping = false;
    };

    ZyrGeSegment2d() = default;
    // The bulge is the tangent of a quarter of the arc's signed included angle: 0 is a line,
    // positive runs counter-clockwise, 1 is a half circle.
    ZyrGeSegment2d(const HsGePoint2d& start, const HsGePoint2d& end, double bulge = 0.0);
    // Takes the curve over: a line segment or a circular arc, kept as its start, end and bulge;
    // the curve is deleted here. Throws HsAssertionViolation for a null or unbounded curve.
    explicit ZyrGeSegment2d(HsGeCurve2d* curve);

    HsGePoint2d startPoint() const { return m_start; }
    HsGePoint2d endPoint() const { return m_end; }
    double bulge() const { return m_bulge; }
    bool isArc() const { return m_bulge != 0.0; }
    // The arc of an arc segment; false for a line or for an arc whose ends coincide.
    bool getArc(HsGeCircArc2d& arc) const;

    double length() const;
    // The signed area between the arc and its chord: positive for a counter-clockwise arc, which
    // bulges out of a counter-clockwise ring; 0 for a line.
    double arcArea() const;
    // This segment's share of its ring's signed area, with the shoelace term taken relative to
    // origin so that far-off coordinates keep their digits.
    double areaContribution(const HsGePoint2d& origin) const;
    // Whether every coordinate and the bulge are finite numbers.
    bool isFinite() const;

    // Runs the other way: ends exchanged, bulge negated.
    void reverse();
    // The ends move with the matrix (at z = 0; z is dropped). An arc becomes the arc through the
    // images of its ends and middle: exact under rotation, uniform scale and mirror, and the
    // nearest circle under a stretch, which would make an ellipse of it.
    void transformBy(const HsGeMatrix3d& matrix);
    // Takes in the ends and, for an arc, the extreme points of its circle that it passes.
    void addExtents(ZyrGeBoundBox3d& box) const;
    Contact intersectWith(const ZyrGeSegment2d& other,
                          const HsGeTol& tol = HsGeContext::gTol) const;

private:
    Contact localIntersectWith(const ZyrGeSegment2d& other, const HsGeTol& tol) const;

    HsGePoint2d m_start;
    HsGePoint2d m_end;
    double m_bulge = 0.0;
};
