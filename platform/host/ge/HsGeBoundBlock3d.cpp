// A box in space: a base point and three edge vectors, which need not follow the axes.
#include "platform/host/ge/HsGeBoundBlock3d.h"

#include "platform/host/ge/HsGeMatrix3d.h"

#include <algorithm>

HsGeBoundBlock3d::HsGeBoundBlock3d(const HsGePoint3d& base, const HsGeVector3d& edge1,
                                   const HsGeVector3d& edge2, const HsGeVector3d& edge3)
    : m_base(base), m_edges{edge1, edge2, edge3} {}

HsGeBoundBlock3d& HsGeBoundBlock3d::set(const HsGePoint3d& minPoint, const HsGePoint3d& maxPoint) {
    return set(minPoint, HsGeVector3d(maxPoint.x - minPoint.x, 0.0, 0.0),
               HsGeVector3d(0.0, maxPoint.y - minPoint.y, 0.0),
               HsGeVector3d(0.0, 0.0, maxPoint.z - minPoint.z));
}

HsGeBoundBlock3d& HsGeBoundBlock3d::set(const HsGePoint3d& base, const HsGeVector3d& edge1,
                                        const HsGeVector3d& edge2, const HsGeVector3d& edge3) {
    *this = HsGeBoundBlock3d(base, edge1, edge2, edge3);
    return *this;
}

void HsGeBoundBlock3d::get(HsGePoint3d& base, HsGeVector3d& edge1, HsGeVector3d& edge2,
                           HsGeVector3d& edge3) const {
    base = m_base;
    edge1 = m_edges[0];
    edge2 = m_edges[1];
    edge3 = m_edges[2];
}

void HsGeBoundBlock3d::getMinMaxPoints(HsGePoint3d& minPoint, HsGePoint3d& maxPoint) const {
    minPoint = maxPoint = m_base;
    for (int corner = 1; corner < 8; ++corner) {
        HsGePoint3d point = m_base;
        for (int edge = 0; edge < 3; ++edge) {
            if ((corner >> edge) & 1) {
                point += m_edges[edge];
            }
        }
        minPoint = {std::min(minPoint.x, point.x), std::min(minPoint.y, point.y),
                    std::min(minPoint.z, point.z)};
        maxPoint = {std::max(maxPoint.x, point.x), std::max(maxPoint.y, point.y),
                    std::max(maxPoint.z, point.z)};
    }
}

HsGeBoundBlock3d& HsGeBoundBlock3d::transformBy(const HsGeMatrix3d& matrix) {
    m_base.transformBy(matrix);
    for (HsGeVector3d& edge : m_edges) {
        edge.transformBy(matrix);
    }
    return *this;
}
