// A curve in the plane: a line, a segment or a circular arc.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGeEntity2d.h"
#include "platform/host/ge/HsGePoint2d.h"

class HsGeCurve2d : public HsGeEntity2d {
public:
    // The point of the curve nearest to point, within the curve's bounds.
    virtual HsGePoint2d closestPointTo(const HsGePoint2d& point,
                                       const HsGeTol& tol = HsGeContext::gTol) const = 0;

protected:
    HsGeCurve2d() = default;
};
