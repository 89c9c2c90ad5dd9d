// A direction and length in space.
#include "platform/host/ge/HsGeVector3d.h"

#include "platform/host/ge/HsGeMatrix3d.h"

#include <cmath>

const HsGeVector3d HsGeVector3d::kXAxis(1.0, 0.0, 0.0);
const HsGeVector3d HsGeVector3d::kYAxis(0.0, 1.0, 0.0);
const HsGeVector3d HsGeVector3d::kZAxis(0.0, 0.0, 1.0);

double HsGeVector3d::length() const {
    return std::hypot(x, y, z);
}

HsGeVector3d HsGeVector3d::crossProduct(const HsGeVector3d& v) const {
    return {y * v.z - z * v.y, z * v.x - x * v.z, x * v.y - y * v.x};
}

double HsGeVector3d::angleTo(const HsGeVector3d& other) const {
    // atan2 of |cross| and dot keeps its precision near 0 and pi, where acos loses it.
    return std::atan2(crossProduct(other).length(), dotProduct(other));
}

HsGeVector3d HsGeVector3d::normal(const HsGeTol& tol) const {
    if (isZeroLength(tol)) {
        return {};
    }
    return *this / length();
}

bool HsGeVector3d::isZeroLength(const HsGeTol& tol) const {
    return length() <= tol.equalVector();
}

bool HsGeVector3d::isParallelTo(const HsGeVector3d& other, const HsGeTol& tol) const {
    if (isZeroLength(tol) || other.isZeroLength(tol)) {
        return false;
    }
    return normal(tol).crossProduct(other.normal(tol)).length() <= tol.equalVector();
}

bool HsGeVector3d::isEqualTo(const HsGeVector3d& other, const HsGeTol& tol) const {
    return (*this - other).length() <= tol.equalVector();
}

HsGeVector3d& HsGeVector3d::transformBy(const HsGeMatrix3d& matrix) {
    return *this = matrix * *this;
}

HsGeVector3d& HsGeVector3d::operator+=(const HsGeVector3d& v) {
    return *this = *this + v;
}
HsGeVector3d& HsGeVector3d::operator-=(const HsGeVector3d& v) {
    return *this = *this - v;
}
HsGeVector3d& HsGeVector3d::operator*=(double factor) {
    return *this = *this * factor;
}
