// A direction and length in the plane.
#include "platform/host/ge/HsGeVector2d.h"

#include <cmath>
#include <numbers>

const HsGeVector2d HsGeVector2d::kXAxis(1.0, 0.0);
const HsGeVector2d HsGeVector2d::kYAxis(0.0, 1.0);

double HsGeVector2d::length() const {
    return std::hypot(x, y);
}

double HsGeVector2d::angleTo(const HsGeVector2d& other) const {
    // atan2 of cross and dot keeps its precision near 0 and pi, where acos of the cosine loses it.
    return std::abs(std::atan2(crossProduct(other), dotProduct(other)));
}

double HsGeVector2d::angleToCCW(const HsGeVector2d& other) const {
    const double angle = std::atan2(crossProduct(other), dotProduct(other));
    return angle < 0.0 ? angle + 2.0 * std::numbers::pi : angle;
}

HsGeVector2d HsGeVector2d::normal(const HsGeTol& tol) const {
    if (isZeroLength(tol)) {
        return {};
    }
    return *this / length();
}

bool HsGeVector2d::isZeroLength(const HsGeTol& tol) const {
    return length() <= tol.equalVector();
}

bool HsGeVector2d::isParallelTo(const HsGeVector2d& other, const HsGeTol& tol) const {
    if (isZeroLength(tol) || other.isZeroLength(tol)) {
        return false;
    }
    // The sine of the angle between the unit directions.
    return std::abs(normal(tol).crossProduct(other.normal(tol))) <= tol.equalVector();
}

bool HsGeVector2d::isEqualTo(const HsGeVector2d& other, const HsGeTol& tol) const {
    return (*this - other).length() <= tol.equalVector();
}

HsGeVector2d& HsGeVector2d::operator+=(const HsGeVector2d& v) {
    return *this = *this + v;
}
HsGeVector2d& HsGeVector2d::operator-=(const HsGeVector2d& v) {
    return *this = *this - v;
}
HsGeVector2d& HsGeVector2d::operator*=(double factor) {
    return *this = *this * factor;
}
