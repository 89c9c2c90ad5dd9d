// An unbounded straight line in the plane.
#pragma once

#include "platform/host/ge/HsGeLinearEnt2d.h"

class HsGeLine2d : public HsGeLinearEnt2d {
public:
    // The x axis.
    HsGeLine2d();
    HsGeLine2d(const HsGePoint2d& first, const HsGePoint2d& second);
    HsGeLine2d(const HsGePoint2d& point, const HsGeVector2d& direction);

    HsGeLine2d& set(const HsGePoint2d& first, const HsGePoint2d& second);
    HsGeLine2d& set(const HsGePoint2d& point, const HsGeVector2d& direction);

    HsGe::EntityId type() const override { return HsGe::kLine2d; }
    HsGeEntity2d* copy() const override { return new HsGeLine2d(*this); }

protected:
    bool holdsParameter(double /*param*/, const HsGeTol& /*tol*/) const override { return true; }
    double clampParameter(double param) const override { return param; }
};
