// A bounded straight segment in the plane, from its start to its end point.
#pragma once

#include "platform/host/ge/HsGeLinearEnt2d.h"

class HsGeLineSeg2d : public HsGeLinearEnt2d {
public:
    // A segment of no length at the origin.
    HsGeLineSeg2d();
    HsGeLineSeg2d(const HsGePoint2d& start, const HsGePoint2d& end);

    HsGeLineSeg2d& set(const HsGePoint2d& start, const HsGePoint2d& end);
    HsGePoint2d startPoint() const { return m_origin; }
    // Kept exactly as given, not recomputed from start plus span.
    HsGePoint2d endPoint() const { return m_end; }
    double length() const { return m_span.length(); }

    HsGe::EntityId type() const override { return HsGe::kLineSeg2d; }
    HsGeEntity2d* copy() const override { return new HsGeLineSeg2d(*this); }

protected:
    bool holdsParameter(double param, const HsGeTol& tol) const override;
    double clampParameter(double param) const override;
    // The end point itself at 1, where start plus span could be off by a rounding far from the
    // origin.
    HsGePoint2d pointAtParameter(double param) const override;

private:
    HsGePoint2d m_end;
};
