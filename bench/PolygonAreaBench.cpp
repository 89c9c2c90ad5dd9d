// ZyrGeometryTools::polygonArea against a plain shoelace loop over the same rings, 4 to 100,000
// vertices.
#include "platform/base/geom/ZyrGeometryTools.h"

#include <benchmark/benchmark.h>

#include <cmath>
#include <numbers>
#include <vector>

namespace {

// A star-shaped ring at survey coordinates, its radius wobbling so that it is not convex.
std::vector<HsGePoint2d> surveyRing(int vertexCount) {
    std::vector<HsGePoint2d> ring;
    ring.reserve(static_cast<size_t>(vertexCount));
    for (int index = 0; index < vertexCount; ++index) {
        const double angle = 2.0 * std::numbers::pi * index / vertexCount;
        const double radius = 20.0 + 5.0 * std::sin(7.0 * angle);
        ring.emplace_back(3'500'000.0 + radius * std::cos(angle),
                          5'400'000.0 + radius * std::sin(angle));
    }
    return ring;
}

// The textbook loop: absolute coordinates, products summed as they come, each edge from the
// point before.
double plainShoelace(const std::vector<HsGePoint2d>& ring) {
    double twiceArea = 0.0;
    const HsGePoint2d* previous = &ring.back();
    for (const HsGePoint2d& point : ring) {
        twiceArea += previous->x * point.y - point.x * previous->y;
        previous = &point;
    }
    return twiceArea / 2.0;
}

void BM_PolygonArea(benchmark::State& state) {
    const std::vector<HsGePoint2d> ring = surveyRing(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(ZyrGeometryTools::polygonArea(ring));
    }
    state.SetComplexityN(state.range(0));
}

void BM_PlainShoelace(benchmark::State& state) {
    const std::vector<HsGePoint2d> ring = surveyRing(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(plainShoelace(ring));
    }
    state.SetComplexityN(state.range(0));
}

void vertexCounts(benchmark::internal::Benchmark* bench) {
    for (const int count : {4, 10, 30, 1'000, 10'000, 100'000}) {
        bench->Arg(count);
    }
    bench->Complexity(benchmark::oN);
}

} // namespace

BENCHMARK(BM_PolygonArea)->Apply(vertexCounts);
BENCHMARK(BM_PlainShoelace)->Apply(vertexCounts);
