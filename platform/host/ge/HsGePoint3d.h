// A position in space.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGePoint2d.h"
#include "platform/host/ge/HsGeVector3d.h"

class HsGeMatrix3d;

class HsGePoint3d {
public:
    constexpr HsGePoint3d() = default;
    constexpr HsGePoint3d(double xValue, double yValue, double zValue)
        : x(xValue), y(yValue), z(zValue) {}

    static const HsGePoint3d kOrigin;

    double distanceTo(const HsGePoint3d& other) const;
    // The same point when the two lie within the tolerance's point value of each other.
    bool isEqualTo(const HsGePoint3d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    HsGeVector3d asVector() const { return {x, y, z}; }
    // The point's x and y; z is dropped.
    HsGePoint2d convert2d() const { return {x, y}; }
    HsGePoint3d& transformBy(const HsGeMatrix3d& matrix);

    HsGePoint3d operator+(const HsGeVector3d& v) const { return {x + v.x, y + v.y, z + v.z}; }
    HsGePoint3d operator-(const HsGeVector3d& v) const { return {x - v.x, y - v.y, z - v.z}; }
    HsGeVector3d operator-(const HsGePoint3d& p) const { return {x - p.x, y - p.y, z - p.z}; }
    HsGePoint3d& operator+=(const HsGeVector3d& v);
    HsGePoint3d& operator-=(const HsGeVector3d& v);
    // Equal within the global tolerance.
    bool operator==(const HsGePoint3d& other) const { return isEqualTo(other); }

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};
