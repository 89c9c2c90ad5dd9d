// Triangulation of planar faces: tiling, exact corners, turn, shape, refusal of crossings.
#include "platform/solid/SolidraFace.h"
#include "platform/solid/SolidraBody.h"
#include "platform/solid/SolidraErrorCode.h"
#include "platform/solid/SolidraOutputTriangleCallback.h"
#include "tests/platform/solid/SolidraTestRings.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <limits>
#include <numbers>
#include <optional>
#include <set>
#include <string>
#include <tuple>
#include <unordered_map>
#include <utility>

namespace {

using Solidra::ErrorCode;
using Solidra::Face;
using Solidra::Point3d;
using Solidra::Vertex;
using namespace SolidraTestRings;

using Corners = std::array<const Vertex*, 3>;

class TriangleCollector : public Solidra::OutputTriangleCallback {
public:
    std::vector<Corners> triangles;

    void outputTriangle(Solidra::Edge** edges, int count) override {
        ASSERT_EQ(count, 3);
        for (int k = 0; k < 3; ++k)
            ASSERT_EQ(edges[k]->endVertex(), edges[(k + 1) % 3]->vertex()) << "edges chain";
        triangles.push_back({edges[0]->vertex(), edges[1]->vertex(), edges[2]->vertex()});
    }
    void outputTriStrip(Solidra::Edge**, int, bool) override {
        ADD_FAILURE() << "single-triangle delivery handed over a strip";
    }
};

std::vector<Corners> triangulate(const Face& face) {
    TriangleCollector collector;
    face.triangulate(&collector, Solidra::kSingleTriangles);
    return collector.triangles;
}

// The corners, copied out before the face goes.
using Triangle = std::array<Point3d, 3>;
std::vector<Triangle> triangulate(const Ring& ring) {
    const Face face(ring.data(), static_cast<int>(ring.size()), 0, false, nullptr, nullptr);
    std::vector<Triangle> triangles;
    for (const Corners& t : triangulate(face))
        triangles.push_back({t[0]->point(), t[1]->point(), t[2]->point()});
    return triangles;
}

// The error a ring is refused with, or nothing when it triangulates.
std::optional<ErrorCode> refusal(const Ring& ring) {
    try {
        triangulate(ring);
    } catch (const ErrorCode& error) {
        return error;
    }
    return std::nullopt;
}

// Twice the signed area of (a, b, c) seen down z, measured from a.
double twiceArea(const Point3d& a, const Point3d& b, const Point3d& c) {
    return (b.x - a.x) * (c.y - a.y) - (b.y - a.y) * (c.x - a.x);
}

double ringArea(const Ring& ring) {
    double twice = 0.0;
    for (std::size_t i = 1; i + 1 < ring.size(); ++i)
        twice += twiceArea(ring[0], ring[i], ring[i + 1]);
    return twice / 2.0;
}

const Point3d& pointOf(const Point3d& point) {
    return point;
}
const Point3d& pointOf(const Vertex* vertex) {
    return vertex->point();
}

// The signed area of triangles given by their corners or by the face's vertices.
template <class Triangles> double trianglesArea(const Triangles& triangles) {
    double twice = 0.0;
    for (const auto& t : triangles)
        twice += twiceArea(pointOf(t[0]), pointOf(t[1]), pointOf(t[2]));
    return twice / 2.0;
}

// Checks that the triangles tile the simple ring: n - 2 of them, corners that are the face's own
// vertices, each turning as the ring turns, the ring's edges each used once in its direction and
// every other edge shared by two triangles in opposite directions, the ring's area in sum.
void expectTiling(const Ring& ring, const std::string& name) {
    SCOPED_TRACE(name);
    const Face face(ring.data(), static_cast<int>(ring.size()), 0, false, nullptr, nullptr);
    std::unordered_map<const Vertex*, int> indexOf;
    for (int i = 0; i < face.vertexCount(); ++i)
        indexOf[face.vertex(i)] = i;
    const std::vector<Corners> triangles = triangulate(face);
    ASSERT_EQ(triangles.size(), ring.size() - 2);

    const double area = ringArea(ring);
    std::set<std::pair<int, int>> edges;
    for (const Corners& t : triangles) {
        const double twice = twiceArea(t[0]->point(), t[1]->point(), t[2]->point());
        ASSERT_GT(twice * area, 0.0) << "a triangle turns against the ring or is flat";
        for (int k = 0; k < 3; ++k) {
            ASSERT_EQ(indexOf.count(t[k]), 1u) << "a corner that is not a vertex of the face";
            ASSERT_TRUE(edges.emplace(indexOf[t[k]], indexOf[t[(k + 1) % 3]]).second);
        }
    }
    const int n = static_cast<int>(ring.size());
    for (const auto& [from, to] : edges) {
        const bool onRing = to == (from + 1) % n;
        ASSERT_EQ(edges.count({to, from}), onRing ? 0u : 1u) << from << " -> " << to;
    }
    for (int i = 0; i < n; ++i)
        ASSERT_EQ(edges.count({i, (i + 1) % n}), 1u) << "ring edge " << i << " not kept";
    EXPECT_NEAR(trianglesArea(triangles), area, 1e-9 * std::fabs(area));
}

// A square whose sides carry points pushed off the line by a millionth of a millionth.
Ring squareWithNearlyStraightSides(int pointsPerSide) {
    Ring ring;
    const Point3d corners[] = {{0, 0, 0}, {10, 0, 0}, {10, 10, 0}, {0, 10, 0}};
    for (int side = 0; side < 4; ++side) {
        const Point3d& a = corners[side];
        const Point3d& b = corners[(side + 1) % 4];
        for (int i = 0; i < pointsPerSide; ++i) {
            const double t = double(i) / pointsPerSide;
            const double push = i % 2 == 1 ? 1e-12 : 0.0;
            ring.push_back({a.x + t * (b.x - a.x) + push, a.y + t * (b.y - a.y) - push, 0.0});
        }
    }
    return ring;
}

TEST(SolidraFace, trianglesTileRoomsAndOutlinesInBothTurns) {
    const std::vector<std::pair<std::string, Ring>> rings = {
        {"triangle", {{0, 0, 0}, {4, 0, 0}, {1, 3, 0}}},
        {"triangle as large as is taken", {{-1e60, -1e60, 0}, {1e60, -1e60, 0}, {0, 1e60, 0}}},
        {"rectangle", staircaseRoom(1, 1)},
        {"L-room", staircaseRoom(2, 2)},
        {"staircase room of 30", staircaseRoom(14, 3)},
        {"U-room",
         {{0, 0, 0}, {9, 0, 0}, {9, 6, 0}, {6, 6, 0}, {6, 2, 0}, {3, 2, 0}, {3, 6, 0}, {0, 6, 0}}},
        {"walls with points on them",
         {{0, 0, 0}, {2, 0, 0}, {5, 0, 0}, {5, 1, 0}, {5, 3, 0}, {1, 3, 0}, {0, 3, 0}}},
        {"nearly straight sides", squareWithNearlyStraightSides(50)},
        {"comb", comb(40)},
        {"spiral", spiral(2000)},
        {"star", star(1000, 7)},
        {"circle", regularPolygon(5000, 12.5)},
        {"room at survey coordinates", translated(staircaseRoom(5, 4), 3.5e6, 5.6e6)},
    };
    for (const auto& [name, ring] : rings) {
        expectTiling(ring, name);
        expectTiling(reversed(ring), name + ", clockwise");
    }
}

TEST(SolidraFace, aHundredThousandVerticesTile) {
    // 50,002 of them on the bar's lower wall, between the teeth.
    expectTiling(comb(25000), "comb of 100,004");
}

TEST(SolidraFace, corridorTrianglesAreAsWellShapedAsItsPointsAllow) {
    // Points every half metre along both walls of a 10 m by 1 m corridor: a triangle between
    // the walls can do no better than 26.57 degrees, while a fan from one corner goes below 3.
    Ring corridor;
    for (int i = 0; i <= 20; ++i)
        corridor.push_back({0.5 * i, 0.0, 0.0});
    for (int i = 20; i >= 0; --i)
        corridor.push_back({0.5 * i, 1.0, 0.0});
    double smallest = 180.0;
    for (const Triangle& t : triangulate(corridor)) {
        for (int k = 0; k < 3; ++k) {
            const Point3d& a = t[k];
            const Point3d& b = t[(k + 1) % 3];
            const Point3d& c = t[(k + 2) % 3];
            const double dot = (b.x - a.x) * (c.x - a.x) + (b.y - a.y) * (c.y - a.y);
            const double angle = std::atan2(std::fabs(twiceArea(a, b, c)), dot);
            smallest = std::min(smallest, angle * 180.0 / std::numbers::pi);
        }
    }
    EXPECT_NEAR(smallest, std::atan(0.5) * 180.0 / std::numbers::pi, 1e-9);
}

// A ring of the plane z = 0 carried into 3D by a rotation (its first two columns) and a shift.
Ring tilted(const Ring& ring, const double (&rotation)[3][3]) {
    Ring out;
    for (const Point3d& p : ring) {
        out.push_back({rotation[0][0] * p.x + rotation[0][1] * p.y + 7.0,
                       rotation[1][0] * p.x + rotation[1][1] * p.y - 3.0,
                       rotation[2][0] * p.x + rotation[2][1] * p.y + 2.5});
    }
    return out;
}

// Stands a ring up as a wall facing +y: x stays, y becomes z.
constexpr double kWallAlongX[3][3] = {{-1, 0, 0}, {0, 0, 0}, {0, 1, 0}};

TEST(SolidraFace, crossingLoopsAreRefusedInBothTurns) {
    Ring crossedComb = comb(30);
    std::swap(crossedComb[10], crossedComb[14]); // one tooth reaches over its neighbour
    const std::vector<std::pair<std::string, Ring>> rings = {
        {"bow tie", {{0, 0, 0}, {2, 2, 0}, {2, 0, 0}, {0, 2, 0}}},
        {"crossed comb", crossedComb},
        {"loops turning apart at a shared vertex",
         {{0, 0, 0}, {1, 1, 0}, {2, 2, 0}, {2, 0, 0}, {1, 1, 0}, {0, 2, 0}}},
        {"loops turning apart at a vertex on another edge",
         {{0, 0, 0}, {4, 0, 0}, {4, 2, 0}, {2, 0, 0}, {0, -2, 0}}},
        {"square walked twice",
         {{0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 1, 0}, {0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 1, 0}}},
    };
    for (const auto& [name, ring] : rings) {
        for (const Ring& turned : {ring, reversed(ring), tilted(ring, kWallAlongX)}) {
            const std::optional<ErrorCode> error = refusal(turned);
            ASSERT_TRUE(error.has_value()) << name << " was triangulated";
            EXPECT_EQ(error->value(), ErrorCode::eSelfCrossing) << name;
        }
    }
    EXPECT_STREQ(refusal(rings[0].second)->what(), "eSelfCrossing (1): edge 2 from vertex 2 to "
                                                   "vertex 3 crosses another edge of the face");
}

TEST(SolidraFace, loopsTouchingThemselvesWithoutCrossingTile) {
    const std::vector<std::tuple<std::string, Ring, double, std::size_t>> rings = {
        {"two triangles sharing a corner",
         {{0, 0, 0}, {1, 1, 0}, {2, 0, 0}, {2, 2, 0}, {1, 1, 0}, {0, 2, 0}},
         2.0,
         2},
        {"a wall jutting into the room",
         {{0, 0, 0}, {4, 0, 0}, {4, 4, 0}, {2, 4, 0}, {2, 2, 0}, {2, 4, 0}, {0, 4, 0}},
         16.0,
         5},
        {"a wall jutting out of the room",
         {{0, 0, 0}, {4, 0, 0}, {4, 4, 0}, {4, 6, 0}, {4, 4, 0}, {0, 4, 0}},
         16.0,
         2},
        {"repeated points and a closing point",
         {{0, 0, 0}, {0, 0, 0}, {3, 0, 0}, {3, 3, 0}, {3, 3, 0}, {0, 3, 0}, {0, 0, 0}},
         9.0,
         2},
    };
    for (const auto& [name, ring, area, count] : rings) {
        const std::vector<Triangle> triangles = triangulate(ring);
        EXPECT_EQ(triangles.size(), count) << name;
        EXPECT_NEAR(trianglesArea(triangles), area, 1e-12) << name;
        EXPECT_NEAR(trianglesArea(triangulate(reversed(ring))), -area, 1e-12) << name;
    }
}

TEST(SolidraFace, aPointMetAgainIsTheVertexWhereTheLoopFirstPassed) {
    const Ring bothTriangles = {{0, 0, 0}, {1, 1, 0}, {2, 0, 0}, {2, 2, 0}, {1, 1, 0}, {0, 2, 0}};
    const Face face(bothTriangles.data(), 6, 0, false, nullptr, nullptr);
    std::multiset<const Vertex*> corners;
    for (const Corners& t : triangulate(face))
        corners.insert(t.begin(), t.end());
    EXPECT_EQ(corners.count(face.vertex(1)), 2u);
    EXPECT_EQ(corners.count(face.vertex(4)), 0u);
}

TEST(SolidraFace, loopsBoundingNoAreaGiveNoTriangle) {
    const std::vector<std::pair<std::string, Ring>> rings = {
        {"no point", {}},
        {"one point", {{1, 2, 0}}},
        {"two points", {{1, 2, 0}, {3, 4, 0}}},
        {"three points on a line", {{0, 0, 0}, {2, 1, 0}, {4, 2, 0}}},
        {"a line walked there and back", {{0, 0, 0}, {1, 0, 0}, {2, 0, 0}, {1, 0, 0}}},
        {"one point three times", {{5, 5, 0}, {5, 5, 0}, {5, 5, 0}}},
        {"points on a line in space", {{1, 2, 3}, {2, 4, 5}, {4, 8, 9}, {3, 6, 7}}},
    };
    for (const auto& [name, ring] : rings)
        EXPECT_TRUE(triangulate(ring).empty()) << name;

    const Face fromNothing(nullptr, 5, 0, false, nullptr, nullptr);
    const Point3d one{1, 1, 1};
    const Face negativeCount(&one, -3, 0, false, nullptr, nullptr);
    EXPECT_EQ(fromNothing.vertexCount(), 0);
    EXPECT_EQ(negativeCount.vertexCount(), 0);
    EXPECT_TRUE(triangulate(negativeCount).empty());
}

TEST(SolidraFace, refusesWhatItCannotComputeWithBeforeDeliveringAnything) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double inf = std::numeric_limits<double>::infinity();
    const std::vector<std::tuple<Ring, ErrorCode::Value, std::string>> cases = {
        {{{0, 0, 0}, {1, 0, 0}, {1, nan, 0}, {0, 1, 0}},
         ErrorCode::eBadCoordinate,
         "vertex 2 is at"},
        {{{0, 0, 0}, {1, 0, inf}, {0, 1, 0}}, ErrorCode::eBadCoordinate, "vertex 1 is at"},
        {{{0, 0, 0}, {1e60, 0, 0}, {-1e61, 1, 0}},
         ErrorCode::eBadCoordinate,
         "vertex 2 is at (-1e+61"},
        {{{nan, 0, 0}, {1, 0, 0}}, ErrorCode::eBadCoordinate, "vertex 0 is at (nan"},
        {{{0, 0, 0}, {4, 0, 0}, {4, 4, 0.001}, {0, 4, 0}},
         ErrorCode::eNotPlanar,
         "off the face's plane"},
    };
    for (const auto& [ring, code, detail] : cases) {
        TriangleCollector collector;
        const Face face(ring.data(), static_cast<int>(ring.size()), 0, false, nullptr, nullptr);
        try {
            face.triangulate(&collector, Solidra::kSingleTriangles);
            ADD_FAILURE() << detail << ": accepted";
        } catch (const ErrorCode& error) {
            EXPECT_EQ(error.value(), code);
            EXPECT_NE(std::string(error.what()).find(detail), std::string::npos) << error.what();
        }
        EXPECT_TRUE(collector.triangles.empty());
    }

    const Ring square = staircaseRoom(1, 1);
    const Face face(square.data(), 4, 0, false, nullptr, nullptr);
    TriangleCollector collector;
    const auto codeOf = [&](Solidra::OutputTriangleCallback* callback, int type) {
        try {
            face.triangulate(callback, static_cast<Solidra::TriangulationType>(type));
        } catch (const ErrorCode& error) {
            return error.value();
        }
        return ErrorCode::Value{};
    };
    EXPECT_EQ(codeOf(nullptr, 0), ErrorCode::eNoCallback);
    EXPECT_EQ(codeOf(&collector, 1), ErrorCode::eUnknownTriangulationType);
    EXPECT_EQ(codeOf(&collector, -1), ErrorCode::eUnknownTriangulationType);
}

TEST(SolidraFace, facesInAnyPlaneTriangulateInThatPlane) {
    const double c = std::cos(0.7);
    const double s = std::sin(0.7);
    const double r = 1.0 / std::sqrt(3.0);
    const double sloped[3][3] = {{c, -s * r, 0}, {s, c * r, 0}, {0, std::sqrt(2.0 / 3.0), 0}};
    const double wallAlongY[3][3] = {{0, 0, 0}, {1, 0, 0}, {0, 1, 0}};
    const Ring room = staircaseRoom(4, 9);
    for (const auto* rotation : {&sloped, &wallAlongY, &kWallAlongX}) {
        for (const Ring& flat : {room, reversed(room)}) {
            const Ring ring = tilted(flat, *rotation);
            const std::vector<Triangle> triangles = triangulate(ring);
            ASSERT_EQ(triangles.size(), ring.size() - 2);
            // The triangles' vector areas add up to the room's, which keeps its size and turn.
            double sum[3] = {0, 0, 0};
            for (const auto& [a, b, d] : triangles) {
                const double u[3] = {b.x - a.x, b.y - a.y, b.z - a.z};
                const double v[3] = {d.x - a.x, d.y - a.y, d.z - a.z};
                sum[0] += (u[1] * v[2] - u[2] * v[1]) / 2.0;
                sum[1] += (u[2] * v[0] - u[0] * v[2]) / 2.0;
                sum[2] += (u[0] * v[1] - u[1] * v[0]) / 2.0;
            }
            const double area = ringArea(flat);
            // The plane's normal is the image of z: the cross product of the first two columns.
            const double(&m)[3][3] = *rotation;
            const double normal[3] = {m[1][0] * m[2][1] - m[2][0] * m[1][1],
                                      m[2][0] * m[0][1] - m[0][0] * m[2][1],
                                      m[0][0] * m[1][1] - m[1][0] * m[0][1]};
            for (int axis = 0; axis < 3; ++axis)
                EXPECT_NEAR(sum[axis], area * normal[axis], 1e-9 * std::fabs(area));
        }
    }
}

TEST(SolidraFace, keepsItsLoopEdgesTagAndTurn) {
    const Ring square = staircaseRoom(1, 5);
    Solidra::Edge* edges[4] = {};
    const Face face(square.data(), 4, 42, true, nullptr, edges);
    EXPECT_EQ(face.tag(), 42);
    EXPECT_EQ(face.body(), nullptr);
    ASSERT_EQ(face.edgeCount(), 4);
    const int walkedBack[] = {0, 3, 2, 1};
    for (int k = 0; k < 4; ++k) {
        EXPECT_EQ(edges[k], face.edge(k));
        EXPECT_EQ(edges[k], &face.vertex(k)->loopEdge());
        EXPECT_EQ(edges[k]->vertex(), face.vertex(k));
        EXPECT_EQ(edges[k]->endVertex(), face.vertex((k + 1) % 4));
        EXPECT_EQ(face.vertex(k)->point().x, square[walkedBack[k]].x);
        EXPECT_EQ(face.vertex(k)->point().y, square[walkedBack[k]].y);
    }
    EXPECT_EQ(face.vertex(4), nullptr);
    EXPECT_EQ(face.edge(-1), nullptr);
    EXPECT_NEAR(trianglesArea(triangulate(face)), -ringArea(square), 1e-12);
}

TEST(SolidraBody, ownsTheFacesBuiltIntoItAndLetsADeletedOneGo) {
    const std::size_t before = Solidra::Entity::liveCount();
    const Ring square = staircaseRoom(1, 5);
    auto* body = new Solidra::Body;
    Face* first = new Face(square.data(), 4, 1, false, body, nullptr);
    Face* second = new Face(square.data(), 4, 2, false, body, nullptr);
    Face* third = new Face(square.data(), 4, 3, false, body, nullptr);
    EXPECT_EQ(Solidra::Entity::liveCount(), before + 4);
    ASSERT_EQ(body->faceCount(), 3);
    EXPECT_EQ(body->face(0), first);
    EXPECT_EQ(second->body(), body);

    delete second;
    ASSERT_EQ(body->faceCount(), 2);
    EXPECT_EQ(body->face(1), third);
    EXPECT_EQ(body->face(2), nullptr);
    EXPECT_EQ(Solidra::Entity::liveCount(), before + 3);

    Solidra::Entity* asEntity = body;
    delete asEntity;
    EXPECT_EQ(Solidra::Entity::liveCount(), before);
}

} // namespace
