// Rings and their segments: signed areas with arcs in both senses, reversal, length, containment;
// and their decomposition into a chord polygon and circular segments, which add up to the same
// area.
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/base/geom/ZyrGeometryTools.h"
#include "platform/base/geom/ZyrRingPreparator.h"
#include "platform/base/zyrtl/zyrtlDelete.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeLine2d.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "platform/solid/SolidraPoint3d.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <numbers>
#include <tuple>

namespace {

constexpr double kPi = std::numbers::pi;
const HsGeVector2d kSurvey(3'500'000.0, 5'400'000.0);

ZyrGeRing ringOf(const std::vector<ZyrGeSegment2d>& segments, const HsGeVector2d& offset = {}) {
    ZyrGeRing ring;
    for (const ZyrGeSegment2d& s : segments) {
        EXPECT_EQ(ring.addSegment(new ZyrGeSegment2d(s.startPoint() + offset, s.endPoint() + offset,
                                                     s.bulge())),
                  Hsys::eSuccess);
    }
    return ring;
}

// The unit square with its top edge replaced by an arc of the given bulge, from (1, 1) to (0, 1).
ZyrGeRing squareWithArcTop(double bulge, const HsGeVector2d& offset = {}) {
    return ringOf({{{0, 0}, {1, 0}}, {{1, 0}, {1, 1}}, {{1, 1}, {0, 1}, bulge}, {{0, 1}, {0, 0}}},
                  offset);
}

TEST(ZyrGeRing, signedAreaCountsArcPartsInBothSenses) {
    // A half circle over the unit edge has area pi / 8; a quarter-angle arc r^2/2 (a - sin a).
    const double quarterRadius = 1.0 / std::sqrt(2.0);
    const double quarterSegment = quarterRadius * quarterRadius / 2.0 * (kPi / 2.0 - 1.0);
    const double quarterLength = 3.0 + quarterRadius * kPi / 2.0;
    const struct {
        double bulge, area, length;
    } cases[] = {{0.0, 1.0, 4.0},
                 {1.0, 1.0 + kPi / 8.0, 3.0 + kPi / 2.0},
                 {-1.0, 1.0 - kPi / 8.0, 3.0 + kPi / 2.0},
                 {std::tan(kPi / 8.0), 1.0 + quarterSegment, quarterLength},
                 {-std::tan(kPi / 8.0), 1.0 - quarterSegment, quarterLength},
                 {1e-9, 1.0 + 1e-9 / 3.0, 4.0}};
    for (const auto& c : cases) {
        for (const HsGeVector2d offset : {HsGeVector2d(), kSurvey}) {
            ZyrGeRing ring = squareWithArcTop(c.bulge, offset);
            for (const double sign : {1.0, -1.0}) {
                EXPECT_NEAR(ring.area(), sign * c.area, 1e-9) << "bulge " << c.bulge;
                EXPECT_NEAR(ring.length(), c.length, 1e-9) << "bulge " << c.bulge;
                ring.reverse();
            }
        }
    }
}

TEST(ZyrGeRing, segmentsJoinAtEitherEndAndReverseBackwards) {
    ZyrGeRing triangle;
    EXPECT_EQ(triangle.addSegment(new ZyrGeSegment2d({1, 0}, {0, 1})), Hsys::eSuccess);
    EXPECT_EQ(triangle.addSegment(new ZyrGeSegment2d({0, 0}, {1, 0}), false), Hsys::eSuccess);
    EXPECT_FALSE(triangle.isClosed());
    EXPECT_EQ(triangle.addSegment(new ZyrGeSegment2d({0, 1}, {0, 0})), Hsys::eSuccess);
    EXPECT_EQ(triangle.addSegment(nullptr), Hsys::eNullPointer);
    EXPECT_TRUE(triangle.isClosed());
    EXPECT_NEAR(triangle.area(), 0.5, 1e-15);

    ZyrGeRing ring = squareWithArcTop(0.5);
    ring.reverse();
    ASSERT_EQ(ring.segmentCount(), 4);
    EXPECT_TRUE(ring.segment(0)->startPoint().isEqualTo({0, 0}));
    EXPECT_TRUE(ring.segment(0)->endPoint().isEqualTo({0, 1}));
    EXPECT_EQ(ring.segment(1)->bulge(), -0.5);
    EXPECT_TRUE(ring.isClosed());
    EXPECT_EQ(ring.segment(4), nullptr);
    EXPECT_EQ(ring.segment(-1), nullptr);
}

TEST(ZyrGeRing, containsHonoursArcsBulgingOutAndIn) {
    const ZyrGeRing outward = squareWithArcTop(1.0);
    const ZyrGeRing inward = squareWithArcTop(-1.0);
    const struct {
        HsGePoint2d point;
        bool inOutward, inInward;
    } cases[] = {{{0.5, 0.2}, true, true},   {{0.5, 0.9}, true, false},  {{0.5, 1.4}, true, false},
                 {{0.5, 1.6}, false, false}, {{1.5, 0.5}, false, false}, {{0.05, 0.6}, true, true}};
    for (const auto& c : cases) {
        EXPECT_EQ(outward.contains(c.point), c.inOutward) << c.point.x << " " << c.point.y;
        EXPECT_EQ(inward.contains(c.point), c.inInward) << c.point.x << " " << c.point.y;
    }
}

TEST(ZyrGeSegment2d, wrapsALineOrArcButNoUnboundedLine) {
    const ZyrGeSegment2d arc(new HsGeCircArc2d({2, 0}, {1, 1}, {0, 0}));
    EXPECT_NEAR(arc.bulge(), 1.0, 1e-12);
    EXPECT_NEAR(arc.length(), kPi, 1e-12);
    EXPECT_NEAR(arc.arcArea(), kPi / 2.0, 1e-12);
    // A flat arc keeps its digits: b / 3 over a unit chord, where a - sin(a) would cancel.
    EXPECT_NEAR(ZyrGeSegment2d({0, 0}, {1, 0}, 1e-6).arcArea(), 1e-6 / 3.0, 1e-16);
    EXPECT_NEAR(ZyrGeSegment2d({0, 0}, {1, 0}, -1e-6).arcArea(), -1e-6 / 3.0, 1e-16);
    EXPECT_THROW(ZyrGeSegment2d(static_cast<HsGeCurve2d*>(nullptr)), HsAssertionViolation);
    EXPECT_THROW(ZyrGeSegment2d(new HsGeLine2d()), HsAssertionViolation);
}

TEST(ZyrGeSegment2d, intersectionsOfLinesAndArcs) {
    // clang-format off
    const struct {
        const char* name;
        ZyrGeSegment2d a, b;
        int count;
        bool overlapping;
    } cases[] = {
        {"lines crossing", {{0, 0}, {2, 2}}, {{0, 2}, {2, 0}}, 1, false},
        {"lines apart", {{0, 0}, {1, 0}}, {{0, 1}, {1, 1}}, 0, false},
        {"lines overlapping", {{0, 0}, {2, 0}}, {{1, 0}, {3, 0}}, 0, true},
        {"lines end to end", {{0, 0}, {1, 0}}, {{1, 0}, {3, 0}}, 1, false},
        {"line through half circle", {{0, -1}, {2, -1}, 1.0}, {{1, -5}, {1, 5}}, 1, false},
        {"line across full chord", {{0, 0}, {2, 0}, -1.0}, {{-1, 0.5}, {3, 0.5}}, 2, false},
        {"line tangent", {{0, 0}, {2, 0}, -1.0}, {{-1, 1}, {3, 1}}, 1, false},
        {"line missing the arc's side", {{0, 0}, {2, 0}, 1.0}, {{-1, 0.5}, {3, 0.5}}, 0, false},
        {"arcs whose circles cross twice", {{0, 0}, {2, 0}, -1.0}, {{1, 0}, {3, 0}, -1.0}, 1, false},
        {"same circle apart ends", {{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, 1.0}, 2, false},
        {"same circle overlapping", {{0, 0}, {2, 0}, 1.0}, {{1, -1}, {1, 1}, 1.0}, 0, true}};
    // clang-format on
    for (const auto& c : cases) {
        for (bool swapped : {false, true}) {
            SCOPED_TRACE(std::string(c.name) + (swapped ? " swapped" : ""));
            const auto contact = swapped ? c.b.intersectWith(c.a) : c.a.intersectWith(c.b);
            EXPECT_EQ(contact.count, c.count);
            EXPECT_EQ(contact.overlapping, c.overlapping);
        }
    }
}

// Sums the arcs' segment areas and deletes the arcs, which the preparator handed over.
double takenArcArea(std::vector<HsGeCircArc2d*> arcs) {
    double sum = 0.0;
    for (const HsGeCircArc2d* arc : arcs) {
        double radius = 0.0;
        double angle = 0.0;
        sum += ZyrGeometryTools::arcSegmentArea(*arc, radius, angle);
    }
    zyrtl::deleteItems(arcs);
    return sum;
}

TEST(ZyrRingPreparator, chordPolygonAndArcsAddUpToTheRingArea) {
    // clang-format off
    const std::vector<ZyrGeSegment2d> rings[] = {
        // The sample outline, counter-clockwise: three quarters of a circle on a corner.
        {{{0, 0}, {0, -8}}, {{0, -8}, {6, -8}}, {{6, -8}, {10, -4}, std::tan(3 * kPi / 8)},
         {{10, -4}, {10, 0}}, {{10, 0}, {0, 0}}},
        // Arcs bulging out and in, in one ring.
        {{{0, 0}, {4, 0}, 0.4}, {{4, 0}, {4, 3}, -0.7}, {{4, 3}, {0, 3}, 1.0}, {{0, 3}, {0, 0}, -0.2}},
        // A circle of two half circles: two chord vertices only.
        {{{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, 1.0}}};
    // clang-format on
    for (const auto& segments : rings) {
        for (const bool reversed : {false, true}) {
            for (const HsGeVector2d offset : {HsGeVector2d(), kSurvey}) {
                ZyrGeRing ring = ringOf(segments, offset);
                if (reversed) {
                    ring.reverse();
                }
                ZyrRingPreparator preparator(&ring);
                preparator.prepare();
                const std::vector<HsGePoint2d>& vertices = preparator.verticies();
                EXPECT_NEAR(ZyrGeometryTools::polygonArea(vertices) +
                                takenArcArea(preparator.positiveArcs()) -
                                takenArcArea(preparator.negativeArcs()),
                            ring.area(), 1e-9);
                EXPECT_EQ(vertices.size(), segments.size() + 1);
                EXPECT_TRUE(vertices.back().isEqualTo(vertices.front()));
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
    for (const HsGeVector2d offset : {HsGeVector2d(), kSurvey}) {
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
    // The turn test is strict: collinear points do not turn.
    EXPECT_TRUE(ZyrGeometryTools::isCCW({0, 0}, {1, 0}, {0, 1}));
    EXPECT_FALSE(ZyrGeometryTools::isCCW({0, 0}, {0, 1}, {1, 0}));
    EXPECT_FALSE(ZyrGeometryTools::isCCW({0, 0}, {1, 1}, {2, 2}));
}

TEST(ZyrGeometryTools, arcSegmentAreaAndConvertGiveTheirFiguresExactly) {
    // Three quarters of the circle of radius 4: 8 (3 pi / 2 + 1).
    double radius = 0.0;
    double angle = 0.0;
    const double area = ZyrGeometryTools::arcSegmentArea(
        HsGeCircArc2d({10, -4}, {10, -12}, {6, -8}), radius, angle);
    EXPECT_NEAR(area, 12.0 * kPi + 8.0, 1e-12);
    EXPECT_NEAR(radius, 4.0, 1e-12);
    EXPECT_NEAR(angle, 1.5 * kPi, 1e-12);

    std::vector<Solidra::Point3d> points = {{9, 9, 9}};
    EXPECT_EQ(ZyrGeometryTools::convert({{1, 2}, {3, 4}}, points, 2.5), 2);
    ASSERT_EQ(points.size(), 2u);
    EXPECT_EQ(std::tuple(points[1].x, points[1].y, points[1].z), std::tuple(3.0, 4.0, 2.5));
}

} // namespace
