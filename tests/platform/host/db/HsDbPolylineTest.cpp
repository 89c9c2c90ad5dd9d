// The polyline: vertices with bulges and widths, moves that keep its arcs, and its filing.
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeMatrix3d.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>
#include <tuple>

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

std::vector<HsGePoint3d> pointsOf(const HsDbPolyline& polyline) {
    std::vector<HsGePoint3d> points(polyline.numVerts());
    for (unsigned int i = 0; i < points.size(); ++i)
        EXPECT_EQ(polyline.getPointAt(i, points[i]), Hsys::eSuccess);
    return points;
}

TEST(HsDbPolyline, verticesGoWhereTheIndexSays) {
    HsDbPolyline polyline;
    drawRoom(polyline);
    EXPECT_EQ(pointsOf(polyline),
              (std::vector<HsGePoint3d>{
                  {0.0, 0.0, 0.0}, {2.0, -1.0, 0.0}, {4.0, 0.0, 0.0}, {4.0, 3.0, 0.0}}));
    double widths[2] = {};
    EXPECT_EQ(polyline.getWidthsAt(3, widths[0], widths[1]), Hsys::eSuccess);
    EXPECT_EQ(widths[1], 0.4);
    HsGePoint2d untouched{9.0, 9.0};
    EXPECT_EQ(polyline.getPointAt(4, untouched), Hsys::eInvalidIndex);
    EXPECT_EQ(untouched.x, 9.0);
    EXPECT_EQ(polyline.addVertexAt(6, {0.0, 0.0}), Hsys::eInvalidIndex);
    EXPECT_EQ(polyline.addVertexAt(0, {std::numeric_limits<double>::quiet_NaN(), 0.0}),
              Hsys::eBadArgument);
    EXPECT_EQ(polyline.removeVertexAt(1), Hsys::eSuccess);
    EXPECT_EQ(polyline.numVerts(), 3u);
}

TEST(HsDbPolyline, movesThatKeepCirclesCarryEveryVertexAndOthersChangeNothing) {
    const HsGeMatrix3d turnAndShift =
        HsGeMatrix3d::translation({10.0, 20.0, 5.0}) *
        HsGeMatrix3d::rotation(std::numbers::pi / 2, HsGeVector3d::kZAxis);
    // What the move is, the move, what it does to widths, and whether it is refused.
    const std::tuple<const char*, HsGeMatrix3d, double, bool> cases[] = {
        {"turn and shift", turnAndShift, 1.0, false},
        {"uniform scale", HsGeMatrix3d::scaling(2.5, {1.0, 1.0, 0.0}), 2.5, false},
        {"mirror", HsGeMatrix3d::scaling(-1.0, 1.0, 1.0), 1.0, false},
        {"tilt into another plane", HsGeMatrix3d::rotation(0.3, HsGeVector3d::kXAxis), 1.0, false},
        {"stretch would bend arcs", HsGeMatrix3d::scaling(2.0, 1.0, 1.0), 1.0, true},
        {"flatten", HsGeMatrix3d::scaling(0.0), 1.0, true},
    };
    HsDbPolyline original;
    drawRoom(original);
    for (const auto& [what, xform, widthFactor, refused] : cases) {
        SCOPED_TRACE(what);
        HsDbPolyline polyline;
        drawRoom(polyline);
        EXPECT_EQ(polyline.transformBy(xform), refused ? Hsys::eBadArgument : Hsys::eSuccess);
        const std::vector<HsGePoint3d> moved = pointsOf(polyline);
        const std::vector<HsGePoint3d> before = pointsOf(original);
        for (std::size_t i = 0; i < moved.size(); ++i) {
            const HsGePoint3d expected = refused ? before[i] : xform * before[i];
            EXPECT_NEAR(moved[i].distanceTo(expected), 0.0, 1e-12) << "vertex " << i;
        }
        double bulge = 0.0;
        double start = 0.0;
        double end = 0.0;
        polyline.getBulgeAt(2, bulge);
        polyline.getWidthsAt(3, start, end);
        EXPECT_EQ(bulge, 1.0) << "the moved axes carry any mirror";
        EXPECT_NEAR(start, 0.2 * widthFactor, 1e-12);
        EXPECT_NEAR(polyline.xAxis().length(), 1.0, 1e-12);
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
    EXPECT_EQ(pointsOf(copy), pointsOf(source));
    EXPECT_TRUE(copy.isClosed());
    EXPECT_TRUE(copy.hasPlinegen());

    // Owner, layer, two flags and the origin come before the x axis.
    const std::size_t xAxisAt = 8 + 8 + 1 + 1 + 24;
    const std::tuple<const char*, std::size_t, std::vector<std::uint8_t>> cases[] = {
        {"an x axis of length 2", xAxisAt, {0, 0, 0, 0, 0, 0, 0, 0x40}},
        {"an x axis of NaN", xAxisAt, {0, 0, 0, 0, 0, 0, 0xF8, 0x7F}},
        {"more vertices than bytes", xAxisAt + 48, {0xFF, 0xFF, 0, 0}},
    };
    for (const auto& [what, at, patch] : cases) {
        std::vector<std::uint8_t> bytes = writer.bytes();
        std::copy(patch.begin(), patch.end(), bytes.begin() + static_cast<long>(at));
        HsDbBdfFiler hostile(bytes, &db);
        HsDbPolyline target;
        drawRoom(target);
        EXPECT_EQ(target.bdfInFields(&hostile), Hsys::eFilerError) << what;
        EXPECT_EQ(target.numVerts(), 4u) << what;
        EXPECT_EQ(target.xAxis().x, 1.0) << what;
    }
}

} // namespace
