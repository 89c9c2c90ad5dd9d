// Affine matrices: inverse round trips, order of composition, what points and vectors feel.
#include "platform/host/ge/HsGeMatrix3d.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <numbers>

namespace {

constexpr double kPi = std::numbers::pi;

void expectNear(const HsGePoint3d& actual, const HsGePoint3d& expected, double tol = 1e-12) {
    EXPECT_NEAR(actual.distanceTo(expected), 0.0, tol)
        << actual.x << ", " << actual.y << ", " << actual.z;
}

TEST(HsGeMatrix3d, inverseUndoesEveryKindOfMatrixAndRefusesASingularOne) {
    const HsGePoint3d survey(3'500'000.25, 5'400'000.5, 12.0);
    const HsGeMatrix3d matrices[] = {
        HsGeMatrix3d::translation({3'500'000.0, -20.0, 7.0}),
        HsGeMatrix3d::rotation(0.7, {1.0, 2.0, 3.0}, {4.0, -5.0, 6.0}),
        HsGeMatrix3d::scaling(2.0, 0.001, 5.0, {1.0, 1.0, 1.0}),
        HsGeMatrix3d::rotation(kPi / 3.0, HsGeVector3d::kZAxis, survey) *
            HsGeMatrix3d::scaling(1000.0) * HsGeMatrix3d::translation({1.0, 2.0, 3.0}),
        // A tiny but regular scale is judged against its own entries, not against 1e-10.
        HsGeMatrix3d::scaling(1e-12),
    };
    for (const HsGeMatrix3d& matrix : matrices) {
        const HsGeMatrix3d inverse = matrix.inverse();
        EXPECT_TRUE((matrix * inverse).isEqualTo(HsGeMatrix3d::kIdentity, HsGeTol(1e-9, 1e-9)));
        expectNear(inverse * (matrix * survey), survey, 1e-6);
    }

    const HsGeMatrix3d flat = HsGeMatrix3d::scaling(1.0, 1.0, 0.0);
    HsGeMatrix3d result = HsGeMatrix3d::translation({1.0, 2.0, 3.0});
    EXPECT_TRUE(flat.isSingular());
    EXPECT_FALSE(flat.inverse(result, 1e-10));
    EXPECT_TRUE(result.isEqualTo(HsGeMatrix3d::translation({1.0, 2.0, 3.0})));
    EXPECT_THROW(flat.inverse(), HsAssertionViolation);
}

TEST(HsGeMatrix3d, composeAppliesTheFirstMatrixFirstAndVectorsIgnoreTranslation) {
    const HsGeMatrix3d quarterTurn = HsGeMatrix3d::rotation(kPi / 2.0, HsGeVector3d::kZAxis);
    const HsGeMatrix3d shift = HsGeMatrix3d::translation({10.0, 0.0, 0.0});
    expectNear(HsGeMatrix3d::compose(shift, quarterTurn) * HsGePoint3d(1, 0, 0), {0, 11, 0});
    expectNear(HsGeMatrix3d::compose(quarterTurn, shift) * HsGePoint3d(1, 0, 0), {10, 1, 0});
    HsGeMatrix3d product = shift;
    product.preMultBy(quarterTurn);
    EXPECT_TRUE(product.isEqualTo(HsGeMatrix3d::compose(shift, quarterTurn)));

    const HsGeMatrix3d halfTurn = HsGeMatrix3d::rotation(kPi, HsGeVector3d::kZAxis, {5, 5, 0});
    expectNear(halfTurn * HsGePoint3d(6, 5, 2), {4, 5, 2});
    EXPECT_TRUE((shift * HsGeVector3d(1, 2, 3)).isEqualTo({1, 2, 3}));
    EXPECT_NEAR(HsGeMatrix3d::scaling(2.0, 3.0, 4.0).det(), 24.0, 1e-12);
}

TEST(HsGeBoundBlock3d, transformedBlockKeepsItsShapeAndReportsItsCorners) {
    HsGeBoundBlock3d block;
    block.set({1.0, 2.0, 0.0}, {4.0, 3.0, 1.0});
    block.transformBy(HsGeMatrix3d::rotation(kPi / 2.0, HsGeVector3d::kZAxis));
    HsGePoint3d low;
    HsGePoint3d high;
    block.getMinMaxPoints(low, high);
    expectNear(low, {-3.0, 1.0, 0.0});
    expectNear(high, {-2.0, 4.0, 1.0});
    EXPECT_TRUE(block.direction1().isEqualTo({0.0, 3.0, 0.0}));
    EXPECT_TRUE(block.direction3().isEqualTo(HsGeVector3d::kZAxis));
}

} // namespace
