// The ring preparator and the geometry tools: chord polygon plus circular segments equal the
// ring's own area.
#include "platform/base/geom/ZyrRingPreparator.h"
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/geom/ZyrGeometryTools.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeMatrix3d.h"
#include "platform/solid/SolidraPoint3d.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <numbers>

namespace {

constexpr double kPi = std::numbers::pi;

ZyrGeRing ringOf(const std::vector<ZyrGeSegment2d>& segments) {
    ZyrGeRing ring;
    for (const ZyrGeSegment2d& segment : segments) {
        EXPECT_EQ(ring.addSegment(new ZyrGeSegment2d(segment)), Hsys::eSuccess);
    }
    return ring;
}

double summedArcAreas(const std::vector<HsGeCircArc2d*>& arcs) {
    double sum = 0.0;
    for (const HsGeCircArc2d* arc : arcs) {
        double radius = 0.0;
        double angle = 0.0;
        sum += ZyrGeometryTools::arcSegmentArea(*arc, radius, angle);
    }
    return sum;
}

TEST(ZyrRingPreparator, chordPolygonAndArcsAddUpToTheRingArea) {
    const std::vector<ZyrGeSegment2d> rings[] = {
        // The sample outline, counter-clockwise: three quarters of a circle on a corner.
        {{{0, 0}, {0, -8}},
         {{0, -8}, {6, -8}},
         {{6, -8}, {10, -4}, std::tan(3 * kPi / 8)},
         {{10, -4}, {10, 0}},
         {{10, 0}, {0, 0}}},
        // Arcs bulging out and in, in one ring.
        {{{0, 0}, {4, 0}, 0.4},
         {{4, 0}, {4, 3}, -0.7},
         {{4, 3}, {0, 3}, 1.0},
         {{0, 3}, {0, 0}, -0.2}},
        // A circle of two half circles: two chord vertices only.
        {{{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, 1.0}},
    };
    for (const auto& segments : rings) {
        for (bool reversed : {false, true}) {
            for (const HsGeVector2d offset : {HsGeVector2d(), HsGeVector2d(3'500'000, 5'400'000)}) {
                ZyrGeRing ring = ringOf(segments);
                ring.transformBy(HsGeMatrix3d::translation({offset.x, offset.y, 0.0}));
                if (reversed) {
                    ring.reverse();
                }
                ZyrRingPreparator preparator(&ring);
                preparator.prepare();
                const std::vector<HsGeCircArc2d*> positive = preparator.positiveArcs();
                const std::vector<HsGeCircArc2d*> negative = preparator.negativeArcs();
                const double sum = ZyrGeometryTools::polygonArea(preparator.verticies()) +
                                   summedArcAreas(positive) - summedArcAreas(negative);
                EXPECT_NEAR(sum, ring.area(), 1e-9);
                EXPECT_EQ(preparator.verticies().size(), segments.size() + 1);
                EXPECT_TRUE(
                    preparator.verticies().back().isEqualTo(preparator.verticies().front()));
                auto owned = positive;
                owned.insert(owned.end(), negative.begin(), negative.end());
                zyrtl::deleteItems(owned);
            }
        }
    }
}

TEST(ZyrRingPreparator, arcsAreSortedBySenseAndHandedOverOnce) {
    const ZyrGeRing ring = ringOf(
        {{{0, 0}, {4, 0}, 0.4}, {{4, 0}, {4, 3}, -0.7}, {{4, 3}, {0, 3}, 1.0}, {{0, 3}, {0, 0}}});
    ZyrRingPreparator preparator(&ring);
    preparator.prepare();
    std::vector<HsGeCircArc2d*> positive = preparator.positiveArcs();
    ASSERT_EQ(positive.size(), 2u);
    EXPECT_FALSE(positive[0]->isClockWise());
    EXPECT_NEAR(positive[1]->includedAngle(), kPi, 1e-12);
    EXPECT_TRUE(preparator.positiveArcs().empty());
    zyrtl::deleteItems(positive);
    // The arc not taken dies with the preparator (the leak checker of the sanitizer build sees it).
    preparator.prepare();
    EXPECT_EQ(preparator.verticies().size(), 5u);
    ZyrRingPreparator none(nullptr);
    none.prepare();
    EXPECT_TRUE(none.verticies().empty());
}

TEST(ZyrGeometryTools, polygonAreaIsSignedAndKeepsItsDigitsFarAway) {
    // Coordinates that stay exact when moved far away, so that only the summing can lose digits.
    const std::vector<HsGePoint2d> room = {
        {0, 0}, {4.375, 0}, {4.375, 3.125}, {1.25, 3.125}, {0, 2}};
    const double expected = 4.375 * 3.125 - 1.25 * 1.125 / 2.0;
    for (const HsGeVector2d offset : {HsGeVector2d(), HsGeVector2d(3'500'000, 5'400'000)}) {
        std::vector<HsGePoint2d> points;
        for (const HsGePoint2d& point : room) {
            points.push_back(point + offset);
        }
        EXPECT_NEAR(ZyrGeometryTools::polygonArea(points), expected, 1e-9);
        points.push_back(points.front());
        EXPECT_NEAR(ZyrGeometryTools::polygonArea(points), expected, 1e-9);
        std::reverse(points.begin(), points.end());
        EXPECT_NEAR(ZyrGeometryTools::polygonArea(points), -expected, 1e-9);
    }
    EXPECT_EQ(ZyrGeometryTools::polygonArea({{0, 0}, {1, 1}}), 0.0);
}

TEST(ZyrGeometryTools, isCCWIsStrict) {
    EXPECT_TRUE(ZyrGeometryTools::isCCW({0, 0}, {1, 0}, {0, 1}));
    EXPECT_FALSE(ZyrGeometryTools::isCCW({0, 0}, {0, 1}, {1, 0}));
    EXPECT_FALSE(ZyrGeometryTools::isCCW({0, 0}, {1, 1}, {2, 2}));
}

TEST(ZyrGeometryTools, convertReplacesThePointsAtTheGivenHeight) {
    std::vector<Solidra::Point3d> points = {{9, 9, 9}};
    EXPECT_EQ(ZyrGeometryTools::convert({{1, 2}, {3, 4}}, points, 2.5), 2);
    ASSERT_EQ(points.size(), 2u);
    EXPECT_EQ(points[1].x, 3.0);
    EXPECT_EQ(points[1].y, 4.0);
    EXPECT_EQ(points[1].z, 2.5);
}

TEST(ZyrGeometryTools, arcSegmentAreaGivesRadiusAndAngleOfItsFormula) {
    // Three quarters of the circle of radius 4: 8 (3 pi / 2 + 1).
    const HsGeCircArc2d arc({10, -4}, {10, -12}, {6, -8});
    double radius = 0.0;
    double angle = 0.0;
    const double area = ZyrGeometryTools::arcSegmentArea(arc, radius, angle);
    EXPECT_NEAR(area, 12.0 * kPi + 8.0, 1e-12);
    EXPECT_NEAR(radius, 4.0, 1e-12);
    EXPECT_NEAR(angle, 1.5 * kPi, 1e-12);
    EXPECT_NEAR(radius * radius / 2.0 * (angle - std::sin(angle)), area, 1e-12);
}

} // namespace
