// Ring triangulation on CGAL's constrained Delaunay triangulation: exact predicates on the
// caller's own coordinates, crossings refused rather than resolved with new points.
#include "platform/solid/SolidraRingTriangulation.h"

#include "platform/solid/SolidraErrorCode.h"

#include <CGAL/Constrained_Delaunay_triangulation_2.h>
#include <CGAL/Exact_predicates_inexact_constructions_kernel.h>
#include <CGAL/Triangulation_face_base_with_info_2.h>
#include <CGAL/Triangulation_vertex_base_with_info_2.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <string>
#include <vector>

namespace Solidra {

namespace {

constexpr std::uint32_t kNoPosition = std::numeric_limits<std::uint32_t>::max();
constexpr int kUnvisited = -1;

// The ring position a triangulation vertex was first inserted from.
struct RingPosition {
    std::uint32_t value = kNoPosition;
};

// How many ring edges lie between a face and the unbounded outside: odd depth is inside.
struct NestingDepth {
    int value = kUnvisited;
};

using Kernel = CGAL::Exact_predicates_inexact_constructions_kernel;
using VertexBase = CGAL::Triangulation_vertex_base_with_info_2<RingPosition, Kernel>;
using FaceBase =
    CGAL::Triangulation_face_base_with_info_2<NestingDepth, Kernel,
                                              CGAL::Constrained_triangulation_face_base_2<Kernel>>;
using Cdt = CGAL::Constrained_Delaunay_triangulation_2<
    Kernel, CGAL::Triangulation_data_structure_2<VertexBase, FaceBase>,
    CGAL::No_constraint_intersection_requiring_constructions_tag>;
using VertexHandle = Cdt::Vertex_handle;
using FaceHandle = Cdt::Face_handle;

[[noreturn]] void throwCrossingEdge(std::size_t edge, std::size_t ringSize) {
    throw ErrorCode(ErrorCode::eSelfCrossing, "edge " + std::to_string(edge) + " from vertex " +
                                                  std::to_string(edge) + " to vertex " +
                                                  std::to_string((edge + 1) % ringSize) +
                                                  " crosses another edge of the face");
}

void constrainEdge(Cdt& cdt, VertexHandle from, VertexHandle to, std::size_t edge,
                   std::size_t ringSize) {
    if (from == to)
        return;
    try {
        cdt.insert_constraint(from, to);
    } catch (const Cdt::Intersection_of_constraints_exception&) {
        throwCrossingEdge(edge, ringSize);
    }
}

// Each point goes in right after its predecessor, located from the predecessor's face, and its
// edge follows at once: the edge is then short and crosses few triangles. This is several times
// faster than inserting all points first, whose Delaunay triangles the long-range ring edges would
// then have to cut through.
void insertRing(Cdt& cdt, const PlaneView& ring) {
    VertexHandle first;
    VertexHandle previous;
    for (std::size_t i = 0; i < ring.size(); ++i) {
        const FaceHandle hint = i == 0 ? FaceHandle() : previous->face();
        const PlanePoint point = ring[i];
        const VertexHandle current = cdt.insert(Kernel::Point_2(point.u, point.v), hint);
        if (current->info().value == kNoPosition)
            current->info().value = static_cast<std::uint32_t>(i);
        if (i == 0)
            first = current;
        else
            constrainEdge(cdt, previous, current, i - 1, ring.size());
        previous = current;
    }
    constrainEdge(cdt, previous, first, ring.size() - 1, ring.size());
}

// Flood fill from the unbounded outside: crossing a ring edge goes one level deeper.
void markNestingDepths(Cdt& cdt) {
    std::vector<FaceHandle> level{cdt.infinite_face()};
    std::vector<FaceHandle> deeper;
    cdt.infinite_face()->info().value = 0;
    for (int depth = 0; !level.empty(); ++depth) {
        while (!level.empty()) {
            const FaceHandle face = level.back();
            level.pop_back();
            for (int i = 0; i < 3; ++i) {
                const FaceHandle neighbour = face->neighbor(i);
                if (neighbour->info().value != kUnvisited)
                    continue;
                if (face->is_constrained(i)) {
                    deeper.push_back(neighbour);
                } else {
                    neighbour->info().value = depth;
                    level.push_back(neighbour);
                }
            }
        }
        for (const FaceHandle& face : deeper) {
            if (face->info().value == kUnvisited) {
                face->info().value = depth + 1;
                level.push_back(face);
            }
        }
        deeper.clear();
    }
}

bool isInside(const FaceHandle& face) {
    return face->info().value % 2 == 1;
}

std::uint32_t position(const FaceHandle& face, int corner) {
    return face->vertex(corner)->info().value;
}

double cross(const PlanePoint& origin, const PlanePoint& a, const PlanePoint& b) {
    return (a.u - origin.u) * (b.v - origin.v) - (a.v - origin.v) * (b.u - origin.u);
}

// A ring that passes twice through one point (a vertex met again, or a vertex lying on another
// edge) can cross itself there, or wind round a second time, without any two edges crossing.
// Depth parity then fills the loop that turns the wrong way, or fills the doubled one only once,
// so the triangles cover another area than the ring encloses: compare the two, allowing for
// rounding alone.
void checkTrianglesCoverRingOnce(const Cdt& cdt, const PlaneView& ring) {
    const PlanePoint origin = ring[0];
    double enclosed = 0.0;
    double reach = 0.0;
    PlanePoint previous = ring[1];
    for (std::size_t i = 2; i < ring.size(); ++i) {
        const PlanePoint next = ring[i];
        enclosed += cross(origin, previous, next);
        reach = std::max({reach, std::fabs(next.u - origin.u), std::fabs(next.v - origin.v)});
        previous = next;
    }
    reach = std::max({reach, std::fabs(ring[1].u - origin.u), std::fabs(ring[1].v - origin.v)});
    double covered = 0.0;
    std::size_t triangles = 0;
    for (const FaceHandle face : cdt.finite_face_handles()) {
        if (isInside(face)) {
            covered +=
                cross(ring[position(face, 0)], ring[position(face, 1)], ring[position(face, 2)]);
            ++triangles;
        }
    }
    const double terms = static_cast<double>(ring.size() + triangles + 8);
    const double roundingBound =
        64.0 * terms * std::numeric_limits<double>::epsilon() * reach * reach;
    if (std::fabs(covered - enclosed) > roundingBound) {
        throw ErrorCode(ErrorCode::eSelfCrossing,
                        "the face's loop passes through a point twice and crosses or retraces "
                        "itself there: its triangles would cover " +
                            messageNumber(covered / 2.0) + " but it encloses " +
                            messageNumber(enclosed / 2.0));
    }
}

} // namespace

void triangulateRing(const PlaneView& ring, RingTriangleSink& sink) {
    if (ring.size() < 3)
        return;
    Cdt cdt;
    insertRing(cdt, ring);
    if (cdt.dimension() < 2)
        return;
    markNestingDepths(cdt);
    checkTrianglesCoverRingOnce(cdt, ring);
    for (const FaceHandle face : cdt.finite_face_handles()) {
        if (isInside(face))
            sink.triangle(position(face, 0), position(face, 1), position(face, 2));
    }
}

} // namespace Solidra
