// A face's loop, its place in a body, and its triangulation seen in its own plane.
#include "platform/solid/SolidraFace.h"

#include "platform/solid/SolidraBody.h"
#include "platform/solid/SolidraErrorCode.h"
#include "platform/solid/SolidraFacePlane.h"
#include "platform/solid/SolidraOutputTriangleCallback.h"
#include "platform/solid/SolidraRingTriangulation.h"

#include <cmath>
#include <cstdint>
#include <string>

namespace Solidra {

namespace {

// The plane squares its normal, a product of two coordinate differences: the square must stay
// finite for any number of vertices.
constexpr double kLargestCoordinate = 1e60;

std::vector<Vertex> loopVertices(const Point3d* points, int count, bool reversed) {
    std::vector<Vertex> vertices;
    if (points == nullptr || count <= 0)
        return vertices;
    const std::size_t size = static_cast<std::size_t>(count);
    vertices.reserve(size);
    vertices.emplace_back(points[0]);
    for (std::size_t i = 1; i < size; ++i)
        vertices.emplace_back(points[reversed ? size - i : i]);
    return vertices;
}

// Not a number fails the comparisons too.
bool isUsable(const Point3d& p) {
    return std::fabs(p.x) <= kLargestCoordinate && std::fabs(p.y) <= kLargestCoordinate &&
           std::fabs(p.z) <= kLargestCoordinate;
}

// Hands each triangle to the caller's callback as three edges between the face's own vertices.
class TriangleDelivery final : public RingTriangleSink {
public:
    TriangleDelivery(const std::vector<Vertex>& loop, OutputTriangleCallback& callback)
        : mLoop(loop), mCallback(callback) {}

    void triangle(std::uint32_t a, std::uint32_t b, std::uint32_t c) override {
        Edge sides[3] = {Edge(&mLoop[a], &mLoop[b]), Edge(&mLoop[b], &mLoop[c]),
                         Edge(&mLoop[c], &mLoop[a])};
        Edge* handed[3] = {&sides[0], &sides[1], &sides[2]};
        mCallback.outputTriangle(handed, 3);
    }

private:
    const std::vector<Vertex>& mLoop;
    OutputTriangleCallback& mCallback;
};

} // namespace

Face::Face(const Point3d* points, int count, int tag, bool reversed, Body* body, Edge** edges)
    : mVertices(loopVertices(points, count, reversed)), mTag(tag), mBody(body) {
    for (std::size_t i = 0; i < mVertices.size(); ++i) {
        Vertex& start = mVertices[i];
        start.mLoopEdge = Edge(&start, i + 1 < mVertices.size() ? &start + 1 : &mVertices[0]);
        if (edges != nullptr)
            edges[i] = &start.mLoopEdge;
        if (mUnusableVertex < 0 && !isUsable(start.point()))
            mUnusableVertex = static_cast<int>(i);
    }
    if (mBody != nullptr)
        mBody->adopt(this);
}

Face::~Face() {
    if (mBody != nullptr)
        mBody->release(this);
}

const Vertex* Face::vertex(int index) const {
    if (index < 0 || index >= vertexCount())
        return nullptr;
    return &mVertices[static_cast<std::size_t>(index)];
}

const Edge* Face::edge(int index) const {
    const Vertex* start = vertex(index);
    return start == nullptr ? nullptr : &start->loopEdge();
}

void Face::checkCoordinates() const {
    if (mUnusableVertex < 0)
        return;
    const Point3d& p = mVertices[static_cast<std::size_t>(mUnusableVertex)].point();
    throw ErrorCode(ErrorCode::eBadCoordinate, "vertex " + std::to_string(mUnusableVertex) +
                                                   " is at (" + messageNumber(p.x) + ", " +
                                                   messageNumber(p.y) + ", " + messageNumber(p.z) +
                                                   "), beyond what the modeler computes with");
}

void Face::triangulate(OutputTriangleCallback* callback, TriangulationType type) const {
    if (callback == nullptr)
        throw ErrorCode(ErrorCode::eNoCallback, "triangulate needs a callback to deliver to");
    if (type != kSingleTriangles) {
        throw ErrorCode(ErrorCode::eUnknownTriangulationType,
                        "triangulation type " + std::to_string(static_cast<int>(type)) +
                            " is not known; 0 delivers single triangles");
    }
    checkCoordinates();
    if (mVertices.size() < 3)
        return;
    const FacePlane plane(mVertices);
    plane.checkPlanar(mVertices);
    TriangleDelivery delivery(mVertices, *callback);
    triangulateRing(plane.view(mVertices), delivery);
}

} // namespace Solidra
