// An axis-aligned box that grows to take in the points given to it.
#pragma once

#include "platform/host/ge/HsGePoint3d.h"

class ZyrGeBoundBox3d {
public:
    // Empty: the first point added becomes both corners, whatever its coordinates.
    ZyrGeBoundBox3d();

    bool isEmpty() const;
    // Lowers the minimum and raises the maximum, coordinate by coordinate, to take in the point.
    void addPoint(const HsGePoint3d& point);
    // In an empty box the minimum lies above the maximum.
    HsGePoint3d minPoint() const { return m_min; }
    HsGePoint3d maxPoint() const { return m_max; }

private:
    HsGePoint3d m_min;
    HsGePoint3d m_max;
};
