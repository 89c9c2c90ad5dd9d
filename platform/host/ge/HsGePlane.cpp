// An unbounded plane in space: a point of it and its normal.
#include "platform/host/ge/HsGePlane.h"

HsGePlane::HsGePlane(const HsGePoint3d& origin, const HsGeVector3d& normal)
    : m_origin(origin), m_normal(normal.normal()) {}
