// A circular arc in the plane, running from its start point counter-clockwise or clockwise.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGeCurve2d.h"
#include "platform/host/ge/HsGePoint2d.h"

class HsGeCircArc2d : public HsGeCurve2d {
public:
    // The full unit circle around the origin, counter-clockwise from angle 0.
    HsGeCircArc2d();
    // From startAngle to endAngle (radians from the x axis) in the given sense; equal angles
    // give the full circle.
    HsGeCircArc2d(const HsGePoint2d& center, double radius, double startAngle, double endAngle,
                  bool isClockWise = false);
    // The arc from start through pointOnArc to end. Throws HsAssertionViolation when the three
    // points are collinear or two coincide, as no arc passes through them; set() answers instead.
    HsGeCircArc2d(const HsGePoint2d& start, const HsGePoint2d& pointOnArc, const HsGePoint2d& end);

    // False, leaving the arc as it was, when no arc passes through the three points.
    bool set(const HsGePoint2d& start, const HsGePoint2d& pointOnArc, const HsGePoint2d& end,
             const HsGeTol& tol = HsGeContext::gTol);
    // The arc from start to end whose bulge is the tangent of a quarter of its signed included
    // angle: positive runs counter-clockwise, and 1 is a half circle. False, leaving the arc as it
    // was, for a zero or non-finite bulge or coincident ends, which make no arc.
    bool setFromBulge(const HsGePoint2d& start, const HsGePoint2d& end, double bulge,
                      const HsGeTol& tol = HsGeContext::gTol);

    HsGePoint2d center() const { return m_center; }
    double radius() const { return m_radius; }
    // The angles of the start and end points around the center, in [0, 2 pi).
    double startAng() const { return m_startAngle; }
    double endAng() const;
    bool isClockWise() const { return m_sweep < 0.0; }
    // The unsigned angle the arc spans, in (0, 2 pi].
    double includedAngle() const;
    // The tangent of a quarter of the included angle, negative for a clockwise arc.
    double bulge() const;
    // Exactly the points the arc was made from, where it was made from points.
    HsGePoint2d startPoint() const { return m_start; }
    HsGePoint2d endPoint() const { return m_end; }
    double length() const;
    // Whether the direction from the center at this angle falls within the arc.
    bool spansAngle(double angle) const;

    HsGePoint2d closestPointTo(const HsGePoint2d& point,
                               const HsGeTol& tol = HsGeContext::gTol) const override;
    HsGe::EntityId type() const override { return HsGe::kCircArc2d; }
    HsGeEntity2d* copy() const override { return new HsGeCircArc2d(*this); }

private:
    HsGePoint2d pointAtAngle(double angle) const;
    void setAroundCenter(const HsGePoint2d& center, const HsGePoint2d& start,
                         const HsGePoint2d& end, double sweep);

    HsGePoint2d m_center;
    double m_radius = 1.0;
    double m_startAngle = 0.0;
    // Signed: positive counter-clockwise.
    double m_sweep = 0.0;
    HsGePoint2d m_start;
    HsGePoint2d m_end;
};
