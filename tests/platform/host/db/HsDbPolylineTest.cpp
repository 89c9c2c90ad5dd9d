// The polyline: vertices with bulges and widths, moves that keep its arcs, and its filing.
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeMatrix3d.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>

namespace {

// The outline of a room with an arc on one side, as an area's outer ring gives it.
void drawRoom(HsDbPolyline& polyline) {
    polyline.setClosed(true);
    polyline.setPlinegen(true);
    polyline.addVertexAt(0, {0.0, 0.0});
    polyline.addVertexAt(1, {4.0, 0.0}, 1.0);
    polyline.addVertexAt(2, {4.0, 3.0}, 0.0, 0.2, 0.4);
    polyline.addVertexAt(1, {2.0, -1.0});
}

TEST(HsDbPolyline, verticesGoWhereTheIndexSays) {
    HsDbPolyline polyline;
    drawRoom(polyline);
    ASSERT_EQ(polyline.numVerts(), 4u);
    const double xs[] = {0.0, 2.0, 4.0, 4.0};
    for (unsigned int i = 0; i < 4; ++i) {
        HsGePoint2d point;
        ASSERT_EQ(polyline.getPointAt(i, point), Hsys::eSuccess);
        EXPECT_EQ(point.x, xs[i]) << "vertex " << i;
    }
    double bulge = 0.0;
    double start = 0.0;
    double end = 0.0;
    EXPECT_EQ(polyline.getBulgeAt(2, bulge), Hsys::eSuccess);
    EXPECT_EQ(bulge, 1.0);
    EXPECT_EQ(polyline.getWidthsAt(3, start, end), Hsys::eSuccess);
    EXPECT_EQ(start, 0.2);
    EXPECT_EQ(end, 0.4);

    HsGePoint2d untouched{9.0, 9.0};
    EXPECT_EQ(polyline.getPointAt(4, untouched), Hsys::eInvalidIndex);
    EXPECT_EQ(untouched.x, 9.0);
    EXPECT_EQ(polyline.addVertexAt(6, {0.0, 0.0}), Hsys::eInvalidIndex);
    EXPECT_EQ(polyline.addVertexAt(0, {std::numeric_limits<double>::quiet_NaN(), 0.0}),
              Hsys::eBadArgument);
    EXPECT_EQ(polyline.removeVertexAt(1), Hsys::eSuccess);
    EXPECT_EQ(polyline.numVerts(), 3u);
    EXPECT_TRUE(polyline.isClosed());
    EXPECT_TRUE(polyline.hasPlinegen());
}

TEST(HsDbPolyline, movesThatKeepCirclesCarryEveryVertexAndScaleTheWidths) {
    const HsGeMatrix3d turnAndShift =
        HsGeMatrix3d::translation({10.0, 20.0, 5.0}) *
        HsGeMatrix3d::rotation(std::numbers::pi / 2, HsGeVector3d::kZAxis);
    struct Case {
        const char* what;
        HsGeMatrix3d xform;
        double widthFactor;
    };
    const Case cases[] = {
        {"turn and shift", turnAndShift, 1.0},
        {"uniform scale", HsGeMatrix3d::scaling(2.5, {1.0, 1.0, 0.0}), 2.5},
        {"mirror", HsGeMatrix3d::scaling(-1.0, 1.0, 1.0), 1.0},
        {"tilt into another plane", HsGeMatrix3d::rotation(0.3, HsGeVector3d::kXAxis), 1.0},
    };
    HsDbPolyline original;
    drawRoom(original);
    for (const Case& c : cases) {
        HsDbPolyline polyline;
        drawRoom(polyline);
        ASSERT_EQ(polyline.transformBy(c.xform), Hsys::eSuccess) << c.what;
        for (unsigned int i = 0; i < polyline.numVerts(); ++i) {
            HsGePoint2d before;
            original.getPointAt(i, before);
            const HsGePoint3d expected = c.xform * HsGePoint3d(before.x, before.y, 0.0);
            HsGePoint3d moved;
            ASSERT_EQ(polyline.getPointAt(i, moved), Hsys::eSuccess);
            EXPECT_NEAR(moved.distanceTo(expected), 0.0, 1e-12) << c.what << ", vertex " << i;
        }
        double bulge = 0.0;
        double start = 0.0;
        double end = 0.0;
        polyline.getBulgeAt(2, bulge);
        polyline.getWidthsAt(3, start, end);
        EXPECT_EQ(bulge, 1.0) << c.what << ": the moved axes carry any mirror";
        EXPECT_NEAR(start, 0.2 * c.widthFactor, 1e-12) << c.what;
        EXPECT_NEAR(polyline.xAxis().length(), 1.0, 1e-12) << c.what;
    }
}

TEST(HsDbPolyline, aMoveThatWouldBendArcsIsRefusedAndChangesNothing) {
    HsDbPolyline polyline;
    drawRoom(polyline);
    const HsGeMatrix3d refused[] = {HsGeMatrix3d::scaling(2.0, 1.0, 1.0),
                                    HsGeMatrix3d::scaling(0.0)};
    for (const HsGeMatrix3d& xform : refused) {
        EXPECT_EQ(polyline.transformBy(xform), Hsys::eBadArgument);
        HsGePoint3d point;
        polyline.getPointAt(2, point);
        EXPECT_EQ(point.x, 4.0);
    }
}

TEST(HsDbPolyline, filesItsPlaneAndVerticesAndRefusesAnImpossiblePlane) {
    HsDbDatabase db(HsDb::kEmptyDatabase, HsDb::kNoTransactions);
    HsDbPolyline source;
    drawRoom(source);
    ASSERT_EQ(source.transformBy(HsGeMatrix3d::rotation(0.7, {1.0, 1.0, 0.0}, {3.0, 0.0, 1.0})),
              Hsys::eSuccess);
    HsDbBdfFiler writer(&db);
    ASSERT_EQ(source.bdfOutFields(&writer), Hsys::eSuccess);

    HsDbBdfFiler reader(writer.bytes(), &db);
    HsDbPolyline copy;
    ASSERT_EQ(copy.bdfInFields(&reader), Hsys::eSuccess);
    EXPECT_EQ(reader.remaining(), 0u);
    ASSERT_EQ(copy.numVerts(), source.numVerts());
    for (unsigned int i = 0; i < copy.numVerts(); ++i) {
        HsGePoint3d a;
        HsGePoint3d b;
        source.getPointAt(i, a);
        copy.getPointAt(i, b);
        EXPECT_EQ(a.distanceTo(b), 0.0) << "vertex " << i;
    }
    EXPECT_TRUE(copy.isClosed());

    // Owner, layer, two flags and the origin come before the x axis.
    const std::size_t xAxisAt = 8 + 8 + 1 + 1 + 24;
    const std::size_t countAt = xAxisAt + 48;
    struct Case {
        const char* what;
        std::size_t at;
        std::vector<std::uint8_t> bytes;
    };
    const Case cases[] = {
        {"an x axis of length 2", xAxisAt, {0, 0, 0, 0, 0, 0, 0, 0x40}},
        {"an x axis of NaN", xAxisAt, {0, 0, 0, 0, 0, 0, 0xF8, 0x7F}},
        {"more vertices than bytes", countAt, {0xFF, 0xFF, 0, 0}},
    };
    for (const Case& c : cases) {
        std::vector<std::uint8_t> bytes = writer.bytes();
        std::copy(c.bytes.begin(), c.bytes.end(), bytes.begin() + static_cast<long>(c.at));
        HsDbBdfFiler hostile(bytes, &db);
        HsDbPolyline target;
        drawRoom(target);
        EXPECT_EQ(target.bdfInFields(&hostile), Hsys::eFilerError) << c.what;
        EXPECT_EQ(target.numVerts(), 4u) << c.what;
        EXPECT_EQ(target.xAxis().x, 1.0) << c.what;
    }
}

} // namespace
