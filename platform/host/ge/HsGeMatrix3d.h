// An affine transformation of space as a 4x4 matrix acting on column vectors (x, y, z, 1).
#pragma once

#include "platform/host/ge/HsGeContext.h"
#include "platform/host/ge/HsGePoint3d.h"
#include "platform/host/ge/HsGeVector3d.h"

class HsGeMatrix3d {
public:
    // The identity.
    constexpr HsGeMatrix3d()
        : entry{{1.0, 0.0, 0.0, 0.0},
                {0.0, 1.0, 0.0, 0.0},
                {0.0, 0.0, 1.0, 0.0},
                {0.0, 0.0, 0.0, 1.0}} {}

    static const HsGeMatrix3d kIdentity;

    static HsGeMatrix3d translation(const HsGeVector3d& offset);
    // Turns by angle (radians, counter-clockwise looking against axis) about the line through
    // center along axis. A zero axis gives the identity.
    static HsGeMatrix3d rotation(double angle, const HsGeVector3d& axis,
                                 const HsGePoint3d& center = HsGePoint3d::kOrigin);
    static HsGeMatrix3d scaling(double factor, const HsGePoint3d& center = HsGePoint3d::kOrigin);
    static HsGeMatrix3d scaling(double xFactor, double yFactor, double zFactor,
                                const HsGePoint3d& center = HsGePoint3d::kOrigin);

    HsGeMatrix3d& setToIdentity();
    bool isEqualTo(const HsGeMatrix3d& other, const HsGeTol& tol = HsGeContext::gTol) const;
    double det() const;
    // Singular when the linear part flattens space: its determinant over the product of its
    // column lengths is within the vector tolerance, whatever the matrix's scale.
    bool isSingular(const HsGeTol& tol = HsGeContext::gTol) const;

    // False for a matrix singular within tol (as isSingular judges); result is then left as it
    // was.
    bool inverse(HsGeMatrix3d& result, double tol) const;
    // The inverse; throws HsAssertionViolation for a singular matrix, which has none.
    HsGeMatrix3d inverse() const;

    // The matrix that applies other first and this second.
    HsGeMatrix3d operator*(const HsGeMatrix3d& other) const;
    HsGeMatrix3d& operator*=(const HsGeMatrix3d& other) { return postMultBy(other); }
    // this = left * this: left applies after this.
    HsGeMatrix3d& preMultBy(const HsGeMatrix3d& left);
    // this = this * right: right applies before this.
    HsGeMatrix3d& postMultBy(const HsGeMatrix3d& right);
    // The transformation that applies first and then second.
    static HsGeMatrix3d compose(const HsGeMatrix3d& first, const HsGeMatrix3d& second);

    HsGeVector3d translation() const;
    HsGeMatrix3d& setTranslation(const HsGeVector3d& offset);

    HsGePoint3d operator*(const HsGePoint3d& point) const;
    HsGeVector3d operator*(const HsGeVector3d& vector) const;

    double operator()(int row, int column) const { return entry[row][column]; }
    double& operator()(int row, int column) { return entry[row][column]; }

    double entry[4][4];
};
