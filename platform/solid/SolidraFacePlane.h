// The plane of a face's loop, from Newell's normal, and the loop seen in that plane.
#pragma once

#include "platform/solid/SolidraVertex.h"

#include <cstddef>
#include <vector>

namespace Solidra {

// A point of the loop in the face's plane.
struct PlanePoint {
    double u;
    double v;
};

// The loop seen in its plane: two of each vertex's three coordinates, read in place.
class PlaneView {
public:
    using Axis = double Point3d::*;

    PlaneView(const std::vector<Vertex>& loop, Axis u, Axis v) : mLoop(loop), mU(u), mV(v) {}

    std::size_t size() const { return mLoop.size(); }
    PlanePoint operator[](std::size_t i) const {
        const Point3d& p = mLoop[i].point();
        return {p.*mU, p.*mV};
    }

private:
    const std::vector<Vertex>& mLoop;
    Axis mU;
    Axis mV;
};

class FacePlane {
public:
    // Expects at least one vertex, all of them with finite coordinates.
    explicit FacePlane(const std::vector<Vertex>& loop);

    // Throws ErrorCode::eNotPlanar when a vertex lies off the plane by more than a billionth
    // of the loop's extent. A degenerate plane holds every loop.
    void checkPlanar(const std::vector<Vertex>& loop) const;

    // The loop seen along the normal's largest axis: two of its three coordinates, exact as
    // given, so that the triangulation decides on the caller's own numbers. The two are ordered so
    // that the loop turns counter-clockwise (u to v) whenever it turns positively about the normal.
    PlaneView view(const std::vector<Vertex>& loop) const { return PlaneView(loop, mU, mV); }

private:
    // True when every vertex has the same coordinate along the axis of view, as the loops of a
    // floor plan do: planar without a measurement.
    bool isLevel(const std::vector<Vertex>& loop) const;

    Point3d mNormal;
    // The loop encloses no area in any direction: its points lie on one line, or its parts cancel
    // out. The plane is then a guess, and the loop is seen across its thinnest axis.
    bool mDegenerate;
    PlaneView::Axis mViewAxis;
    PlaneView::Axis mU;
    PlaneView::Axis mV;
};

} // namespace Solidra
