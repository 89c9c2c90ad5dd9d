// An unbounded straight line in the plane.
#include "platform/host/ge/HsGeLine2d.h"

HsGeLine2d::HsGeLine2d() : HsGeLinearEnt2d(HsGePoint2d::kOrigin, HsGeVector2d::kXAxis) {}

HsGeLine2d::HsGeLine2d(const HsGePoint2d& first, const HsGePoint2d& second)
    : HsGeLinearEnt2d(first, second - first) {}

HsGeLine2d::HsGeLine2d(const HsGePoint2d& point, const HsGeVector2d& direction)
    : HsGeLinearEnt2d(point, direction) {}

HsGeLine2d& HsGeLine2d::set(const HsGePoint2d& first, const HsGePoint2d& second) {
    return set(first, second - first);
}

HsGeLine2d& HsGeLine2d::set(const HsGePoint2d& point, const HsGeVector2d& direction) {
    m_origin = point;
    m_span = direction;
    return *this;
}
