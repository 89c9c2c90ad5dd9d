// The common part of unbounded lines and bounded segments: a point and a direction.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGeCurve2d.h"
#include "platform/host/ge/HsGePoint2d.h"
#include "platform/host/ge/HsGeVector2d.h"

class HsGeLine2d;

class HsGeLinearEnt2d : public HsGeCurve2d {
public:
    HsGePoint2d pointOnLine() const { return m_origin; }
    // The unit direction, or the zero vector for a segment of no length.
    HsGeVector2d direction() const { return m_span.normal(); }

    // The unbounded line through point perpendicular to this entity.
    void getPerpLine(const HsGePoint2d& point, HsGeLine2d& perpLine) const;
    // True, with the crossing in point, when the two cross; a bounded entity counts only within
    // its bounds widened by the point tolerance. Parallel entities, overlapping or not, and
    // entities of no length do not cross.
    bool intersectWith(const HsGeLinearEnt2d& other, HsGePoint2d& point,
                       const HsGeTol& tol = HsGeContext::gTol) const;
    // The sine of the angle between the two directions is within the vector tolerance.
    bool isParallelTo(const HsGeLinearEnt2d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    HsGePoint2d closestPointTo(const HsGePoint2d& point,
                               const HsGeTol& tol = HsGeContext::gTol) const override;

protected:
    HsGeLinearEnt2d(const HsGePoint2d& origin, const HsGeVector2d& span)
        : m_origin(origin), m_span(span) {}

    // Whether the entity holds the point at parameter (origin + param * span), with the
    // tolerance as a distance along the entity.
    virtual bool holdsParameter(double param, const HsGeTol& tol) const = 0;
    // The parameter of the entity's point nearest to the one at param.
    virtual double clampParameter(double param) const = 0;
    virtual HsGePoint2d pointAtParameter(double param) const { return m_origin + m_span * param; }

    // For a segment the span runs from its start to its end point, so parameters 0 and 1 are
    // its ends; for a line only the direction of the span counts.
    HsGePoint2d m_origin;
    HsGeVector2d m_span;
};
