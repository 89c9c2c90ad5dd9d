// A bounded straight segment in the plane, from its start to its end point.
#include "platform/host/ge/HsGeLineSeg2d.h"

#include <algorithm>

HsGeLineSeg2d::HsGeLineSeg2d() : HsGeLinearEnt2d(HsGePoint2d::kOrigin, HsGeVector2d()) {}

HsGeLineSeg2d::HsGeLineSeg2d(const HsGePoint2d& start, const HsGePoint2d& end)
    : HsGeLinearEnt2d(start, end - start), m_end(end) {}

HsGeLineSeg2d& HsGeLineSeg2d::set(const HsGePoint2d& start, const HsGePoint2d& end) {
    return *this = HsGeLineSeg2d(start, end);
}

bool HsGeLineSeg2d::holdsParameter(double param, const HsGeTol& tol) const {
    // The tolerance is a distance; along the segment it is a fraction of the length.
    const double slack = tol.equalPoint() / length();
    return param >= -slack && param <= 1.0 + slack;
}

double HsGeLineSeg2d::clampParameter(double param) const {
    return std::clamp(param, 0.0, 1.0);
}

HsGePoint2d HsGeLineSeg2d::pointAtParameter(double param) const {
    return param == 1.0 ? m_end : m_origin + m_span * param;
}
