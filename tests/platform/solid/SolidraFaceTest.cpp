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
#include <memory>
#include <numbers>
#include <optional>
#include <set>
#include <string>
#include <unordered_map>
#include <utility>

namespace {

using Solidra::ErrorCode;
using Solidra::Face;
using Solidra::Point3d;
using Solidra::Vertex;
using namespace SolidraTestRings;

using Corners = std::array<const Vertex*, 3>;
using Triangle = std::array<Point3d, 3>;

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

std::unique_ptr<Face> faceOf(const Ring& ring) {
    return std::make_unique<Face>(ring.data(), static_cast<int>(ring.size()), 0, false, nullptr,
                                  nullptr);
}

std::vector<Corners> triangulate(const Face& face) {
    TriangleCollector collector;
    face.triangulate(&collector, Solidra::kSingleTriangles);
    return collector.triangles;
}

// The corners, copied out before the face goes.
std::vector<Triangle> triangulate(const Ring& ring) {
    const auto face = faceOf(ring);
    std::vector<Triangle> triangles;
    for (const Corners& t : triangulate(*face))
        triangles.push_back({t[0]->point(), t[1]->point(), t[2]->point()});
    return triangles;
}

// The error a ring is refused with, which must come before any triangle, or nothing.
std::optional<ErrorCode> refusal(const Ring& ring) {
    TriangleCollector collector;
    try {
        faceOf(ring)->triangulate(&collector, Solidra::kSingleTriangles);
    } catch (const ErrorCode& error) {
        EXPECT_TRUE(collector.triangles.empty()) << "delivered before refusing";
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

double trianglesArea(const std::vector<Triangle>& triangles) {
    double twice = 0.0;
    for (const auto& [a, b, c] : triangles)
        twice += twiceArea(a, b, c);
    return twice / 2.0;
}

// Checks that the triangles tile the simple ring: n - 2 of them, corners that are the face's own
// vertices, each turning as the ring turns, the ring's edges each used once in its direction and
// every other edge shared by two triangles in opposite directions, the ring's area in sum.
void expectTiling(const Ring& ring, const std::string& name) {
    SCOPED_TRACE(name);
    const auto face = faceOf(ring);
    std::unordered_map<const Vertex*, int> indexOf;
    for (int i = 0; i < face->vertexCount(); ++i)
        indexOf[face->vertex(i)] = i;
    const std::vector<Corners> triangles = triangulate(*face);
    ASSERT_EQ(triangles.size(), ring.size() - 2);

    const double area = ringArea(ring);
    double sum = 0.0;
    std::set<std::pair<int, int>> edges;
    for (const Corners& t : triangles) {
        const double twice = twiceArea(t[0]->point(), t[1]->point(), t[2]->point());
        ASSERT_GT(twice * area, 0.0) << "a triangle turns against the ring or is flat";
        sum += twice / 2.0;
        for (int k = 0; k < 3; ++k) {
            ASSERT_EQ(indexOf.count(t[k]), 1u) << "a corner that is not a vertex of the face";
            ASSERT_TRUE(edges.emplace(indexOf[t[k]], indexOf[t[(k + 1) % 3]]).second);
        }
    }
    const int n = static_cast<int>(ring.size());
    for (int i = 0; i < n; ++i)
        ASSERT_EQ(edges.count({i, (i + 1) % n}), 1u) << "ring edge " << i << " not kept";
    for (const auto& [from, to] : edges)
        ASSERT_EQ(edges.count({to, from}), to == (from + 1) % n ? 0u : 1u) << from << "->" << to;
    EXPECT_NEAR(sum, area, 1e-9 * std::fabs(area));
}

// A square whose sides carry points pushed off the line by a millionth of a millionth.
Ring squareWithNearlyStraightSides(int pointsPerSide) {
    Ring ring;
    for (int side = 0; side < 4; ++side) {
        for (int i = 0; i < pointsPerSide; ++i) {
            const double t = 10.0 * i / pointsPerSide;
            const double p = i % 2 == 1 ? 1e-12 : 0.0;
            const Point3d along[] = {{t, 0, 0}, {10, t, 0}, {10 - t, 10, 0}, {0, 10 - t, 0}};
            ring.push_back({along[side].x + p, along[side].y - p, 0.0});
        }
    }
    return ring;
}

TEST(SolidraFace, trianglesTileRoomsAndOutlinesInBothTurns) {
    // clang-format off
    const std::vector<std::pair<std::string, Ring>> rings = {
        {"triangle", {{0, 0, 0}, {4, 0, 0}, {1, 3, 0}}},
        {"triangle as large as is taken", {{-1e60, -1e60, 0}, {1e60, -1e60, 0}, {0, 1e60, 0}}},
        {"rectangle", staircaseRoom(1, 1)},
        {"L-room", staircaseRoom(2, 2)},
        {"staircase room of 30", staircaseRoom(14, 3)},
        {"U-room", {{0, 0, 0}, {9, 0, 0}, {9, 6, 0}, {6, 6, 0}, {6, 2, 0}, {3, 2, 0}, {3, 6, 0}, {0, 6, 0}}},
        {"walls with points on them", {{0, 0, 0}, {2, 0, 0}, {5, 0, 0}, {5, 1, 0}, {5, 3, 0}, {1, 3, 0}, {0, 3, 0}}},
        {"nearly straight sides", squareWithNearlyStraightSides(50)},
        {"comb", comb(40)},
        {"spiral", spiral(2000)},
        {"star", star(1000, 7)},
        {"circle", regularPolygon(5000, 12.5)},
        {"room at survey coordinates", translated(staircaseRoom(5, 4), 3.5e6, 5.6e6)}};
    // clang-format on
    for (const auto& [name, ring] : rings) {
        expectTiling(ring, name);
        expectTiling(reversed(ring), name + ", clockwise");
    }
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
    double smallest = std::numbers::pi;
    for (const Triangle& t : triangulate(corridor)) {
        for (int k = 0; k < 3; ++k) {
            const Point3d& a = t[k];
            const Point3d& b = t[(k + 1) % 3];
            const Point3d& c = t[(k + 2) % 3];
            const double dot = (b.x - a.x) * (c.x - a.x) + (b.y - a.y) * (c.y - a.y);
            smallest = std::min(smallest, std::atan2(std::fabs(twiceArea(a, b, c)), dot));
        }
    }
    EXPECT_NEAR(smallest, std::atan(0.5), 1e-11);
}

// A ring carried into 3D by a rotation, whose last column is the image of z, and a shift.
Ring tilted(const Ring& ring, const double (&m)[3][3]) {
    Ring out;
    for (const Point3d& p : ring) {
        out.push_back({m[0][0] * p.x + m[0][1] * p.y + m[0][2] * p.z + 7.0,
                       m[1][0] * p.x + m[1][1] * p.y + m[1][2] * p.z - 3.0,
                       m[2][0] * p.x + m[2][1] * p.y + m[2][2] * p.z + 2.5});
    }
    return out;
}

// Stands a ring up as a wall facing +y: x stays, y becomes z.
constexpr double kWallAlongX[3][3] = {{-1, 0, 0}, {0, 0, 1}, {0, 1, 0}};

TEST(SolidraFace, loopsNotSimpleTileTheirAreaOrAreRefusedBeforeDeliveringAnything) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double inf = std::numeric_limits<double>::infinity();
    Ring crossedComb = comb(30);
    std::swap(crossedComb[10], crossedComb[14]); // one tooth reaches over its neighbour
    // A refused loop gives its error, and its message the detail, in every turn; the others give
    // their triangles and area, negated when walked backwards.
    const struct {
        const char* name;
        Ring ring;
        ErrorCode::Value error;
        const char* detail;
        std::size_t count = 0;
        double area = 0.0;
    } cases[] = {
        // clang-format off
        {"bow tie", {{0, 0, 0}, {2, 2, 0}, {2, 0, 0}, {0, 2, 0}}, ErrorCode::eSelfCrossing, ""},
        {"crossed comb", crossedComb, ErrorCode::eSelfCrossing, ""},
        {"loops turning apart at a shared vertex", {{0, 0, 0}, {1, 1, 0}, {2, 2, 0}, {2, 0, 0}, {1, 1, 0},
         {0, 2, 0}}, ErrorCode::eSelfCrossing, ""},
        {"loops turning apart at a vertex on another edge", {{0, 0, 0}, {4, 0, 0}, {4, 2, 0}, {2, 0, 0},
         {0, -2, 0}}, ErrorCode::eSelfCrossing, ""},
        {"square walked twice", {{0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 1, 0}, {0, 0, 0}, {1, 0, 0}, {1, 1, 0},
         {0, 1, 0}}, ErrorCode::eSelfCrossing, ""},
        {"not a number", {{0, 0, 0}, {1, 0, 0}, {1, nan, 0}, {0, 1, 0}}, ErrorCode::eBadCoordinate,
         "vertex 2 is at"},
        {"infinite", {{0, 0, 0}, {1, 0, inf}, {0, 1, 0}}, ErrorCode::eBadCoordinate, "vertex 1 is at"},
        {"too far", {{0, 0, 0}, {1e60, 0, 0}, {-1e61, 1, 0}}, ErrorCode::eBadCoordinate,
         "vertex 2 is at (-1e+61"},
        {"two points, one not a number", {{nan, 0, 0}, {1, 0, 0}}, ErrorCode::eBadCoordinate,
         "vertex 0 is at (nan"},
        {"not planar", {{0, 0, 0}, {4, 0, 0}, {4, 4, 0.001}, {0, 4, 0}}, ErrorCode::eNotPlanar,
         "off the face's plane"},
        {"two triangles sharing a corner", {{0, 0, 0}, {1, 1, 0}, {2, 0, 0}, {2, 2, 0}, {1, 1, 0},
         {0, 2, 0}}, {}, "", 2, 2.0},
        {"a wall jutting into the room", {{0, 0, 0}, {4, 0, 0}, {4, 4, 0}, {2, 4, 0}, {2, 2, 0},
         {2, 4, 0}, {0, 4, 0}}, {}, "", 5, 16.0},
        {"a wall jutting out of the room", {{0, 0, 0}, {4, 0, 0}, {4, 4, 0}, {4, 6, 0}, {4, 4, 0},
         {0, 4, 0}}, {}, "", 2, 16.0},
        {"repeated points and a closing point", {{0, 0, 0}, {0, 0, 0}, {3, 0, 0}, {3, 3, 0}, {3, 3, 0},
         {0, 3, 0}, {0, 0, 0}}, {}, "", 2, 9.0},
        {"no point", {}, {}, ""},
        {"one point", {{1, 2, 0}}, {}, ""},
        {"two points", {{1, 2, 0}, {3, 4, 0}}, {}, ""},
        {"three points on a line", {{0, 0, 0}, {2, 1, 0}, {4, 2, 0}}, {}, ""},
        {"a line walked there and back", {{0, 0, 0}, {1, 0, 0}, {2, 0, 0}, {1, 0, 0}}, {}, ""},
        {"one point three times", {{5, 5, 0}, {5, 5, 0}, {5, 5, 0}}, {}, ""},
        {"points on a line in space", {{1, 2, 3}, {2, 4, 5}, {4, 8, 9}, {3, 6, 7}}, {}, ""},
        // clang-format on
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.name);
        for (const Ring& turned : {c.ring, reversed(c.ring), tilted(c.ring, kWallAlongX)}) {
            const std::optional<ErrorCode> error = refusal(turned);
            EXPECT_EQ(error ? error->value() : ErrorCode::Value{}, c.error);
        }
        if (c.error != ErrorCode::Value{}) {
            const std::string message = refusal(c.ring).value().what();
            EXPECT_NE(message.find(c.detail), std::string::npos) << message;
            continue;
        }
        EXPECT_EQ(triangulate(c.ring).size(), c.count);
        EXPECT_NEAR(trianglesArea(triangulate(c.ring)), c.area, 1e-12);
        EXPECT_NEAR(trianglesArea(triangulate(reversed(c.ring))), -c.area, 1e-12);
    }
    EXPECT_STREQ(refusal(cases[0].ring).value().what(),
                 "eSelfCrossing (1): edge 2 from vertex 2 to "
                 "vertex 3 crosses another edge of the face");
    // A point met again is the vertex where the loop first passed.
    const auto face = faceOf(cases[10].ring);
    std::multiset<const Vertex*> corners;
    for (const Corners& t : triangulate(*face))
        corners.insert(t.begin(), t.end());
    EXPECT_EQ(corners.count(face->vertex(1)), 2u);
    EXPECT_EQ(corners.count(face->vertex(4)), 0u);
}

TEST(SolidraFace, emptyFacesAndBadCallsGiveNothing) {
    const Point3d one{1, 1, 1};
    const Face fromNothing(nullptr, 5, 0, false, nullptr, nullptr);
    const Face negativeCount(&one, -3, 0, false, nullptr, nullptr);
    EXPECT_EQ(fromNothing.vertexCount(), 0);
    EXPECT_EQ(negativeCount.vertexCount(), 0);
    EXPECT_TRUE(triangulate(negativeCount).empty());

    const auto face = faceOf(staircaseRoom(1, 1));
    TriangleCollector collector;
    const auto codeOf = [&face](Solidra::OutputTriangleCallback* callback, int type) {
        try {
            face->triangulate(callback, static_cast<Solidra::TriangulationType>(type));
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
    const double q = std::sqrt(2.0 / 3.0);
    const double sloped[3][3] = {{c, -s * r, s * q}, {s, c * r, -c * q}, {0, q, r}};
    const double wallAlongY[3][3] = {{0, 0, 1}, {1, 0, 0}, {0, 1, 0}};
    const Ring room = staircaseRoom(4, 9);
    for (const auto* rotation : {&sloped, &wallAlongY, &kWallAlongX}) {
        for (const Ring& flat : {room, reversed(room)}) {
            const std::vector<Triangle> triangles = triangulate(tilted(flat, *rotation));
            ASSERT_EQ(triangles.size(), flat.size() - 2);
            // The corners are the face's, so in its plane: the triangles' vector areas along the
            // normal (the image of z) add up to the room's, with its turn.
            double sum = 0.0;
            for (const auto& [a, b, d] : triangles) {
                const double u[3] = {b.x - a.x, b.y - a.y, b.z - a.z};
                const double v[3] = {d.x - a.x, d.y - a.y, d.z - a.z};
                for (int axis = 0; axis < 3; ++axis) {
                    const int next = (axis + 1) % 3;
                    const int last = (axis + 2) % 3;
                    sum += (u[next] * v[last] - u[last] * v[next]) / 2.0 * (*rotation)[axis][2];
                }
            }
            EXPECT_NEAR(sum, ringArea(flat), 1e-9 * ringArea(room));
        }
    }
}

TEST(SolidraFace, keepsItsLoopEdgesTagAndTurn) {
    const Ring square = staircaseRoom(1, 5);
    Solidra::Edge* edges[4] = {};
    const Face face(square.data(), 4, 42, true, nullptr, edges);
    EXPECT_EQ(face.tag(), 42);
    ASSERT_EQ(face.edgeCount(), 4);
    const int walkedBack[] = {0, 3, 2, 1};
    for (int k = 0; k < 4; ++k) {
        EXPECT_EQ(edges[k], face.edge(k));
        EXPECT_EQ(edges[k], &face.vertex(k)->loopEdge());
        EXPECT_EQ(edges[k]->vertex(), face.vertex(k));
        EXPECT_EQ(face.vertex(k)->point().x, square[walkedBack[k]].x);
        EXPECT_EQ(face.vertex(k)->point().y, square[walkedBack[k]].y);
    }
    EXPECT_EQ(face.vertex(4), nullptr);
    EXPECT_EQ(face.edge(-1), nullptr);
    double area = 0.0;
    for (const Corners& t : triangulate(face))
        area += twiceArea(t[0]->point(), t[1]->point(), t[2]->point()) / 2.0;
    EXPECT_NEAR(area, -ringArea(square), 1e-12);
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
