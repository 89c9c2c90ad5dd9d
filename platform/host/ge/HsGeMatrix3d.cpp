// An affine transformation of space as a 4x4 matrix acting on column vectors (x, y, z, 1).
#include "platform/host/ge/HsGeMatrix3d.h"

#include "platform/host/ut/HsAssertionViolation.h"

#include <cmath>
#include <utility>

const HsGeMatrix3d HsGeMatrix3d::kIdentity;

namespace {

// |det| of the linear part over the product of its column lengths: 1 for a rotation, 0 for a
// flattening, and the same for a matrix of millimetres and one of kilometres.
double linearPartRegularity(const HsGeMatrix3d& matrix) {
    HsGeVector3d columns[3];
    for (int column = 0; column < 3; ++column) {
        columns[column] = {matrix.entry[0][column], matrix.entry[1][column],
                           matrix.entry[2][column]};
    }
    const double lengths = columns[0].length() * columns[1].length() * columns[2].length();
    if (lengths == 0.0) {
        return 0.0;
    }
    return std::abs(columns[0].crossProduct(columns[1]).dotProduct(columns[2])) / lengths;
}

// Gauss-Jordan elimination with partial pivoting; false at a zero pivot.
bool invertInto(HsGeMatrix3d source, HsGeMatrix3d& inverse) {
    inverse.setToIdentity();
    for (int column = 0; column < 4; ++column) {
        int pivot = column;
        for (int row = column + 1; row < 4; ++row) {
            if (std::abs(source.entry[row][column]) > std::abs(source.entry[pivot][column])) {
                pivot = row;
            }
        }
        if (source.entry[pivot][column] == 0.0) {
            return false;
        }
        std::swap(source.entry[pivot], source.entry[column]);
        std::swap(inverse.entry[pivot], inverse.entry[column]);
        const double scale = 1.0 / source.entry[column][column];
        for (int k = 0; k < 4; ++k) {
            source.entry[column][k] *= scale;
            inverse.entry[column][k] *= scale;
        }
        for (int row = 0; row < 4; ++row) {
            const double factor = source.entry[row][column];
            if (row == column || factor == 0.0) {
                continue;
            }
            for (int k = 0; k < 4; ++k) {
                source.entry[row][k] -= factor * source.entry[column][k];
                inverse.entry[row][k] -= factor * inverse.entry[column][k];
            }
        }
    }
    return true;
}

} // namespace

HsGeMatrix3d HsGeMatrix3d::translation(const HsGeVector3d& offset) {
    HsGeMatrix3d matrix;
    return matrix.setTranslation(offset);
}

HsGeMatrix3d HsGeMatrix3d::rotation(double angle, const HsGeVector3d& axis,
                                    const HsGePoint3d& center) {
    const HsGeVector3d u = axis.normal();
    if (u.isZeroLength()) {
        return {};
    }
    // Rodrigues' formula for the linear part, then the center kept in place.
    const double c = std::cos(angle);
    const double s = std::sin(angle);
    const double t = 1.0 - c;
    HsGeMatrix3d matrix;
    matrix.entry[0][0] = t * u.x * u.x + c;
    matrix.entry[0][1] = t * u.x * u.y - s * u.z;
    matrix.entry[0][2] = t * u.x * u.z + s * u.y;
    matrix.entry[1][0] = t * u.x * u.y + s * u.z;
    matrix.entry[1][1] = t * u.y * u.y + c;
    matrix.entry[1][2] = t * u.y * u.z - s * u.x;
    matrix.entry[2][0] = t * u.x * u.z - s * u.y;
    matrix.entry[2][1] = t * u.y * u.z + s * u.x;
    matrix.entry[2][2] = t * u.z * u.z + c;
    return matrix.setTranslation(center.asVector() - matrix * center.asVector());
}

HsGeMatrix3d HsGeMatrix3d::scaling(double factor, const HsGePoint3d& center) {
    return scaling(factor, factor, factor, center);
}

HsGeMatrix3d HsGeMatrix3d::scaling(double xFactor, double yFactor, double zFactor,
                                   const HsGePoint3d& center) {
    HsGeMatrix3d matrix;
    matrix.entry[0][0] = xFactor;
    matrix.entry[1][1] = yFactor;
    matrix.entry[2][2] = zFactor;
    return matrix.setTranslation(center.asVector() - matrix * center.asVector());
}

HsGeMatrix3d& HsGeMatrix3d::setToIdentity() {
    return *this = HsGeMatrix3d();
}

bool HsGeMatrix3d::isEqualTo(const HsGeMatrix3d& other, const HsGeTol& tol) const {
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column) {
            if (std::abs(entry[row][column] - other.entry[row][column]) > tol.equalVector()) {
                return false;
            }
        }
    }
    return true;
}

double HsGeMatrix3d::det() const {
    // Cofactor expansion along the bottom row, which is (0 0 0 1) for every affine matrix.
    double result = 0.0;
    for (int skipped = 0; skipped < 4; ++skipped) {
        double minor[3][3];
        for (int row = 0; row < 3; ++row) {
            for (int column = 0, target = 0; column < 4; ++column) {
                if (column != skipped) {
                    minor[row][target++] = entry[row][column];
                }
            }
        }
        const double minorDet =
            minor[0][0] * (minor[1][1] * minor[2][2] - minor[1][2] * minor[2][1]) -
            minor[0][1] * (minor[1][0] * minor[2][2] - minor[1][2] * minor[2][0]) +
            minor[0][2] * (minor[1][0] * minor[2][1] - minor[1][1] * minor[2][0]);
        const double sign = (3 + skipped) % 2 == 0 ? 1.0 : -1.0;
        result += sign * entry[3][skipped] * minorDet;
    }
    return result;
}

bool HsGeMatrix3d::isSingular(const HsGeTol& tol) const {
    HsGeMatrix3d unused;
    return linearPartRegularity(*this) <= tol.equalVector() || !invertInto(*this, unused);
}

bool HsGeMatrix3d::inverse(HsGeMatrix3d& result, double tol) const {
    HsGeMatrix3d candidate;
    if (linearPartRegularity(*this) <= tol || !invertInto(*this, candidate)) {
        return false;
    }
    result = candidate;
    return true;
}

HsGeMatrix3d HsGeMatrix3d::inverse() const {
    HsGeMatrix3d result;
    if (!inverse(result, HsGeContext::gTol.equalVector())) {
        throw HsAssertionViolation("HsGeMatrix3d::inverse of a singular matrix");
    }
    return result;
}

HsGeMatrix3d HsGeMatrix3d::operator*(const HsGeMatrix3d& other) const {
    HsGeMatrix3d product;
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column) {
            double sum = 0.0;
            for (int k = 0; k < 4; ++k) {
                sum += entry[row][k] * other.entry[k][column];
            }
            product.entry[row][column] = sum;
        }
    }
    return product;
}

HsGeMatrix3d& HsGeMatrix3d::preMultBy(const HsGeMatrix3d& left) {
    return *this = left * *this;
}

HsGeMatrix3d& HsGeMatrix3d::postMultBy(const HsGeMatrix3d& right) {
    return *this = *this * right;
}

HsGeMatrix3d HsGeMatrix3d::compose(const HsGeMatrix3d& first, const HsGeMatrix3d& second) {
    return second * first;
}

HsGeVector3d HsGeMatrix3d::translation() const {
    return {entry[0][3], entry[1][3], entry[2][3]};
}

HsGeMatrix3d& HsGeMatrix3d::setTranslation(const HsGeVector3d& offset) {
    entry[0][3] = offset.x;
    entry[1][3] = offset.y;
    entry[2][3] = offset.z;
    return *this;
}

HsGePoint3d HsGeMatrix3d::operator*(const HsGePoint3d& point) const {
    const HsGeVector3d moved = *this * point.asVector() + translation();
    const double w =
        entry[3][0] * point.x + entry[3][1] * point.y + entry[3][2] * point.z + entry[3][3];
    // Every matrix built here keeps w at 1; a projective one read from elsewhere is honoured.
    if (w != 1.0 && w != 0.0) {
        return {moved.x / w, moved.y / w, moved.z / w};
    }
    return {moved.x, moved.y, moved.z};
}

HsGeVector3d HsGeMatrix3d::operator*(const HsGeVector3d& v) const {
    return {entry[0][0] * v.x + entry[0][1] * v.y + entry[0][2] * v.z,
            entry[1][0] * v.x + entry[1][1] * v.y + entry[1][2] * v.z,
            entry[2][0] * v.x + entry[2][1] * v.y + entry[2][2] * v.z};
}
