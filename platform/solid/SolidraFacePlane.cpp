// Newell's normal of a loop, the loop's axis of view, and its flatness.
#include "platform/solid/SolidraFacePlane.h"

#include "platform/solid/SolidraErrorCode.h"

#include <algorithm>
#include <cmath>
#include <string>
#include <utility>

namespace Solidra {

namespace {

constexpr double kPlanarityTolerance = 1e-9;

// The coordinates in axis order, so that the axis after another is the next one, cyclically.
constexpr PlaneView::Axis kAxes[3] = {&Point3d::x, &Point3d::y, &Point3d::z};

Point3d minus(const Point3d& a, const Point3d& b) {
    return {a.x - b.x, a.y - b.y, a.z - b.z};
}

double dot(const Point3d& a, const Point3d& b) {
    return a.x * b.x + a.y * b.y + a.z * b.z;
}

// Twice the vector area of the loop. Measured from the first vertex, so that a room far from the
// origin loses no digits to its position.
Point3d newellNormal(const std::vector<Vertex>& loop) {
    const Point3d& origin = loop.front().point();
    Point3d normal{0.0, 0.0, 0.0};
    for (std::size_t i = 1; i + 1 < loop.size(); ++i) {
        const Point3d a = minus(loop[i].point(), origin);
        const Point3d b = minus(loop[i + 1].point(), origin);
        normal.x += a.y * b.z - a.z * b.y;
        normal.y += a.z * b.x - a.x * b.z;
        normal.z += a.x * b.y - a.y * b.x;
    }
    return normal;
}

int largestAxis(const Point3d& vector) {
    const double size[3] = {std::fabs(vector.x), std::fabs(vector.y), std::fabs(vector.z)};
    return static_cast<int>(std::max_element(size, size + 3) - size);
}

// The axis along which the loop is thinnest: the view for a loop without a normal.
int thinnestAxis(const std::vector<Vertex>& loop) {
    Point3d low = loop.front().point();
    Point3d high = low;
    for (const Vertex& vertex : loop) {
        for (const PlaneView::Axis axis : kAxes) {
            low.*axis = std::min(low.*axis, vertex.point().*axis);
            high.*axis = std::max(high.*axis, vertex.point().*axis);
        }
    }
    const Point3d size = minus(high, low);
    const double extents[3] = {size.x, size.y, size.z};
    return static_cast<int>(std::min_element(extents, extents + 3) - extents);
}

} // namespace

FacePlane::FacePlane(const std::vector<Vertex>& loop)
    : mNormal(newellNormal(loop)),
      mDegenerate(mNormal.x == 0.0 && mNormal.y == 0.0 && mNormal.z == 0.0) {
    const int viewAxis = mDegenerate ? thinnestAxis(loop) : largestAxis(mNormal);
    mViewAxis = kAxes[viewAxis];
    // (x, y) seen down z, (y, z) down x, (z, x) down y: each pair turns positively about its axis.
    mU = kAxes[(viewAxis + 1) % 3];
    mV = kAxes[(viewAxis + 2) % 3];
    if (mNormal.*mViewAxis < 0.0)
        std::swap(mU, mV);
}

bool FacePlane::isLevel(const std::vector<Vertex>& loop) const {
    const double level = loop.front().point().*mViewAxis;
    for (const Vertex& vertex : loop) {
        if (vertex.point().*mViewAxis != level)
            return false;
    }
    return true;
}

void FacePlane::checkPlanar(const std::vector<Vertex>& loop) const {
    if (mDegenerate || isLevel(loop))
        return;
    // Compared as |normal . d| against tolerance * |normal| * |d|max, to spare a root per vertex.
    const Point3d& origin = loop.front().point();
    double farthest = 0.0;
    double longestSquared = 0.0;
    std::size_t farthestVertex = 0;
    for (std::size_t i = 1; i < loop.size(); ++i) {
        const Point3d d = minus(loop[i].point(), origin);
        const double off = std::fabs(dot(d, mNormal));
        longestSquared = std::max(longestSquared, dot(d, d));
        if (off > farthest) {
            farthest = off;
            farthestVertex = i;
        }
    }
    const double normalLength = std::sqrt(dot(mNormal, mNormal));
    if (farthest > kPlanarityTolerance * normalLength * std::sqrt(longestSquared)) {
        throw ErrorCode(ErrorCode::eNotPlanar, "vertex " + std::to_string(farthestVertex) +
                                                   " lies " +
                                                   messageNumber(farthest / normalLength) +
                                                   " off the face's plane through vertex 0");
    }
}

} // namespace Solidra
