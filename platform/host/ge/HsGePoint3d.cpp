// A position in space.
#include "platform/host/ge/HsGePoint3d.h"

#include "platform/host/ge/HsGeMatrix3d.h"

const HsGePoint3d HsGePoint3d::kOrigin(0.0, 0.0, 0.0);

double HsGePoint3d::distanceTo(const HsGePoint3d& other) const {
    return (*this - other).length();
}

bool HsGePoint3d::isEqualTo(const HsGePoint3d& other, const HsGeTol& tol) const {
    return distanceTo(other) <= tol.equalPoint();
}

HsGePoint3d& HsGePoint3d::transformBy(const HsGeMatrix3d& matrix) {
    return *this = matrix * *this;
}

HsGePoint3d& HsGePoint3d::operator+=(const HsGeVector3d& v) {
    return *this = *this + v;
}
HsGePoint3d& HsGePoint3d::operator-=(const HsGeVector3d& v) {
    return *this = *this - v;
}
