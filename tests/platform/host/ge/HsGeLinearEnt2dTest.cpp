// Lines and segments: crossings inside and outside bounds, parallels, perpendiculars, nearest
// points.
#include "platform/host/ge/HsGeLine2d.h"
#include "platform/host/ge/HsGeLineSeg2d.h"

#include <gtest/gtest.h>

#include <cmath>

namespace {

TEST(HsGeLinearEnt2d, intersectWithHonoursBoundsOfSegmentsOnly) {
    struct Case {
        const char* name;
        HsGePoint2d a0, a1, b0, b1;
        bool segmentsCross;
        bool linesCross;
        HsGePoint2d crossing;
    };
    const Case cases[] = {
        {"cross", {0, 0}, {2, 2}, {0, 2}, {2, 0}, true, true, {1, 1}},
        {"short of b", {0, 0}, {2, 2}, {3, 0}, {4, -1}, false, true, {1.5, 1.5}},
        {"end on b", {0, 0}, {1, 1}, {0, 2}, {2, 0}, true, true, {1, 1}},
        {"end within tolerance",
         {0, 0},
         {1 - 5e-11, 1 - 5e-11},
         {0, 2},
         {2, 0},
         true,
         true,
         {1, 1}},
        {"end beyond tolerance", {0, 0}, {1 - 1e-9, 1 - 1e-9}, {0, 2}, {2, 0}, false, true, {1, 1}},
        {"parallel", {0, 0}, {2, 0}, {0, 1}, {2, 1}, false, false, {}},
        {"collinear overlap", {0, 0}, {2, 0}, {1, 0}, {3, 0}, false, false, {}},
        {"near parallel", {0, 0}, {1, 0}, {0, 1}, {1, 1 - 1e-6}, false, true, {1e6, 0}},
        {"survey",
         {3'500'000, 5'400'000},
         {3'500'010, 5'400'010},
         {3'500'000, 5'400'010},
         {3'500'010, 5'400'000},
         true,
         true,
         {3'500'005, 5'400'005}},
    };
    for (const Case& c : cases) {
        for (bool swapped : {false, true}) {
            SCOPED_TRACE(std::string(c.name) + (swapped ? " swapped" : ""));
            const HsGeLineSeg2d a = swapped ? HsGeLineSeg2d(c.b0, c.b1) : HsGeLineSeg2d(c.a0, c.a1);
            const HsGeLineSeg2d b = swapped ? HsGeLineSeg2d(c.a0, c.a1) : HsGeLineSeg2d(c.b0, c.b1);
            HsGePoint2d point;
            EXPECT_EQ(a.intersectWith(b, point), c.segmentsCross);
            const HsGeLine2d lineA(a.startPoint(), a.endPoint());
            const HsGeLine2d lineB(b.startPoint(), b.endPoint());
            HsGePoint2d linePoint;
            ASSERT_EQ(lineA.intersectWith(lineB, linePoint), c.linesCross);
            if (c.linesCross) {
                EXPECT_NEAR(linePoint.x, c.crossing.x,
                            1e-9 * std::max(1.0, std::abs(c.crossing.x)));
                EXPECT_NEAR(linePoint.y, c.crossing.y, 1e-9);
            }
        }
    }
}

TEST(HsGeLinearEnt2d, parallelTestUsesTheSineOfTheAngle) {
    const HsGeLineSeg2d base({0, 0}, {1000, 0});
    EXPECT_TRUE(base.isParallelTo(HsGeLine2d({5, 5}, HsGeVector2d(-3, 0))));
    EXPECT_TRUE(base.isParallelTo(HsGeLineSeg2d({0, 1}, {1, 1 + 1e-11})));
    EXPECT_FALSE(base.isParallelTo(HsGeLineSeg2d({0, 1}, {1, 1 + 1e-9})));
    EXPECT_TRUE(base.isParallelTo(HsGeLineSeg2d({0, 1}, {1, 1 + 1e-9}), HsGeTol(1e-10, 1e-8)));
    EXPECT_FALSE(base.isParallelTo(HsGeLineSeg2d({1, 1}, {1, 1})));
}

TEST(HsGeLinearEnt2d, perpLineRunsThroughThePointAtRightAngles) {
    const HsGeLineSeg2d slanted({0, 0}, {3, 4});
    HsGeLine2d perp;
    slanted.getPerpLine({10, -2}, perp);
    EXPECT_NEAR(perp.direction().dotProduct(slanted.direction()), 0.0, 1e-15);
    EXPECT_TRUE(perp.pointOnLine().isEqualTo({10, -2}));
    HsGePoint2d foot;
    ASSERT_TRUE(perp.intersectWith(HsGeLine2d(HsGePoint2d(0, 0), HsGePoint2d(3, 4)), foot));
    EXPECT_TRUE(foot.isEqualTo(slanted.closestPointTo({10, -2}), HsGeTol(1e-12, 1e-12)));
}

TEST(HsGeLinearEnt2d, closestPointStaysWithinBoundsOfASegment) {
    const HsGeLineSeg2d segment({3'500'000.0, 1.0}, {3'500'010.0, 1.0});
    const HsGeLine2d line(segment.startPoint(), segment.endPoint());
    struct Case {
        HsGePoint2d query, onSegment, onLine;
    };
    const Case cases[] = {
        {{3'500'004.0, 7.0}, {3'500'004.0, 1.0}, {3'500'004.0, 1.0}},
        {{3'499'990.0, -7.0}, {3'500'000.0, 1.0}, {3'499'990.0, 1.0}},
        {{3'500'011.0, 0.0}, {3'500'010.0, 1.0}, {3'500'011.0, 1.0}},
    };
    for (const Case& c : cases) {
        EXPECT_TRUE(segment.closestPointTo(c.query).isEqualTo(c.onSegment));
        EXPECT_TRUE(line.closestPointTo(c.query).isEqualTo(c.onLine));
    }
}

} // namespace
