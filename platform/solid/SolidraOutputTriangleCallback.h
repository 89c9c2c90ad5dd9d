// The receiver of a face's triangles: the modeler calls it on the caller's thread, inside
// Face::triangulate, once per piece.
#pragma once

namespace Solidra {

class Edge;

class OutputTriangleCallback {
public:
    virtual ~OutputTriangleCallback() = default;

    // One triangle: edges[k] starts at corner k and ends at corner (k + 1) % 3, count is 3, and
    // the corners turn the way the face's loop turns. The edges and the array live for this call
    // only; the vertices they point to live as long as the face.
    virtual void outputTriangle(Edge** edges, int count) = 0;

    // A strip of triangles, for delivery modes that hand over strips. This modeler's one mode,
    // kSingleTriangles, never calls it; it stays in the contract so that every receiver states
    // what it does with strips, if only to ignore them.
    virtual void outputTriStrip(Edge** edges, int count, bool flag) = 0;

protected:
    OutputTriangleCallback() = default;
    OutputTriangleCallback(const OutputTriangleCallback&) = default;
    OutputTriangleCallback& operator=(const OutputTriangleCallback&) = default;
};

} // namespace Solidra
