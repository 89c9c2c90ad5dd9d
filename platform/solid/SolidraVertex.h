// A corner of a face: the point the face was built from, kept exactly as given, and the edge of
// the face's loop that starts there.
#pragma once

#include "platform/solid/SolidraEdge.h"
#include "platform/solid/SolidraPoint3d.h"

namespace Solidra {

class Vertex {
public:
    explicit Vertex(const Point3d& point) : mPoint(point) {}

    const Point3d& point() const { return mPoint; }
    const Edge& loopEdge() const { return mLoopEdge; }

private:
    // The face links its vertices once they have their places. Kept inside the vertex, the loop
    // costs the face a single allocation.
    friend class Face;

    Point3d mPoint;
    Edge mLoopEdge{nullptr, nullptr};
};

} // namespace Solidra
