// Circular arcs: three points, bulge, angles, length and nearest points, in both senses.
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <cmath>
#include <numbers>

namespace {

constexpr double kPi = std::numbers::pi;

TEST(HsGeCircArc2d, threePointsGiveCenterSenseAndAngles) {
    struct Case {
        HsGePoint2d start, through, end, center;
        double radius, startAng, endAng, included;
        bool clockWise;
    };
    const Case cases[] = {
        // Three quarters of the circle of radius 4 around (10, -8), clockwise, and back.
        {{10, -4}, {10, -12}, {6, -8}, {10, -8}, 4, kPi / 2, kPi, 1.5 * kPi, true},
        {{6, -8}, {10, -12}, {10, -4}, {10, -8}, 4, kPi, kPi / 2, 1.5 * kPi, false},
        {{3'500'001, 0}, {3'500'000, -1}, {3'499'999, 0}, {3'500'000, 0}, 1, 0, kPi, kPi, true},
    };
    for (const Case& c : cases) {
        const HsGeCircArc2d arc(c.start, c.through, c.end);
        EXPECT_TRUE(arc.center().isEqualTo(c.center, HsGeTol(1e-9, 1e-9)));
        EXPECT_NEAR(arc.radius(), c.radius, 1e-9);
        EXPECT_NEAR(arc.startAng(), c.startAng, 1e-9);
        EXPECT_NEAR(arc.endAng(), c.endAng, 1e-9);
        EXPECT_NEAR(arc.length(), c.radius * c.included, 1e-9);
        EXPECT_EQ(arc.isClockWise(), c.clockWise);
        // The ends are the given points exactly, even far from the origin.
        EXPECT_EQ(arc.startPoint().x, c.start.x);
        EXPECT_EQ(arc.endPoint().y, c.end.y);
    }
}

TEST(HsGeCircArc2d, bulgeIsTheTangentOfAQuarterOfTheSignedAngle) {
    for (const double bulge : {1.0, -1.0, std::tan(kPi / 8), -std::tan(3 * kPi / 8), 1e-7, 40.0}) {
        HsGeCircArc2d arc;
        ASSERT_TRUE(arc.setFromBulge({2, 1}, {5, 5}, bulge));
        EXPECT_NEAR(arc.bulge(), bulge, 1e-12 * std::max(1.0, std::abs(bulge * bulge)));
        EXPECT_EQ(arc.isClockWise(), bulge < 0);
        EXPECT_NEAR(arc.includedAngle(), 4 * std::atan(std::abs(bulge)), 1e-12);
        EXPECT_NEAR(arc.center().distanceTo({5, 5}), arc.radius(), 1e-9);
        // Rebuilt through its own middle point, the arc is the same arc.
        const double middle = arc.startAng() + (bulge < 0 ? -1 : 1) * arc.includedAngle() / 2;
        const HsGePoint2d through =
            arc.center() + HsGeVector2d(std::cos(middle), std::sin(middle)) * arc.radius();
        if (std::abs(bulge) > 1e-6) {
            EXPECT_NEAR(HsGeCircArc2d({2, 1}, through, {5, 5}).bulge(), bulge,
                        1e-9 * (1 + bulge * bulge));
        }
    }
}

TEST(HsGeCircArc2d, refusesPointsThatMakeNoArc) {
    HsGeCircArc2d arc({0, 0}, 2.0, 0.0, kPi / 2);
    EXPECT_FALSE(arc.set({0, 0}, {1, 1}, {2, 2}));
    EXPECT_FALSE(arc.set({0, 0}, {0, 0}, {2, 2}));
    EXPECT_FALSE(arc.setFromBulge({0, 0}, {0, 0}, 1.0));
    EXPECT_FALSE(arc.setFromBulge({0, 0}, {1, 0}, 0.0));
    EXPECT_FALSE(arc.setFromBulge({0, 0}, {1, 0}, std::nan("")));
    EXPECT_EQ(arc.radius(), 2.0);
    EXPECT_THROW(HsGeCircArc2d({0, 0}, {1, 1}, {2, 2}), HsAssertionViolation);
}

TEST(HsGeCircArc2d, closestPointIsOnTheArcOrItsNearerEnd) {
    // The upper half circle counter-clockwise and the lower one clockwise share no point but ends.
    const HsGeCircArc2d upper({0, 0}, 1.0, 0.0, kPi);
    const HsGeCircArc2d lower({0, 0}, 1.0, 0.0, kPi, true);
    const HsGeTol tol(1e-12, 1e-12);
    EXPECT_TRUE(upper.closestPointTo({0, 5}).isEqualTo({0, 1}, tol));
    EXPECT_TRUE(upper.closestPointTo({0.5, -3}).isEqualTo({1, 0}, tol));
    EXPECT_TRUE(lower.closestPointTo({0, 5}).isEqualTo({1, 0}, tol));
    EXPECT_TRUE(lower.closestPointTo({0, -0.2}).isEqualTo({0, -1}, tol));
    EXPECT_TRUE(upper.closestPointTo({0, 0}).isEqualTo(upper.startPoint()));
}

} // namespace
