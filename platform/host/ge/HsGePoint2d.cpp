// A position in the plane.
#include "platform/host/ge/HsGePoint2d.h"

const HsGePoint2d HsGePoint2d::kOrigin(0.0, 0.0);

double HsGePoint2d::distanceTo(const HsGePoint2d& other) const {
    return (*this - other).length();
}

bool HsGePoint2d::isEqualTo(const HsGePoint2d& other, const HsGeTol& tol) const {
    return distanceTo(other) <= tol.equalPoint();
}

HsGePoint2d& HsGePoint2d::operator+=(const HsGeVector2d& v) {
    return *this = *this + v;
}
HsGePoint2d& HsGePoint2d::operator-=(const HsGeVector2d& v) {
    return *this = *this - v;
}
