// The price of Solidra::Face::triangulate over calling CGAL directly on the same rings: floor-plan
// rooms of 4 to 30 vertices, and outlines of 1,000 to 100,000.
#include "platform/solid/SolidraFace.h"
#include "platform/solid/SolidraOutputTriangleCallback.h"
#include "tests/platform/solid/SolidraTestRings.h"

#include <CGAL/Constrained_Delaunay_triangulation_2.h>
#include <CGAL/Exact_predicates_inexact_constructions_kernel.h>
#include <CGAL/Triangulation_face_base_with_info_2.h>

#include <benchmark/benchmark.h>

#include <cstddef>
#include <cstdint>
#include <vector>

namespace {

using SolidraTestRings::Ring;

// The bare CGAL program: the ring as one closed constraint, the inside found by a flood fill
// that counts the constrained edges crossed, and the corners of each inside triangle read.
using Kernel = CGAL::Exact_predicates_inexact_constructions_kernel;
using FaceBase =
    CGAL::Triangulation_face_base_with_info_2<int, Kernel,
                                              CGAL::Constrained_triangulation_face_base_2<Kernel>>;
using Cdt = CGAL::Constrained_Delaunay_triangulation_2<
    Kernel,
    CGAL::Triangulation_data_structure_2<CGAL::Triangulation_vertex_base_2<Kernel>, FaceBase>,
    CGAL::No_constraint_intersection_requiring_constructions_tag>;

// Points in ring order, each located from its predecessor, each edge right after its end point:
// the insertion the modeler makes.
void insertRingInOrder(Cdt& cdt, const Ring& ring) {
    Cdt::Vertex_handle first;
    Cdt::Vertex_handle previous;
    for (const Solidra::Point3d& p : ring) {
        const Cdt::Vertex_handle current = cdt.insert(
            Kernel::Point_2(p.x, p.y), previous == nullptr ? Cdt::Face_handle() : previous->face());
        if (previous == nullptr)
            first = current;
        else if (current != previous)
            cdt.insert_constraint(previous, current);
        previous = current;
    }
    cdt.insert_constraint(previous, first);
}

// CGAL's own closed polyline insertion, as its manual shows it: each point located afresh.
void insertRingAsPolyline(Cdt& cdt, const Ring& ring) {
    std::vector<Kernel::Point_2> points;
    points.reserve(ring.size());
    for (const Solidra::Point3d& p : ring)
        points.emplace_back(p.x, p.y);
    cdt.insert_constraint(points.begin(), points.end(), true);
}

double sumOfInsideCorners(Cdt& cdt) {
    for (const Cdt::Face_handle face : cdt.all_face_handles())
        face->info() = -1;
    std::vector<Cdt::Face_handle> level{cdt.infinite_face()};
    std::vector<Cdt::Face_handle> deeper;
    cdt.infinite_face()->info() = 0;
    for (int depth = 0; !level.empty(); ++depth) {
        while (!level.empty()) {
            const Cdt::Face_handle face = level.back();
            level.pop_back();
            for (int i = 0; i < 3; ++i) {
                const Cdt::Face_handle next = face->neighbor(i);
                if (next->info() != -1)
                    continue;
                if (face->is_constrained(i)) {
                    deeper.push_back(next);
                } else {
                    next->info() = depth;
                    level.push_back(next);
                }
            }
        }
        for (const Cdt::Face_handle& face : deeper) {
            if (face->info() == -1) {
                face->info() = depth + 1;
                level.push_back(face);
            }
        }
        deeper.clear();
    }
    double sum = 0.0;
    for (const Cdt::Face_handle face : cdt.finite_face_handles()) {
        if (face->info() % 2 == 1)
            sum += face->vertex(0)->point().x() + face->vertex(1)->point().x() +
                   face->vertex(2)->point().x();
    }
    return sum;
}

class CornerSum : public Solidra::OutputTriangleCallback {
public:
    double sum = 0.0;
    void outputTriangle(Solidra::Edge** edges, int) override {
        sum += edges[0]->vertex()->point().x + edges[1]->vertex()->point().x +
               edges[2]->vertex()->point().x;
    }
    void outputTriStrip(Solidra::Edge**, int, bool) override {}
};

double solidra(const Ring& ring) {
    const Solidra::Face face(ring.data(), static_cast<int>(ring.size()), 0, false, nullptr,
                             nullptr);
    CornerSum corners;
    face.triangulate(&corners, Solidra::kSingleTriangles);
    return corners.sum;
}

double cgalInOrder(const Ring& ring) {
    Cdt cdt;
    insertRingInOrder(cdt, ring);
    return sumOfInsideCorners(cdt);
}

double cgalPolyline(const Ring& ring) {
    Cdt cdt;
    insertRingAsPolyline(cdt, ring);
    return sumOfInsideCorners(cdt);
}

// Rooms with range(0) steps (2 * steps + 2 vertices), 64 different ones taken in turn.
template <double (*triangulate)(const Ring&)> void rooms(benchmark::State& state) {
    std::vector<Ring> rooms;
    for (std::uint32_t seed = 1; seed <= 64; ++seed)
        rooms.push_back(SolidraTestRings::staircaseRoom(static_cast<int>(state.range(0)), seed));
    std::size_t next = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(triangulate(rooms[next]));
        next = (next + 1) % rooms.size();
    }
    state.counters["vertices"] = static_cast<double>(rooms.front().size());
}

Ring starOf(int vertices) {
    return SolidraTestRings::star(vertices, 17);
}
Ring spiralOf(int vertices) {
    return SolidraTestRings::spiral(vertices);
}
Ring combOf(int vertices) {
    return SolidraTestRings::comb(vertices / 4);
}

// One outline of about range(0) vertices.
void outlines(benchmark::State& state, double (*triangulate)(const Ring&),
              Ring (*shape)(int vertices)) {
    const Ring ring = shape(static_cast<int>(state.range(0)));
    for (auto _ : state)
        benchmark::DoNotOptimize(triangulate(ring));
    state.counters["ns/vertex"] = benchmark::Counter(static_cast<double>(ring.size()),
                                                     benchmark::Counter::kIsIterationInvariantRate |
                                                         benchmark::Counter::kInvert);
}

void roomSizes(benchmark::internal::Benchmark* bench) {
    for (int steps : {1, 2, 4, 9, 14})
        bench->Arg(steps);
}

void outlineSizes(benchmark::internal::Benchmark* bench) {
    bench->Arg(1000)->Arg(10000)->Arg(100000)->Unit(benchmark::kMillisecond);
}

BENCHMARK(rooms<solidra>)->Apply(roomSizes);
BENCHMARK(rooms<cgalInOrder>)->Apply(roomSizes);
BENCHMARK(rooms<cgalPolyline>)->Apply(roomSizes);
BENCHMARK_CAPTURE(outlines, star_solidra, solidra, starOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, star_cgalInOrder, cgalInOrder, starOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, star_cgalPolyline, cgalPolyline, starOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, spiral_solidra, solidra, spiralOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, spiral_cgalInOrder, cgalInOrder, spiralOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, spiral_cgalPolyline, cgalPolyline, spiralOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, comb_solidra, solidra, combOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, comb_cgalInOrder, cgalInOrder, combOf)->Apply(outlineSizes);
BENCHMARK_CAPTURE(outlines, comb_cgalPolyline, cgalPolyline, combOf)->Apply(outlineSizes);

} // namespace
