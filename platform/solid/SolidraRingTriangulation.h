// Triangulation of one closed ring in the plane. Its .cpp is the one place that sees CGAL.
#pragma once

#include "platform/solid/SolidraFacePlane.h"

#include <cstdint>

namespace Solidra {

// The receiver of the triangles, each as three positions in the ring turning counter-clockwise.
class RingTriangleSink {
public:
    virtual void triangle(std::uint32_t a, std::uint32_t b, std::uint32_t c) = 0;

protected:
    ~RingTriangleSink() = default;
};

// Cuts the inside of ring into constrained Delaunay triangles whose corners are ring positions:
// no point is added, and each triangle is as well shaped as the ring allows. The ring closes by
// itself and should turn counter-clockwise; a repeated point adds no edge, and a point met again
// is named by its first position. A ring on one line gives no triangle.
// Throws ErrorCode::eSelfCrossing when two edges cross, or when the ring passes through a point
// twice and crosses or retraces itself there. Nothing reaches sink before these checks pass.
void triangulateRing(const PlaneView& ring, RingTriangleSink& sink);

} // namespace Solidra
