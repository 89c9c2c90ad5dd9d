// A position in the plane.
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGeVector2d.h"

class HsGePoint2d {
public:
    constexpr HsGePoint2d() = default;
    constexpr HsGePoint2d(double xValue, double yValue) : x(xValue), y(yValue) {}

    static const HsGePoint2d kOrigin;

    double distanceTo(const HsGePoint2d& other) const;
    // The same point when the two lie within the tolerance's point value of each other.
    bool isEqualTo(const HsGePoint2d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    HsGeVector2d asVector() const { return {x, y}; }

    HsGePoint2d operator+(const HsGeVector2d& v) const { return {x + v.x, y + v.y}; }
    HsGePoint2d operator-(const HsGeVector2d& v) const { return {x - v.x, y - v.y}; }
    HsGeVector2d operator-(const HsGePoint2d& p) const { return {x - p.x, y - p.y}; }
    HsGePoint2d& operator+=(const HsGeVector2d& v);
    HsGePoint2d& operator-=(const HsGeVector2d& v);
    // Equal within the global tolerance.
    bool operator==(const HsGePoint2d& other) const { return isEqualTo(other); }

    double x = 0.0;
    double y = 0.0;
};
