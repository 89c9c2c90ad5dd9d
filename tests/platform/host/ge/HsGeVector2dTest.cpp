// Plane vectors and points: angles, parallels and the global point tolerance.
#include "platform/host/ge/HsGePoint2d.h"

#include <gtest/gtest.h>

#include <numbers>
#include <tuple>

namespace {

constexpr double kPi = std::numbers::pi;

TEST(HsGeVector2d, angleToIsUnsignedAndPreciseNearZeroAndPi) {
    const std::tuple<HsGeVector2d, HsGeVector2d, double> cases[] = {
        {{1, 0}, {0, 1}, kPi / 2}, {{1, 0}, {0, -1}, kPi / 2}, {{1, 0}, {-1, 0}, kPi},
        {{3, 3}, {1, 1}, 0},       {{1, 0}, {1, 1e-9}, 1e-9},  {{1, 0}, {-1, 1e-9}, kPi - 1e-9},
        {{0, 0}, {1, 0}, 0},
    };
    for (const auto& [a, b, angle] : cases) {
        EXPECT_NEAR(a.angleTo(b), angle, 1e-15);
        EXPECT_NEAR(b.angleTo(a), angle, 1e-15);
    }
    EXPECT_NEAR(HsGeVector2d(1, 0).angleToCCW({0, -1}), 1.5 * kPi, 1e-15);
}

TEST(HsGePoint2d, equalityFollowsTheGlobalPointTolerance) {
    const HsGeTol saved = HsGeContext::gTol;
    const HsGePoint2d a(3'500'000.0, 1.0);
    EXPECT_TRUE(a == HsGePoint2d(3'500'000.0, 1.0 + 5e-11));
    EXPECT_FALSE(a == HsGePoint2d(3'500'000.0, 1.0 + 2e-10));
    HsGeContext::gTol.setEqualPoint(1e-6);
    EXPECT_TRUE(a == HsGePoint2d(3'500'000.0, 1.0 + 2e-10));
    HsGeContext::gTol = saved;
    EXPECT_NEAR(a.distanceTo({3'500'003.0, 5.0}), 5.0, 1e-9);
}

} // namespace
