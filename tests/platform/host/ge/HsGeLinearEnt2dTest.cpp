// Lines and segments: crossings inside and outside bounds, parallels, perpendiculars, nearest
// points.
#include "platform/host/ge/HsGeLine2d.h"
#include "platform/host/ge/HsGeLineSeg2d.h"

#include <gtest/gtest.h>

#include <cmath>

namespace {

TEST(HsGeLinearEnt2d, intersectWithHonoursBoundsOfSegmentsOnly) {
    const double e = 3'500'000;
    const double n = 5'400'000;
    struct Case {
        const char* name;
        HsGePoint2d a0, a1, b0, b1;
        bool segmentsCross, linesCross;
        HsGePoint2d crossing;
    };
    const Case cases[] = {
        {"cross", {0, 0}, {2, 2}, {0, 2}, {2, 0}, true, true, {1, 1}},
        {"short of b", {0, 0}, {2, 2}, {3, 0}, {4, -1}, false, true, {1.5, 1.5}},
        {"end on b", {0, 0}, {1, 1}, {0, 2}, {2, 0}, true, true, {1, 1}},
        {"in tolerance", {0, 0}, {1 - 5e-11, 1 - 5e-11}, {0, 2}, {2, 0}, true, true, {1, 1}},
        {"beyond tolerance", {0, 0}, {1 - 1e-9, 1 - 1e-9}, {0, 2}, {2, 0}, false, true, {1, 1}},
        {"parallel", {0, 0}, {2, 0}, {0, 1}, {2, 1}, false, false, {}},
        {"collinear overlap", {0, 0}, {2, 0}, {1, 0}, {3, 0}, false, false, {}},
        {"near parallel", {0, 0}, {1, 0}, {0, 1}, {1, 1 - 1e-6}, false, true, {1e6, 0}},
        {"survey", {e, n}, {e + 10, n + 10}, {e, n + 10}, {e + 10, n}, true, true, {e + 5, n + 5}},
    };
    for (const Case& c : cases) {
        for (bool swapped : {false, true}) {
            SCOPED_TRACE(std::string(c.name) + (swapped ? " swapped" : ""));
            const HsGeLineSeg2d a = swapped ? HsGeLineSeg2d(c.b0, c.b1) : HsGeLineSeg2d(c.a0, c.a1);
            const HsGeLineSeg2d b = swapped ? HsGeLineSeg2d(c.a0, c.a1) : HsGeLineSeg2d(c.b0, c.b1);
            HsGePoint2d point;
            EXPECT_EQ(a.intersectWith(b, point), c.segmentsCross);
            const HsGeLine2d lineA(a.startPoint(), a.endPoint());
            ASSERT_EQ(lineA.intersectWith(HsGeLine2d(b.startPoint(), b.endPoint()), point),
                      c.linesCross);
            if (c.linesCross) {
                EXPECT_NEAR(point.x, c.crossing.x, 1e-9 * std::max(1.0, std::abs(c.crossing.x)));
                EXPECT_NEAR(point.y, c.crossing.y, 1e-9);
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

TEST(HsGeLinearEnt2d, closestPointStaysWithinBoundsOfASegmentAndIsThePerpendicularsFoot) {
    const HsGeLineSeg2d segment({3'500'000.0, 1.0}, {3'500'010.0, 1.0});
    const HsGeLine2d line(segment.startPoint(), segment.endPoint());
    const HsGePoint2d cases[][3] = {
        // query, on the segment, on the line
        {{3'500'004.0, 7.0}, {3'500'004.0, 1.0}, {3'500'004.0, 1.0}},
        {{3'499'990.0, -7.0}, {3'500'000.0, 1.0}, {3'499'990.0, 1.0}},
        {{3'500'011.0, 0.0}, {3'500'010.0, 1.0}, {3'500'011.0, 1.0}},
    };
    for (const auto& [query, onSegment, onLine] : cases) {
        EXPECT_TRUE(segment.closestPointTo(query).isEqualTo(onSegment));
        EXPECT_TRUE(line.closestPointTo(query).isEqualTo(onLine));
    }

    const HsGeLineSeg2d slanted({0, 0}, {3, 4});
    HsGeLine2d perp;
    slanted.getPerpLine({10, -2}, perp);
    EXPECT_NEAR(perp.direction().dotProduct(slanted.direction()), 0.0, 1e-15);
    HsGePoint2d foot;
    ASSERT_TRUE(perp.intersectWith(HsGeLine2d(HsGePoint2d(0, 0), HsGePoint2d(3, 4)), foot));
    EXPECT_TRUE(foot.isEqualTo(slanted.closestPointTo({10, -2}), HsGeTol(1e-12, 1e-12)));
}

} // namespace
