// A direction and length in the plane.
#pragma once

#include "platform/host/ge/HsGeContext.h"

class HsGeVector2d {
public:
    constexpr HsGeVector2d() = default;
    constexpr HsGeVector2d(double xValue, double yValue) : x(xValue), y(yValue) {}

    static const HsGeVector2d kXAxis;
    static const HsGeVector2d kYAxis;

    double length() const;
    double lengthSqrd() const { return x * x + y * y; }
    double dotProduct(const HsGeVector2d& other) const { return x * other.x + y * other.y; }
    // The z of the 3D cross product: positive when other lies counter-clockwise of this.
    double crossProduct(const HsGeVector2d& other) const { return x * other.y - y * other.x; }
    // The unsigned angle between the two directions, in [0, pi]; 0 when either has no length.
    double angleTo(const HsGeVector2d& other) const;
    // The angle from this direction counter-clockwise to other, in [0, 2 pi).
    double angleToCCW(const HsGeVector2d& other) const;
    // This vector turned by a quarter counter-clockwise.
    HsGeVector2d perpVector() const { return {-y, x}; }
    // The unit vector of this direction, or the zero vector for a zero-length vector.
    HsGeVector2d normal(const HsGeTol& tol = HsGeContext::gTol) const;
    bool isZeroLength(const HsGeTol& tol = HsGeContext::gTol) const;
    bool isParallelTo(const HsGeVector2d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    bool isEqualTo(const HsGeVector2d& other, const HsGeTol& tol = HsGeContext::gTol) const;

    HsGeVector2d operator+(const HsGeVector2d& v) const { return {x + v.x, y + v.y}; }
    HsGeVector2d operator-(const HsGeVector2d& v) const { return {x - v.x, y - v.y}; }
    HsGeVector2d operator-() const { return {-x, -y}; }
    HsGeVector2d operator*(double factor) const { return {x * factor, y * factor}; }
    HsGeVector2d operator/(double divisor) const { return {x / divisor, y / divisor}; }
    HsGeVector2d& operator+=(const HsGeVector2d& v);
    HsGeVector2d& operator-=(const HsGeVector2d& v);
    HsGeVector2d& operator*=(double factor);
    // Equal within the global tolerance.
    bool operator==(const HsGeVector2d& other) const { return isEqualTo(other); }

    double x = 0.0;
    double y = 0.0;
};

inline HsGeVector2d operator*(double factor, const HsGeVector2d& v) {
    return v * factor;
}
