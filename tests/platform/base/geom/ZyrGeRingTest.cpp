// Rings and their segments: signed areas with arcs in both senses, reversal, length, containment.
#include "platform/base/geom/ZyrGeRing.h"
#include "platform/host/ge/HsGeCircArc2d.h"
#include "platform/host/ge/HsGeLine2d.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <cmath>
#include <numbers>

namespace {

constexpr double kPi = std::numbers::pi;

// The unit square with its top edge replaced by an arc of the given bulge, from (1, 1) to (0, 1).
ZyrGeRing squareWithArcTop(double bulge, const HsGeVector2d& offset = {}) {
    const HsGePoint2d corners[] = {HsGePoint2d(0, 0) + offset, HsGePoint2d(1, 0) + offset,
                                   HsGePoint2d(1, 1) + offset, HsGePoint2d(0, 1) + offset};
    ZyrGeRing ring;
    for (int index = 0; index < 4; ++index) {
        const double edgeBulge = index == 2 ? bulge : 0.0;
        EXPECT_EQ(ring.addSegment(
                      new ZyrGeSegment2d(corners[index], corners[(index + 1) % 4], edgeBulge)),
                  Hsys::eSuccess);
    }
    return ring;
}

TEST(ZyrGeRing, signedAreaCountsArcPartsInBothSenses) {
    // A half circle over the unit edge has area pi / 8; a quarter-angle arc r^2/2 (a - sin a).
    const double quarterRadius = 1.0 / std::sqrt(2.0);
    const double quarterSegment = quarterRadius * quarterRadius / 2.0 * (kPi / 2.0 - 1.0);
    struct Case {
        double bulge, area, length;
    };
    const Case cases[] = {
        {0.0, 1.0, 4.0},
        {1.0, 1.0 + kPi / 8.0, 3.0 + kPi / 2.0},
        {-1.0, 1.0 - kPi / 8.0, 3.0 + kPi / 2.0},
        {std::tan(kPi / 8.0), 1.0 + quarterSegment, 3.0 + quarterRadius * kPi / 2.0},
        {-std::tan(kPi / 8.0), 1.0 - quarterSegment, 3.0 + quarterRadius * kPi / 2.0},
        {1e-9, 1.0 + 1e-9 / 3.0, 4.0},
    };
    for (const Case& c : cases) {
        for (const HsGeVector2d offset : {HsGeVector2d(), HsGeVector2d(3'500'000.0, 5'400'000.0)}) {
            ZyrGeRing ring = squareWithArcTop(c.bulge, offset);
            EXPECT_NEAR(ring.area(), c.area, 1e-9) << "bulge " << c.bulge;
            EXPECT_NEAR(ring.length(), c.length, 1e-9) << "bulge " << c.bulge;
            ring.reverse();
            EXPECT_NEAR(ring.area(), -c.area, 1e-9) << "bulge " << c.bulge;
            EXPECT_NEAR(ring.length(), c.length, 1e-9) << "bulge " << c.bulge;
        }
    }
}

TEST(ZyrGeRing, reversalRunsTheSegmentsBackwards) {
    ZyrGeRing ring = squareWithArcTop(0.5);
    ring.reverse();
    ASSERT_EQ(ring.segmentCount(), 4);
    EXPECT_TRUE(ring.segment(0)->startPoint().isEqualTo({0, 0}));
    EXPECT_TRUE(ring.segment(0)->endPoint().isEqualTo({0, 1}));
    EXPECT_TRUE(ring.segment(1)->startPoint().isEqualTo({0, 1}));
    EXPECT_EQ(ring.segment(1)->bulge(), -0.5);
    EXPECT_TRUE(ring.isClosed());
    EXPECT_EQ(ring.segment(4), nullptr);
    EXPECT_EQ(ring.segment(-1), nullptr);
}

TEST(ZyrGeRing, addSegmentAtFrontOrEnd) {
    ZyrGeRing ring;
    EXPECT_EQ(ring.addSegment(new ZyrGeSegment2d({1, 0}, {0, 1})), Hsys::eSuccess);
    EXPECT_EQ(ring.addSegment(new ZyrGeSegment2d({0, 0}, {1, 0}), false), Hsys::eSuccess);
    EXPECT_FALSE(ring.isClosed());
    EXPECT_EQ(ring.addSegment(new ZyrGeSegment2d({0, 1}, {0, 0})), Hsys::eSuccess);
    EXPECT_EQ(ring.addSegment(nullptr), Hsys::eNullPointer);
    EXPECT_TRUE(ring.isClosed());
    EXPECT_NEAR(ring.area(), 0.5, 1e-15);
}

TEST(ZyrGeRing, containsHonoursArcsBulgingOutAndIn) {
    const ZyrGeRing outward = squareWithArcTop(1.0);
    const ZyrGeRing inward = squareWithArcTop(-1.0);
    struct Case {
        HsGePoint2d point;
        bool inOutward, inInward;
    };
    const Case cases[] = {
        {{0.5, 0.2}, true, true},   {{0.5, 0.9}, true, false},  {{0.5, 1.4}, true, false},
        {{0.5, 1.6}, false, false}, {{1.5, 0.5}, false, false}, {{0.05, 0.6}, true, true},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(outward.contains(c.point), c.inOutward) << c.point.x << " " << c.point.y;
        EXPECT_EQ(inward.contains(c.point), c.inInward) << c.point.x << " " << c.point.y;
    }
}

TEST(ZyrGeSegment2d, wrapsAndDeletesALineOrArcButNoUnboundedLine) {
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
    struct Case {
        const char* name;
        ZyrGeSegment2d a, b;
        int count;
        bool overlapping;
    };
    const Case cases[] = {
        {"lines crossing", {{0, 0}, {2, 2}}, {{0, 2}, {2, 0}}, 1, false},
        {"lines apart", {{0, 0}, {1, 0}}, {{0, 1}, {1, 1}}, 0, false},
        {"lines overlapping", {{0, 0}, {2, 0}}, {{1, 0}, {3, 0}}, 0, true},
        {"lines end to end", {{0, 0}, {1, 0}}, {{1, 0}, {3, 0}}, 1, false},
        {"line through half circle", {{0, -1}, {2, -1}, 1.0}, {{1, -5}, {1, 5}}, 1, false},
        {"line across full chord", {{0, 0}, {2, 0}, -1.0}, {{-1, 0.5}, {3, 0.5}}, 2, false},
        {"line tangent", {{0, 0}, {2, 0}, -1.0}, {{-1, 1}, {3, 1}}, 1, false},
        {"line missing the arc's side", {{0, 0}, {2, 0}, 1.0}, {{-1, 0.5}, {3, 0.5}}, 0, false},
        {"arcs whose circles cross twice",
         {{0, 0}, {2, 0}, -1.0},
         {{1, 0}, {3, 0}, -1.0},
         1,
         false},
        {"same circle apart ends", {{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, 1.0}, 2, false},
        {"same circle overlapping", {{0, 0}, {2, 0}, 1.0}, {{1, -1}, {1, 1}, 1.0}, 0, true},
    };
    for (const Case& c : cases) {
        for (bool swapped : {false, true}) {
            SCOPED_TRACE(std::string(c.name) + (swapped ? " swapped" : ""));
            const auto contact = swapped ? c.b.intersectWith(c.a) : c.a.intersectWith(c.b);
            EXPECT_EQ(contact.count, c.count);
            EXPECT_EQ(contact.overlapping, c.overlapping);
        }
    }
}

} // namespace
