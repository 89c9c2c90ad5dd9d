// The common part of unbounded lines and bounded segments: a point and a direction.
#include "platform/host/ge/HsGeLinearEnt2d.h"

#include "platform/host/ge/HsGeLine2d.h"

void HsGeLinearEnt2d::getPerpLine(const HsGePoint2d& point, HsGeLine2d& perpLine) const {
    perpLine.set(point, m_span.perpVector());
}

bool HsGeLinearEnt2d::intersectWith(const HsGeLinearEnt2d& other, HsGePoint2d& point,
                                    const HsGeTol& tol) const {
    if (m_span.isZeroLength(tol) || other.m_span.isZeroLength(tol) || isParallelTo(other, tol)) {
        return false;
    }
    // Solved relative to this entity's origin, so that far-off coordinates keep their digits.
    const HsGeVector2d between = other.m_origin - m_origin;
    const double denominator = m_span.crossProduct(other.m_span);
    const double param = between.crossProduct(other.m_span) / denominator;
    const double otherParam = between.crossProduct(m_span) / denominator;
    if (!holdsParameter(param, tol) || !other.holdsParameter(otherParam, tol)) {
        return false;
    }
    point = pointAtParameter(param);
    return true;
}

bool HsGeLinearEnt2d::isParallelTo(const HsGeLinearEnt2d& other, const HsGeTol& tol) const {
    return m_span.isParallelTo(other.m_span, tol);
}

HsGePoint2d HsGeLinearEnt2d::closestPointTo(const HsGePoint2d& point, const HsGeTol& tol) const {
    if (m_span.isZeroLength(tol)) {
        return m_origin;
    }
    const double param = (point - m_origin).dotProduct(m_span) / m_span.lengthSqrd();
    return pointAtParameter(clampParameter(param));
}
