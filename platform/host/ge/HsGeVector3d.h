// A direction and length in space.
#pragma once

#include "platform/host/ge/HsGeContext.h"

class HsGeMatrix3d;

class HsGeVector3d {
public:
    constexpr HsGeVector3d() = default;
    constexpr HsGeVector3d(double xValue, double yValue, double zValue)
        : x(xValue), y(yValue), z(zValue) {}

    static const HsGeVector3d kXAxis;
    static const HsGeVector3d kYAxis;
    static const HsGeVector3d kZAxis;

    double length() const;
    double lengthSqrd() const { return x * x + y * y + z * z; }
    double dotProduct(const HsGeVector3d& v) const { return x * v.x + y * v.y + z * v.z; }
    HsGeVector3d crossProduct(const HsGeVector3d& v) const;
    // The unsigned angle between the two directions, in [0, pi]; 0 when either has no length.
    double angleTo(const HsGeVector3d& other) const;
    // The unit vector of this direction, or the zero vector for a zero-length vector.
    HsGeVector3d normal(const HsGeTol& tol = HsGeContext::gTol) const;
    bool isZeroLength(const HsGeTol& tol = HsGeContext::gTol) const;
    bool isParallelTo(const HsGeVector3d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    bool isEqualTo(const HsGeVector3d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    // A vector is moved by the linear part of the matrix only; translation does not apply.
    HsGeVector3d& transformBy(const HsGeMatrix3d& matrix);

    HsGeVector3d operator+(const HsGeVector3d& v) const { return {x + v.x, y + v.y, z + v.z}; }
    HsGeVector3d operator-(const HsGeVector3d& v) const { return {x - v.x, y - v.y, z - v.z}; }
    HsGeVector3d operator-() const { return {-x, -y, -z}; }
    HsGeVector3d operator*(double f) const { return {x * f, y * f, z * f}; }
    HsGeVector3d operator/(double d) const { return {x / d, y / d, z / d}; }
    HsGeVector3d& operator+=(const HsGeVector3d& v);
    HsGeVector3d& operator-=(const HsGeVector3d& v);
    HsGeVector3d& operator*=(double factor);
    // Equal within the global tolerance.
    bool operator==(const HsGeVector3d& other) const { return isEqualTo(other); }

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

inline HsGeVector3d operator*(double factor, const HsGeVector3d& v) {
    return v * factor;
}
