// An unbounded plane in space: a point of it and its normal.
#pragma once

#include "platform/host/ge/HsGePoint3d.h"
#include "platform/host/ge/HsGeVector3d.h"

class HsGePlane {
public:
    // The XY plane through the origin.
    HsGePlane() = default;
    // The normal is kept as a unit vector.
    HsGePlane(const HsGePoint3d& origin, const HsGeVector3d& normal);

    HsGePoint3d pointOnPlane() const { return m_origin; }
    HsGeVector3d normal() const { return m_normal; }

private:
    HsGePoint3d m_origin;
    HsGeVector3d m_normal = HsGeVector3d::kZAxis;
};
