// A planar face bounded by one loop of points, which cuts itself into triangles for area work.
#pragma once

#include "platform/solid/SolidraEdge.h"
#include "platform/solid/SolidraEntity.h"
#include "platform/solid/SolidraPoint3d.h"
#include "platform/solid/SolidraVertex.h"

#include <vector>

namespace Solidra {

class Body;
class OutputTriangleCallback;

// How triangulate hands triangles over. The numbers are passed between modules.
enum TriangulationType : int {
    kSingleTriangles = 0, // one outputTriangle call per triangle
};

class Face : public Entity {
public:
    // The loop runs through the count points in order and closes by itself; a last point equal
    // to the first adds nothing. A negative count or null points give an empty face.
    // - tag: a number the caller keeps on the face.
    // - reversed: the loop runs through the points backwards, from the first point on.
    // - body: the body that owns and deletes the face (which must then come from new), or null
    //   for a free face that its caller deletes.
    // - edges: null, or room for count pointers that receive the loop's edges in order.
    // No geometry is refused here: triangulate refuses what it cannot work with.
    Face(const Point3d* points, int count, int tag, bool reversed, Body* body, Edge** edges);
    ~Face() override;

    // As many edges as vertices: edge k runs from vertex k to vertex (k + 1) % vertexCount().
    int vertexCount() const { return static_cast<int>(mVertices.size()); }
    int edgeCount() const { return vertexCount(); }
    // Null out of range.
    const Vertex* vertex(int index) const;
    const Edge* edge(int index) const;
    int tag() const { return mTag; }
    Body* body() const { return mBody; }

    // Cuts the face into triangles whose corners are its own vertices, adding no point, and hands
    // each one to callback, turning the way the loop turns about the face's normal. The triangles
    // are constrained Delaunay: as well shaped as the loop allows. A face of fewer than three
    // distinct points, or of points on one line, bounds no area and gives no triangle.
    // Throws ErrorCode: eNoCallback, eUnknownTriangulationType, eBadCoordinate (a coordinate not
    // finite or beyond 1e60), eNotPlanar, eSelfCrossing. Nothing is delivered before the checks
    // have passed.
    void triangulate(OutputTriangleCallback* callback, TriangulationType type) const;

private:
    void checkCoordinates() const;

    std::vector<Vertex> mVertices;
    int mTag;
    Body* mBody;
    // The first vertex with a coordinate not finite or beyond 1e60, found while building, or -1.
    int mUnusableVertex = -1;
};

} // namespace Solidra
