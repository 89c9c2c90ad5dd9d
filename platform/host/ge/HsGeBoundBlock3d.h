// A box in space: a base point and three edge vectors, which need not follow the axes.
#pragma once

#include "platform/host/ge/HsGePoint3d.h"
#include "platform/host/ge/HsGeVector3d.h"

class HsGeMatrix3d;

class HsGeBoundBlock3d {
public:
    // A block of no size at the origin.
    HsGeBoundBlock3d() = default;
    HsGeBoundBlock3d(const HsGePoint3d& base, const HsGeVector3d& edge1, const HsGeVector3d& edge2,
                     const HsGeVector3d& edge3);

    // The block along the axes from one corner to the opposite one.
    HsGeBoundBlock3d& set(const HsGePoint3d& minPoint, const HsGePoint3d& maxPoint);
    HsGeBoundBlock3d& set(const HsGePoint3d& base, const HsGeVector3d& edge1,
                          const HsGeVector3d& edge2, const HsGeVector3d& edge3);
    void get(HsGePoint3d& base, HsGeVector3d& edge1, HsGeVector3d& edge2,
             HsGeVector3d& edge3) const;
    HsGePoint3d basePoint() const { return m_base; }
    HsGeVector3d direction1() const { return m_edges[0]; }
    HsGeVector3d direction2() const { return m_edges[1]; }
    HsGeVector3d direction3() const { return m_edges[2]; }
    // The smallest and largest coordinates over the eight corners.
    void getMinMaxPoints(HsGePoint3d& minPoint, HsGePoint3d& maxPoint) const;
    // The base point moves with the whole matrix, the edges with its linear part.
    HsGeBoundBlock3d& transformBy(const HsGeMatrix3d& matrix);

private:
    HsGePoint3d m_base;
    HsGeVector3d m_edges[3];
};
